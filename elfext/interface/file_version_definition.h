// SPDX-License-Identifier: Apache-2.0
//
// A version that a shared library defines: one row of its SHT_GNU_verdef section. The row for the
// library itself, its base version, is known to the module; the others to their symbols.
//
// From Elf_Verdef: vd_ndx, vd_flags, and the name of the first Elf_Verdaux.
#pragma once

#include <cstdint>

namespace elfext {

struct FileVersionDefinition {
  /// The text of the first name record; the module's own, maybe empty, never null.
  const char* name;
  /// vd_ndx: the number that the words of the versym section mean.
  uint32_t index;
  /// vd_flags.
  uint32_t flags;
};

} // namespace elfext
