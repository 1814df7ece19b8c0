// SPDX-License-Identifier: Apache-2.0
//
// The way through a symbol table, in memory and in a file, and archives whose symbols nobody wants.
// Names longer than what is read at a time, names without an end and files that fail at any read
// must come to the same in both.

#include "arlib/src/table_cursor.h"

#include "tests/support/faulty_host.h"
#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>

namespace arlib {

namespace {

using testsupport::FaultyHost;

class TableCursorTest : public ArchiveTest {
protected:
  // The table stands somewhere in the middle of its file.
  TableSource inFile(const std::string& table) {
    m_Host.addFile("file", "before" + table + "behind");
    EXPECT_EQ(m_Files.open("file", m_File), 0);
    m_Faulty.failCall(0, 0);
    return {.file = m_File.get(), .offset = 6, .size = table.size()};
  }
  static TableSource inMemory(const std::string& table) {
    return {.text = table, .size = table.size()};
  }

  static std::vector<std::string> namesOf(TableCursor cursor) {
    std::vector<std::string> names;
    while (const std::optional<std::string_view> name = cursor.takeName())
      names.emplace_back(*name);
    EXPECT_FALSE(cursor.hasFailed());
    return names;
  }

  FaultyHost m_Faulty{m_Host};
  support::SourceFiles m_Files{m_Faulty};
  std::shared_ptr<support::SourceFile> m_File;
};

std::string joined(const std::vector<std::string>& names) {
  std::string text;
  for (const std::string& name : names)
    text += name + '\0';
  return text;
}

} // namespace

TEST_F(TableCursorTest, FindsNamesOfAnyLengthInMemoryAndInAFile) {
  const std::vector<std::string> names = {
      "a", "", std::string(65'535, 'b'), std::string(65'536, 'c'), std::string(400'000, 'd'), "e"};
  const std::string table = joined(names);
  EXPECT_EQ(namesOf(TableCursor(inMemory(table), 0)), names);
  EXPECT_EQ(namesOf(TableCursor(inFile(table), 0)), names);
  EXPECT_EQ(namesOf(TableCursor(inFile(table), 2)), std::vector(names.begin() + 1, names.end()));
}

TEST_F(TableCursorTest, ManyNamesTakeFewReads) {
  const std::vector<std::string> names(50'000, "nineteen_characters");
  EXPECT_EQ(namesOf(TableCursor(inFile(joined(names)), 0)), names);
  EXPECT_LE(m_Faulty.getCallCount(), 17u);
}

TEST_F(TableCursorTest, ANameWithoutAnEndIsNone) {
  for (const std::string& table : {std::string("ab"), std::string(200'000, 'x'), std::string()}) {
    EXPECT_THAT(namesOf(TableCursor(inMemory(table), 0)), IsEmpty());
    EXPECT_THAT(namesOf(TableCursor(inFile(table), 0)), IsEmpty());
  }
}

TEST_F(TableCursorTest, TakesWordsAsLongAsThereAreFourBytes) {
  const std::string table = bigEndian(7) + bigEndian(0xFFFFFFFE) + "abc";
  for (TableCursor cursor : {TableCursor(inMemory(table), 0), TableCursor(inFile(table), 0)}) {
    EXPECT_EQ(cursor.takeWord(), 7u);
    EXPECT_EQ(cursor.takeWord(), 0xFFFFFFFEu);
    EXPECT_EQ(cursor.takeWord(), std::nullopt);
    EXPECT_FALSE(cursor.hasFailed());
    EXPECT_EQ(cursor.getPosition(), 8u);
  }
}

TEST_F(TableCursorTest, FindsDataBehindManyNuls) {
  const std::string nuls(300'000, '\0');
  for (const std::string& table : {nuls + "x", nuls}) {
    for (TableCursor cursor : {TableCursor(inMemory(table), 1), TableCursor(inFile(table), 1)}) {
      EXPECT_EQ(cursor.findData(), table.size() > nuls.size());
      EXPECT_EQ(cursor.getPosition(), nuls.size());
    }
  }
}

TEST_F(TableCursorTest, TellsWhyBytesCannotBeHad) {
  TableCursor unreadable(inFile("name"), 0);
  m_Faulty.failCall(1, EIO);
  EXPECT_EQ(unreadable.takeName(), std::nullopt);
  EXPECT_TRUE(unreadable.hasFailed());
  EXPECT_EQ(unreadable.getError(), EIO);
  TableSource source = inFile("name");
  source.size += 100;
  TableCursor cut(source, 0);
  EXPECT_EQ(cut.takeName(), std::nullopt);
  EXPECT_TRUE(cut.hasFailed());
  EXPECT_EQ(cut.getError(), 0);
}

// ---- Archives whose symbols nobody wants

TEST_F(TableCursorTest, AnUnreadableTableEndsTheReadWhereverItFails) {
  m_Host.addFile("lib.a", archive().symbolTable({{"s", "a.o"}}).member("a.o", "12").bytes());
  for (uint64_t call = 1;; ++call) {
    m_Faulty.failCall(call, EIO);
    Archive unwanted(m_Faulty);
    RecordingHandler handler(Answer::GiveUp);
    unwanted.setErrorHandler(&handler);
    unwanted.setSymbolsWanted(false);
    const bool isRead = readFile("lib.a", unwanted);
    if (m_Faulty.getFailedOperation().empty()) break;
    if (isRead) continue; // what failed was only a question
    EXPECT_TRUE(unwanted.getMembers().empty());
    EXPECT_EQ(handler.reports.size(), 1u) << m_Faulty.getFailedOperation();
  }
}

TEST_F(TableCursorTest, SymbolsAreVisitedInTheFileAsTheyAreInMemory) {
  m_Host.addFile("lib.a", archive()
                              .symbolTable({{"b$$BuildAttributes$FP2", "b.o"}, {"a", "a.o"}})
                              .member("a.o", "12")
                              .member("b.o", "34")
                              .bytes());
  for (const bool isWanted : {true, false}) {
    Archive library(m_Host);
    library.setSymbolsWanted(isWanted);
    ASSERT_TRUE(readFile("lib.a", library));
    const auto expected = ElementsAre("b|FP2 in b.o", "a in a.o");
    EXPECT_THAT(visitedSymbolsOf(library), expected);
    if (isWanted) static_cast<void>(library.getSymbols());
    EXPECT_THAT(visitedSymbolsOf(library), expected) << "again, and where they have been made";
    library.removeMember(library.getMembers()[2]);
    EXPECT_THAT(visitedSymbolsOf(library), ElementsAre("a in a.o"));
  }
}

TEST_F(TableCursorTest, AVisitFailsWhereTheFileCannotBeRead) {
  m_Host.addFile("lib.a", archive().symbolTable({{"s", "a.o"}}).member("a.o", "12").bytes());
  const auto visit = [](const Archive& library) {
    return library.visitSymbols([](const Symbol&) {});
  };
  Archive library(m_Faulty);
  RecordingHandler handler(Answer::GiveUp);
  library.setErrorHandler(&handler);
  library.setSymbolsWanted(false);
  ASSERT_TRUE(readFile("lib.a", library));
  m_Faulty.failCall(1, EIO);
  EXPECT_FALSE(visit(library));
  EXPECT_THAT(handler.take(), ElementsAre("0 I/O error reading file 'lib.a': Input/output error"));
  m_Faulty.failCall(0, 0);
  EXPECT_TRUE(visit(library));
  ASSERT_TRUE(writeFile("lib.a", library));
  EXPECT_TRUE(visit(library));
  EXPECT_THAT(visitedSymbolsOf(library), IsEmpty()) << "the table that was read is gone";
}

TEST_F(TableCursorTest, AnArchiveIsRewrittenAlsoIfItsTableWasNotKept) {
  const ArchiveBuilder builder =
      archive().symbolTable({{"s", "a.o"}}).member("a.o", "12").member("b.o", "34");
  const auto rewritten = [&](bool isWanted) {
    m_Host.addFile("lib.a", builder.bytes());
    Archive library(m_Host);
    library.setSymbolsWanted(isWanted);
    EXPECT_TRUE(readFile("lib.a", library));
    EXPECT_EQ(library.getSymbolTable()->hasContents(), isWanted);
    library.removeMember(library.getMembers()[2]);
    EXPECT_TRUE(writeFile("lib.a", library));
    return std::string(m_Host.at("lib.a").bytes);
  };
  EXPECT_EQ(rewritten(false), rewritten(true));
}

TEST_F(TableCursorTest, ATableThatIsNotStaleIsCopiedAsItStands) {
  m_Host.addFile("lib.a", archive().symbolTable({{"odd", "a.o"}}).member("a.o", "12").bytes());
  Archive library(m_Host);
  library.setSymbolsWanted(false);
  ASSERT_TRUE(readFile("lib.a", library));
  ASSERT_TRUE(writeFile("copy.a", library));
  EXPECT_EQ(m_Host.at("copy.a").bytes, m_Host.at("lib.a").bytes);
}

} // namespace arlib
