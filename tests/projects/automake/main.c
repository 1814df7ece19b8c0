// SPDX-License-Identifier: Apache-2.0
//
// Linked against libraries that the archiver under test has made.
#include <stdio.h>

int outer(void);
int plain(void);

int main(void) {
  printf("%d\n", outer() + plain());
  return 0;
}
