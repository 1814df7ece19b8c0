// SPDX-License-Identifier: Apache-2.0
//
// The one member of the library of many that the project compiles itself.
int first(void) {
  return 1;
}
