// SPDX-License-Identifier: Apache-2.0
//
// The system calls that our programs make, and what each can be answered with when things go wrong.

#pragma once

#include <span>
#include <string>
#include <vector>

namespace disturbed {

enum class CallKind {
  Open,
  Read,
  Write,
  Close,
  FileStatus,
  LinkText,
  Name,   // gives a file a name, or another one
  Remove, // takes a name away
  Attributes,
  Lock, // and the other controls of a descriptor
  Position,
  Memory,
  Listing,
  Other, // nothing of it goes wrong
};

// One call as it was made.
struct SystemCall {
  long number = -1;
  long arguments[3] = {};
  long result = 0;              // negative: an error number
  bool isToErrorStream = false; // a write whose failure can't be told of
  [[nodiscard]] CallKind kind() const;
  [[nodiscard]] std::string name() const;
  // The errors that it may end with.
  [[nodiscard]] std::vector<int> errors() const;
  // Whether its third argument is a number of bytes of which it may move fewer.
  [[nodiscard]] bool isCounted() const;
};

// ENOSPC and its kin, as words of a command line.
[[nodiscard]] std::string errorName(int error);
[[nodiscard]] std::string signalName(int signal);
// 0 if there is none of this name.
[[nodiscard]] int errorOfName(const std::string& name);
[[nodiscard]] int signalOfName(const std::string& name);

} // namespace disturbed
