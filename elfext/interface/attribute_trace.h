// SPDX-License-Identifier: Apache-2.0
//
// For those who want to see how an attribute section is read: decodes one into a plain table, with
// nothing of an object around it, and tells of each step. The section is walked up to three times:
// for what holds of the file, of sections, and of symbols.
//
// A part whose length can't be right is told as corrupt and left out, and one of a kind that there
// is not is told as skipped. Other bytes that run past the end of their part stop the program.
#pragma once

#include "elfext/interface/build_attributes_tags.h"

#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace elfext {

struct TracedAttribute {
  uint32_t tag = 0;
  std::optional<uint32_t> number;
  std::optional<std::string_view> text;

  friend bool operator==(const TracedAttribute&, const TracedAttribute&) = default;
};

/// Attributes that stand together in the section; they may hold of many owners.
struct TracedRun {
  std::string_view vendor;
  AttributeScope scope = Tag_File;
  std::vector<uint32_t> owners; ///< the numbers of the sections or symbols; empty for the file
  std::span<const uint8_t> bytes;
  /// Of the vendors whose tags are known; up to the first tag that can't be.
  std::vector<TracedAttribute> attributes;
};

/// Its texts and bytes are those of the sections that it was made from.
struct AttributeTable {
  std::vector<TracedRun> runs;

  /// Which of the runs hold of the file, and of each section and symbol, by its number.
  std::vector<size_t> global;
  std::map<uint32_t, std::vector<size_t>> sections;
  std::map<uint32_t, std::vector<size_t>> symbols;
};

/// Adds what the section says to the table, and the steps to the trace. Whether all of it was well
/// formed.
bool traceAttributeSection(AttributeTable& table, std::span<const uint8_t> section,
                           bool isLittleEndian, std::string& trace);

} // namespace elfext
