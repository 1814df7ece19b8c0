// SPDX-License-Identifier: Apache-2.0
//
// Which segment a section without bytes in the file belongs to. Taken in their order, segments are
// judged in one of two ways. Most must have the section's offset in their bytes and room for its
// size; the first such one is a candidate, which only a later one that also has the section's
// addresses replaces, unless the candidate has them. Segments of other types must end where the
// section is and have room for it behind their bytes; the first such one is taken at once.
#pragma once

#include "elfext/src/bytes/elf_records.h"

#include <cstdint>
#include <span>
#include <vector>

namespace elfext {

// For each section the index of its segment; NoExtent for none, and for null sections and those
// with bytes.
[[nodiscard]] std::vector<uint32_t> findSegments(std::span<const SectionHeader> sections,
                                                 std::span<const ProgramHeader> segments,
                                                 uint32_t osAbi);

} // namespace elfext
