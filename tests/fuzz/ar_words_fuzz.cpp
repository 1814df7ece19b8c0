// SPDX-License-Identifier: Apache-2.0
//
// Any bytes as a response file of quarn-ar, in either way of quoting, which may name itself and two
// more. Its words, all in quotes, are read back as they are; as a command line they are a request
// that can be done or are refused, and never both.
#include "messages/interface/messages.h"
#include "quarn-ar/command_line.h"
#include "quarn-ar/response_file.h"
#include "quarn/reporting.h"
#include "tests/fuzz/memory_bound.h"
#include "tests/fuzz/quoted_words.h"
#include "tests/fuzz/silence.h"
#include "tests/support/memory_host.h"

#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

namespace {

using namespace quarn_ar;
using Words = std::vector<std::string>;

void expect(bool condition) {
  if (!condition) std::abort();
}

std::string quotedForWindows(const Words& words) {
  std::string text;
  for (const std::string& word : words) {
    text += '"';
    size_t backslashes = 0;
    for (const char character : word) {
      if (character == '"') text.append(backslashes + 1, '\\');
      backslashes = character == '\\' ? backslashes + 1 : 0;
      text += character;
    }
    text.append(backslashes, '\\');
    text += "\" ";
  }
  return text;
}

void readBack(std::string_view text) {
  if (const auto words = splitWords(text, Quoting::Posix))
    expect(splitWords(fuzzing::quotedWords(*words), Quoting::Posix) == words);
  if (const auto words = splitWords(text, Quoting::Windows))
    expect(splitWords(quotedForWindows(*words), Quoting::Windows) == words);
}

void readRequest(Program program, const Words& words) {
  messages::initialise();
  Request request;
  const Answer answer = readCommandLine(program, words, request);
  expect((answer == Answer::Refused) == quarn::hasErrors());
  if (answer != Answer::Run) return;
  expect(request.operation != Operation::None);
  expect(!request.archives.empty() && !request.archives.front().empty());
  expect(program == Program::Ranlib || request.archives.size() == 1);
}

void expand(std::string_view text, Quoting quoting) {
  testsupport::MemoryHost host;
  host.addFile("f", text);
  host.addFile("g", std::string_view("@h rc 'lib.a"));
  host.addFile("h", std::string_view("x.o -v"));
  messages::initialise();
  Words words = {"@f"};
  const bool isDone = expandResponseFiles(host, quoting, words);
  expect(isDone != quarn::hasErrors() && host.openHandles() == 0);
  if (!isDone) return;
  for (const Program program : {Program::Ar, Program::Ranlib})
    readRequest(program, words);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  static const bool IsInitialised = fuzzing::silenceMessages();
  if (!IsInitialised) return 0;
  const fuzzing::MemoryBound bound(size);
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  readBack(text);
  expand(text, Quoting::Posix);
  expand(text, Quoting::Windows);
  return 0;
}
