// SPDX-License-Identifier: Apache-2.0
//
// One row for each call; one that has no row can be killed at, and get signals, but does not fail.
#include "tests/disturbed/system_calls.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <fcntl.h>
#include <sys/syscall.h>

namespace disturbed {

namespace {

struct CallRow {
  long number;
  const char* name;
  CallKind kind;
};

// clang-format off
constexpr CallRow CallRows[] = {
    {SYS_access,          "access",          CallKind::FileStatus},
    {SYS_brk,             "brk",             CallKind::Memory},
    {SYS_chmod,           "chmod",           CallKind::Attributes},
    {SYS_clock_nanosleep, "clock_nanosleep", CallKind::Other},
    {SYS_close,           "close",           CallKind::Close},
    {SYS_copy_file_range, "copy_file_range", CallKind::Write},
    {SYS_creat,           "creat",           CallKind::Open},
    {SYS_dup,             "dup",             CallKind::Lock},
    {SYS_dup2,            "dup2",            CallKind::Lock},
    {SYS_exit_group,      "exit_group",      CallKind::Other},
    {SYS_faccessat,       "faccessat",       CallKind::FileStatus},
    {SYS_faccessat2,      "faccessat2",      CallKind::FileStatus},
    {SYS_fchmod,          "fchmod",          CallKind::Attributes},
    {SYS_fchown,          "fchown",          CallKind::Attributes},
    {SYS_fcntl,           "fcntl",           CallKind::Lock},
    {SYS_flock,           "flock",           CallKind::Lock},
    {SYS_fstat,           "fstat",           CallKind::FileStatus},
    {SYS_fsync,           "fsync",           CallKind::Write},
    {SYS_ftruncate,       "ftruncate",       CallKind::Write},
    {SYS_futex,           "futex",           CallKind::Other},
    {SYS_getdents64,      "getdents64",      CallKind::Listing},
    {SYS_getpid,          "getpid",          CallKind::Other},
    {SYS_getrandom,       "getrandom",       CallKind::Other},
    {SYS_gettid,          "gettid",          CallKind::Other},
    {SYS_link,            "link",            CallKind::Name},
    {SYS_linkat,          "linkat",          CallKind::Name},
    {SYS_lseek,           "lseek",           CallKind::Position},
    {SYS_lstat,           "lstat",           CallKind::FileStatus},
    {SYS_mkdir,           "mkdir",           CallKind::Name},
    {SYS_mmap,            "mmap",            CallKind::Memory},
    {SYS_mremap,          "mremap",          CallKind::Memory},
    {SYS_munmap,          "munmap",          CallKind::Other},
    {SYS_newfstatat,      "newfstatat",      CallKind::FileStatus},
    {SYS_open,            "open",            CallKind::Open},
    {SYS_openat,          "openat",          CallKind::Open},
    {SYS_pread64,         "pread64",         CallKind::Read},
    {SYS_pwrite64,        "pwrite64",        CallKind::Write},
    {SYS_read,            "read",            CallKind::Read},
    {SYS_readlink,        "readlink",        CallKind::LinkText},
    {SYS_readlinkat,      "readlinkat",      CallKind::LinkText},
    {SYS_readv,           "readv",           CallKind::Read},
    {SYS_rename,          "rename",          CallKind::Name},
    {SYS_renameat,        "renameat",        CallKind::Name},
    {SYS_renameat2,       "renameat2",       CallKind::Name},
    {SYS_rt_sigaction,    "rt_sigaction",    CallKind::Other},
    {SYS_rt_sigprocmask,  "rt_sigprocmask",  CallKind::Other},
    {SYS_sendfile,        "sendfile",        CallKind::Write},
    {SYS_stat,            "stat",            CallKind::FileStatus},
    {SYS_statx,           "statx",           CallKind::FileStatus},
    {SYS_tgkill,          "tgkill",          CallKind::Other},
    {SYS_unlink,          "unlink",          CallKind::Remove},
    {SYS_unlinkat,        "unlinkat",        CallKind::Remove},
    {SYS_utimensat,       "utimensat",       CallKind::Attributes},
    {SYS_write,           "write",           CallKind::Write},
    {SYS_writev,          "writev",          CallKind::Write},
};
// clang-format on

const CallRow* findRow(long number) {
  const auto* const row = std::find_if(std::begin(CallRows), std::end(CallRows),
                                       [&](const CallRow& each) { return each.number == number; });
  return row == std::end(CallRows) ? nullptr : row;
}

struct NamedNumber {
  int number;
  const char* name;
};

constexpr NamedNumber Errors[] = {
    {EACCES, "EACCES"}, {EDQUOT, "EDQUOT"}, {EINTR, "EINTR"},   {EIO, "EIO"},
    {EMFILE, "EMFILE"}, {ENOLCK, "ENOLCK"}, {ENOMEM, "ENOMEM"}, {ENOSPC, "ENOSPC"},
    {EPERM, "EPERM"},   {ESTALE, "ESTALE"},
};

constexpr NamedNumber Signals[] = {
    {SIGALRM, "SIGALRM"}, {SIGHUP, "SIGHUP"},   {SIGINT, "SIGINT"},
    {SIGPIPE, "SIGPIPE"}, {SIGQUIT, "SIGQUIT"}, {SIGTERM, "SIGTERM"},
    {SIGUSR1, "SIGUSR1"}, {SIGUSR2, "SIGUSR2"}, {SIGXCPU, "SIGXCPU"},
};

std::string nameOf(std::span<const NamedNumber> rows, int number) {
  const auto row = std::find_if(rows.begin(), rows.end(),
                                [&](const NamedNumber& each) { return each.number == number; });
  return row == rows.end() ? std::to_string(number) : row->name;
}

int numberOf(std::span<const NamedNumber> rows, const std::string& name) {
  const auto row = std::find_if(rows.begin(), rows.end(),
                                [&](const NamedNumber& each) { return name == each.name; });
  return row == rows.end() ? 0 : row->number;
}

bool isWaitingForLock(const SystemCall& call) {
  return call.number == SYS_flock ||
         (call.number == SYS_fcntl && call.arguments[1] == F_OFD_SETLKW);
}

bool mayMakeFile(const SystemCall& call) {
  return call.number == SYS_creat ||
         (call.arguments[call.number == SYS_openat ? 2 : 1] & O_CREAT) != 0;
}

std::vector<int> errorsOfOpen(const SystemCall& call) {
  std::vector<int> errors = {EACCES, EMFILE, EIO, ENOMEM, ESTALE, EINTR};
  if (mayMakeFile(call)) errors.insert(errors.end(), {ENOSPC, EDQUOT});
  return errors;
}

} // namespace

CallKind SystemCall::kind() const {
  const CallRow* row = findRow(number);
  return row == nullptr ? CallKind::Other : row->kind;
}

std::string SystemCall::name() const {
  const CallRow* row = findRow(number);
  return row == nullptr ? "call_" + std::to_string(number) : row->name;
}

std::vector<int> SystemCall::errors() const {
  switch (kind()) {
  case CallKind::Open:
    return errorsOfOpen(*this);
  case CallKind::Read:
    return {EIO, ESTALE, ENOMEM, EINTR};
  case CallKind::Write:
    return {ENOSPC, EIO, EDQUOT, ESTALE, EINTR};
  case CallKind::Close:
    return {EIO, ENOSPC, EDQUOT, EINTR};
  case CallKind::FileStatus:
    return {EIO, EACCES, ENOMEM, ESTALE};
  case CallKind::LinkText:
    return {EIO, EACCES, ENOMEM};
  case CallKind::Name:
    return {EIO, EACCES, ENOSPC, EDQUOT, ENOMEM, ESTALE};
  case CallKind::Remove:
    return {EIO, EACCES, ESTALE};
  case CallKind::Attributes:
    return {EIO, EPERM};
  case CallKind::Lock:
    if (isWaitingForLock(*this)) return {ENOLCK, ENOMEM, EINTR};
    return {EMFILE};
  case CallKind::Position:
    return {EIO};
  case CallKind::Memory:
    return {ENOMEM};
  case CallKind::Listing:
    return {EIO, ENOMEM};
  case CallKind::Other:
    break;
  }
  return {};
}

bool SystemCall::isCounted() const {
  return number == SYS_read || number == SYS_pread64 || number == SYS_write ||
         number == SYS_pwrite64;
}

std::string errorName(int error) {
  return nameOf(Errors, error);
}

std::string signalName(int signal) {
  return nameOf(Signals, signal);
}

int errorOfName(const std::string& name) {
  return numberOf(Errors, name);
}

int signalOfName(const std::string& name) {
  return numberOf(Signals, name);
}

} // namespace disturbed
