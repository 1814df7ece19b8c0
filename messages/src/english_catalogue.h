// SPDX-License-Identifier: Apache-2.0
// The built-in catalogue "en_US".
#pragma once

#include "messages/interface/catalogue.h"

namespace messages {

std::span<const CatalogueRow> englishCatalogue();

} // namespace messages
