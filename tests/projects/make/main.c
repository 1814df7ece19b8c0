// SPDX-License-Identifier: Apache-2.0
//
// Linked against libraries that the archiver under test has made.
#include <stdio.h>

int a(void), b(void), c(void), d(void), e(void), f(void), g(void), h(void), p(void), q(void);

int main(void) {
  printf("%d\n", a() + b() + c() + d() + e() + f() + g() + h() + p() + q());
  return 0;
}
