// SPDX-License-Identifier: Apache-2.0
//
// Libraries of a hundred thousand members or of a million symbols, and objects of more sections
// than 16 bits can count: the real programs do with them what they do with small ones, and no pass
// is quadratic.
//
// The bounds are ten times what the runs need and far below what a quadratic pass would take. They
// are of the processor's time, so that neighbours matter little.

#include "elfext/interface/elf_constants.h"
#include "tests/support/archive_builder.h"
#include "tests/support/object_builder.h"
#include "tests/support/sanitized.h"
#include "tests/support/tool_folder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <string_view>
#include <vector>

namespace testsupport {

namespace {

using namespace elfext;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

// Sanitized runs are not timed, and a run that takes too long is ended.
constexpr uint32_t Share = IsSanitized ? 5 : 1;
constexpr uint32_t ManyMembers = 100000 / Share;
constexpr uint32_t ManySymbols = 1000000 / Share;

constexpr uint32_t SymbolTablePlace = 8 + 60;

// Of four letters: tables of these names are hardly larger than the offsets in them.
std::string shortName(uint32_t number) {
  std::string name(4, 'a');
  for (size_t i = name.size(); i-- > 0; number /= 32)
    name[i] = static_cast<char>('A' + number % 32);
  return name;
}

// Two of three have names that stand in their headers.
std::string memberName(uint32_t number) {
  const std::string digits = std::to_string(ManyMembers + number);
  return number % 3 == 0 ? "member_of_a_long_name_" + digits + ".txt" : digits + ".txt";
}

std::vector<std::string> memberNames() {
  std::vector<std::string> names;
  for (uint32_t i = 0; i < ManyMembers; ++i)
    names.push_back(memberName(i));
  return names;
}

std::string lines(const std::vector<std::string>& texts) {
  std::string all;
  for (const std::string& text : texts)
    all += text + "\n";
  return all;
}

// The builder looks each long name up; their places are known here.
std::string libraryOf(const std::vector<std::string>& names) {
  std::string table;
  for (const std::string& name : names)
    if (name.size() > 15) table += name + "/\n";
  ArchiveBuilder builder = archive().longNamesText(table);
  size_t place = 0;
  for (const std::string& name : names) {
    if (name.size() <= 15) {
      builder.member(name, "in");
      continue;
    }
    builder.memberWithNameField("/" + std::to_string(place), "in");
    place += name.size() + 2;
  }
  return builder.bytes();
}

// An object that defines the symbols of these numbers.
std::string objectOf(uint32_t first, uint32_t count) {
  std::string strings(1, '\0');
  std::string rows(16, '\0');
  for (uint32_t i = 0; i < count; ++i) {
    rows += littleEndian(static_cast<uint32_t>(strings.size())) + littleEndian(0U) +
            littleEndian(0U) + littleEndian(1U << 4 | 3U << 16);
    strings += shortName(first + i) + '\0';
  }
  ObjectBuilder file = object();
  file.section(".strtab", SHT_STRTAB).bytes(strings);
  file.section(".symtab", SHT_SYMTAB).link(1).bytes(rows);
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(4);
  return file.bytes();
}

std::string tableNames(uint32_t count) {
  std::string names;
  for (uint32_t i = 0; i < count; ++i)
    names += shortName(i) + '\0';
  return names;
}

} // namespace

class LargeLibrary : public testing::Test {
protected:
  using Program = ToolRun (ToolFolder::*)(const std::vector<std::string>& words) const;

  // The run ends well, in time, and says nothing but its output, which is returned.
  std::string run(const std::vector<std::string>& words, Program program = &ToolFolder::runProgram,
                  double mostSeconds = 5) {
    SCOPED_TRACE(words.front());
    const ToolRun run = (m_Folder.*program)(words);
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.errors.substr(0, 500), "");
    if (!IsSanitized) {
      EXPECT_LT(run.seconds, mostSeconds);
    }
    return run.output;
  }

  // The names stand behind the count and the offsets.
  void expectTableOfManySymbols() {
    const std::string library = m_Folder.read("lib.a");
    const size_t place = SymbolTablePlace + 4 + 4 * size_t{ManySymbols};
    EXPECT_EQ(library.substr(SymbolTablePlace, 4), bigEndian(ManySymbols));
    EXPECT_TRUE(library.substr(place, 5 * size_t{ManySymbols}) == tableNames(ManySymbols));
  }

  ToolFolder m_Folder;
};

class LargeObject : public LargeLibrary, public testing::WithParamInterface<uint32_t> {};

TEST_F(LargeLibrary, OfAHundredThousandMembersIsListedAndReported) {
  const std::vector<std::string> names = memberNames();
  m_Folder.write("lib.a", libraryOf(names));
  m_Folder.write("words", lines(names));
  EXPECT_TRUE(run({"-t", "lib.a"}) == lines(names));
  EXPECT_TRUE(run({"-t", "lib.a", "--via", "words"}) == lines(names));
  EXPECT_EQ(std::ranges::count(run({"-tv", "lib.a", "*.txt"}), '\n'), ManyMembers);
  EXPECT_EQ(run({"-p", "lib.a", "--via", "words"}).size(), 2 * ManyMembers);
  EXPECT_THAT(run({"--zt", "lib.a"}), EndsWith("No ENTRY points found.\n"));
  const std::string document = run({"lib.a"}, &ToolFolder::runJson);
  EXPECT_THAT(document.substr(document.find(memberName(ManyMembers - 1))), HasSubstr("\"file\""));
}

