// SPDX-License-Identifier: Apache-2.0
//
// From the path of the program to the name in its messages: the extension of a program file goes,
// then everything up to the last separator, where "." counts as one, so "quarn-1.2" is called "2".
// A "zq" in front is no part of the name either. The rest is cut to the buffer, whatever the caller
// has put into argv[0].

#include "support/interface/tool_name.h"

#include <algorithm>
#include <initializer_list>
#include <string_view>

namespace support {

namespace {

constexpr size_t ShortestCutName = 5; // ".exe" alone is a name

bool endsWithAny(std::string_view text, std::initializer_list<std::string_view> endings) {
  return std::any_of(endings.begin(), endings.end(),
                     [text](std::string_view ending) { return text.ends_with(ending); });
}

std::string_view withoutProgramExtension(std::string_view text) {
  if (text.size() < ShortestCutName) return text;
  const bool isProgram = endsWithAny(text, {".exe", ".EXE", ".dll", ".DLL"});
  return isProgram ? text.substr(0, text.size() - 4) : text;
}

} // namespace

void toolNameFrom(const char* argv0, std::span<char, ToolNameSize> buffer) {
  std::string_view name = withoutProgramExtension(argv0 ? argv0 : "");
  name.remove_prefix(name.find_last_of("./:\\") + 1);
  if (name.starts_with("zq")) name.remove_prefix(2);
  name = name.substr(0, ToolNameSize - 1);
  *std::copy(name.begin(), name.end(), buffer.begin()) = '\0';
}

} // namespace support
