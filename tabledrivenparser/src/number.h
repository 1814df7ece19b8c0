// SPDX-License-Identifier: Apache-2.0
//
// Numbers in arguments: decimal, or hexadecimal behind "0x". value_store reads with it both single
// numbers and the elements of a list, and looks itself at what stands behind the digits.

#pragma once

#include "tabledrivenparser/interface/value.h"

#include <cstdint>

namespace tabledrivenparser {

enum class NumberResult { Good, Bad, Overflow };

struct NumberText {
  NumberResult result = NumberResult::Bad;
  int64_t value = 0;         // as in Value::integer
  const char* end = nullptr; // behind the last digit
};

// Reads the number that text begins with, after white space and a sign if there are any. What is
// too large for the type, one of the types of numbers, is an overflow; a text without digits is
// bad.
NumberText readNumber(const char* text, ValueType type);

} // namespace tabledrivenparser
