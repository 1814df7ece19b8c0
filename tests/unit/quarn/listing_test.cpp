// SPDX-License-Identifier: Apache-2.0
//
// The lines of a table of contents, to the letter, in the short form and the long one: order,
// columns, permissions, and dates in local time.

#include "tests/support/test_host.h"
#include "tests/unit/quarn/driver_fixture.h"

namespace quarn {

class ListingTest : public DriverTest {
protected:
  ListingTest() { testsupport::setTimeZone("UTC"); }

  std::string listed(int64_t date, uint32_t uid, uint32_t gid, std::string_view octalMode) {
    m_Host.addFile(
        "lib.a",
        testsupport::archive().member("a.o", "abc").numbers(date, uid, gid, octalMode).bytes());
    return run({"-tv", "lib.a"}).output;
  }
};

TEST_F(ListingTest, ShowsNamesInArchiveOrder) {
  givenLibrary({"b.o", "a.o"});
  EXPECT_EQ(run({"-t", "lib.a"}).output, "b.o\na.o\n");
}

TEST_F(ListingTest, ShowsTheMembersOfWordsInTheirOrder) {
  givenLibrary({"b.o", "a.o"});
  EXPECT_EQ(run({"-t", "lib.a", "a.o", "*"}).output, "a.o\nb.o\na.o\n");
}

TEST_F(ListingTest, ShowsHeadersInTheLongForm) {
  EXPECT_EQ(listed(1700000000, 12, 34, "100644"),
            "rw-r--r--    12/    34      3 Nov 14 22:13 2023 a.o (offset      8)\n");
}

TEST_F(ListingTest, ShowsPermissionsWithoutTheType) {
  EXPECT_THAT(listed(0, 0, 0, "100755"), testing::StartsWith("rwxr-xr-x "));
  EXPECT_THAT(listed(0, 0, 0, "644"), testing::StartsWith("rw-r--r-- "));
  EXPECT_THAT(listed(0, 0, 0, "7000"), testing::StartsWith("--------- "));
}

TEST_F(ListingTest, ShowsDatesInLocalTime) {
  EXPECT_THAT(listed(0, 0, 0, "644"), HasSubstr(" Jan 01 00:00 1970 "));
  testsupport::setTimeZone("XYZ-1");
  EXPECT_THAT(listed(0, 0, 0, "644"), HasSubstr(" Jan 01 01:00 1970 "));
}

TEST_F(ListingTest, ReportsAMemberThatIsNotThere) {
  givenLibrary({"a.o"});
  const RunOutcome outcome = run({"-t", "lib.a", "none.o", "a.o"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.output, "a.o\n");
  EXPECT_EQ(outcome.errors, "Error: L6831E: 'none.o' not present in archive 'lib.a'\n");
}

} // namespace quarn
