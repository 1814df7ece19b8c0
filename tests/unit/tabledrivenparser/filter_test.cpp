// SPDX-License-Identifier: Apache-2.0
//
// Parsing for some options only, as a client does that looks at a command line twice: the others
// are passed over without a word, and bad arguments of the listed ones are still told.

#include "tool_table.h"

namespace tabledrivenparser::tool {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr uint32_t OnlyStyleAndVerbose[] = {Id_DiagStyle, Id_Verbose};

uint32_t parseFiltered(Session& session, const char* word, const char* next = nullptr) {
  return session.parser().parseWord(word, next, OnlyStyleAndVerbose);
}

TEST(FilteredParse, StoresTheListedOptions) {
  Session session;
  EXPECT_EQ(parseFiltered(session, "--diag_style", "gnu"), 2u);
  EXPECT_EQ(parseFiltered(session, "-v"), 1u);
  EXPECT_EQ(session.parser().getEnumerator(Id_DiagStyle), 4u);
  EXPECT_TRUE(session.parser().getBoolean(Id_Verbose));
}

TEST(FilteredParse, PassesOverTheOthersWithoutTheirArguments) {
  Session session;
  EXPECT_EQ(parseFiltered(session, "-a", "pos"), 1u);
  EXPECT_EQ(parseFiltered(session, "-a"), 1u);
  EXPECT_EQ(parseFiltered(session, "--normalise=abc"), 1u);
  EXPECT_EQ(parseFiltered(session, "word"), 1u);
  EXPECT_EQ(session.parser().getSetCounter(), 0u);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(FilteredParse, SkipsWordsThatNoRowAccepts) {
  Session session;
  EXPECT_EQ(parseFiltered(session, "--nonsense"), 0u);
  EXPECT_EQ(parseFiltered(session, "--create=1"), 0u);
  EXPECT_EQ(parseFiltered(session, "-k"), 0u);
  EXPECT_THAT(session.getReports(), IsEmpty());
}

TEST(FilteredParse, StillReportsBadArgumentsOfListedOptions) {
  Session session;
  EXPECT_EQ(parseFiltered(session, "--diag_style=x"), 1u);
  EXPECT_THAT(session.getReports(),
              ElementsAre("fatal: Argument 'x' not permitted for option 'diag_style'."));
}

TEST(FilteredParse, ReadsViaFilesThroughTheFilter) {
  Session session;
  session.m_Files.m_Contents["f"] = "-t --diag_style=ide word --via g";
  session.m_Files.m_Contents["g"] = "-v";
  EXPECT_EQ(parseFiltered(session, "--via", "f"), 2u);
  EXPECT_EQ(session.parser().getEnumerator(Id_DiagStyle), 2u);
  EXPECT_TRUE(session.parser().getBoolean(Id_Verbose));
  EXPECT_FALSE(session.parser().getBoolean(Id_List));
  EXPECT_THAT(session.texts(Id_Words), IsEmpty());
  EXPECT_THAT(session.texts(Id_Via), ElementsAre("f", "g"));
}

TEST(FilteredParse, SetsTheEndOfOptions) {
  Session session;
  EXPECT_EQ(parseFiltered(session, "--"), 1u);
  EXPECT_TRUE(session.parser().isEndOfOptions());
}

} // namespace tabledrivenparser::tool
