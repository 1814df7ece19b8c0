// SPDX-License-Identifier: Apache-2.0
//
// Archives of about a megabyte whose thousands of members share the bytes of one long name. What
// does not print these names, and does not write them, takes little time and memory; what writes
// them takes no memory for it.

#include "tests/systematic/hostile_object.h"

namespace testsupport {

namespace {

std::string indexField(size_t index) {
  return "/" + std::to_string(index);
}

// Names by places in the table that are `step` bytes apart, in each entry of it in turn.
std::string membersOf(const std::string& table, const std::vector<size_t>& entries, size_t count,
                      size_t step, const std::string& contents = "") {
  ArchiveBuilder builder = archive().longNamesText(table);
  for (size_t i = 0; i < count; ++i) {
    const size_t index = entries[i % entries.size()] + i / entries.size() * step;
    builder.memberWithNameField(indexField(index), contents);
  }
  return builder.bytes();
}

constexpr size_t ManyMembers = 8000;
constexpr size_t NameSize = 300000;
constexpr std::string_view NameEnd = "/\n";

std::string entry(const std::string& name) {
  return name + std::string(NameEnd);
}

std::string sameName() {
  return membersOf(entry(std::string(NameSize, 'n')), {0}, ManyMembers, 0);
}

std::string shorterName() {
  return membersOf(entry(std::string(50000, 'n')), {0}, ManyMembers, 0);
}

std::string endsOfOneName() {
  return membersOf(entry(std::string(NameSize, 'n')), {0}, ManyMembers, 3);
}

std::string twoSpellings() {
  const std::string table = entry(std::string(NameSize, 'n')) + entry(std::string(NameSize, 'N'));
  return membersOf(table, {0, NameSize + 2}, ManyMembers, 0);
}

std::string endsOfTwoSpellings() {
  const std::string table = entry(std::string(NameSize, 'n')) + entry(std::string(NameSize, 'N'));
  return membersOf(table, {0, NameSize + 2}, ManyMembers, 3);
}

std::string namesOfSlashes() {
  return membersOf(entry(std::string(NameSize, '/')), {0}, ManyMembers, 3);
}

std::string nameInAFolder() {
  return membersOf(entry("folder/" + std::string(NameSize, 'n')), {0}, ManyMembers, 0);
}

std::string nameOfObjects() {
  const std::string table = entry(std::string(NameSize, 'n'));
  return membersOf(table, {0}, ManyMembers, 0, object().bytes());
}

class HostileNames : public HostileObject {
protected:
  void givenLibrary(std::string (*make)()) {
    write(make);
    m_Folder.write("lib.a", m_Folder.read("x.o"));
    m_Folder.write("word.o", object().bytes());
  }
};

constexpr char TooMany[] = "File too large";

// What is said of them where each must be written for itself.
// clang-format off
const Hostile Archives[] = {
  {"SameName",           sameName,           TooMany},
  {"EndsOfOneName",      endsOfOneName,      TooMany},
  {"TwoSpellings",       twoSpellings,       TooMany},
  {"EndsOfTwoSpellings", endsOfTwoSpellings, TooMany},
  {"NamesOfSlashes",     namesOfSlashes,     ""},
  {"NameInAFolder",      nameInAFolder,      TooMany},
  {"NameOfObjects",      nameOfObjects,      TooMany},
};
// clang-format on

} // namespace

TEST_P(HostileNames, AreLookedUpInLittleTimeAndMemory) {
  givenLibrary(GetParam().make);
  for (const char* action : {"-t", "-p", "-m", "-x"}) {
    const ToolRun asking = run({action, "lib.a", "word.o", "n.o", "*.x"});
    EXPECT_EQ(asking.status, 1);
    EXPECT_THAT(asking.errors, testing::HasSubstr("'word.o' not present in archive 'lib.a'"));
    EXPECT_THAT(asking.errors, testing::HasSubstr("'*.x' not present in archive 'lib.a'"));
  }
  EXPECT_EQ(run({"-p", "lib.a"}).status, 0);
  EXPECT_EQ(run({"--entries", "lib.a"}).status, 0);
  EXPECT_EQ(run({"--zs", "lib.a"}).status, 0);
  EXPECT_EQ(run({"-d", "lib.a", "*"}).status, 0);
  EXPECT_LT(m_Folder.read("lib.a").size(), 100u);
}

TEST_P(HostileNames, AreTakenOverInLittleTimeAndMemory) {
  givenLibrary(GetParam().make);
  m_Folder.write("other.a", m_Folder.read("lib.a"));
  const bool isRefused = *GetParam().report != '\0';
  const ToolRun taking = run({"-r", "new.a", "lib.a", "other.a"});
  EXPECT_EQ(taking.status, isRefused ? 1 : 0);
  EXPECT_THAT(taking.errors, testing::HasSubstr(GetParam().report));
  const ToolRun replacing = run({"-r", "lib.a", "other.a"});
  EXPECT_EQ(replacing.status, isRefused ? 1 : 0);
  EXPECT_TRUE(!isRefused || m_Folder.read("lib.a") == m_Folder.read("other.a"));
}

// Each of them stands in the new table for itself, which is far larger than all else.
TEST_F(HostileNames, AreWrittenInLittleMemory) {
  givenLibrary(shorterName);
  EXPECT_EQ(run({"-r", "lib.a", "word.o"}).status, 0);
}

INSTANTIATE_TEST_SUITE_P(Tool, HostileNames, testing::ValuesIn(Archives),
                         [](const auto& instance) { return instance.param.name; });

} // namespace testsupport
