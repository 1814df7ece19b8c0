// SPDX-License-Identifier: Apache-2.0
//
// What is told of an attribute section step by step, and the table that it fills; sections are
// written with attribute_bytes.h. Every prefix of a good one and every wrong byte are gone through,
// and owners by the hundred thousand that share their attributes must not be given a copy each. The
// checked reader below it ends the program at a step beyond its bytes.

#include "elfext/interface/attribute_trace.h"

#include "checking/interface/checking.h"
#include "elfext/src/bytes/checked_reader.h"
#include "tests/support/attribute_bytes.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <set>
#include <vector>

namespace elfext {
namespace {

using namespace std::string_literals;
using testing::ElementsAre;
using testing::ExitedWithCode;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Pair;
using testing::SizeIs;

class AttributeTraceTest : public testing::Test {
protected:
  [[nodiscard]] std::string word(size_t number) const {
    return testsupport::word(number, m_IsLittleEndian);
  }
  [[nodiscard]] std::string part(uint32_t kind, const std::string& contents) const {
    return testsupport::subSubsection({kind, contents}, m_IsLittleEndian);
  }
  [[nodiscard]] std::string subsection(const std::string& vendor, const std::string& parts) const {
    return testsupport::subsection(testsupport::ntbs(vendor) + parts, m_IsLittleEndian);
  }
  [[nodiscard]] std::string goodSection() const {
    return "A" +
           subsection("qobix", part(3, "\x05\0\x06\x0a"s) + part(2, "\x01\x02\0\x07\x41"s) +
                                   part(1, "\x05proc\0\x20\x02ZEV\0"s)) +
           subsection("ZEV", part(1, "\x04\x01\x05text\0"s));
  }

  bool trace(const std::string& section) {
    // A copy without room behind it, for the sanitizers to watch.
    m_Sections.emplace_back(section.begin(), section.end());
    m_Trace.clear();
    return traceAttributeSection(m_Table, m_Sections.back(), m_IsLittleEndian, m_Trace);
  }

