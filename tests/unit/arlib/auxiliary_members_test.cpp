// SPDX-License-Identifier: Apache-2.0
//
// The two tables that are derived from the members: when they are rebuilt, what they hold, where
// they stand. An edit that makes one stale and a rebuild that forgets it would lead a linker to
// wrong members.

#include "elfext/interface/elf_constants.h"
#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

const std::string Long1 = "first_long_name_of_member.o";
const std::string Long2 = "second_long_name_of_member.o";

using testsupport::objectThatDefines;

class AuxiliaryMembersTest : public ArchiveTest {
protected:
  std::vector<uint32_t> offsets() {
    std::vector<uint32_t> all;
    for (const ArchiveMember* each : m_Archive.getMembers())
      all.push_back(each->getOffset());
    return all;
  }

  std::string longNameTable() {
    const ArchiveMember* table = m_Archive.getFileNameTable();
    return table == nullptr ? "(none)" : contentsOf(m_Archive, table);
  }
};

} // namespace

TEST_F(AuxiliaryMembersTest, MakesNoTablesWhereNoneAreNeeded) {
  add("a.o", "odd");
  add("b.o", "");
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("a.o", "b.o"));
  EXPECT_THAT(offsets(), ElementsAre(8, 72));
}

TEST_F(AuxiliaryMembersTest, ListsLongNamesInMemberOrder) {
  add(Long1.c_str(), "x");
  add("short.o", "y");
  add(Long2.c_str(), "z");
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(longNameTable(), Long1 + "/\n" + Long2 + "/\n");
  EXPECT_EQ(member(1)->getFileNameTableOffset(), 0u);
  EXPECT_EQ(member(3)->getFileNameTableOffset(), Long1.size() + 2);
  EXPECT_EQ(member(2)->getFileNameTableOffset(), ArchiveMember::NoFileNameTableOffset);
}

TEST_F(AuxiliaryMembersTest, PutsALoneLongNameTableFirst) {
  add(Long1.c_str(), "x");
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getFileNameTable(), member(0));
  const uint32_t end = 8 + 60 + static_cast<uint32_t>(Long1.size()) + 2;
  EXPECT_THAT(offsets(), ElementsAre(8, end + end % 2));
}

TEST_F(AuxiliaryMembersTest, PutsTheSymbolTableInFrontOfTheLongNames) {
  add(Long1.c_str(), "x");
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getSymbolTable(), member(0));
  EXPECT_EQ(m_Archive.getFileNameTable(), member(1));
  const uint32_t end = 72 + 60 + static_cast<uint32_t>(Long1.size()) + 2;
  EXPECT_THAT(offsets(), ElementsAre(8, 72, end + end % 2));
}

TEST_F(AuxiliaryMembersTest, MakesNewTablesWithZerosInTheirHeaders) {
  add(Long1.c_str(), "x");
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  for (const uint32_t i : {0u, 1u}) {
    EXPECT_EQ(member(i)->getName(), "");
    EXPECT_EQ(member(i)->getDate(), 0);
    EXPECT_EQ(member(i)->getUid(), 0u);
    EXPECT_EQ(member(i)->getGid(), 0u);
    EXPECT_EQ(member(i)->getMode(), 0u);
  }
  EXPECT_EQ(member(0)->getSize(), 4u);
  EXPECT_EQ(contentsOf(member(0)), bigEndian(0));
}

TEST_F(AuxiliaryMembersTest, KeepsTheHeaderFieldsOfATableFromTheFile) {
  read(archive()
           .symbolTable({})
           .numbers(5, 6, 7, "644")
           .longNames({Long1})
           .numbers(8, 9, 10, "600")
           .member(Long1, "x"));
  add(Long2.c_str(), "y");
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"), archive()
                                      .symbolTable({})
                                      .numbers(5, 6, 7, "644")
                                      .longNames({Long1, Long2})
                                      .numbers(8, 9, 10, "600")
                                      .member(Long1, "x")
                                      .member(Long2, "y")
                                      .bytes());
}

