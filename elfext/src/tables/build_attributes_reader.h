// SPDX-License-Identifier: Apache-2.0
//
// Build attributes, from the two places where objects state them. A section of a new enough tool
// outranks decoration symbols, and these outrank the section of an older one.
//
// Both roads end here: the outline with a store of its own, the model with its module.
#pragma once

#include "elfext/src/tables/attribute_store.h"
#include "elfext/src/tables/object_tables.h"

namespace elfext {

// The last step of a read. False ends it.
[[nodiscard]] bool readBuildAttributes(ObjectTables& tables, AttributeStore& store);

} // namespace elfext
