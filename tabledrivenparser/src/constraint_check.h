// SPDX-License-Identifier: Apache-2.0
//
// Whether a value may be stored, as far as tables can tell: the first of the three gates of
// value_store, before the client's validator and the listener.

#pragma once

#include "tabledrivenparser/interface/option_table.h"

#include <cstdint>
#include <string_view>

namespace tabledrivenparser {

// value is one element where the definition is a vector. A constraint without a usable node lets
// everything pass.
bool meetsConstraint(const ValueDefinition& definition, const Value& value, uint32_t tableMask);

// The usable entry of that name, whatever its case, or of that number; null if there is none.
const MatchString* findEnumerator(const Enumeration& enumeration, std::string_view name,
                                  uint32_t tableMask);
const MatchString* findEnumerator(const Enumeration& enumeration, int64_t number,
                                  uint32_t tableMask);

} // namespace tabledrivenparser
