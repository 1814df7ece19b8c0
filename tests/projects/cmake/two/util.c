// SPDX-License-Identifier: Apache-2.0
//
// One of two sources of one name, in two folders.
int two(void) {
  return 2;
}
