// SPDX-License-Identifier: Apache-2.0
//
// What the user's severities do to messages, and what they cannot do: no error becomes less, no
// remark more, and no number leads out of the table. Elements come from command lines, so the bad
// ones are tested as well as the good.

#include "messages/interface/diagnostic_control.h"

#include "tests/support/messages_fixture.h"

namespace messages {

namespace {

struct DiagnosticControlTest : MessagesTest {
  void reportNonElf() { report(WarningWord, nullptr, AddingNonElfObject, "a", "b"); }
};

uint32_t severityOfNonElf(uint32_t word) {
  return computeEffectiveSeverity(word, AddingNonElfObject);
}

} // namespace

TEST_F(DiagnosticControlTest, ANumberSuppressesItsWarning) {
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticSuppress, "L6875"));
  reportNonElf();
  EXPECT_EQ(getErrorText(), "");
  EXPECT_EQ(getCounters().suppressed, 1u);
  EXPECT_EQ(getCounters().warnings, 0u);
}

TEST_F(DiagnosticControlTest, AWarningRaisedToAnErrorCountsAndKeepsItsLetter) {
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticError, "6875"));
  reportNonElf();
  EXPECT_EQ(getErrorText(), "Error: L6875W: Adding non-ELF object 'a' to archive 'b'\n");
  EXPECT_EQ(getErrorCount(), 1u);
}

TEST_F(DiagnosticControlTest, AWarningLoweredToARemarkHasNeitherPrefixNorCode) {
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticRemark, "L6875W"));
  reportNonElf();
  EXPECT_EQ(getErrorText(), "Adding non-ELF object 'a' to archive 'b'\n");
}

TEST_F(DiagnosticControlTest, RaisedWarningsReachTheLimit) {
  applyDiagnosticOption(DiagnosticError, "warning");
  for (int i = 0; i < 50; ++i)
    reportNonElf();
  EXPECT_EQ(statusOf([&] { reportNonElf(); }), 1);
  EXPECT_EQ(m_Error.writeCount(), 50u);
}

TEST_F(DiagnosticControlTest, WarningMovesAllWarnings) {
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticSuppress, "Warning"));
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Suppressed);
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticError, "WARNING"));
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Error);
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticWarning, "warning"));
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Warning);
}

TEST_F(DiagnosticControlTest, NeitherErrorsNorRemarksMove) {
  applyDiagnosticOption(DiagnosticSuppress, "error");
  applyDiagnosticOption(DiagnosticSuppress, "6838");
  applyDiagnosticOption(DiagnosticSuppress, "6873");
  applyDiagnosticOption(DiagnosticError, "6872");
  EXPECT_EQ(computeEffectiveSeverity(ErrorWord, NoArchiveSpecified), Severity_Error);
  EXPECT_EQ(computeEffectiveSeverity(RemarkWord, CreatingArchive), Severity_Remark);
  EXPECT_EQ(computeEffectiveSeverity(RemarkWord, NoSymbolTable), Severity_Remark);
}

TEST_F(DiagnosticControlTest, EachWayNeedsThePermissionOfTheWord) {
  applyDiagnosticOption(DiagnosticSuppress, "6875");
  EXPECT_EQ(severityOfNonElf(0x30001), Severity_Suppressed);
  EXPECT_EQ(severityOfNonElf(0x30002), Severity_Warning);
  applyDiagnosticOption(DiagnosticError, "6875");
  EXPECT_EQ(severityOfNonElf(0x30001), Severity_Warning);
  EXPECT_EQ(severityOfNonElf(0x30002), Severity_Error);
}

TEST_F(DiagnosticControlTest, TheMapActsOnTheOverriddenSeverity) {
  applyDiagnosticOption(DiagnosticError, "warning");
  applyDiagnosticOption(DiagnosticWarning, "6875");
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Error);
  applyDiagnosticOption(DiagnosticSuppress, "error");
  applyDiagnosticOption(DiagnosticError, "6875");
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Suppressed);
}

TEST_F(DiagnosticControlTest, TheOrderOfMapAndNumberDoesNotMatter) {
  applyDiagnosticOption(DiagnosticError, "WARNING");
  applyDiagnosticOption(DiagnosticError, "L6874");
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Error);
  EXPECT_EQ(computeEffectiveSeverity(WarningWord, NoBaseVariant), Severity_Error);
}