TEST_F(LargeLibrary, OfAHundredThousandMembersIsEdited) {
  std::vector<std::string> names = memberNames();
  m_Folder.write("other.a", libraryOf(names));
  run({"--create", "--diag_suppress=L6875", "lib.a", "other.a"});
  EXPECT_TRUE(run({"-t", "lib.a"}) == lines(names));
  const std::string old = m_Folder.read("lib.a");
  run({"-r", "--diag_suppress=L6875", "lib.a", "other.a"});
  run({"-ru", "--diag_suppress=L6875", "lib.a", "other.a"});
  EXPECT_TRUE(m_Folder.read("lib.a") == old);
  std::ranges::reverse(names);
  m_Folder.write("words", lines(names));
  run({"-m", "lib.a", "--via", "words"});
  EXPECT_TRUE(run({"-t", "lib.a"}) == lines(names));
  run({"-d", "lib.a", "--via", "words"});
  EXPECT_EQ(run({"-t", "lib.a"}), "");
}

TEST_F(LargeLibrary, OfManyMembersOfOneNameIsMovedByAsManyWords) {
  constexpr uint32_t Count = ManyMembers / 2;
  ArchiveBuilder library = archive();
  for (uint32_t i = 0; i < Count; ++i)
    library.member("t", std::to_string(i));
  m_Folder.write("lib.a", library.bytes());
  m_Folder.write("words", lines(std::vector<std::string>(Count - 1, "t")));
  run({"-m", "-n", "lib.a", "--via", "words"});
  const std::string moved = run({"-p", "lib.a"});
  EXPECT_THAT(moved, StartsWith(std::to_string(Count - 1) + "0" + "1" + "2"));
}

TEST_F(LargeLibrary, OfAMillionSymbolsInOneObject) {
  m_Folder.write("x.o", objectOf(0, ManySymbols));
  run({"--create", "lib.a", "x.o"});
  expectTableOfManySymbols();
  run({"-s", "--unique_symbols", "lib.a"}, &ToolFolder::runProgram, 15);
  expectTableOfManySymbols();
  EXPECT_THAT(run({"--sizes", "lib.a"}), HasSubstr("   x.o\n"));
}

TEST_F(LargeLibrary, OfAMillionSymbolsInAThousandObjects) {
  constexpr uint32_t EachHas = 1000;
  ArchiveBuilder library = archive();
  for (uint32_t i = 0; i < ManySymbols; i += EachHas)
    library.member(std::to_string(i) + ".o", objectOf(i, EachHas));
  m_Folder.write("lib.a", library.bytes());
  run({"-s", "lib.a"});
  expectTableOfManySymbols();
  EXPECT_EQ(std::ranges::count(run({"--sizes", "lib.a"}), '\n'), 4 + ManySymbols / EachHas);
  run({"-d", "lib.a", "*"});
  EXPECT_EQ(run({"-t", "lib.a"}), "");
}

// Builds of one module are found by their symbols, of which each member here has its own, and then
// all have the same.
TEST_F(LargeLibrary, OfManyObjectsOfFewSymbolsIsSearchedForBuildsOfOneModule) {
  constexpr uint32_t Count = ManyMembers / 5;
  ArchiveBuilder different = archive();
  ArchiveBuilder same = archive();
  for (uint32_t i = 0; i < Count; ++i) {
    different.member(std::to_string(i) + ".o", objectOf(i, 1));
    same.member(std::to_string(i) + ".o", objectOf(0, 1));
  }
  m_Folder.write("lib.a", different.bytes());
  run({"-s", "lib.a"});
  EXPECT_EQ(std::ranges::count(run({"--zs", "lib.a"}), '\n'), Count);
  m_Folder.write("lib.a", same.bytes());
  run({"-s", "--diag_suppress=L6876", "lib.a"});
  EXPECT_EQ(std::ranges::count(run({"--zs", "lib.a"}), '\n'), Count);
}

// Up to 65535 stand in the header, and any index that isn't one of those without a section stands
// in the symbol; more of either stand elsewhere.
TEST_P(LargeObject, OfManySectionsPublishesTheSymbolOfTheLastOne) {
  const uint32_t count = GetParam();
  const uint32_t last = count - 1;
  const bool isPlain = last < SHN_XINDEX && last != SHN_ABS && last != SHN_COMMON;
  ObjectBuilder file = object().nameless();
  if (count > 0xFFFF) file.extendedNumbering();
  file.section("", SHT_STRTAB);
  file.section("", SHT_SYMTAB)
      .link(1)
      .symbol({.name = "last", .section = static_cast<uint16_t>(isPlain ? last : SHN_XINDEX)});
  file.section("", SHT_SYMTAB_SHNDX).link(2).word(0).word(isPlain ? 0 : last);
  for (uint32_t i = 4; i < count; ++i)
    file.section("", SHT_PROGBITS).flags(SHF_ALLOC | SHF_WRITE);
  m_Folder.write("x.o", file.bytes());
  run({"--create", "lib.a", "x.o"});
  EXPECT_THAT(run({"--zs", "lib.a"}), StartsWith("last "));
  EXPECT_THAT(run({"--sizes", "lib.a"}), HasSubstr("   x.o\n"));
  EXPECT_THAT(run({"lib.a"}, &ToolFolder::runJson), HasSubstr("\"last\""));
}

INSTANTIATE_TEST_SUITE_P(Counts, LargeObject,
                         testing::Values(0xFEFF, 0xFF00, 0xFF01, 0xFFF1, 0xFFF2, 0xFFFE, 0xFFFF,
                                         0x10000, 0x10001, 0x20000));

} // namespace testsupport
