// SPDX-License-Identifier: Apache-2.0
//
// The version under which a dynamic symbol is defined.
//
// From the symbol's word in the SHT_GNU_versym section, whose number a definition of the file has.
#pragma once

namespace elfext {

struct FileVersionDefinition;

struct SymbolVersionDefinition {
  const FileVersionDefinition* version;
  /// Only references that name the version reach the symbol.
  bool isHidden;
};

} // namespace elfext
