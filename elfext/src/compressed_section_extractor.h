// SPDX-License-Identifier: Apache-2.0
//
// Linked images may hold their initialised data compressed, as a table of regions between
// "Region$$Table$$Base" and "Region$$Table$$Limit" says. Objects that are still to be linked, and
// images without symbols, have no such table.
#pragma once

#include "elfext/interface/object_module.h"

#include <cstdint>

namespace elfext {

class CompressedSectionExtractor {
public:
  explicit CompressedSectionExtractor(ObjectModule& module);

  // Whether the image has a region table.
  [[nodiscard]] bool isActive() const { return m_IsActive; }
  // Whether the section is stored compressed. No compression scheme is known here, so none is; the
  // size, in bytes, would be that after expansion.
  [[nodiscard]] bool isCompressed(const Section&, uint64_t*) const { return false; }

private:
  bool m_IsActive;
};

} // namespace elfext
