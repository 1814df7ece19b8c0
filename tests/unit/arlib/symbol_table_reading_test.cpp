// SPDX-License-Identifier: Apache-2.0
//
// Decoding the symbol table: a count, as many offsets, as many names. The count may be any number,
// offsets may lead to no member or into a table, and names may be cut off: what can be told is
// told, and what is left is right.

#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

Reading readTable(std::string_view contents, Answer answer = Answer::GoOnIfTolerable) {
  return Reading(archive().symbolTableBytes(contents).member("a.o", "x"), answer);
}

void expectRefused(std::string_view contents, const std::string& report) {
  const Reading reading = readTable(contents, Answer::GoOnIfPossible);
  EXPECT_FALSE(reading.isRead);
  EXPECT_THAT(reading.handler.reports, ElementsAre(report));
  EXPECT_TRUE(reading.archive.getMembers().empty());
  EXPECT_TRUE(reading.archive.getSymbols().empty());
  EXPECT_FALSE(isReadWithoutHandler(archive().symbolTableBytes(contents).member("a.o", "x")));
}

void expectDoubtful(const ArchiveBuilder& builder, const std::string& report,
                    const std::vector<std::string>& remaining) {
  const Reading tolerant(builder);
  EXPECT_TRUE(tolerant.isRead);
  EXPECT_THAT(tolerant.handler.reports, ElementsAre(report));
  EXPECT_EQ(symbolNamesOf(tolerant.archive), remaining);
  const Reading strict(builder, Answer::GiveUp);
  EXPECT_FALSE(strict.isRead);
  EXPECT_THAT(strict.handler.reports, ElementsAre(report));
  EXPECT_FALSE(isReadWithoutHandler(builder));
}

const std::string Zeros3(3, '\0');

} // namespace

