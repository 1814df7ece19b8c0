// SPDX-License-Identifier: Apache-2.0
//
// The table is walked with `lstat` and `unlink` alone, which are allowed in a signal handler, so
// its names have fixed places. A file is removed only where the name still leads to it itself: not
// to a link, and not to what somebody else has put there.
//
// A fault of our own (an access violation, a full stack) takes the same way out as Ctrl-C, on a
// stack that is kept for it. The signal then does what it would have done without us, so that the
// caller's shell, a debugger or a sanitizer sees what has ended the process.
#include "support/src/posix_unfinished.h"

#include "support/interface/host.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>
#include <unistd.h>

namespace support {

namespace {

// Not those of real time, which only programs send each other that have agreed on it.
constexpr std::array EndingSignals = {
    SIGINT,  SIGTERM, SIGHUP,    SIGPIPE, SIGQUIT, SIGXCPU, SIGALRM, SIGVTALRM, SIGPROF,
    SIGUSR1, SIGUSR2, SIGABRT,   SIGSEGV, SIGBUS,  SIGFPE,  SIGILL,  SIGSYS,    SIGTRAP,
#ifdef __linux__
    SIGIO,   SIGPWR,  SIGSTKFLT,
#endif
};

// One archive is written and one member extracted at a time, and members rarely have temporaries of
// their own.
constexpr size_t MaximumUnfinished = 16;
constexpr size_t MaximumName = 4096;

struct Unfinished {
  volatile sig_atomic_t isUsed = 0;
  int descriptor = NoDescriptor;
  dev_t device = 0;
  ino_t inode = 0;
  char name[MaximumName] = {};
};

std::array<Unfinished, MaximumUnfinished> unfinishedFiles;

// What each signal did before, by its place in EndingSignals.
std::array<struct sigaction, EndingSignals.size()> actionsBefore;

constexpr size_t HandlerStackSize = 0x10000;
alignas(16) std::array<uint8_t, HandlerStackSize> handlerStack;

void removeIfStillThere(const Unfinished& entry) {
  struct stat now;
  if (lstat(entry.name, &now) != 0) return;
  if (now.st_dev == entry.device && now.st_ino == entry.inode) unlink(entry.name);
}

void restoreAction(int signal) {
  const auto* const place = std::find(EndingSignals.begin(), EndingSignals.end(), signal);
  sigaction(signal, &actionsBefore[static_cast<size_t>(place - EndingSignals.begin())], nullptr);
}

bool isFault(int signal) {
  return signal == SIGSEGV || signal == SIGBUS || signal == SIGFPE || signal == SIGILL;
}

extern "C" void removeUnfinishedAndEnd(int signal, siginfo_t* info, void*) {
  removeUnfinishedFiles();
  restoreAction(signal);
  // A true fault comes again when the instruction is taken up again, and then with its reason.
  if (isFault(signal) && info->si_code > 0) return;
  std::raise(signal);
}

void useOwnStack() {
  stack_t before;
  if (sigaltstack(nullptr, &before) != 0 || (before.ss_flags & SS_DISABLE) == 0) return;
  stack_t own = {};
  own.ss_sp = handlerStack.data();
  own.ss_size = handlerStack.size();
  sigaltstack(&own, nullptr);
}

} // namespace

SignalHold::SignalHold() {
  sigset_t ending;
  sigemptyset(&ending);
  for (const int signal : EndingSignals)
    sigaddset(&ending, signal);
  sigprocmask(SIG_BLOCK, &ending, &m_Before);
}

SignalHold::~SignalHold() {
  sigprocmask(SIG_SETMASK, &m_Before, nullptr);
}

void enterUnfinished(const char* name, const struct stat& file, int descriptor) {
  const size_t length = std::strlen(name);
  if (length >= MaximumName) return;
  for (Unfinished& entry : unfinishedFiles) {
    if (entry.isUsed != 0) continue;
    entry.descriptor = descriptor;
    entry.device = file.st_dev;
    entry.inode = file.st_ino;
    std::memcpy(entry.name, name, length + 1);
    entry.isUsed = 1;
    return;
  }
}

void forgetUnfinished(const char* name) {
  for (Unfinished& entry : unfinishedFiles) {
    if (entry.isUsed != 0 && std::strcmp(entry.name, name) == 0) entry.isUsed = 0;
  }
}

void endUnfinished(int descriptor, bool isKept) {
  for (Unfinished& entry : unfinishedFiles) {
    if (entry.isUsed == 0 || entry.descriptor != descriptor) continue;
    if (!isKept) removeIfStillThere(entry);
    entry.isUsed = 0;
  }
}

void removeUnfinishedFiles() {
  for (Unfinished& entry : unfinishedFiles) {
    if (entry.isUsed != 0) removeIfStillThere(entry);
    entry.isUsed = 0;
  }
}

void installSignalCleanUp() {
  useOwnStack();
  struct sigaction action = {};
  action.sa_sigaction = removeUnfinishedAndEnd;
  action.sa_flags = SA_SIGINFO | SA_ONSTACK | SA_RESTART;
  for (size_t i = 0; i < EndingSignals.size(); ++i) {
    struct sigaction& before = actionsBefore[i];
    if (sigaction(EndingSignals[i], &action, &before) != 0) continue;
    // A signal that the parent process ignores (a job in the background) stays ignored; one that
    // comes before this line finds nothing to remove, and is ignored in the end as well.
    if (before.sa_handler == SIG_IGN) sigaction(EndingSignals[i], &before, nullptr);
  }
  // The write then fails with EFBIG, and the clean-up of a failed write runs as for a full disk.
  std::signal(SIGXFSZ, SIG_IGN);
}

} // namespace support