TEST_F(DiagnosticControlTest, RemarkIsABadTargetForAWholeSeverity) {
  EXPECT_TRUE(applyDiagnosticOption(DiagnosticRemark, "warning"));
  EXPECT_TRUE(applyDiagnosticOption(DiagnosticRemark, "Error"));
  EXPECT_EQ(getErrorText(), "Warning: L9962I: Unknown diagnostic number warning\n"
                            "Warning: L9962I: Unknown diagnostic number Error\n");
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Warning);
}

TEST_F(DiagnosticControlTest, AnotherToolsLetterIsPassedOver) {
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticError, "Q6875"));
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticWarning, "Q1234"));
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticError, "warnings"));
  EXPECT_EQ(getErrorText(), "");
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Warning);
}

TEST_F(DiagnosticControlTest, TheToolsLetterCountsInEitherCase) {
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticError, "l6875w"));
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Error);
}

TEST_F(DiagnosticControlTest, AnEmptyElementIsNothing) {
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticError, ""));
  EXPECT_EQ(getErrorText(), "");
}

TEST_F(DiagnosticControlTest, NumbersOutsideTheRangeAreBad) {
  for (const char* text : {"0", "10000", "4294974171", "-1", "+6875", "L", "L-1", "L0", "*", "\xe9",
                           "99999999999999999999999", " 6875"}) {
    EXPECT_TRUE(applyDiagnosticOption(DiagnosticWarning, text)) << text;
  }
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Warning);
  EXPECT_EQ(getCounters().warnings, 12u);
  EXPECT_TRUE(
      getErrorText().starts_with("Warning: L9962I: Unknown diagnostic number 0\n"
                                 "Warning: L9962I: Unknown diagnostic number 10000\n"
                                 "Warning: L9962I: Unknown diagnostic number 4294974171\n"));
}

TEST_F(DiagnosticControlTest, FirstAndLastNumberOfTheRangeAreGood) {
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticError, "1"));
  EXPECT_FALSE(applyDiagnosticOption(DiagnosticError, "09999"));
  EXPECT_EQ(computeEffectiveSeverity(WarningWord, makeKey('L', 1, 'W')), Severity_Error);
  EXPECT_EQ(computeEffectiveSeverity(WarningWord, makeKey('L', 9999, 'W')), Severity_Error);
  EXPECT_EQ(computeEffectiveSeverity(WarningWord, makeKey('L', 10000, 'W')), Severity_Warning);
  EXPECT_EQ(computeEffectiveSeverity(WarningWord, makeKey('L', 16383, 'W')), Severity_Warning);
}

TEST_F(DiagnosticControlTest, TheReportOfABadElementCannotBeMoved) {
  applyDiagnosticOption(DiagnosticSuppress, "warning");
  applyDiagnosticOption(DiagnosticError, "9962");
  EXPECT_TRUE(applyDiagnosticOption(DiagnosticError, "0"));
  EXPECT_EQ(getErrorText(), "Warning: L9962I: Unknown diagnostic number 0\n");
}

TEST_F(DiagnosticControlTest, AnOverrideDoesNotChangeWhatWasCounted) {
  reportNonElf();
  applyDiagnosticOption(DiagnosticError, "6875");
  EXPECT_EQ(getCounters().warnings, 1u);
  EXPECT_EQ(getErrorCount(), 0u);
}

TEST_F(DiagnosticControlTest, LiteralFormatsAreOutOfReachOfNumbers) {
  applyDiagnosticOption(DiagnosticSuppress, "warning");
  EXPECT_TRUE(reportFormat(RemarkWord, nullptr, " * %s [%u] : %s", "a", 0u, "a"));
  EXPECT_EQ(getErrorText(), " * a [0] : a\n");
}

TEST_F(DiagnosticControlTest, InitialiseForgetsAllOverrides) {
  applyDiagnosticOption(DiagnosticError, "6875");
  applyDiagnosticOption(DiagnosticSuppress, "warning");
  initialise();
  EXPECT_EQ(severityOfNonElf(WarningWord), Severity_Warning);
}

TEST_F(DiagnosticControlTest, TheStyleOptionMapsToTheThreeStyles) {
  const std::pair<uint32_t, uint32_t> expected[] = {{0, 1}, {1, 0}, {2, 1}, {3, 1}, {4, 2}};
  for (const auto& [enumerator, number] : expected) {
    applyDiagnosticStyle(enumerator);
    EXPECT_EQ(getStyle(), number) << enumerator;
  }
}

} // namespace messages
