// SPDX-License-Identifier: Apache-2.0
//
// Each call of the host failing in turn: the old archive or the new one, nothing else left behind,
// and an error told whenever what was asked for was not done.

#include "tests/support/faulty_host.h"
#include "tests/unit/quarn-ar/ar_fixture.h"

#include <cerrno>

namespace quarn_ar {

namespace {

class FaultsTest : public ArTest, public testing::WithParamInterface<Words> {
protected:
  void fill() {
    m_Host = testsupport::MemoryHost();
    testsupport::ArchiveBuilder library = testsupport::archive();
    library.member("a.o", objectBytes("1")).member("b.o", objectBytes("2"));
    m_Host.addFile("lib.a", library.bytes());
    m_Host.addFile("a.o", testsupport::objectThatDefines("main").bytes());
    givenFile("a_file_with_a_long_name.o", "3");
    m_Host.addFile("words", std::string_view("lib.a a.o"));
    m_Files = m_Host.getNames();
  }
  // As the run leaves it with that call failing; 0 for none.
  RunOutcome runFailing(uint64_t call) {
    fill();
    m_Faulty.failCall(call, EIO);
    return runWork(arMain, "quarn-ar", GetParam(), m_Faulty);
  }

  Words m_Files;
  testsupport::FaultyHost m_Faulty{m_Host};
};

} // namespace

TEST_P(FaultsTest, KeepTheOldArchiveOrMakeTheNewOne) {
  fill();
  const std::string oldArchive = m_Host.read("lib.a");
  EXPECT_EQ(runFailing(0).status, 0);
  const uint64_t needed = m_Faulty.getCallCount();
  const std::string newArchive = m_Host.read("lib.a");
  ASSERT_GT(needed, 5U);
  for (uint64_t call = 1; call <= needed; ++call) {
    const RunOutcome outcome = runFailing(call);
    const std::string what = m_Faulty.getFailedOperation() + " " + m_Faulty.getFailedName();
    EXPECT_EQ(m_Host.getNames(), m_Files) << what;
    EXPECT_EQ(m_Host.openHandles(), 0U) << what;
    EXPECT_EQ(m_Host.read("lib.a"), outcome.status == 0 ? newArchive : oldArchive) << what;
    EXPECT_EQ(outcome.status != 0, outcome.errors.find("Error: ") != std::string::npos) << what;
  }
}

INSTANTIATE_TEST_SUITE_P(Words, FaultsTest,
                         testing::Values(Words{"r", "lib.a", "a.o", "a_file_with_a_long_name.o"},
                                         Words{"q", "lib.a", "a.o"},
                                         Words{"rb", "b.o", "@words", "a_file_with_a_long_name.o"},
                                         Words{"d", "lib.a", "a.o"}, Words{"m", "lib.a", "a.o"},
                                         Words{"s", "lib.a"}));

} // namespace quarn_ar
