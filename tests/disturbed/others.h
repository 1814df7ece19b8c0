// SPDX-License-Identifier: Apache-2.0
//
// Somebody else at work on a file that a run uses.

#pragma once

#include "tests/disturbed/fault.h"

#include <string>

namespace disturbed {

// Does to the file in the folder what the fault says. A file that is not there can only be put
// there. Afterwards it has a date of its own, the same one on every day.
void changeFile(const std::string& folder, const Fault& fault, const std::string& replacement);

} // namespace disturbed
