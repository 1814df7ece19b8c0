// SPDX-License-Identifier: Apache-2.0
//
// Any bytes as a via file. The pieces in which it is read make no difference; without its comments
// it is the same text in memory, as far as the buffer reaches; and its words, all in quotes, are
// read back as they are.
#include "alloclib/interface/region.h"
#include "alloclib/interface/region_objects.h"
#include "tabledrivenparser/interface/dummy_via_file.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/reporter.h"
#include "tabledrivenparser/interface/via_file.h"
#include "tests/fuzz/memory_bound.h"
#include "tests/fuzz/one_file.h"
#include "tests/fuzz/quoted_words.h"

#include <algorithm>
#include <cstdlib>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace {

using namespace tabledrivenparser;

struct Reading {
  std::vector<std::string> words;
  std::optional<OptionMessage> failure;

  bool operator==(const Reading&) const = default;
};

class FailureReporter final : public Reporter {
public:
  explicit FailureReporter(Reading& reading) : m_Reading(reading) {}
  void reportOptionMessage(ReportLevel, OptionMessage message,
                           std::span<const OptionMessageArgument>) override {
    if (m_Reading.failure) std::abort();
    m_Reading.failure = message;
  }

private:
  Reading& m_Reading;
};

void expect(bool condition) {
  if (!condition) std::abort();
}

// Two words are in use at a time, so each is looked at again when the next one has come.
void readWords(ViaFile& file, Reading& reading) {
  const char* previous = nullptr;
  while (const char* word = file.nextToken()) {
    expect(previous == nullptr || reading.words.back() == previous);
    reading.words.emplace_back(word);
    previous = word;
  }
  expect(file.nextToken() == nullptr);
}

// Calls use with a parser over empty tables.
template <class Use>
Reading withParser(ViaFileReader& files, Use use) {
  static constexpr OptionTable NoOptions = {{}, indexByFirstLetter({})};
  const alloclib::RegionOwner region(alloclib::RegionGeneral::Create(1024, "fuzz"));
  Reading reading;
  FailureReporter reporter(reading);
  Parser parser({NoOptions, {}, {}}, nullptr, reporter, files, *region);
  use(parser, reading);
  return reading;
}

Reading readFile(std::string_view text, size_t pieceSize) {
  OneFile files(text, pieceSize);
  return withParser(files, [&files](Parser& parser, Reading& reading) {
    ViaFile file(parser, files, "file");
    readWords(file, reading);
  });
}

Reading readText(const std::string& text) {
  OneFile files({}, 1);
  return withParser(files, [&text](Parser& parser, Reading& reading) {
    DummyViaFile file(parser, text.c_str());
    readWords(file, reading);
  });
}

std::string withoutComments(std::string_view text) {
  std::string kept;
  while (!text.empty()) {
    const size_t comment = text.find_first_of("#;");
    kept += text.substr(0, comment);
    if (comment == std::string_view::npos) break;
    const size_t end = text.find_first_of("\r\n", comment);
    if (end == std::string_view::npos) break;
    text.remove_prefix(end + 1);
  }
  return kept;
}

bool isPrefix(const std::vector<std::string>& front, const std::vector<std::string>& whole) {
  return front.size() <= whole.size() && std::equal(front.begin(), front.end(), whole.begin());
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  static const bool IsInitialised = (static_cast<void>(alloclib::initialise()), true);
  if (!IsInitialised || size == 0) return 0;
  const fuzzing::MemoryBound bound(size);
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  const Reading reading = readFile(text, ViaFile::BufferSize);
  expect(readFile(text, size_t{data[0]} + 1) == reading);

  const bool hasNul = text.find('\0') != std::string_view::npos;
  if (!hasNul) {
    const Reading inMemory = readText(withoutComments(text));
    const bool isCut = reading.failure == OptionMessage::ViaFileCommandTooLong;
    expect(isCut ? isPrefix(reading.words, inMemory.words) : reading == inMemory);
  }
  expect(readText(fuzzing::quotedWords(reading.words)) == Reading{reading.words, {}});
  return 0;
}
