// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "elfext/interface/symbol.h"

namespace elfext {

// The class of a symbol of that name; a null name is that of an ordinary one.
[[nodiscard]] Symbol::Class classOf(const char* name);

} // namespace elfext
