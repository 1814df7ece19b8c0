// SPDX-License-Identifier: Apache-2.0
//
// Any command line, and any via file, over the tool's own option table: lines of the input are the
// words, and the input as a whole is a via file that is read in pieces of a size of its choice.
// What was understood is written again both ways, in every buffer size that matters.
#include "quarn/option_table.h"

#include "alloclib/interface/region_objects.h"
#include "tabledrivenparser/interface/option_report.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/text_sink.h"
#include "tests/fuzz/memory_bound.h"
#include "tests/fuzz/one_file.h"

#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

namespace {

using namespace tabledrivenparser;

class SilentReporter final : public Reporter {
public:
  void reportOptionMessage(ReportLevel, OptionMessage,
                           std::span<const OptionMessageArgument>) override {}
};

void writeAgain(const Parser& parser) {
  TextSink measuring({}, TextSink::QuoteMode::Blanks, ' ');
  std::vector<char> buffer(printCommandLine(parser, measuring));
  TextSink exact(buffer, TextSink::QuoteMode::Blanks, ' ');
  if (printCommandLine(parser, exact) != buffer.size() || buffer.back() != '\0') std::abort();
  TextSink dump({}, TextSink::QuoteMode::Never, ',');
  dumpTables(parser, dump);
}

std::vector<std::string> linesOf(std::string_view text) {
  std::vector<std::string> lines(1);
  for (const char character : text) {
    if (character == '\n') {
      lines.emplace_back();
    } else if (character != '\0') {
      lines.back() += character;
    }
  }
  return lines;
}

void parse(const std::vector<std::string>& words, std::string_view file, size_t pieceSize) {
  const alloclib::RegionOwner region(alloclib::RegionGeneral::Create(1024, "fuzz"));
  SilentReporter reporter;
  OneFile files(file, pieceSize);
  quarn::OptionValues values;
  Parser parser({quarn::getOptionTable(), quarn::getOptionDefinitions(), values}, nullptr, reporter,
                files, *region);
  for (size_t i = 0; i < words.size();) {
    i += parser.parseWord(words[i].c_str(), i + 1 < words.size() ? words[i + 1].c_str() : nullptr);
  }
  writeAgain(parser);
  parser.releaseValues();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  static const bool IsInitialised = (static_cast<void>(alloclib::initialise()), true);
  if (!IsInitialised || size == 0) return 0;
  const fuzzing::MemoryBound bound(size);
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  parse(linesOf(text), text, size_t{data[0]} + 1);
  parse({"--via", "itself"}, text, size_t{data[0]} + 1);
  return 0;
}
