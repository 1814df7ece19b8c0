// SPDX-License-Identifier: Apache-2.0
//
// How a program begins, where hosts differ in it.

#pragma once

#include "support/interface/host.h"

namespace support {

/// The words that a program was started with, as `main` has them.
struct CommandLine {
  int argc;
  const char* const* argv;
};

/// The words in UTF-8: on Windows `main` gets them in the code page of the machine, which has not
/// every character. They live as long as the process.
[[nodiscard]] CommandLine getCommandLine(int argc, const char* const* argv);

/// The host of a program: getNativeHost(), and on Windows, where the environment variable CYGPATH
/// names a path converter, that with each name converted.
[[nodiscard]] Host& getProgramHost();

} // namespace support
