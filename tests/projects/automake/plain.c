// SPDX-License-Identifier: Apache-2.0
//
// In a library that is no libtool library.
int plain(void) {
  return 3;
}
