// SPDX-License-Identifier: Apache-2.0
//
// Takes a member of the beginning, of the middle and of the end of the library of many.
#include <stdio.h>

int first(void);
int f_0000(void);
int f_2000(void);
int f_3999(void);

int main(void) {
  printf("%d\n", first() + f_0000() + f_2000() + f_3999());
  return 0;
}
