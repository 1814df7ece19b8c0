// SPDX-License-Identifier: Apache-2.0
//
// Who may do what with a file: owner, group, mode, access lists, and what else others have noted
// about it in extended attributes.
#pragma once

#include "support/interface/host.h"

namespace support {

/// Best effort: makes an open file as protected as the one of that name, of which the host has told
/// `status`.
void copyProtectionTo(int descriptor, const char* from, const FileStatus& status);

} // namespace support
