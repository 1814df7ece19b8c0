// SPDX-License-Identifier: Apache-2.0
//
// One member of a library.
int b(void) {
  return 1;
}
