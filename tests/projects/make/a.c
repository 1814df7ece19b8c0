// SPDX-License-Identifier: Apache-2.0
//
// One member of a library.
int a(void) {
  return 1;
}
