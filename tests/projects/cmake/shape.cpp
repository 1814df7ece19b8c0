// SPDX-License-Identifier: Apache-2.0
//
// What a C++ library takes from its own.
#include <string>

std::string shape(int corners) {
  return std::to_string(corners) + " corners";
}
