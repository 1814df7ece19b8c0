// SPDX-License-Identifier: Apache-2.0
//
// Resolving "." and "..". On this host ".." is what the text says, not what a link in front of it
// leads to: the host itself takes names apart before it looks at files.

#include "support/interface/long_names.h"

#include "support/interface/path.h"

#include <algorithm>
#include <vector>

namespace support {

namespace {

size_t countCharacters(std::string_view name) {
  size_t count = 0;
  for (const char character : name) {
    const auto byte = static_cast<unsigned char>(character);
    const bool continues = byte >= 0x80 && byte < 0xC0;
    const bool takesTwo = byte >= 0xF0;
    count += continues ? 0 : takesTwo ? 2 : 1;
  }
  return count;
}

// Appends the folders and the leaf of a text without its drive to those that lead there.
void appendParts(std::string_view text, std::vector<std::string_view>& parts) {
  while (!text.empty()) {
    const size_t length = std::min(text.find_first_of("/\\"), text.size());
    const std::string_view part = text.substr(0, length);
    text.remove_prefix(std::min(length + 1, text.size()));
    if (part == ".." && !parts.empty()) parts.pop_back();
    if (!part.empty() && part != "." && part != "..") parts.push_back(part);
  }
}

std::string driveOf(std::string_view name) {
  return path(name, PathStyle_Windows).getDrive();
}

// Behind this prefix the host resolves nothing; and a drive alone stands for a folder of its own.
bool canBeResolved(std::string_view name, std::string_view drive) {
  if (name.starts_with(R"(\\?\)") || name.starts_with(R"(\\.\)")) return false;
  return drive.empty() || drive.starts_with('\\') ||
         name.substr(drive.size()).find_first_of("/\\") == 0;
}

} // namespace

std::string shortenLongName(std::string_view name, std::string_view currentDirectory) {
  if (countCharacters(name) < LongName) return std::string(name);
  std::string drive = driveOf(name);
  if (!canBeResolved(name, drive)) return std::string(name);

  const std::string_view rest = name.substr(drive.size());
  std::vector<std::string_view> parts;
  if (drive.empty()) {
    drive = driveOf(currentDirectory);
    const bool isFromTheRoot = rest.find_first_of("/\\") == 0;
    if (!isFromTheRoot) appendParts(currentDirectory.substr(drive.size()), parts);
  }
  appendParts(rest, parts);
  std::string resolved = drive;
  for (const std::string_view part : parts)
    resolved.append("\\").append(part);
  return countCharacters(resolved) < countCharacters(name) ? resolved : std::string(name);
}

} // namespace support
