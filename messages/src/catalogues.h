// SPDX-License-Identifier: Apache-2.0
// The built-in catalogues. All have the same keys and, for each, the same arguments, which a text
// may name in another order ("%2$s").
#pragma once

#include "messages/interface/catalogue.h"

namespace messages {

std::span<const CatalogueRow> englishCatalogue();
std::span<const CatalogueRow> japaneseCatalogue();

} // namespace messages
