// SPDX-License-Identifier: Apache-2.0
//
// Members looked up by name, some of which this run has replaced: the sorted view must give what a
// walk through the archive would, also after it has grown.

#include "quarn/member_names.h"

#include "arlib/interface/archive_file_reader.h"
#include "tests/unit/quarn/driver_fixture.h"

namespace quarn {

class MemberNamesTest : public DriverTest {
protected:
  arlib::ArchiveMember* add(const char* name) { return m_Archive.addMember(name, 0, 0, 0, 0); }

  arlib::Archive m_Archive{m_Host};
};

TEST_F(MemberNamesTest, FindsMembersOfANameInArchiveOrderAndAnyCase) {
  arlib::ArchiveMember* first = add("a.o");
  add("b.o");
  arlib::ArchiveMember* second = add("A.o");
  EXPECT_THAT(MemberNames(m_Archive).find("a.O"), ElementsAre(first, second));
  EXPECT_THAT(MemberNames(m_Archive).find("c.o"), IsEmpty());
}

TEST_F(MemberNamesTest, PassesOverWhatThisRunHasReplaced) {
  givenLibrary({"a.o", "a.o"});
  ASSERT_TRUE(arlib::readFile("lib.a", m_Archive));
  arlib::ArchiveMember* first = m_Archive.getMembers()[0];
  arlib::ArchiveMember* second = m_Archive.getMembers()[1];
  MemberNames names(m_Archive);
  EXPECT_EQ(names.findUnmodified("a.o"), first);
  EXPECT_EQ(names.findUnmodified("a.o"), first);
  first->setContents("new", 3);
  EXPECT_EQ(names.findUnmodified("a.o"), second);
  second->setContents("new", 3);
  EXPECT_EQ(names.findUnmodified("a.o"), nullptr);
  EXPECT_EQ(names.findUnmodified("b.o"), nullptr);
}

TEST_F(MemberNamesTest, StaysTrueWhileTheArchiveGrows) {
  add("a.o");
  const MemberNames names(m_Archive);
  add("a.o");
  EXPECT_EQ(names.find("a.o").size(), 1u);
}

} // namespace quarn
