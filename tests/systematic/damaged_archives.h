// SPDX-License-Identifier: Apache-2.0
//
// A small archive that has everything, and every way to damage it that the tests go through: each
// of its prefixes, and each byte of its headers and tables set to 0x00, 0xFF and its complement.
//
// The small archive has each part of the format once, so a few hundred bytes reach every check of
// the reader; the bytes of ordinary contents are left out, as they are no part of the format.

#pragma once

#include "tests/support/archive_builder.h"
#include "tests/support/object_builder.h"

#include <cstdint>
#include <functional>
#include <string>

namespace testsupport {

// Tables of odd size, a long name, an object, odd and even sizes.
inline std::string goodArchive() {
  return archive()
      .symbolTable({{"alpha", "a.o"}, {"beta", "b_with_a_long_name"}})
      .longNames({"b_with_a_long_name"})
      .member("a.o", object().bytes() + "x")
      .member("b_with_a_long_name", "body")
      .member("c", "")
      .bytes();
}

// Calls the visitor with a name for the damage and the damaged bytes.
using DamageVisitor = std::function<void(const std::string& what, const std::string& bytes)>;

inline void forEachPrefix(const DamageVisitor& visit) {
  const std::string good = goodArchive();
  for (size_t size = 0; size <= good.size(); ++size)
    visit("prefix of " + std::to_string(size) + " bytes", good.substr(0, size));
}

// Offset and size of each run of bytes that belongs to no ordinary member's contents.
inline bool isStructure(const std::vector<ParsedMember>& members, size_t position) {
  for (const ParsedMember& member : members) {
    const size_t start = member.offset + size_t{60};
    if (!member.name.empty() && position >= start && position < start + member.contents.size()) {
      return false;
    }
  }
  return true;
}

// Of the bytes that are structure every `step`-th one, each as three other values.
inline void forEachChangedByte(const DamageVisitor& visit, size_t step = 1) {
  const std::string good = goodArchive();
  std::string error;
  const std::vector<ParsedMember> members = parseArchive(good, error);
  size_t structureCount = 0;
  for (size_t position = 0; position < good.size(); ++position) {
    if (!isStructure(members, position) || structureCount++ % step != 0) continue;
    const auto old = static_cast<uint8_t>(good[position]);
    for (const uint8_t value : {uint8_t{0x00}, uint8_t{0xFF}, static_cast<uint8_t>(~old)}) {
      std::string damaged = good;
      damaged[position] = static_cast<char>(value);
      visit("byte " + std::to_string(position) + " as " + std::to_string(value), damaged);
    }
  }
}

} // namespace testsupport
