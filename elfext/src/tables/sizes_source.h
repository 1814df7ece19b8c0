// SPDX-License-Identifier: Apache-2.0
//
// What the size statistics look at, be it taken from a model or from an object's tables.
//
// Sizes and offsets are bytes and may be any number that a header can hold.
#pragma once

#include "elfext/interface/sizes_statistics.h"

#include <cstdint>
#include <functional>
#include <optional>
#include <vector>

namespace elfext {

struct SizesSource {
  // Bytes in the file; `size` is 0 for what has none there.
  struct FileRange {
    uint64_t offset = 0;
    uint64_t size = 0;
  };
  struct SectionSize {
    const char* name; // null for none
    uint32_t type;
    uint32_t flags;
    uint64_t size;
    // What it comes to when the image is loaded.
    uint64_t expandedSize;
  };
  // A mapping symbol of an executable section.
  struct MappingSymbol {
    uint32_t section;
    uint64_t offset;
    const char* name;
  };
  struct SegmentSize {
    uint32_t type;
    uint32_t flags;
    FileRange range;
    uint64_t memorySize;
  };
  // Bytes of a segment that belong to no section and no header.
  struct RawData {
    uint64_t size;
    bool isZero;
  };

  std::vector<SectionSize> sections = {};
  // In the order of the symbol tables.
  std::vector<MappingSymbol> mappingSymbols = {};
  std::vector<SegmentSize> segments = {};
  std::vector<RawData> rawData = {};
  // Of sections, raw data and the three headers, which count also where they are empty; only looked
  // at where there are segments.
  std::vector<FileRange> occupied = {};
};

// Whether all of the bytes, which are looked at in pieces, are zero; nothing if `view`, which
// answers the bytes of a piece or null, can't have them.
[[nodiscard]] std::optional<bool>
isAllZero(uint64_t size,
          const std::function<const uint8_t*(uint64_t offset, uint64_t count)>& view);

[[nodiscard]] SizesStatistics computeSizesStatistics(SizesSource source);

} // namespace elfext
