// SPDX-License-Identifier: Apache-2.0
//
// The files that this process has made and not finished. They stand in a small table until they are
// renamed, removed or whole, so that nothing of them stays when the process ends before, by a
// signal or by its own decision.
#pragma once

#include <csignal>
#include <sys/stat.h>

namespace support {

/// Holds back the signals that end the process while it lives: while the table and the disk
/// disagree.
class SignalHold {
public:
  SignalHold();
  ~SignalHold();
  SignalHold(const SignalHold&) = delete;
  SignalHold& operator=(const SignalHold&) = delete;

private:
  sigset_t m_Before;
};

inline constexpr int NoDescriptor = -1;

/// Enters a file; where there is no room, or the name is too long, it is simply not removed. One
/// that is written in its own place has the descriptor that it is written through.
void enterUnfinished(const char* name, const struct stat& file, int descriptor = NoDescriptor);

/// The name is none of an unfinished file any more.
void forgetUnfinished(const char* name);

/// What is written through the descriptor has come to its end: it is kept, or removed.
void endUnfinished(int descriptor, bool isKept);

/// Removes all that the table holds. A name that leads to another file by now is left alone. Calls
/// nothing that a signal handler may not call.
void removeUnfinishedFiles();

} // namespace support
