// SPDX-License-Identifier: Apache-2.0
//
// A path converter at work: a program that is told names, one a line, and answers each with a line
// of its own before it reads the next. It is somebody else's program: it may die, hang, answer
// nonsense or not exist, so that each step has a deadline and says how it went. What follows from
// that is decided in path_converter.h; how the program is run is the host's matter.

#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace support {

/// How a step of the dialogue went.
enum class ConverterReply : uint8_t {
  Done,
  Broken,   ///< the converter has gone, or is out of step: a fresh one may do better
  Late,     ///< the deadline has passed
  Unusable, ///< no line as it should be, or the host refuses: a fresh one would do the same
};

using ConverterDeadline = std::chrono::steady_clock::time_point;

/// Runs at most one converter at a time, which ends with this object at the latest. Texts are views
/// for the call.
class ConverterProcess {
public:
  virtual ~ConverterProcess() = default;

  /// Starts a converter; false if there is none to start. None must be running.
  [[nodiscard]] virtual bool start() = 0;

  /// Sends a line, with its end.
  [[nodiscard]] virtual ConverterReply send(std::string_view line, ConverterDeadline deadline) = 0;

  /// Reads a line, and stores it with its end. One that takes more than `longest` bytes is
  /// unusable, and so is more than one; half a line in front of the converter's end is broken.
  [[nodiscard]] virtual ConverterReply readLine(std::string& line, size_t longest,
                                                ConverterDeadline deadline) = 0;

  /// Ends the converter at once, with all that it has started. Does nothing where none runs.
  virtual void end() = 0;
};

} // namespace support
