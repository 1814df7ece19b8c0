// SPDX-License-Identifier: Apache-2.0
//
// What a table says of members that nobody here can look into, such as another compiler's
// intermediate code: an archive that takes objects of any machine keeps it when it is written.

#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

using elfext::ObjectOutline;

// "lib.a" with two plain members, an object between them, and a table that knows all three.
class KeptSymbols : public testing::Test {
protected:
  explicit KeptSymbols(ObjectOutline::Machines machines = ObjectOutline::Machines::Any) {
    const std::vector<ArchiveBuilder::Symbol> symbols = {
        {"first", "a.bc"}, {"stale", "b.o"}, {"last", "c.bc"}, {"other", "c.bc"}};
    m_Host.addFile("lib.a", archive()
                                .symbolTable(symbols)
                                .member("a.bc", "plain")
                                .member("b.o", testsupport::objectThatDefines("fresh").bytes())
                                .member("c.bc", "plain too")
                                .bytes());
    m_Archive.setErrorHandler(&m_Handler);
    m_Archive.setMachines(machines);
    m_Archive.setSymbolsWanted(false);
    EXPECT_TRUE(readFile("lib.a", m_Archive));
    m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  }
  ArchiveMember* member(const char* name) {
    ArchiveMemberList list;
    EXPECT_TRUE(m_Archive.findMembers(name, list));
    return list[0];
  }
  std::vector<std::string> write() {
    EXPECT_TRUE(writeFile("lib.a", m_Archive));
    EXPECT_THAT(m_Handler.reports, IsEmpty());
    Archive written(m_Host);
    EXPECT_TRUE(readFile("lib.a", written));
    return visitedSymbolsOf(written);
  }

  MemoryHost m_Host;
  RecordingHandler m_Handler{Answer::GoOnIfTolerable};
  Archive m_Archive{m_Host};
};

class ForgottenSymbols : public KeptSymbols {
protected:
  ForgottenSymbols() : KeptSymbols(ObjectOutline::Machines::Own) {}
};

} // namespace

TEST_F(KeptSymbols, AreThoseOfMembersThatAreNoObjects) {
  EXPECT_THAT(write(),
              ElementsAre("first in a.bc", "fresh in b.o", "last in c.bc", "other in c.bc"));
}

TEST_F(KeptSymbols, FollowTheirMembers) {
  m_Archive.moveMember(member("c.bc"), 1);
  EXPECT_THAT(write(),
              ElementsAre("last in c.bc", "other in c.bc", "first in a.bc", "fresh in b.o"));
}

TEST_F(KeptSymbols, StayWhereOthersComeAndGo) {
  m_Host.addFile("a_file_with_a_long_name.txt", "new");
  EXPECT_NE(m_Archive.addMemberFromFile("a_file_with_a_long_name.txt"), nullptr);
  m_Archive.removeMember(member("a.bc"));
  EXPECT_THAT(write(), ElementsAre("fresh in b.o", "last in c.bc", "other in c.bc"));
}

TEST_F(KeptSymbols, GoWithTheBytesThatTheyWereToldOf) {
  m_Host.addFile("c.bc", "changed");
  EXPECT_TRUE(member("c.bc")->setContentsFromFile("c.bc"));
  EXPECT_THAT(write(), ElementsAre("first in a.bc", "fresh in b.o"));
}

TEST_F(KeptSymbols, AreLeftOutWhereThereIsToBeNoTable) {
  m_Archive.setSymbolTableMode(SymbolTableMode::Never);
  EXPECT_THAT(write(), IsEmpty());
}

// A build of one module among others is told by its object, and by nobody else.
TEST_F(KeptSymbols, AreNoneThatTellABuild) {
  const std::vector<ArchiveBuilder::Symbol> symbols = {{"f$$BuildAttributes$x", "a.bc"},
                                                       {"f", "a.bc"}};
  m_Host.addFile("other.a", archive().symbolTable(symbols).member("a.bc", "plain").bytes());
  EXPECT_TRUE(readFile("other.a", m_Archive));
  m_Archive.setSymbolTableMode(SymbolTableMode::Always);
  EXPECT_TRUE(writeFile("lib.a", m_Archive));
  Archive written(m_Host);
  EXPECT_TRUE(readFile("lib.a", written));
  EXPECT_THAT(visitedSymbolsOf(written), ElementsAre("f in a.bc"));
}

TEST_F(ForgottenSymbols, AreAllWhereOnlyOurOwnMachinesCount) {
  EXPECT_THAT(write(), ElementsAre("fresh in b.o"));
}

} // namespace arlib
