// SPDX-License-Identifier: Apache-2.0
//
// Objects of about a megabyte whose build attributes were made to keep the tool busy: runs that
// are for thousands of sections, lists that are copied for each of them, texts that share their
// bytes. Whether attributes are asked for or not, each is read or refused in little time and
// memory.
//
// A section of attributes may name thousands of owners in a few bytes each, and each owner gets a
// set: what is copied for each of them, or joined pair by pair, shows here as seconds.

#include "tests/support/attribute_bytes.h"
#include "tests/systematic/hostile_object.h"

#include <functional>

namespace testsupport {

namespace {

using namespace elfext;

// What is appended for each number from 0 on, in one.
std::string repeated(uint32_t count, const std::function<std::string(uint32_t)>& piece) {
  std::string text;
  for (uint32_t i = 0; i < count; ++i)
    text += piece(i);
  return text;
}

std::string file(std::string_view attributes) {
  return subSubsection({Tag_File, std::string(attributes)}, true);
}

std::string section(uint32_t index, std::string_view attributes) {
  return subSubsection(sectionPart({index}, attributes), true);
}

// For the sections 1 to `count`.
std::string sections(uint32_t count, std::string_view attributes) {
  std::vector<uint32_t> indices;
  for (uint32_t i = 1; i <= count; ++i)
    indices.push_back(i);
  return subSubsection(sectionPart(indices, attributes), true);
}

std::string vendor(const std::string& name, std::string_view content) {
  return subsection(ntbs(name) + std::string(content));
}

// So many sections, and then one of attributes.
std::string withAttributes(const std::string& subsections, uint32_t sectionCount = 0) {
  ObjectBuilder object = testsupport::object();
  for (uint32_t i = 0; i < sectionCount; ++i)
    object.section("", SHT_PROGBITS);
  object.section("", SHT_ZEV_ATTRIBUTES).bytes("A" + subsections);
  return object.bytes();
}

std::string compatible(uint32_t count) {
  return repeated(count, [](uint32_t i) { return tag(32, i, ""); });
}

std::string alsoCompatible(uint32_t number) {
  return "\x41" + tag(6, number) + '\0';
}

// ---- Vendors

std::string vendorsOfTheFile() {
  return withAttributes(
      repeated(70000, [](uint32_t i) { return vendor(std::to_string(i), file("")); }));
}

std::string vendorsOfASection() {
  return withAttributes(
      repeated(45000, [](uint32_t i) { return vendor(std::to_string(i), section(1, "")); }));
}

std::string vendorsOfAllSections() {
  return withAttributes(
      repeated(25, [](uint32_t i) { return vendor(std::to_string(i), sections(15000, "")); }),
      15000);
}

std::string vendorsInTurn() {
  return withAttributes(repeated(50000, [](uint32_t i) {
    return vendor(i % 2 == 0 ? "qobix" : "ZEV", file(tag(6, i % 250)));
  }));
}

// ---- Runs

std::string runForAllSections() {
  const std::string run = repeated(100000, [](uint32_t i) { return tag(6, i % 100); });
  return withAttributes(vendor("qobix", sections(30000, run)), 30000);
}

// Each section has attributes of its own already.
std::string runForSectionsThatDiffer(uint32_t length) {
  const std::string own = repeated(20000, [](uint32_t i) { return section(i + 1, tag(6, i)); });
  const std::string run = repeated(length, [](uint32_t) { return tag(30, 1); });
  return withAttributes(vendor("qobix", own + sections(20000, run)), 20000);
}

std::string shortRunForSectionsThatDiffer() {
  return runForSectionsThatDiffer(20);
}

std::string longRunForSectionsThatDiffer() {
  return runForSectionsThatDiffer(150000);
}

std::string emptyRuns() {
  return withAttributes(vendor("qobix", repeated(200000, [](uint32_t) { return file(""); })));
}

std::string repeatedIndices() {
  return withAttributes(vendor(
      "qobix", subSubsection({Tag_Section, std::string(900000, '\1') + '\0' + tag(6, 1)}, true)));
}

std::string runsForRepeatedIndices() {
  return withAttributes(
      vendor("qobix", repeated(4000, [](uint32_t i) {
               return subSubsection({Tag_Section, std::string(200, '\1') + '\0' + tag(6, i)}, true);
             })));
}

std::string attributeSections() {
  ObjectBuilder object = testsupport::object();
  for (uint32_t i = 0; i < 17000; ++i)
    object.section("", SHT_ZEV_ATTRIBUTES).bytes("A" + vendor("qobix", file(tag(6, i))));
  return object.bytes();
}

// ---- Lists

std::string longList() {
  return withAttributes(vendor("qobix", file(compatible(250000))));
}

std::string listOfTheSame() {
  return withAttributes(
      vendor("qobix", file(repeated(350000, [](uint32_t) { return tag(32, 1, ""); }))));
}

// Two lists of multiples of a number that a hash table of so many entries may well divide by.
std::string listsOfMultiples() {
  const std::string list =
      repeated(42000, [](uint32_t i) { return tag(Tag_compatibility, i * 42043, ""); });
  return withAttributes(vendor("qobix", section(1, list) + section(2, list)), 2);
}

std::string longListOfOthers() {
  return withAttributes(vendor("qobix", file(repeated(200000, alsoCompatible))));
}

std::string runsBehindALongList() {
  return withAttributes(vendor("qobix", file(compatible(100000)) + repeated(60000, [](uint32_t i) {
                                          return file(tag(6, i));
                                        })));
}

std::string sectionsBehindALongList() {
  ObjectBuilder object = testsupport::object();
  object.section("", SHT_ZEV_ATTRIBUTES).bytes("A" + vendor("qobix", file(compatible(60000))));
  for (uint32_t i = 0; i < 10000; ++i)
    object.section("", SHT_ZEV_ATTRIBUTES).bytes("A" + vendor("qobix", file(tag(6, i))));
  return object.bytes();
}

// Numbers that put an entry at the end of a list, and take it out again.
std::string changesOfALongList() {
  return withAttributes(
      vendor("qobix", file(compatible(100000))) +
      vendor("ZEV", file(repeated(100000, [](uint32_t) { return tag(4, 1) + tag(4, 0); }))));
}

std::string listsThatDiffer() {
  return withAttributes(
      vendor("qobix", repeated(30000, [](uint32_t i) { return section(i + 1, tag(32, i, "")); })),
      30000);
}

std::string listsOfOthersThatDiffer() {
  return withAttributes(
      vendor("qobix",
             repeated(30000, [](uint32_t i) { return section(i + 1, alsoCompatible(i + 1)); })),
      30000);
}

// ---- Decorations

constexpr uint32_t ManySymbols = 60000;
const std::string Prefix = "BuildAttributes$";

// Absolute or undefined symbols, whose names begin at every `step`-th of the first `count` places
// of one text.
std::string decorations(const std::string& text, uint32_t count, uint32_t step,
                        uint32_t where = SHN_ABS) {
  std::string rows(16, '\0');
  for (uint32_t i = 0; i < ManySymbols; ++i)
    put(rows, {1 + i % count * step, 0, 0, symbolInfo(Local, 0, where)});
  ObjectBuilder object = withSymbols(rows, '\0' + text + '\0');
  return object.bytes();
}

std::string manyTokens() {
  return repeated(250000, [](uint32_t) { return "$q"; });
}

std::string textsOfPrefixes() {
  return decorations(repeated(31250, [](uint32_t) { return Prefix; }), 31250, 16);
}

std::string oneText() {
  return decorations(Prefix + manyTokens(), 1, 0);
}

std::string oneTextOfNobody() {
  return decorations(Prefix + manyTokens(), 1, 0, SHN_UNDEF);
}

std::string oneTextOfAccesses() {
  return decorations(Prefix + repeated(80000, [](uint32_t) { return "$A:L88"; }), 1, 0);
}

std::string textsThatAreEndsOfOne() {
  return decorations(repeated(16, [](uint32_t) { return Prefix; }) + manyTokens(), 16, 16);
}

std::string namesThatAreEndsOfOne() {
  return decorations(std::string(ManySymbols, 'a') + "$$" + Prefix + manyTokens(), ManySymbols, 1);
}

std::string namesOfNothing() {
  return decorations("$$" + Prefix + manyTokens(), 1, 0);
}

// Each with a symbol that it is for.
std::string decorationsOfManySymbols() {
  std::string strings(1, '\0');
  std::string rows(16, '\0');
  const auto add = [&](const std::string& name, uint32_t where) {
    put(rows, {static_cast<uint32_t>(strings.size()), 0, 0, symbolInfo(Local, 0, where)});
    strings += name + '\0';
  };
  for (uint32_t i = 0; i < 15000; ++i) {
    const std::string name = "x" + std::to_string(i);
    add(name + "$$" + Prefix + "$E$" + std::to_string(i), SHN_ABS);
    add(name, SHN_ABS);
  }
  return withSymbols(rows, strings).bytes();
}

constexpr char Corrupted[] = "Build attributes in section #";

// clang-format off
const Hostile HostileAttributeObjects[] = {
  {"VendorsOfTheFile",              vendorsOfTheFile,              Corrupted},
  {"VendorsOfASection",             vendorsOfASection,             Corrupted},
  {"VendorsOfAllSections",          vendorsOfAllSections,          ""},
  {"VendorsInTurn",                 vendorsInTurn,                 ""},
  {"RunForAllSections",             runForAllSections,             ""},
  {"ShortRunForSectionsThatDiffer", shortRunForSectionsThatDiffer, ""},
  {"LongRunForSectionsThatDiffer",  longRunForSectionsThatDiffer,  Corrupted},
  {"EmptyRuns",                     emptyRuns,                     ""},
  {"RepeatedIndices",               repeatedIndices,               ""},
  {"RunsForRepeatedIndices",        runsForRepeatedIndices,        ""},
  {"AttributeSections",             attributeSections,             ""},
  {"LongList",                      longList,                      ""},
  {"ListOfTheSame",                 listOfTheSame,                 ""},
  {"ListsOfMultiples",              listsOfMultiples,              ""},
  {"LongListOfOthers",              longListOfOthers,              ""},
  {"RunsBehindALongList",           runsBehindALongList,           Corrupted},
  {"SectionsBehindALongList",       sectionsBehindALongList,       Corrupted},
  {"ChangesOfALongList",            changesOfALongList,            Corrupted},
  {"ListsThatDiffer",               listsThatDiffer,               ""},
  {"ListsOfOthersThatDiffer",       listsOfOthersThatDiffer,       ""},
  {"TextsOfPrefixes",               textsOfPrefixes,               ""},
  {"OneText",                       oneText,                       ""},
  {"OneTextOfNobody",               oneTextOfNobody,               ""},
  {"OneTextOfAccesses",             oneTextOfAccesses,             ""},
  {"TextsThatAreEndsOfOne",         textsThatAreEndsOfOne,         ""},
  {"NamesThatAreEndsOfOne",         namesThatAreEndsOfOne,         ""},
  {"NamesOfNothing",                namesOfNothing,                ""},
  {"DecorationsOfManySymbols",      decorationsOfManySymbols,      ""},
};
// clang-format on

using HostileAttributes = HostileObject;

} // namespace

TEST_P(HostileAttributes, AreReadOrRefusedInLittleTimeAndMemory) {
  expectHarmless(GetParam());
  const ToolRun run = this->run({"--qobix_buildattr", "-s", "lib.a"});
  EXPECT_EQ(run.status, 0);
  EXPECT_THAT(run.errors, testing::HasSubstr(GetParam().report));
}

TEST_P(HostileAttributes, AreTheSameInTablesAndOnAModel) {
  expectSameOnBothRoads(GetParam().make());
}

INSTANTIATE_TEST_SUITE_P(Tool, HostileAttributes, testing::ValuesIn(HostileAttributeObjects),
                         [](const auto& instance) { return instance.param.name; });

} // namespace testsupport
