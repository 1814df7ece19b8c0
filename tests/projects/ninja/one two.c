// SPDX-License-Identifier: Apache-2.0
//
// A name with a blank, which has to be quoted in the response file.
int words(void) {
  return 12;
}
