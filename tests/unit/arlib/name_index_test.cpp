// SPDX-License-Identifier: Apache-2.0
//
// Look-ups of members by name, compared with a look at each member.
#include "arlib/interface/name_index.h"

#include "arlib/interface/name_order.h"
#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

class NameIndexTest : public ArchiveTest {
protected:
  void expectAsLookedThrough(std::string_view name) {
    std::vector<ArchiveMember*> wanted;
    for (ArchiveMember* member : m_Archive.getMembers()) {
      if (compareIgnoringCase(member->getName(), name) == 0) wanted.push_back(member);
    }
    EXPECT_THAT(m_Index.getMembers(m_Index.find(name)), testing::ElementsAreArray(wanted)) << name;
  }

  void expectAllAsLookedThrough() {
    const std::span<ArchiveMember* const> members = m_Archive.getMembers();
    m_Index = NameIndex({members.begin(), members.end()}, compareIgnoringCase);
    for (const ArchiveMember* member : members)
      expectAsLookedThrough(member->getName());
    for (const char* name : {"", "a", "b.o", "no such name"})
      expectAsLookedThrough(name);
  }

  NameIndex m_Index;
};

} // namespace

TEST_F(NameIndexTest, FindsNothingAmongNoMembers) {
  expectAllAsLookedThrough();
}

TEST_F(NameIndexTest, FindsTheMembersOfANameInTheirOrder) {
  for (const char* name : {"b.o", "a.o", "B.O", "", "long.o", "b.o", "LONG.O", "", "c.o", "b.O"})
    m_Archive.addMember(name, 0, 0, 0, 0);
  expectAllAsLookedThrough();
}

// Of two entries of the table, in two spellings, and of their ends.
TEST_F(NameIndexTest, FindsNamesThatShareTheirBytes) {
  testsupport::ArchiveBuilder builder = testsupport::archive();
  builder.longNamesText("name_of_many_members.o/\nNAME_OF_MANY_members.o/\n");
  for (const char* field : {"/24", "/0", "/5", "/29", "/0", "/24", "/28", "/4", "/8", "/32", "/0"})
    builder.memberWithNameField(field, "");
  read(builder);
  expectAllAsLookedThrough();
}

} // namespace arlib