TEST_F(AuxiliaryMembersTest, WritesBlankFieldsOfATableAsZeros) {
  read(archive()
           .memberWithNameField("//", Long1 + "/\n")
           .blankNumbers()
           .memberWithNameField("/0", "x"));
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"), archive().longNames({Long1}).member(Long1, "x").bytes());
}

TEST_F(AuxiliaryMembersTest, DropsTheLongNameTableWithTheLastLongName) {
  read(archive().longNames({Long1}).member(Long1, "x").member("a.o", "y"));
  m_Archive.removeMember(member(1));
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getFileNameTable(), nullptr);
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("a.o"));
  EXPECT_THAT(offsets(), ElementsAre(8));
}

// Long names are read in place, so a rewrite of the table must not pull them from under the
// members.
TEST_F(AuxiliaryMembersTest, RewritesTheLongNameTableWhole) {
  read(archive().longNames({Long1, Long2}).member(Long1, "x").member(Long2, "y"));
  m_Archive.moveMember(member(2), 1);
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(longNameTable(), Long2 + "/\n" + Long1 + "/\n");
  m_Archive.removeMember(member(1));
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(longNameTable(), Long1 + "/\n");
  add("another_quite_long_member_name.o", "z");
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(longNameTable(), Long1 + "/\nanother_quite_long_member_name.o/\n");
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("", Long1, "another_quite_long_member_name.o"));
}

TEST_F(AuxiliaryMembersTest, FollowsARename) {
  read(archive().longNames({Long1}).member(Long1, "x").member("a.o", ""));
  member(1)->setName("b.o");
  member(2)->setName(Long2);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"),
            archive().longNames({Long2}).member("b.o", "x").member(Long2, "").bytes());
}

TEST_F(AuxiliaryMembersTest, LeavesTablesAloneThatAreNotStale) {
  // An entry that nobody refers to, and a reference into the middle of one.
  const ArchiveBuilder builder = archive()
                                     .longNames({"dir/" + Long1, "unused_name_of_no_member.o"})
                                     .memberWithNameField("/4", "x")
                                     .member("a.o", "y");
  read(builder);
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"), builder.bytes());
}

TEST_F(AuxiliaryMembersTest, GivesAShortNameFromTheTableAShortHeader) {
  read(archive().longNames({"directory/sub/short.o"}).memberWithNameField("/0", "x"));
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"),
            archive().longNames({"directory/sub/short.o"}).member("short.o", "x").bytes());
}

TEST_F(AuxiliaryMembersTest, KeepsASymbolTableOnlyForSymbolsByDefault) {
  read(archive().symbolTable({{"s", "a"}}).member("a", "no object"));
  add("b", "x");
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getSymbolTable(), nullptr);
  EXPECT_THAT(namesOf(m_Archive), ElementsAre("a", "b"));
}

TEST_F(AuxiliaryMembersTest, KeepsNoSymbolTableWhenToldSo) {
  read(archive().symbolTable({}).member("a.o", object().bytes()));
  m_Archive.setSymbolTableMode(SymbolTableMode::Never);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"), archive().member("a.o", object().bytes()).bytes());
}

TEST_F(AuxiliaryMembersTest, KeepsAnEmptySymbolTableWhenToldSo) {
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"), archive().symbolTable({}).bytes());
}

// The decoded symbols are what the file held.
TEST_F(AuxiliaryMembersTest, DoesNotDecodeTheSymbolsAnew) {
  read(archive().symbolTable({{"s", "a"}, {"t", "b"}}).member("a", "").member("b", ""));
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  m_Archive.removeMember(member(1));
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(symbolNamesOf(m_Archive), ElementsAre("t"));
  EXPECT_EQ(contentsOf(m_Archive, m_Archive.getSymbolTable()), bigEndian(0));
}

