// SPDX-License-Identifier: Apache-2.0
//
// Linked against a library that the archiver under test has made.
#include <stdio.h>

int words(void);

int main(void) {
  printf("%d\n", words());
  return 0;
}
