// SPDX-License-Identifier: Apache-2.0
//
// `quarn-json`: all that `quarn` shows of libraries, as one JSON document for other programs. What
// its fields mean is in docs/quarn-json.md, and docs/quarn-json.schema.json is their schema.
#pragma once

#include "alloclib/interface/region_general.h"
#include "support/interface/host.h"

namespace quarn_json {

// The work of one run.
void jsonMain(int argc, const char* const* argv, const char* toolName, support::Host& host,
              alloclib::RegionGeneral& memory);

} // namespace quarn_json