TEST_F(AuxiliaryMembersTest, ReplacesASymbolTableOfAnySize) {
  for (const std::string name : {"s", "symbol_with_a_name_of_some_length", ""}) {
    read(archive().symbolTable({{name, "a"}}).member("a", "x"));
    m_Archive.setSymbolTableMode(SymbolTableMode::Always);
    EXPECT_TRUE(writeFile("lib.a", m_Archive));
    EXPECT_EQ(m_Host.read("lib.a"), archive().symbolTable({}).member("a", "x").bytes());
  }
}

// An odd-sized table is followed by a padding byte that all offsets count.
TEST_F(AuxiliaryMembersTest, CountsThePaddingOfTheTables) {
  const std::string odd = "a_member_with_an_odd_name";
  add(odd.c_str(), "x");
  add("b", "y");
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  std::string error;
  const auto members = testsupport::parseArchive(m_Host.read("lib.a"), error);
  EXPECT_EQ(error, "");
  ASSERT_EQ(members.size(), 4u);
  for (uint32_t i = 0; i < 4; ++i)
    EXPECT_EQ(members[i].offset, member(i)->getOffset());
}

TEST_F(AuxiliaryMembersTest, PutsTablesInFrontOfMembersMovedBeforeThem) {
  read(archive().symbolTable({}).longNames({Long1}).member(Long1, "x").member("b", "y"));
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  m_Archive.moveMember(member(3), 0);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(
      m_Host.read("lib.a"),
      archive().symbolTable({}).longNames({Long1}).member("b", "y").member(Long1, "x").bytes());
}

TEST_F(AuxiliaryMembersTest, CorrectsOffsetsWhenNothingIsStaleButATableMoves) {
  read(archive().member("a", "x").longNames({Long1}).member(Long1, "y"));
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getFileNameTable(), member(0));
  const uint32_t tableSize = 60 + static_cast<uint32_t>(Long1.size()) + 2;
  EXPECT_THAT(offsets(),
              ElementsAre(8, 8 + tableSize + tableSize % 2, 8 + tableSize + tableSize % 2 + 62));
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  EXPECT_EQ(m_Host.read("lib.a"),
            archive().longNames({Long1}).member("a", "x").member(Long1, "y").bytes());
}

TEST_F(AuxiliaryMembersTest, ChangesNothingTheSecondTime) {
  add(Long1.c_str(), "x");
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_TRUE(member(0)->loadContents());
  const uint8_t* tableBytes = m_Archive.getSymbolTable()->getContents().data();
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getSymbolTable()->getContents().data(), tableBytes);
  EXPECT_THAT(reports(), IsEmpty());
}

TEST_F(AuxiliaryMembersTest, DeterminesTypesThatAreNotKnown) {
  ArchiveMember* edited = add("a.o", object().bytes());
  EXPECT_TRUE(edited->clearType());
  EXPECT_EQ(edited->getType(), nullptr);
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(edited->getType(), ElfImageArchiveMemberType::getInstance());
}

TEST_F(AuxiliaryMembersTest, AreNotMadeWithoutTheTypeOfAMemberThatCannotBeRead) {
  ArchiveMember* edited = add("a.o", object().bytes());
  m_Archive.closeFiles();
  m_Host.at("a.o").isUnreadable = true;
  EXPECT_FALSE(edited->clearType());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'a.o': Permission denied"));
  EXPECT_FALSE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'a.o': Permission denied"));
  EXPECT_EQ(edited->getType(), nullptr);
  m_Host.at("a.o").isUnreadable = false;
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(edited->getType(), ElfImageArchiveMemberType::getInstance());
}

TEST_F(AuxiliaryMembersTest, LoadsATableThatWasDiscarded) {
  read(archive().longNames({Long1, Long2}).member(Long1, "x").member(Long2, "y"));
  member(0)->discardContents();
  EXPECT_FALSE(member(0)->hasContents());
  m_Archive.removeMember(member(2));
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(longNameTable(), Long1 + "/\n");
}

