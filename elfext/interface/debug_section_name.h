// SPDX-License-Identifier: Apache-2.0
#pragma once

namespace elfext {

/// Whether a section of that name holds debug information: one that starts with ".debug" or
/// ".line", or is "C$$fpmap". A null name doesn't.
[[nodiscard]] bool isDebugSectionName(const char* name);

} // namespace elfext
