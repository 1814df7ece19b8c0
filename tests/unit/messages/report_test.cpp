// SPDX-License-Identifier: Apache-2.0
//
// How diagnostics look, are counted, and end the run: each prefix of each style, locations as far
// as they are known, texts from outside that hold conversions or control bytes, and the error that
// is one too many.

#include "messages/interface/catalogue.h"
#include "tests/support/messages_fixture.h"

namespace messages {

namespace {

struct ReportTest : MessagesTest {
  void reportErrors(int count) {
    for (int i = 0; i < count; ++i)
      report(ErrorWord, nullptr, NoArchiveSpecified);
  }
};

bool limitReached = false;

} // namespace

TEST_F(ReportTest, PrintsPrefixCodeAndText) {
  EXPECT_TRUE(report(ErrorWord, nullptr, NoActionSpecified, "dmpqrtx"));
  EXPECT_TRUE(report(WarningWord, nullptr, AddingNonElfObject, "a.txt", "lib.a"));
  EXPECT_TRUE(report(FatalWord, nullptr, OutOfMemory));
  EXPECT_EQ(getErrorText(), "Error: L6839E: One of the actions -[dmpqrtx] must be specified\n"
                            "Warning: L6875W: Adding non-ELF object 'a.txt' to archive 'lib.a'\n"
                            "Fatal error: L6800U: Out of memory\n");
}

TEST_F(ReportTest, PrintsRemarksWithoutPrefixOrCodeInEveryStyle) {
  for (const uint32_t number : {0u, 1u, 2u}) {
    setStyle(number);
    report(RemarkWord, nullptr, CreatingArchive, "lib.a");
  }
  EXPECT_EQ(getErrorText(), "Creating archive 'lib.a'\n"
                            "quarn : Creating archive 'lib.a'\n"
                            "Creating archive 'lib.a'\n");
}

TEST_F(ReportTest, BeginsWithTheNameOfTheProgramWhereNoFileIsKnown) {
  setProgramName("quarn-ar");
  for (const uint32_t number : {0u, 1u, 2u}) {
    setStyle(number);
    report(RemarkWord, nullptr, CreatingArchive, "lib.a");
    report(ErrorWord, nullptr, NoArchiveSpecified);
    const Location place = {.file = "x.c", .line = 3};
    report(ErrorWord, &place, NoArchiveSpecified);
  }
  const std::string text(getMessageText(NoArchiveSpecified));
  EXPECT_EQ(getErrorText(), "quarn-ar: Creating archive 'lib.a'\n"
                            "quarn-ar: Error: L6838E: " +
                                text +
                                "\n"
                                "\"x.c\", line 3: Error: L6838E: " +
                                text +
                                "\n"
                                "quarn-ar : Creating archive 'lib.a'\n"
                                "quarn-ar : error L6838:  " +
                                text +
                                "\n"
                                "x.c(3) : error L6838:  " +
                                text +
                                "\n"
                                "quarn-ar: Creating archive 'lib.a'\n"
                                "quarn-ar: Error: L6838E: " +
                                text +
                                "\n"
                                "x.c:3: Error: L6838E: " +
                                text + "\n");
}

TEST_F(ReportTest, BeginsWithTheSubjectInTheStylesOfOtherPrograms) {
  setProgramName("quarn-ar");
  setSubject("lib.a");
  for (const uint32_t number : {0u, 1u, 2u}) {
    setStyle(number);
    report(WarningWord, nullptr, AddingNonElfObject, "x", "lib.a");
    const Location place = {.file = "x.c"};
    report(WarningWord, &place, AddingNonElfObject, "x", "lib.a");
  }
  EXPECT_EQ(getErrorText(),
            "quarn-ar: Warning: L6875W: Adding non-ELF object 'x' to archive 'lib.a'\n"
            "\"x.c\": Warning: L6875W: Adding non-ELF object 'x' to archive 'lib.a'\n"
            "lib.a : warning L6875:  Adding non-ELF object 'x' to archive 'lib.a'\n"
            "x.c : warning L6875:  Adding non-ELF object 'x' to archive 'lib.a'\n"
            "lib.a: Warning: L6875W: Adding non-ELF object 'x' to archive 'lib.a'\n"
            "x.c: Warning: L6875W: Adding non-ELF object 'x' to archive 'lib.a'\n");
}

TEST_F(ReportTest, AlwaysShowsTheCodeLetterOfTheTool) {
  report(FatalWord, nullptr, UnrecognizedOption, "--", "x");
  EXPECT_EQ(getErrorText(), "Fatal error: L3900U: Unrecognized option '--x'.\n");
}

TEST_F(ReportTest, PrintsEachPrefixOfEachStyle) {
  const std::pair<uint32_t, const char*> expected[] = {
      {0, "Warning: L6838E: x\nError: L6838E: x\nFatal error: L6838E: x\n"
          "Internal fault: L6838E: x\n"},
      {1, "quarn : warning L6838:  x\nquarn : error L6838:  x\nquarn : Fatal error L6838:  x\n"
          "quarn : Internal fault: L6838:  x\n"},
      {2, "Warning: L6838E: x\nError: L6838E: x\nFatal error: L6838E: x\n"
          "Internal fault: L6838E: x\n"},
  };
  std::string all;
  for (const auto& [number, text] : expected) {
    setStyle(number);
    for (const uint32_t word :
         {WarningWord, ErrorWord, FatalWord, severityWord(Severity_InternalFault)}) {
      report(word, nullptr, NoArchiveSpecified);
    }
    all += text;
  }
  std::string::size_type at = 0;
  while ((at = all.find(" x\n", at)) != std::string::npos)
    all.replace(at, 3, " No archive specified\n");
  EXPECT_EQ(getErrorText(), all);
}

TEST_F(ReportTest, ShowsWhatIsKnownOfTheLocation) {
  const Location nothing{};
  const Location file{"a.via"};
  const Location line{"a.via", 3};
  const Location full{"a.via", 3, 9};
  const Location lineOnly{"", 3};
  const Location columnOnly{"a.via", 0, 9};
  for (const uint32_t number : {0u, 1u, 2u}) {
    setStyle(number);
    for (const Location* location : {&nothing, &file, &line, &full, &lineOnly, &columnOnly}) {
      reportFormat(RemarkWord, location, "x");
    }
  }
  EXPECT_EQ(
      getErrorText(),
      "x\n\"a.via\": x\n\"a.via\", line 3: x\n\"a.via\", line 3 (column 9): x\nx\n\"a.via\": x\n"
      "quarn : x\na.via : x\na.via(3) : x\na.via(3,9) : x\nquarn : x\na.via : x\n"
      "x\na.via: x\na.via:3: x\na.via:3:9: x\nx\na.via: x\n");
}

TEST_F(ReportTest, StyleOneHasToolNameAndNoSeverityLetter) {
  setStyle(1);
  report(ErrorWord, nullptr, NoActionSpecified, "dmpqrtx");
  EXPECT_EQ(getErrorText(),
            "quarn : error L6839:  One of the actions -[dmpqrtx] must be specified\n");
}

TEST_F(ReportTest, PrintsALiteralFormatWithoutCode) {
  EXPECT_TRUE(reportFormat(RemarkWord, nullptr, "[%s %s]", "quarn", "-t 100%s.a"));
  EXPECT_TRUE(reportFormat(WarningWord, nullptr, "odd"));
  EXPECT_EQ(getErrorText(), "[quarn -t 100%s.a]\nWarning: odd\n");
  EXPECT_EQ(getCounters().remarks, 1u);
  EXPECT_EQ(getCounters().warnings, 1u);
}

TEST_F(ReportTest, PrintsNoNewlineBehindAnEmptyText) {
  reportFormat(RemarkWord, nullptr, "");
  EXPECT_EQ(getErrorText(), "");
  reportFormat(RemarkWord, nullptr, " * %s clashes with %s\n", "A", "B");
  EXPECT_EQ(getErrorText(), " * A clashes with B\n\n");
}

TEST_F(ReportTest, NeverReadsAnArgumentAsFormat) {
  report(ErrorWord, nullptr, MalformedArchive, "%s%n%d", "%1$s %%");
  EXPECT_EQ(getErrorText(), "Error: L6829E: '%s%n%d': malformed archive: %1$s %%\n");
}

TEST_F(ReportTest, EscapesControlBytesAndPassesTheOthers) {
  report(ErrorWord, nullptr, FileDoesNotExist, "a\001\r\033[0m\177\\\t\n\xe3\x81\x82\xff");
  EXPECT_EQ(
      getErrorText(),
      "Error: L6833E: File 'a\\001\\015\\033[0m\\177\\\t\n\xe3\x81\x82\xff' does not exist\n");
}

TEST_F(ReportTest, PrintsVeryLongNamesWhole) {
  const std::string name(100000, 'n');
  report(ErrorWord, nullptr, FileDoesNotExist, name);
  EXPECT_EQ(getErrorText(), "Error: L6833E: File '" + name + "' does not exist\n");
}

TEST_F(ReportTest, WritesEachDiagnosticWithOneCall) {
  report(ErrorWord, nullptr, FileDoesNotExist, "a\001");
  report(ErrorWord, nullptr, FileDoesNotExist, "b");
  EXPECT_EQ(m_Error.writeCount(), 2u);
}

TEST_F(ReportTest, CountsEachSeverity) {
  report(severityWord(Severity_Suppressed), nullptr, NoArchiveSpecified);
  for (int i = 0; i < 2; ++i)
    report(RemarkWord, nullptr, NoArchiveSpecified);
  for (int i = 0; i < 3; ++i)
    report(WarningWord, nullptr, NoArchiveSpecified);
  for (int i = 0; i < 4; ++i)
    report(ErrorWord, nullptr, NoArchiveSpecified);
  for (int i = 0; i < 5; ++i)
    report(FatalWord, nullptr, NoArchiveSpecified);
  for (int i = 0; i < 6; ++i) {
    report(severityWord(Severity_InternalFault), nullptr, NoArchiveSpecified);
  }
  const Counters counted = getCounters();
  EXPECT_EQ(counted.suppressed, 1u);
  EXPECT_EQ(counted.remarks, 2u);
  EXPECT_EQ(counted.warnings, 3u);
  EXPECT_EQ(counted.errors, 4u);
  EXPECT_EQ(counted.fatalErrors, 5u);
  EXPECT_EQ(counted.internalFaults, 6u);
  EXPECT_EQ(getErrorCount(), 4u);
}

TEST_F(ReportTest, ASuppressedMessageIsCountedAndNotPrinted) {
  EXPECT_FALSE(report(severityWord(Severity_Suppressed), nullptr, NoArchiveSpecified));
  EXPECT_FALSE(reportFormat(severityWord(Severity_Suppressed), nullptr, "x"));
  EXPECT_EQ(getErrorText(), "");
  EXPECT_EQ(getCounters().suppressed, 2u);
}

TEST_F(ReportTest, TheFiftyFirstErrorEndsTheRunUnprinted) {
  reportErrors(50);
  const std::string before = getErrorText();
  EXPECT_EQ(statusOf([&] { reportErrors(1); }), 1);
  EXPECT_EQ(getErrorText(), before);
  EXPECT_EQ(m_Error.writeCount(), 50u);
}

TEST_F(ReportTest, ErrorsFatalErrorsAndInternalFaultsCountTogetherForTheLimit) {
  reportErrors(48);
  report(FatalWord, nullptr, OutOfMemory);
  report(severityWord(Severity_InternalFault), nullptr, OutOfMemory);
  EXPECT_EQ(statusOf([] { report(FatalWord, nullptr, OutOfMemory); }), 1);
  EXPECT_EQ(m_Error.writeCount(), 50u);
}

TEST_F(ReportTest, WarningsAndRemarksNeverReachTheLimit) {
  reportErrors(50);
  for (int i = 0; i < 60; ++i)
    report(WarningWord, nullptr, NoArchiveSpecified);
  for (int i = 0; i < 60; ++i)
    report(RemarkWord, nullptr, NoArchiveSpecified);
  EXPECT_EQ(m_Error.writeCount(), 170u);
}

TEST_F(ReportTest, CallsAnotherLimitHandlerOnlyOnceAndGoesOnIfItReturns) {
  limitReached = false;
  setLimit(1, [] { limitReached = true; });
  reportErrors(1);
  EXPECT_FALSE(limitReached);
  reportErrors(1);
  EXPECT_TRUE(limitReached);
  limitReached = false;
  reportErrors(1);
  EXPECT_FALSE(limitReached);
  EXPECT_EQ(m_Error.writeCount(), 3u);
}

TEST_F(ReportTest, PlainMessagesKeepAccountOfTheColumn) {
  plainMessage(NoArchiveSpecified);
  EXPECT_EQ(getColumn(), 20u);
  plainMessage(NoArchiveSpecified);
  EXPECT_EQ(getColumn(), 40u);
  plainMessage(SelectableArguments, "x", "ab");
  EXPECT_EQ(getColumn(), 3u);
  plainMessage(ListedMember, "a.o");
  EXPECT_EQ(getColumn(), 0u);
  EXPECT_EQ(getErrorText(), "No archive specifiedNo archive specified"
                            "The following arguments to option 'x' can be selected:\n aba.o\n");
  EXPECT_EQ(getCounters().remarks, 0u);
}

TEST_F(ReportTest, DiagnosticsAndListingLinesResetTheColumn) {
  plainMessage(NoArchiveSpecified);
  listingMessage(ListedMember, "a.o");
  EXPECT_EQ(getColumn(), 0u);
  plainMessage(NoArchiveSpecified);
  listingMessage(NoArchiveSpecified);
  EXPECT_EQ(getColumn(), 20u);
  report(RemarkWord, nullptr, NoArchiveSpecified);
  EXPECT_EQ(getColumn(), 0u);
}

TEST_F(ReportTest, ListingsGoToStdoutWhateverTheStreamOfDiagnostics) {
  listingMessage(ListedMember, "a\001.o");
  EXPECT_EQ(outputText(), "a\\001.o\n");
  EXPECT_EQ(getErrorText(), "");
  EXPECT_EQ(getCounters().remarks, 0u);
  setDiagnosticStream(Stream::Output);
  report(ErrorWord, nullptr, NoArchiveSpecified);
  plainMessage(ListedMember, "b.o");
  EXPECT_EQ(outputText(), "a\\001.o\nError: L6838E: No archive specified\nb.o\n");
  EXPECT_EQ(getErrorText(), "");
}

TEST_F(ReportTest, AFormatThatReachesBeyondTwentyArgumentsEndsTheRun) {
  EXPECT_EQ(statusOf([] { reportFormat(RemarkWord, nullptr, "%21$s", "a"); }), 1);
  EXPECT_EQ(getErrorText(), "** NLS Fatal Error: Too many arguments in format string\n");
}

TEST_F(ReportTest, InitialiseBringsBackTheStateOfAFreshProcess) {
  setStyle(1);
  setDiagnosticStream(Stream::Output);
  reportErrors(3);
  plainMessage(NoArchiveSpecified);
  setLimit(1, [] {});
  initialise();
  EXPECT_EQ(getStyle(), 0u);
  EXPECT_EQ(getDiagnosticStream(), Stream::Error);
  EXPECT_EQ(getErrorCount(), 0u);
  EXPECT_EQ(getColumn(), 0u);
  reportErrors(50);
  EXPECT_EQ(statusOf([&] { reportErrors(1); }), 1);
}

} // namespace messages