// They share their bytes in a table of some megabytes, and would be written one by one.
TEST_F(AuxiliaryMembersTest, RefusesLongNamesThatAreMoreThanAnArchiveHolds) {
  ArchiveBuilder library = archive();
  library.longNamesText(std::string(4'000'000, 'n') + "/\n");
  for (int i = 0; i < 1100; ++i)
    library.memberWithNameField("/0", "");
  read(library);
  const std::string before = m_Host.read("lib.a");
  m_Archive.removeMember(member(1));
  EXPECT_FALSE(writeFile("lib.a", m_Archive));
  EXPECT_THAT(reports(), ElementsAre("0 I/O error writing file 'lib.a': File too large"));
  EXPECT_EQ(m_Host.read("lib.a"), before);
}

// A long name that comes, goes or changes shifts all members, and the symbol table leads to them.
TEST_F(AuxiliaryMembersTest, KeepsSymbolsRightWhenNamesChangeTheLayout) {
  const std::string defining = objectThatDefines("f").bytes();
  const ArchiveBuilder library = archive()
                                     .symbolTable({{"f", "a.o"}})
                                     .longNames({Long1})
                                     .member("a.o", defining)
                                     .member(Long1, "y");
  for (const std::string& name : {Long1 + "_and_more_of_it", std::string("short"), Long1 + "__"}) {
    for (const uint32_t index : {2u, 3u}) {
      read(library);
      member(index)->setName(name);
      ASSERT_TRUE(writeFile("lib.a", m_Archive));
      ASSERT_TRUE(readFile("lib.a", m_Archive));
      EXPECT_THAT(reports(), IsEmpty());
      ASSERT_THAT(symbolNamesOf(m_Archive), ElementsAre("f"));
      EXPECT_EQ(m_Archive.getSymbols()[0]->getDefiningMember()->getSize(), defining.size());
    }
  }
}

// Names that leave the layout as it is leave the table alone, also where no object can be read.
TEST_F(AuxiliaryMembersTest, DoesNotRebuildSymbolsForANameThatMovesNothing) {
  read(archive().symbolTable({{"s", "a.o"}}).member("a.o", "no object"));
  member(1)->setName("b.o");
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_NE(m_Archive.getSymbolTable(), nullptr);
}

TEST_F(AuxiliaryMembersTest, FailsWhereATableCannotBeLoaded) {
  read(archive().longNames({Long1}).member(Long1, "x"));
  member(0)->discardContents();
  m_Archive.moveMember(member(1), 0);
  m_Archive.closeFiles();
  m_Host.at("lib.a").isUnreadable = true;
  EXPECT_FALSE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'lib.a': Permission denied"));
  m_Host.at("lib.a").isUnreadable = false;
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getFileNameTable(), member(0));
}

// Both tables are handed over together, or none.
TEST_F(AuxiliaryMembersTest, LeaveTheArchiveAsItWasWhereTheSecondOneFails) {
  read(archive().symbolTable({{"s", "a"}}).longNames({Long1}).member("a", "x").member(Long1, "y"));
  const std::vector<uint8_t> names(member(1)->getContents().begin(),
                                   member(1)->getContents().end());
  const uint32_t offset = member(3)->getOffset();
  member(0)->discardContents();
  m_Archive.closeFiles();
  m_Host.at("lib.a").isUnreadable = true;
  member(2)->setName(Long2);
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  EXPECT_FALSE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(member(1)->getContents(), testing::ElementsAreArray(names));
  EXPECT_EQ(member(1)->getSize(), names.size());
  EXPECT_EQ(member(3)->getOffset(), offset);
  EXPECT_EQ(m_Archive.getMembers().size(), 4u);
}

TEST_F(AuxiliaryMembersTest, FailsWhereTheSymbolTableCannotBeLoaded) {
  read(archive().symbolTable({{"s", "a"}}).member("a", "x"));
  member(0)->discardContents();
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  m_Archive.closeFiles();
  m_Host.at("lib.a").isUnreadable = true;
  EXPECT_FALSE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'lib.a': Permission denied"));
}

} // namespace arlib
