// SPDX-License-Identifier: Apache-2.0
//
// In the convenience library, under the name of an object of the outer one.
int inner(void) {
  return 1;
}
