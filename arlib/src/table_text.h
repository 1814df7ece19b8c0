// SPDX-License-Identifier: Apache-2.0
//
// A table that was made and is not written yet: not its bytes, but what these are put together from
// when somebody wants them. Thousands of names may share their bytes, in an object or in an archive
// that was read, so that a table of two gigabytes can come of one megabyte.
#pragma once

#include "alloclib/interface/region_objects.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>
#include <utility>
#include <vector>

namespace arlib {

// Bytes as they are, and behind them texts, each with an ending that it shares with its neighbours.
class TableText {
public:
  // How far somebody has come.
  struct Place {
    size_t headAt = 0;
    size_t run = 0;
    size_t text = 0;
    size_t textAt = 0; // in the text with its ending
  };

  // Texts and endings are views of what is in the region, or lives longer than the table.
  explicit TableText(alloclib::RegionOwner region) : m_Region(std::move(region)) {}

  void addHead(std::vector<uint8_t> bytes) { m_Head = std::move(bytes); }
  // Texts of that many bytes in all, without their endings, which are not empty.
  void addTexts(std::span<const std::string_view> texts, uint64_t textSize,
                std::string_view ending);

  [[nodiscard]] uint64_t getSize() const { return m_Head.size() + m_TextsSize; }

  // Fills the room with the bytes at the place, which moves on. How many they are: the room is
  // filled but at the end.
  size_t take(std::span<uint8_t> room, Place& place) const;

private:
  struct Run {
    std::span<const std::string_view> texts;
    std::string_view ending;
  };

  alloclib::RegionOwner m_Region;
  std::vector<uint8_t> m_Head;
  std::vector<Run> m_Runs;
  uint64_t m_TextsSize = 0;
};

} // namespace arlib
