// SPDX-License-Identifier: Apache-2.0
//
// In the library that takes in the convenience library.
int inner(void);

int outer(void) {
  return inner() + 1;
}