TEST(SymbolTableReading, KeepsTheTablesOrder) {
  const Reading reading(archive()
                            .symbolTable({{"zeta", "b.o"}, {"alpha", "a.o"}, {"beta", "b.o"}})
                            .member("a.o", "odd")
                            .member("b.o", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(symbolNamesOf(reading.archive), ElementsAre("zeta", "alpha", "beta"));
  const auto symbols = reading.archive.getSymbols();
  EXPECT_EQ(symbols[0]->getDefiningMember(), reading.archive.getMembers()[2]);
  EXPECT_EQ(symbols[1]->getDefiningMember(), reading.archive.getMembers()[1]);
  EXPECT_EQ(symbols[0]->getArchive(), &reading.archive);
  EXPECT_FALSE(symbols[0]->hasBuildAttributes());
}

TEST(SymbolTableReading, SplitsTheAttributeSuffixAtTheFirstMarker) {
  const Reading reading(archive()
                            .symbolTable({{"f$$BuildAttributes$ISA1,FP2", "a.o"},
                                          {"g$$BuildAttributes$", "a.o"},
                                          {"h$$BuildAttributes$x$$BuildAttributes$y", "a.o"},
                                          {"$$BuildAttributes$z", "a.o"},
                                          {"i$$BuildAttribute", "a.o"}})
                            .member("a.o", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(symbolNamesOf(reading.archive), ElementsAre("f", "g", "h", "", "i$$BuildAttribute"));
  const auto symbols = reading.archive.getSymbols();
  EXPECT_EQ(symbols[0]->getAttributeText(), "ISA1,FP2");
  EXPECT_TRUE(symbols[1]->hasBuildAttributes());
  EXPECT_EQ(symbols[1]->getAttributeText(), "");
  EXPECT_EQ(symbols[2]->getAttributeText(), "x$$BuildAttributes$y");
  EXPECT_TRUE(symbols[3]->hasBuildAttributes());
  EXPECT_FALSE(symbols[4]->hasBuildAttributes());
}

TEST(SymbolTableReading, TakesEmptyNamesAndMembersOfAnyKind) {
  const Reading reading(archive().symbolTable({{"", "a"}}).member("a", "no object"));
  ASSERT_TRUE(reading.isRead);
  EXPECT_THAT(reading.handler.reports, IsEmpty());
  EXPECT_THAT(symbolNamesOf(reading.archive), ElementsAre(""));
}

TEST(SymbolTableReading, TakesACountOfZeroWithOrWithoutNulBytesBehindIt) {
  for (const std::string& contents : {bigEndian(0), bigEndian(0) + Zeros3}) {
    const Reading reading = readTable(contents);
    EXPECT_TRUE(reading.isRead);
    EXPECT_THAT(reading.handler.reports, IsEmpty());
    EXPECT_TRUE(reading.archive.getSymbols().empty());
  }
}

TEST(SymbolTableReading, RefusesATableWithoutACount) {
  expectRefused("", "0 Archive symbol table is 0 bytes long, but should contain at least a 4-byte "
                    "symbol count");
  expectRefused(Zeros3, "0 Archive symbol table is 3 bytes long, but should contain at least a "
                        "4-byte symbol count");
}

TEST(SymbolTableReading, RefusesACountThatDoesNotFitInSixtyFourBits) {
  const auto report = [](const char* size, const char* count, const char* required) {
    return std::string("0 Archive symbol table is ") + size +
           " bytes long, but claims to contain " + count + " symbols so it should be at least " +
           required + " bytes long";
  };
  expectRefused(bigEndian(1) + Zeros3, report("7", "1", "8"));
  expectRefused(bigEndian(0x3FFFFFFF), report("4", "1073741823", "4294967296"));
  expectRefused(bigEndian(0x40000000), report("4", "1073741824", "4294967300"));
  expectRefused(bigEndian(0xFFFFFFFF), report("4", "4294967295", "17179869184"));
}

TEST(SymbolTableReading, RefusesANameThatIsCutOff) {
  expectRefused(bigEndian(1) + bigEndian(76),
                "0 Archive symbol table ends in the middle of the name of symbol #0 (out of 1)");
  expectRefused(bigEndian(2) + bigEndian(84) + bigEndian(84) + std::string("a\0b", 3),
                "0 Archive symbol table ends in the middle of the name of symbol #1 (out of 2)");
}

TEST(SymbolTableReading, DropsASymbolAtNoMember) {
  expectDoubtful(
      archive().symbolTable({{"good", "a"}, {"bad", 66}, {"last", "a"}}).member("a", ""),
      "2 Archive symbol table says symbol #1 'bad' is defined in the archive member starting at "
      "offset 66 but no archive member starts there",
      {"good", "last"});
}

TEST(SymbolTableReading, ShowsTheWholeNameOfADroppedSymbol) {
  const Reading reading(archive().symbolTable({{"bad$$BuildAttributes$FP", 66}}).member("a", ""));
  EXPECT_THAT(reading.handler.reports,
              ElementsAre(testing::HasSubstr("symbol #0 'bad$$BuildAttributes$FP' is defined")));
}

TEST(SymbolTableReading, DropsASymbolInATable) {
  expectDoubtful(archive().symbolTable({{"bad", 8}, {"good", "a"}}).member("a", ""),
                 "2 Archive symbol table says symbol #0 'bad' is defined in the archive member "
                 "starting at offset 8, but that member is not an object file",
                 {"good"});
  const ArchiveBuilder names =
      archive().symbolTable({{"bad", 80}}).longNames({"a_long_member_name.o"}).member("a", "");
  expectDoubtful(names,
                 "2 Archive symbol table says symbol #0 'bad' is defined in the archive member "
                 "starting at offset 80, but that member is not an object file",
                 {});
}

// Skipped entries keep their number.
TEST(SymbolTableReading, CountsSkippedEntries) {
  const Reading reading(archive().symbolTable({{"x", 9}, {"y", "a"}, {"z", 11}}).member("a", ""));
  EXPECT_THAT(reading.handler.reports, ElementsAre(testing::HasSubstr("symbol #0 'x'"),
                                                   testing::HasSubstr("symbol #2 'z'")));
}

TEST(SymbolTableReading, ReportsDataBehindTheLastName) {
  const std::string table = bigEndian(1) + bigEndian(84) + std::string("ab\0\0\0x", 6) + "yz";
  const auto builder = archive().symbolTableBytes(table).member("a", "");
  expectDoubtful(builder,
                 "1 Archive symbol table contains unexpected data at offset 13, after all the "
                 "expected data has finished at offset 11",
                 {"ab"});
}

TEST(SymbolTableReading, FindsMembersBehindOddSizes) {
  const Reading reading(
      archive().symbolTable({{"sym", "c"}}).member("a", "1").member("b", "123").member("c", "x"));
  ASSERT_TRUE(reading.isRead);
  EXPECT_EQ(reading.archive.getSymbols()[0]->getDefiningMember(), reading.archive.getMembers()[3]);
}

TEST(SymbolTableReading, TakesNoTableButTheFirstMember) {
  const Reading reading(archive().member("a", "").memberWithNameField("/", bigEndian(7)));
  EXPECT_TRUE(reading.isRead);
  EXPECT_TRUE(reading.archive.getSymbols().empty());
}

TEST(SymbolViews, GiveEachMembersSymbolsInTableOrderAndSorted) {
  Reading reading(archive()
                      .symbolTable({{"z", "a"}, {"m", "b"}, {"a", "a"}, {"\xFF", "a"}, {"a", "a"}})
                      .member("a", "")
                      .member("b", "")
                      .member("c", ""));
  ASSERT_TRUE(reading.isRead);
  const auto names = [](std::span<Symbol* const> symbols) {
    std::vector<std::string> all;
    for (const Symbol* symbol : symbols)
      all.emplace_back(symbol->getName());
    return all;
  };
  const auto members = reading.archive.getMembers();
  EXPECT_THAT(names(reading.archive.getDefinedSymbols(members[1])),
              ElementsAre("z", "a", "\xFF", "a"));
  EXPECT_THAT(names(reading.archive.getSortedDefinedSymbols(members[1])),
              ElementsAre("a", "a", "z", "\xFF"));
  EXPECT_THAT(names(reading.archive.getDefinedSymbols(members[2])), ElementsAre("m"));
  EXPECT_THAT(names(reading.archive.getDefinedSymbols(members[3])), IsEmpty());
  const auto sorted = reading.archive.getSortedDefinedSymbols(members[1]);
  EXPECT_LT(reading.archive.getSymbolIndex(sorted[0]), reading.archive.getSymbolIndex(sorted[1]));
}

TEST(SymbolViews, AreEmptyAfterAFailedRead) {
  Reading reading(archive().symbolTable({{"s", "a"}}).member("a", ""));
  ASSERT_TRUE(reading.isRead);
  EXPECT_EQ(reading.archive.getDefinedSymbols(reading.archive.getMembers()[1]).size(), 1u);
  const ArchiveMember* old = reading.archive.getMembers()[1];
  reading.host.addFile("lib.a", "junk junk");
  EXPECT_FALSE(readFile("lib.a", reading.archive));
  EXPECT_TRUE(reading.archive.getDefinedSymbols(old).empty());
  SymbolList list;
  EXPECT_FALSE(reading.archive.findSymbols("s", list));
}

// ---- Symbols are made when somebody asks

TEST(SymbolTableReading, KnowsTheTableOfTheFileAlsoAfterEdits) {
  Reading reading(archive()
                      .symbolTable({{"a1", "a.o"}, {"b1", "b.o"}, {"a2", "a.o"}, {"c1", "c.o"}})
                      .member("a.o", "1")
                      .member("b.o", "2")
                      .member("c.o", "3"));
  Archive& archive = reading.archive;
  archive.removeMember(archive.getMembers()[2]);
  EXPECT_TRUE(archive.getMembers()[1]->clearType());
  archive.moveMember(archive.getMembers()[2], 1);
  EXPECT_TRUE(archive.updateAuxiliaryMembers());
  EXPECT_THAT(symbolNamesOf(archive), ElementsAre("a1", "a2", "c1"));
  EXPECT_EQ(archive.getSymbols()[2]->getDefiningMember()->getName(), "c.o");
  archive.removeMember(archive.getSymbols()[2]->getDefiningMember());
  EXPECT_THAT(symbolNamesOf(archive), ElementsAre("a1", "a2"));
}

TEST(SymbolTableReading, LeavesOutWhatTheHandlerWentOnFrom) {
  Reading reading(
      archive().symbolTable({{"nowhere", 12345u}, {"a", "a.o"}, {"table", 8u}}).member("a.o", "1"));
  EXPECT_TRUE(reading.isRead);
  EXPECT_EQ(reading.handler.take().size(), 2u);
  EXPECT_THAT(symbolNamesOf(reading.archive), ElementsAre("a"));
  EXPECT_THAT(reading.handler.reports, IsEmpty());
}

} // namespace arlib
