// SPDX-License-Identifier: Apache-2.0
//
// The rows are sorted by name, as the look-up wants them, and the compiler checks that they are.
// Objects of all machines are read, and names are those of the archive, folders included: a
// document that left some out would be of no use to a tool that looks for them.
#include "quarn-json/command_line.h"

#include "quarn/host_via_file_reader.h"
#include "quarn/option_reporter.h"
#include "quarn/reporting.h"
#include "tabledrivenparser/interface/parser.h"

#include <array>

namespace quarn_json {

using namespace tabledrivenparser;

namespace {

enum OptionId : uint32_t {
  Option_Libraries,
  Option_Help,
  Option_LibraryAttributeMap,
  Option_QobixBuildAttributes,
  Option_Version,
  Option_Count,
};

constexpr Value On = {.integer = 1};
constexpr Value Off = {.integer = 0};
constexpr Value NoText = {.text = nullptr};
constexpr Value NoTexts = {.strings = nullptr};

// clang-format off
constexpr MatchString Rows[] = {
    {"",                Option_Libraries},
    {"help",            Option_Help,                 Kind_Implied, On},
    {"libattrmap",      Option_LibraryAttributeMap},
    {"qobix_buildattr", Option_QobixBuildAttributes, Kind_Implied, On},
    {"version",         Option_Version,              Kind_Implied, On},
};
// clang-format on

constexpr auto LibrariesRows = rowsNamed(Rows, "");
constexpr auto HelpRows = rowsNamed(Rows, "help");
constexpr auto LibraryAttributeMapRows = rowsNamed(Rows, "libattrmap");
constexpr auto QobixBuildAttributesRows = rowsNamed(Rows, "qobix_buildattr");
constexpr auto VersionRows = rowsNamed(Rows, "version");

// In the order of OptionId.
constexpr ValueDefinition Definitions[] = {
    {Type_StringVector, Default_Fixed, NoTexts, {}, LibrariesRows.data()},
    {Type_Boolean, Default_Fixed, Off, {}, HelpRows.data()},
    {Type_String, Default_Fixed, NoText, {}, LibraryAttributeMapRows.data()},
    {Type_Boolean, Default_Fixed, Off, {}, QobixBuildAttributesRows.data()},
    {Type_Boolean, Default_Fixed, Off, {}, VersionRows.data()},
};

static_assert(areWellFormed(Rows, Option_Count));
static_assert(std::size(Definitions) == Option_Count);
static_assert(listEveryRow(Definitions, Rows));

constexpr OptionTable Table = {Rows, indexByFirstLetter(Rows)};

Answer takeValues(const Parser& parser, Request& request) {
  if (quarn::hasErrors()) return Answer::Refused;
  if (parser.getBoolean(Option_Help)) return Answer::Help;
  if (parser.getBoolean(Option_Version)) return Answer::Version;
  const StrList* libraries = parser.getTexts(Option_Libraries);
  if (libraries == nullptr || libraries->isEmpty()) {
    quarn::reportMessage(messages::ErrorWord, messages::NoArchiveSpecified);
    return Answer::Refused;
  }
  for (const char* library : *libraries)
    request.libraries.emplace_back(library);
  request.settings.useObjectBuildAttributes = parser.getBoolean(Option_QobixBuildAttributes);
  request.settings.libraryAttributeMap = parser.getText(Option_LibraryAttributeMap);
  request.settings.machines = elfext::ObjectOutline::Machines::Any;
  request.settings.keepFolders = true;
  request.settings.takeAnyNumbers = true;
  return Answer::Run;
}

} // namespace

Answer readCommandLine(int argc, const char* const* argv, support::Host& host,
                       alloclib::RegionGeneral& memory, Request& request) {
  quarn::OptionReporter reporter;
  quarn::HostViaFileReader viaFiles(host);
  std::array<ValueRecord, Option_Count> values;
  Parser parser({Table, Definitions, values}, nullptr, reporter, viaFiles, memory);
  for (int i = 1; i < argc;)
    i += static_cast<int>(parser.parseWord(argv[i], i + 1 < argc ? argv[i + 1] : nullptr));
  const Answer answer = takeValues(parser, request);
  parser.releaseValues();
  return answer;
}

std::span<const MatchString> getOptionRows() {
  return Rows;
}

} // namespace quarn_json
