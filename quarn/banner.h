// SPDX-License-Identifier: Apache-2.0
//
// What the tool says of itself, where there is nothing to do or help was asked for.
#pragma once

namespace quarn {

enum class BannerMode { WithHelp, Alone };

// Prints which build this is, and the help, on stdout. `toolName` is the name
// that the user called the tool by.
void showBanner(BannerMode mode, const char* toolName);

} // namespace quarn
