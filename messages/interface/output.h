// SPDX-License-Identifier: Apache-2.0
//
// The two streams of the process. All text and all raw bytes for stdout pass through one buffer,
// so that they come out in the order in which they were written; stderr has no buffer, and stdout
// is flushed before each write to it. In the tool both are private duplicates of the descriptors:
// a file that is opened later can never get the number of a closed stdout and be written into.
//
// Names in archives come out here, and somebody may have chosen them to do harm: as text no control
// byte passes but tab and line feed. The contents of a member that is printed go out raw.

#pragma once

#include "messages/interface/output_sink.h"

#include <cstdint>
#include <string_view>

namespace messages {

enum class Stream : uint8_t { Output, Error };

/// Duplicates stdout and stderr, unless this was done before. What is written to a stream that is
/// closed at this moment is dropped silently.
void openStreams();

/// Flushes stdout and closes both duplicates; what is written afterwards is dropped.
void closeStreams();

/// Puts other sinks in place of the descriptors; null brings the descriptor back. The sinks belong
/// to the caller and must outlive their use. What is still buffered goes to the sink it was
/// written for, and earlier failures of the streams are forgotten.
void setOutputSinks(OutputSink* output, OutputSink* error);

/// Writes a text with its control bytes as backslash and three octal digits, other than tab and
/// line feed, in the code page of the locale. In UTF-8 bytes above 127 pass as they are; in any
/// other page "?" stands for characters that it lacks, and for bytes that are no UTF-8.
void writeText(Stream stream, std::string_view text);

/// Writes bytes to stdout unchanged.
void writeRaw(std::string_view bytes);

/// Keeps what is written to both streams until it is known whether it is true: a run that finds
/// itself overtaken drops it and starts over. Too much of it, or the end of the process, and it
/// comes out.
class HeldOutput {
public:
  HeldOutput() = default;
  /// What is still held comes out.
  ~HeldOutput() { release(); }
  HeldOutput(const HeldOutput&) = delete;
  HeldOutput& operator=(const HeldOutput&) = delete;

  /// From now on.
  void hold();
  /// Lets what is held come out; what follows is written at once again.
  void release();
  /// Whether anything that is written now would be kept.
  [[nodiscard]] static bool isOn();
  /// Forgets what was written since `hold`. False if some of it is out already.
  [[nodiscard]] bool drop();
};

/// Call at every way out of the process. False if stdout has failed, now or earlier.
bool flushAll();

/// The same where nothing more is going to be printed: some failures show at the close alone, and
/// stderr is still there to tell of them.
bool finishOutput();

/// Whether a write to stdout failed; from then on everything for stdout is dropped.
[[nodiscard]] bool hasStdoutFailed();
/// Whether a write to stderr failed. The next one is tried all the same.
[[nodiscard]] bool hasStderrFailed();
/// The host's error number of stdout's failure, or 0.
[[nodiscard]] int getStdoutError();

} // namespace messages
