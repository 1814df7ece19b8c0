// SPDX-License-Identifier: Apache-2.0
//
// What is known of one library.
#pragma once

#include "arlib/interface/archive.h"
#include "quarn-json/document.h"

namespace quarn_json {

// Puts an archive that was read into the document. What went wrong has been reported; the document
// is of no use then.
void putFacts(arlib::Archive& archive, Document& document);

} // namespace quarn_json
