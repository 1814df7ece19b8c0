// SPDX-License-Identifier: Apache-2.0
//
// Where relocations stand in the file: in which relocation section, and in which row. One that was
// read stays in the section that it came from, for as long as it is of that section's kind; any
// other is in the first section for its kind. Rows have the order of the target's list, so those
// behind a relocation that goes or comes move.
#pragma once

#include <cstdint>
#include <vector>

namespace elfext {

class RelocationSection;
class Section;

struct RelocationPlace {
  const RelocationSection* section; // null where the target has none for the relocation's kind
  uint32_t row;                     // without a section, the place in the target's list
};

// Of all relocations of the target, in the order of its list.
[[nodiscard]] std::vector<RelocationPlace> findRelocationPlaces(Section& target);

} // namespace elfext
