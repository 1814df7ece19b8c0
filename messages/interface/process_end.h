// SPDX-License-Identifier: Apache-2.0
//
// How the process ends when a message decides so: one error too many, a fatal report, a fault. The
// driver owns the ordered shut-down and hangs it in here, since this library stands below it.

#pragma once

namespace messages {

/// Must not return; a test may throw out of it.
using ExitHandler = void (*)(int status);

/// Null brings back the default, which flushes the streams and exits.
void setExitHandler(ExitHandler handler);

/// Calls the exit handler. Should the shut-down itself fail and come back here, the process ends at
/// once, with only the streams flushed.
[[noreturn]] void endProcess(int status);

} // namespace messages
