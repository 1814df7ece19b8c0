// SPDX-License-Identifier: Apache-2.0
//
// command_line [--shout] [--times=n] [--via=file] name...: greets. A table says which options there
// are and what they hold; the compiler checks it, and the parser does the rest.
#include "alloclib/interface/region_objects.h"
#include "alloclib/interface/session.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/stdio_via_file_reader.h"

#include <iostream>

namespace {

using namespace tabledrivenparser;

enum Option : uint32_t { Option_Names, Option_Shout, Option_Times, Option_Via, Option_Count };

// How each is written. The row without a name stands for the words that are no options.
constexpr MatchString Rows[] = {
    {"", Option_Names},
    {"shout", Option_Shout, Kind_Implied, {.integer = 1}},
    {"times", Option_Times},
    {"via", Option_Via},
};
static_assert(areWellFormed(Rows, Option_Count));

constexpr auto NamesRows = rowsNamed(Rows, "");
constexpr auto ShoutRows = rowsNamed(Rows, "shout");
constexpr auto TimesRows = rowsNamed(Rows, "times");
constexpr auto ViaRows = rowsNamed(Rows, "via");

// What each holds, in the order of the enumeration, and what it is while nobody has set it.
constexpr ValueDefinition Definitions[] = {
    {Type_StringVector, Default_Fixed, {.strings = nullptr}, {}, NamesRows.data()},
    {Type_Boolean, Default_Fixed, {.integer = 0}, {}, ShoutRows.data()},
    {Type_Int, Default_Fixed, {.integer = 1}, {}, TimesRows.data()},
    {Type_ViaFile, Default_Fixed, {.strings = nullptr}, {}, ViaRows.data()},
};

constexpr OptionTable Options = {Rows, indexByFirstLetter(Rows)};

// The parser knows no wording: it tells which message it means, and the words that it is about.
class Complaints final : public Reporter {
public:
  void reportOptionMessage(ReportLevel level, OptionMessage message,
                           std::span<const OptionMessageArgument> arguments) override {
    if (level >= ReportLevel::Error) m_IsWrong = true;
    std::cerr << (message == OptionMessage::UnrecognizedOption ? "unknown option: " : "misused: ");
    for (const OptionMessageArgument& argument : arguments)
      std::visit([](const auto& value) { std::cerr << value; }, argument);
    std::cerr << '\n';
  }

  bool m_IsWrong = false;
};

} // namespace

int main(int, char** words) {
  const alloclib::Session session; // lives longer than all regions
  const alloclib::RegionOwner region(alloclib::RegionGeneral::Create(4096, "command line"));
  ValueRecord values[Option_Count];
  Complaints complaints;
  StdioViaFileReader files;
  Parser parser({Options, Definitions, values}, nullptr, complaints, files, *region);

  ++words;
  while (*words != nullptr)
    words += parser.parseWord(words[0], words[1]);
  if (complaints.m_IsWrong) return 1;

  const StrList* names = parser.getTexts(Option_Names);
  if (names == nullptr) return 0;
  for (const char* name : *names) {
    for (int32_t i = 0; i < parser.getInteger(Option_Times); ++i)
      std::cout << "Hello, " << name << (parser.getBoolean(Option_Shout) ? "!" : ".") << '\n';
  }
  return 0;
}
