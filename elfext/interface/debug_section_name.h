// SPDX-License-Identifier: Apache-2.0
//
// What counts as debug information, by the name of its section: one rule for sizes, for debug
// overlays and for the archive's symbol table.
#pragma once

namespace elfext {

/// Whether a section of that name holds debug information: one that starts with ".debug" or
/// ".line", or is "C$$fpmap". A null name doesn't.
[[nodiscard]] bool isDebugSectionName(const char* name);

} // namespace elfext
