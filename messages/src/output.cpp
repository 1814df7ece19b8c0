// SPDX-License-Identifier: Apache-2.0
//
// The two streams, and the one routine that every text passes. The way of a text: control bytes
// escaped, then into the code page of the output, held back while a run may yet be dropped, then
// into the buffer of stdout or straight to stderr. stdout is flushed before each write to stderr,
// so that on a terminal a complaint comes behind the lines that were listed before it.
//
// A failure of stdout is remembered and told by the driver as an error of the run; one of stderr
// can't be told to anybody, and shows in the exit status alone.

#include "messages/interface/output.h"

#include "messages/src/descriptor_sink.h"
#include "messages/src/output_buffer.h"
#include "messages/src/output_page.h"
#include "support/interface/descriptor.h"

#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace messages {

namespace {

constinit DescriptorSink outputDescriptor;
constinit DescriptorSink errorDescriptor;
constinit OutputBuffer outputBuffer(&outputDescriptor);
constinit OutputSink* errorSink = &errorDescriptor;
constinit bool hasErrorSinkFailed = false;

// What is held back, in the order in which it was written.
struct HeldPiece {
  Stream stream;
  std::string bytes;
};

// A run that prints a whole library must not keep all of it in memory to be able to take it back.
constexpr size_t MostHeld = 0x100000; // bytes

struct Hold {
  bool isOn = false;
  size_t size = 0;
  std::vector<HeldPiece> pieces = {};
};

constinit Hold currentHold;

// A name with such a byte could otherwise move the cursor, or change a terminal's settings. Nothing
// is left out by a shortcut here, so that the compiler tests many bytes at a time.
bool mustBeEscaped(char character) {
  const auto byte = static_cast<unsigned char>(character);
  const bool isControl = byte < 32;
  const bool isTabOrLineFeed = (byte == '\t') | (byte == '\n');
  return (isControl & !isTabOrLineFeed) | (byte == 127);
}

bool hasBytesToEscape(std::string_view text) {
  uint8_t isFound = 0;
  for (const char character : text)
    isFound |= mustBeEscaped(character);
  return isFound != 0;
}

char octalDigit(unsigned value) {
  return static_cast<char>('0' + (value & 7));
}

std::string escaped(std::string_view text) {
  std::string result;
  for (const char character : text) {
    if (!mustBeEscaped(character)) {
      result += character;
      continue;
    }
    const unsigned byte = static_cast<unsigned char>(character);
    result += {'\\', octalDigit(byte >> 6), octalDigit(byte >> 3), octalDigit(byte)};
  }
  return result;
}

void passOn(Stream stream, std::string_view bytes) {
  if (stream == Stream::Output) {
    outputBuffer.append(bytes);
    return;
  }
  outputBuffer.flush();
  hasErrorSinkFailed |= errorSink->write(bytes) != 0;
}

void releaseHeld() {
  Hold& hold = currentHold;
  hold.isOn = false;
  for (const HeldPiece& piece : std::exchange(hold.pieces, {})) {
    passOn(piece.stream, piece.bytes);
  }
}

void writeBytes(Stream stream, std::string_view bytes) {
  Hold& hold = currentHold;
  if (hold.isOn) hold.size += bytes.size();
  // What is out can't be taken back: from here on `drop` answers false.
  if (hold.isOn && hold.size > MostHeld) releaseHeld();
  if (!hold.isOn) {
    passOn(stream, bytes);
    return;
  }
  if (hold.pieces.empty() || hold.pieces.back().stream != stream)
    hold.pieces.push_back({stream, {}});
  hold.pieces.back().bytes += bytes;
}

} // namespace

void openStreams() {
  outputDescriptor.open(support::OutputDescriptor);
  errorDescriptor.open(support::ErrorDescriptor);
}

void HeldOutput::hold() {
  currentHold = {.isOn = true};
}

void HeldOutput::release() {
  releaseHeld();
}

bool HeldOutput::isOn() {
  return currentHold.isOn;
}

bool HeldOutput::drop() {
  const bool isDropped = currentHold.isOn;
  currentHold = {};
  return isDropped;
}

bool finishOutput() {
  flushAll();
  outputBuffer.noteError(outputDescriptor.close());
  return !hasStdoutFailed();
}

void closeStreams() {
  finishOutput();
  hasErrorSinkFailed |= errorDescriptor.close() != 0;
}

void setOutputSinks(OutputSink* output, OutputSink* error) {
  outputBuffer.setSink(output ? output : &outputDescriptor);
  errorSink = error ? error : &errorDescriptor;
  hasErrorSinkFailed = false;
}

void writeText(Stream stream, std::string_view text) {
  if (hasBytesToEscape(text)) {
    writeBytes(stream, inOutputPage(escaped(text)));
    return;
  }
  writeBytes(stream, inOutputPage(text));
}

void writeRaw(std::string_view bytes) {
  writeBytes(Stream::Output, bytes);
}

bool flushAll() {
  releaseHeld();
  outputBuffer.flush();
  return !hasStdoutFailed();
}

bool hasStdoutFailed() {
  return outputBuffer.getError() != 0;
}

bool hasStderrFailed() {
  return hasErrorSinkFailed;
}

int getStdoutError() {
  return outputBuffer.getError();
}

} // namespace messages
