// SPDX-License-Identifier: Apache-2.0
//
// A path converter as a process of this host. The user names the program; all that it is ever told
// is "cygpath -w -f -": write the host's names for those that come on the standard input. It ends
// with the tool, however that ends.

#pragma once

#include "support/interface/converter_process.h"

#include <memory>
#include <string>

namespace support {

/// A process for the program of that name. One with a "\", "/" or ":" in it says where the program
/// lies; any other is looked for in the folders of PATH, and nowhere else. ".exe" may be left out.
[[nodiscard]] std::unique_ptr<ConverterProcess> makeConverterProcess(std::wstring program);

} // namespace support
