// SPDX-License-Identifier: Apache-2.0
//
// One printf conversion with its flags, and the rendering of each kind of value under it. The
// reader of formats fills it, in the compiler or at run time; format.cpp puts in what the arguments
// say.

#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace messages {

struct Conversion {
  uint32_t width = 0;
  uint32_t precision = 0;
  bool hasPrecision = false;
  bool isLeftAligned = false; // -
  bool showsPlus = false;     // +
  bool showsBlank = false;    // blank
  bool isAlternate = false;   // #
  bool isZeroPadded = false;  // 0
  char letter = '\0';
};

// For %s; the precision cuts the text.
void appendString(std::string& text, const Conversion& conversion, std::string_view value);
// For %c.
void appendCharacter(std::string& text, const Conversion& conversion, char value);
// For %d and %i.
void appendSigned(std::string& text, const Conversion& conversion, int64_t value);
// For %u, %o, %x and %X.
void appendUnsigned(std::string& text, const Conversion& conversion, uint64_t value);

} // namespace messages
