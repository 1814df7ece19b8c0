// SPDX-License-Identifier: Apache-2.0
//
// One member of a library.
int e(void) {
  return 1;
}
