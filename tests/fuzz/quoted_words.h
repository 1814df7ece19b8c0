// SPDX-License-Identifier: Apache-2.0
//
// Words as a file holds them that is read with quotes: what the reader makes of it must be the
// words again.
#pragma once

#include <string>
#include <vector>

namespace fuzzing {

// Each in double quotes, on a line of its own.
inline std::string quotedWords(const std::vector<std::string>& words) {
  std::string text;
  for (const std::string& word : words) {
    text += '"';
    for (const char character : word) {
      if (character == '"' || character == '\\') text += '\\';
      text += character;
    }
    text += "\"\n";
  }
  return text;
}

} // namespace fuzzing
