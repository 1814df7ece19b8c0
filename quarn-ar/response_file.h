// SPDX-License-Identifier: Apache-2.0
//
// Response files: a word "@file" stands for the words in that file, which may hold such words too.
// Build systems put there what is too long for a command line.
#pragma once

#include "support/interface/host.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace quarn_ar {

// How words are told apart. In either, white space outside of quotes ends a word.
enum class Quoting {
  Posix,   // quotes of both kinds; a backslash takes the next character as it is, everywhere
  Windows, // double quotes alone; a backslash counts only in front of one
};

// Refuses any name but "posix" and "windows".
[[nodiscard]] std::optional<Quoting> quotingNamed(std::string_view name);

// The words of a text. Nothing if a quote has no end.
[[nodiscard]] std::optional<std::vector<std::string>> splitWords(std::string_view text,
                                                                 Quoting quoting);

// Puts the words of the files in the place of those that name them. False after a refusal: a file
// that can't be read, or that leads back to itself.
[[nodiscard]] bool expandResponseFiles(support::Host& host, Quoting quoting,
                                       std::vector<std::string>& words);

} // namespace quarn_ar