  bool m_IsLittleEndian = true;
  AttributeTable m_Table;
  std::string m_Trace;
  std::vector<std::vector<uint8_t>> m_Sections;
};

TEST_F(AttributeTraceTest, TellsOfEachStep) {
  EXPECT_TRUE(trace(goodSection()));
  EXPECT_EQ(m_Trace, "\nDecoding attribute buffer, 68 bytes...\n"
                     "Build attributes before decode:\n"
                     "Build attributes decode pass 1:\n"
                     "  Subsection length: 46 out of 67\n"
                     "  Vendor \"qobix\" subsection:\n"
                     "    Symbol subsubsection (size 9 out of 36) (skipped)\n"
                     "    Section subsubsection (size 10 out of 27) (skipped)\n"
                     "    File subsubsection (size 17 out of 17):\n"
                     "  Subsection length: 21 out of 21\n"
                     "  Vendor \"ZEV\" subsection:\n"
                     "    File subsubsection (size 13 out of 13):\n"
                     "Build attributes decode pass 2:\n"
                     "  Subsection length: 46 out of 67\n"
                     "  Vendor \"qobix\" subsection:\n"
                     "    Symbol subsubsection (size 9 out of 36) (skipped)\n"
                     "    Section subsubsection (size 10 out of 27):\n"
                     "      Reading for index 1:\n"
                     "      Reading for index 2:\n"
                     "    File subsubsection (size 17 out of 17) (skipped)\n"
                     "  Subsection length: 21 out of 21\n"
                     "  Vendor \"ZEV\" subsection:\n"
                     "    File subsubsection (size 13 out of 13) (skipped)\n"
                     "Build attributes decode pass 3:\n"
                     "  Subsection length: 46 out of 67\n"
                     "  Vendor \"qobix\" subsection:\n"
                     "    Symbol subsubsection (size 9 out of 36):\n"
                     "      Reading for index 5:\n"
                     "    Section subsubsection (size 10 out of 27) (skipped)\n"
                     "    File subsubsection (size 17 out of 17) (skipped)\n"
                     "  Subsection length: 21 out of 21\n"
                     "  Vendor \"ZEV\" subsection:\n"
                     "    File subsubsection (size 13 out of 13) (skipped)\n"
                     "Decoded build attributes:\n"
                     "  Vendor \"qobix\":\n"
                     "    File (12 bytes):\n"
                     "      CPU_name \"proc\"\n"
                     "      compatibility 2 \"ZEV\"\n"
                     "  Vendor \"ZEV\":\n"
                     "    File (8 bytes):\n"
                     "      PCS_interworking 1\n"
                     "      unaligned \"text\"\n"
                     "  Vendor \"qobix\":\n"
                     "    Section 1 2 (2 bytes):\n"
                     "      CPU_arch_profile 65\n"
                     "    Symbol 5 (2 bytes):\n"
                     "      CPU_arch 10\n");
}

TEST_F(AttributeTraceTest, FillsATableThatPointsBothWays) {
  ASSERT_TRUE(trace(goodSection()));
  EXPECT_THAT(m_Table.global, ElementsAre(0, 1));
  EXPECT_THAT(m_Table.sections, ElementsAre(Pair(1, ElementsAre(2)), Pair(2, ElementsAre(2))));
  EXPECT_THAT(m_Table.symbols, ElementsAre(Pair(5, ElementsAre(3))));
  ASSERT_THAT(m_Table.runs, SizeIs(4));
  EXPECT_THAT(m_Table.runs[0].owners, IsEmpty());
  EXPECT_THAT(m_Table.runs[2].owners, ElementsAre(1, 2));
  EXPECT_EQ(m_Table.runs[3].scope, Tag_Symbol);
  EXPECT_THAT(m_Table.runs[0].attributes,
              ElementsAre(TracedAttribute{5, {}, "proc"}, TracedAttribute{32, 2, "ZEV"}));
}

TEST_F(AttributeTraceTest, ReadsBothByteOrders) {
  ASSERT_TRUE(trace(goodSection()));
  const std::string littleTrace = m_Trace;
  m_IsLittleEndian = false;
  m_Table = {};
  EXPECT_TRUE(trace(goodSection()));
  EXPECT_EQ(m_Trace, littleTrace);
}

size_t countPasses(std::string_view trace) {
  size_t count = 0;
  for (size_t at = 0; (at = trace.find("decode pass ", at)) != std::string_view::npos; ++at)
    ++count;
  return count;
}

TEST_F(AttributeTraceTest, MakesOnlyThePassesThatItNeeds) {
  EXPECT_TRUE(trace("A"));
  EXPECT_EQ(countPasses(m_Trace), 1u);
  EXPECT_TRUE(trace("A" + subsection("qobix", part(1, ""))));
  EXPECT_EQ(countPasses(m_Trace), 1u);
  EXPECT_TRUE(trace("A" + subsection("qobix", part(2, "\x01\0"s) + part(1, ""))));
  EXPECT_EQ(countPasses(m_Trace), 2u);
  EXPECT_TRUE(trace("A" + subsection("qobix", part(3, "\x01\0"s))));
  EXPECT_EQ(countPasses(m_Trace), 3u);
}

TEST_F(AttributeTraceTest, SkipsPartsOfOtherKindsInEveryPassAndAnswersFalse) {
  EXPECT_FALSE(trace("A" + subsection("qobix", part(6, "") + part('\x21', "") + part('\0', ""))));
  EXPECT_EQ(countPasses(m_Trace), 3u);
  EXPECT_THAT(m_Trace, HasSubstr("    CPU_arch subsubsection (size 5 out of 15) (skipped)\n"));
  EXPECT_THAT(m_Trace, HasSubstr("    <tag:33> subsubsection (size 5 out of 10) (skipped)\n"));
  EXPECT_THAT(m_Trace, HasSubstr("    <tag:0> subsubsection (size 5 out of 5) (skipped)\n"));
  EXPECT_THAT(m_Table.runs, IsEmpty());
}

// A kind that there is not makes the section ill formed, and the parts behind it are read on.
TEST_F(AttributeTraceTest, GoesOnBehindAKindThatThereIsNot) {
  for (const uint32_t kind : {0U, 4U, 7U}) {
    m_Table = {};
    EXPECT_FALSE(trace("A" + subsection("qobix", part(kind, "") + part(1, "\x06\x0a")))) << kind;
    EXPECT_EQ(countPasses(m_Trace), kind == 0 ? 1u : 3u);
    EXPECT_THAT(m_Trace, HasSubstr(" subsubsection (size 5 out of 12) (skipped)\n"
                                   "    File subsubsection (size 7 out of 7):\n"));
    EXPECT_THAT(m_Table.runs, SizeIs(1));
  }
}

TEST_F(AttributeTraceTest, AddsToTheTableAndShowsItBefore) {
  ASSERT_TRUE(trace("A" + subsection("qobix", part(1, "\x06\x0a"))));
  ASSERT_TRUE(trace("A" + subsection("qobix", part(2, "\x01\0\x06\x0b"s))));
  EXPECT_THAT(m_Trace, HasSubstr("Build attributes before decode:\n"
                                 "  Vendor \"qobix\":\n"
                                 "    File (2 bytes):\n"
                                 "      CPU_arch 10\n"
                                 "Build attributes decode pass 1:\n"));
  EXPECT_THAT(m_Table.global, ElementsAre(0));
  EXPECT_THAT(m_Table.sections, ElementsAre(Pair(1, ElementsAre(1))));
}

TEST_F(AttributeTraceTest, NamesTagsByVendor) {
  ASSERT_TRUE(trace("A" + subsection("qobix", part(1, "\x04x\0\x22\x01\x43y\0"s)) +
                    subsection("ZEV", part(1, "\x06\x01\x08\x02"))));
  EXPECT_THAT(m_Trace, HasSubstr("      CPU_raw_name \"x\"\n"
                                 "      <tag:34> 1\n"
                                 "      <tag:67> \"y\"\n"));
  EXPECT_THAT(m_Trace, HasSubstr("      uses_exceptions 1\n"
                                 "      <tag:8> 2\n"));
}

TEST_F(AttributeTraceTest, KeepsTheBytesOfOtherVendors) {
  ASSERT_TRUE(trace("A" + subsection("other", part(1, "\x80\x80"))));
  ASSERT_THAT(m_Table.runs, SizeIs(1));
  EXPECT_EQ(m_Table.runs[0].vendor, "other");
  EXPECT_THAT(m_Table.runs[0].bytes, ElementsAre(0x80, 0x80));
  EXPECT_THAT(m_Table.runs[0].attributes, IsEmpty());
}

TEST_F(AttributeTraceTest, WantsTheSignature) {
  for (const std::string& section : {""s, "B"s, "\0A"s}) {
    EXPECT_FALSE(trace(section));
    EXPECT_EQ(m_Trace, "\nDecoding attribute buffer, " + std::to_string(section.size()) +
                           " bytes...\nBuild attributes before decode:\n"
                           "  Signature 'A' not present\n");
  }
}

TEST_F(AttributeTraceTest, EndsAtALengthThatCannotBe) {
  const std::string good = "A" + subsection("qobix", part(1, ""));
  const std::string rest = std::to_string(good.size());
  for (const std::string& bad : {word(4), word(0), word(6) + "x", word(~uint32_t{0}) + "x\0"s}) {
    EXPECT_FALSE(trace(good + bad));
    EXPECT_THAT(m_Trace,
                HasSubstr(" out of " + std::to_string(bad.size()) +
                          "\n    ** corrupt (bad length) **\n"
                          "ABI: attributes section not all consumed: " +
                          rest + " != " + std::to_string(good.size() + bad.size()) + "\n"));
  }
}

TEST_F(AttributeTraceTest, EndsAtALengthThatIsCutOff) {
  EXPECT_FALSE(trace("A\x01\x02\x03"));
  EXPECT_THAT(m_Trace, HasSubstr("pass 1:\n    ** corrupt (bad length) **\n"
                                 "ABI: attributes section not all consumed: 1 != 4\n"));
}

TEST_F(AttributeTraceTest, GoesOnBehindAVendorWithoutAnEnd) {
  EXPECT_FALSE(trace("A" + word(7) + "abc" + subsection("ZEV", part(1, "\x04\x01"))));
  EXPECT_THAT(m_Trace, HasSubstr("  Subsection length: 7 out of 22\n"
                                 "    ** corrupt (bad length) **\n"
                                 "  Subsection length: 15 out of 15\n"));
  EXPECT_THAT(m_Table.global, ElementsAre(0));
}

TEST_F(AttributeTraceTest, GoesOnWithTheNextSubsectionBehindABadSize) {
  for (const uint32_t size : {0u, 4u, 6u, ~0u}) {
    m_Table = {};
    EXPECT_FALSE(trace("A" + subsection("qobix", "\x01" + word(size)) +
                       subsection("ZEV", part(1, "\x04\x01"))));
    EXPECT_THAT(m_Trace, HasSubstr("    File subsubsection (size " + std::to_string(size) +
                                   " out of 5)\n      ** corrupt (bad size) **\n"));
    EXPECT_THAT(m_Trace, testing::Not(HasSubstr("not all consumed")));
    EXPECT_THAT(m_Table.global, ElementsAre(0));
  }
}

TEST_F(AttributeTraceTest, TellsOfAMissingSize) {
  EXPECT_FALSE(trace("A" + subsection("qobix", "\x01\x02\x03\x04")));
  EXPECT_THAT(m_Trace, HasSubstr("    File subsubsection\n      ** corrupt (missing length) **\n"));
}

TEST_F(AttributeTraceTest, EndsARunAtATagThatCannotBe) {
  EXPECT_FALSE(trace("A" + subsection("qobix", part(1, "\x06\x0a\x03\x01\x07\x41"))));
  EXPECT_THAT(m_Table.runs.at(0).attributes, ElementsAre(TracedAttribute{6, 10, {}}));
  EXPECT_FALSE(trace("A" + subsection("ZEV", part(1, "\x04\x01\0\x01"s))));
  EXPECT_THAT(m_Table.runs.at(1).attributes, ElementsAre(TracedAttribute{4, 1, {}}));
}

TEST_F(AttributeTraceTest, TellsEveryPrefixThatIsCutInsideASubsection) {
  const std::string section = goodSection();
  const std::set<size_t> wholeSizes = {1, 47, section.size()};
  for (size_t size = 0; size <= section.size(); ++size) {
    m_Table = {};
    EXPECT_EQ(trace(section.substr(0, size)), wholeSizes.contains(size)) << size;
  }
}

struct Stopped {};

TEST_F(AttributeTraceTest, ReadsNothingOutsideWhateverByteIsWrong) {
  checking::setFaultHandler([](const char*) { throw Stopped(); });
  const std::string section = goodSection();
  for (size_t position = 0; position < section.size(); ++position) {
    for (uint32_t byte = 0; byte < 256; ++byte) {
      std::string damaged = section;
      damaged[position] = static_cast<char>(byte);
      m_Table = {};
      m_Sections.clear();
      try {
        EXPECT_TRUE(trace(damaged) || damaged != section);
      } catch (const Stopped&) {
        EXPECT_NE(damaged, section);
      }
    }
  }
  checking::setFaultHandler(nullptr);
}

// Half a million owners share as many attributes.
TEST_F(AttributeTraceTest, NeedsNoMoreThanTheSectionsSizeForSharedRuns) {
  std::string contents(500'000, '\x01');
  contents += '\0';
  for (int i = 0; i < 250'000; ++i)
    contents += "\x06\x0a";
  EXPECT_TRUE(trace("A" + subsection("qobix", part(2, contents))));
  ASSERT_THAT(m_Table.runs, SizeIs(1));
  EXPECT_EQ(m_Table.sections.at(1).size(), 500'000u);
  EXPECT_LT(m_Trace.size(), 50u * contents.size());
}

// So do a hundred thousand runs share a vendor.
TEST_F(AttributeTraceTest, ShowsALongVendorOnceForAllOfItsRuns) {
  std::string parts;
  for (int i = 0; i < 100'000; ++i)
    parts += part(1, "");
  const std::string section = "A" + subsection(std::string(500'000, 'v'), parts);
  EXPECT_TRUE(trace(section));
  EXPECT_LT(m_Trace.size(), 50u * section.size());
}

using AttributeTraceDeathTest = AttributeTraceTest;

TEST_F(AttributeTraceDeathTest, StopsTheProgramWhereAttributesRunPastTheirEnd) {
  // A tag, a number, a text; a list of owners; and a kind, which is no attribute.
  for (const std::string& parts : {part(1, "\x86"), part(1, "\x06"), part(1, "\x05xy"),
                                   part(1, "\x20\x01"), part(2, "\x01"), part(2, ""), "\x81"s}) {
    EXPECT_EXIT(trace("A" + subsection("qobix", parts) + subsection("qobix", "")),
                ExitedWithCode(1), "^DW_UTIL: Out of buffer\n$");
  }
}

// ---- The reader

constexpr uint8_t Bytes[] = {0x01, 0x02, 0x03, 0x04, 'a', 'b', 0x00, 0xE5, 0x8E, 0x26};

TEST(CheckedReaderTest, ReadsOneAfterTheOther) {
  CheckedReader little(Bytes, true);
  EXPECT_EQ(little.readWord(), 0x04030201u);
  EXPECT_TRUE(little.isAtText());
  EXPECT_EQ(little.readText(), "ab");
  EXPECT_FALSE(little.isAtText());
  EXPECT_EQ(little.getRemaining(), 3u);
  EXPECT_EQ(little.readUleb(), 624485u);
  EXPECT_TRUE(little.isAtEnd());

  CheckedReader big(Bytes, false);
  EXPECT_EQ(big.readWord(), 0x01020304u);
  EXPECT_EQ(big.readByte(), 'a');
}

TEST(CheckedReaderTest, GivesPartsTheirOwnEnd) {
  CheckedReader reader(Bytes, false);
  CheckedReader part = reader.takePart(2);
  EXPECT_EQ(part.getRemaining(), 2u);
  EXPECT_EQ(reader.readByte(), 0x03);
}

TEST(CheckedReaderDeathTest, StopsTheProgramAtTheEnd) {
  const auto stops = [](size_t size, auto read) {
    CheckedReader reader({Bytes + 4, size}, true);
    EXPECT_EXIT(static_cast<void>(read(reader)), ExitedWithCode(1), "^DW_UTIL: Out of buffer\n$");
  };
  stops(0, [](CheckedReader& reader) { return reader.readByte(); });
  stops(3, [](CheckedReader& reader) { return reader.readWord(); });
  stops(0, [](CheckedReader& reader) { return reader.readUleb(); });
  stops(2, [](CheckedReader& reader) { return reader.readText(); });
  stops(5, [](CheckedReader& reader) {
    reader.takePart(3);
    return reader.readUleb();
  });
  stops(4, [](CheckedReader& reader) { return reader.takePart(5); });
}

} // namespace
} // namespace elfext
