// SPDX-License-Identifier: Apache-2.0
//
// The version under which a dynamic symbol is defined.
#pragma once

namespace elfext {

struct FileVersionDefinition;

struct SymbolVersionDefinition {
  const FileVersionDefinition* version;
  /// Only references that name the version reach the symbol.
  bool isHidden;
};

} // namespace elfext
