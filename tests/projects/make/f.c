// SPDX-License-Identifier: Apache-2.0
//
// One member of a library.
int f(void) {
  return 1;
}
