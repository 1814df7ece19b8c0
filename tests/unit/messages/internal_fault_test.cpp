// SPDX-License-Identifier: Apache-2.0
//
// Faults of the program: their line, their number, and that they end the run. Those of the checking
// and region libraries must come this way too, and a fault in reporting a fault must not go round
// in circles.

#include "alloclib/interface/handlers.h"
#include "checking/interface/checking.h"
#include "tests/support/messages_fixture.h"

#include <new>

namespace messages {

namespace {

struct InternalFaultTest : MessagesTest {};

} // namespace

TEST_F(InternalFaultTest, PrintsNumberVersionAndMessageAndEndsTheRun) {
  EXPECT_EQ(statusOf([] { internalFault("Broken %s", "thing"); }), 1);
  EXPECT_EQ(getErrorText(), "Internal fault: [0x1698f9:1000001] Broken thing\n");
  EXPECT_EQ(getCounters().internalFaults, 1u);
}

TEST_F(InternalFaultTest, StartsWithTheToolNameInStyleOne) {
  setStyle(1);
  EXPECT_EQ(statusOf([] { internalFault("Broken %s", "thing"); }), 1);
  EXPECT_EQ(getErrorText(), "quarn : Internal fault: [0x1698f9:1000001] Broken thing\n");
}

TEST_F(InternalFaultTest, ShowsTheHostsNumberWithSixDigits) {
  EXPECT_EQ(statusOf([] { internalFault("a"); }), 1);
  EXPECT_EQ(getErrorText(), "Internal fault: [0x000061:1000001] a\n");
}

TEST_F(InternalFaultTest, EndsSilentlyAtTheLimit) {
  setLimit(0, nullptr);
  EXPECT_EQ(statusOf([] { internalFault("a"); }), 1);
  EXPECT_EQ(getErrorText(), "");
}

TEST(FaultHash, EndsAtTheFirstNewline) {
  EXPECT_EQ(computeFaultHash("Broken %s\nmore"), 0x1698f9u);
  EXPECT_EQ(computeFaultHash(""), 0u);
}

TEST(FaultHash, CountsABackslashAsASlash) {
  EXPECT_EQ(computeFaultHash("a\\b"), computeFaultHash("a/b"));
}

TEST(FaultHash, CutsThePathOfAnAssertionToItsLastWorkComponent) {
  const uint32_t hash = computeFaultHash("Assertion failed: work/arlib/src/a.cpp line 12 (%s)");
  EXPECT_EQ(hash, 0x017813u);
  for (const char* text : {"Assertion failed: /home/me/work/arlib/src/a.cpp line 12 (%s)",
                           "Assertion failed: C:\\work\\x\\work\\arlib\\src\\a.cpp line 12 (%s)",
                           "Assertion failed: /work/work/arlib/src/a.cpp line 12 (%s)"}) {
    EXPECT_EQ(computeFaultHash(text), hash) << text;
  }
}

TEST(FaultHash, TakesOnlyAWholeComponentForTheTree) {
  const char* const whole = "Assertion failed: /homework/workshop/a.cpp line 12 (%s)";
  EXPECT_NE(computeFaultHash(whole),
            computeFaultHash("Assertion failed: work/workshop/a.cpp line 12 (%s)"));
  EXPECT_NE(computeFaultHash(whole),
            computeFaultHash("Assertion failed: workshop/a.cpp line 12 (%s)"));
  EXPECT_NE(computeFaultHash("Broken /work/a.cpp"), computeFaultHash("Broken work/a.cpp"));
}

TEST_F(InternalFaultTest, AFailedAssertionShowsPathLineAndExpression) {
  EXPECT_EQ(statusOf([] { assertionFault("quarn/src/a.cpp", 12, "m_Type != NULL"); }), 1);
  EXPECT_EQ(getErrorText(), "Internal fault: [0x208ed2:1000001] Assertion failed: quarn/src/a.cpp "
                            "line 12 (m_Type != NULL)\n");
}

TEST_F(InternalFaultTest, AnExpressionIsNotReadAsFormat) {
  EXPECT_EQ(statusOf([] { assertionFault("a.cpp", 1, "x %s 2"); }), 1);
  EXPECT_TRUE(getErrorText().ends_with("Assertion failed: a.cpp line 1 (x %s 2)\n"));
}

TEST_F(InternalFaultTest, FailedAssertionsOfAllLibrariesComeHere) {
  EXPECT_EQ(statusOf([] { QUARN_ASSERT(1, 1 + 1 == 3); }), 1);
  EXPECT_NE(getErrorText().find(" Assertion failed: "), std::string::npos);
  EXPECT_TRUE(getErrorText().ends_with(" (1 + 1 == 3)\n"));
}

TEST_F(InternalFaultTest, FaultsOfTheCheckingLibraryComeHere) {
  EXPECT_EQ(statusOf([] { checking::reportFault("Unreachable code: set_checking_level"); }), 1);
  EXPECT_EQ(getErrorText(),
            "Internal fault: [0xc1295b:1000001] Unreachable code: set_checking_level\n");
}

TEST_F(InternalFaultTest, CheckingLevelsAreShownRawOnTheStreamOfDiagnostics) {
  setStyle(1);
  EXPECT_TRUE(checking::set_checking_level("show"));
  EXPECT_EQ(getErrorText(), "COLD LOW checks enabled\nHOT LOW checks enabled\n");
}

TEST_F(InternalFaultTest, RunningOutOfRegionMemoryIsFatal) {
  EXPECT_EQ(statusOf([] { alloclib::outOfMemory(1000); }), 1);
  EXPECT_EQ(getErrorText(), "Fatal error: L6800U: Out of memory\n");
}

TEST_F(InternalFaultTest, RunningOutOfHeapMemoryIsFatal) {
  EXPECT_EQ(statusOf([] { std::get_new_handler()(); }), 1);
  EXPECT_EQ(getErrorText(), "Fatal error: L6800U: Out of memory\n");
}

TEST_F(InternalFaultTest, AnErrorInsideTheRegionsEndsTheRun) {
  EXPECT_EQ(statusOf([] { alloclib::internalError("RegionStats list is inconsistent"); }), 1);
  EXPECT_EQ(getErrorText(), "Internal alloclib error: RegionStats list is inconsistent\n");
}

TEST_F(InternalFaultTest, ABadFormatIsAFaultAndIsShownUnread) {
  EXPECT_EQ(statusOf([] { reportFormat(RemarkWord, nullptr, "%d of %s", "a"); }), 1);
  EXPECT_EQ(getErrorText(),
            "Internal fault: [0xeabb11:1000001] Messages: Bad message format %d of %s\n\n");
}

TEST_F(InternalFaultTest, ABadFormatOfAFaultIsShownAsItIs) {
  EXPECT_EQ(statusOf([] { internalFault("a %d", "x"); }), 1);
  EXPECT_TRUE(getErrorText().ends_with("] a %d\n"));
}

TEST_F(InternalFaultTest, ABadSeverityIsAFault) {
  EXPECT_EQ(statusOf([] { report(0x70000, nullptr, NoArchiveSpecified); }), 1);
  EXPECT_EQ(getErrorText(),
            "Internal fault: [0x89cfe0:1000001] Messages: Bad severity number 7\n\n");
}

TEST_F(InternalFaultTest, ABadStyleIsAFault) {
  setStyle(3);
  EXPECT_EQ(statusOf([] { report(ErrorWord, nullptr, NoArchiveSpecified); }), 1);
  EXPECT_EQ(getErrorText(),
            "Internal fault: [0x4541ca:1000001] Messages: unexpected diagnostic style 3\n");
}

} // namespace messages
