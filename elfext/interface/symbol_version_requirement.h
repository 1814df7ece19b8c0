// SPDX-License-Identifier: Apache-2.0
//
// The version that a reference by a dynamic symbol wants: one row of the SHT_GNU_verneed section.
//
// From Elf_Vernaux, and from its Elf_Verneed the name of the file.
#pragma once

#include <cstdint>

namespace elfext {

struct SymbolVersionRequirement {
  /// vna_other: the number that the words of the versym section mean.
  uint32_t version;
  /// The module's own texts, maybe empty, never null: the version's, and the file's that has it.
  const char* versionName;
  const char* fileName;
  bool isHidden;
};

} // namespace elfext
