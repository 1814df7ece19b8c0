// SPDX-License-Identifier: Apache-2.0
//
// One member of a library.
int q(void) {
  return 1;
}
