// SPDX-License-Identifier: Apache-2.0
//
// One of two sources of one name, in two folders.
int one(void) {
  return 1;
}
