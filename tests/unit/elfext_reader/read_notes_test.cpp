// SPDX-License-Identifier: Apache-2.0
//
// Debug overlay sections, and the note that maps sections to segments: rows and descriptors that
// are too small, cut off by their section, or name what there is not.

#include "elfext/interface/segment.h"
#include "tests/support/reader_fixture.h"

#include <functional>

namespace elfext {

using ReadNotesTest = ReaderTest;
using ReadNotesOfEachFormTest = EachFormTest;

INSTANTIATE_TEST_SUITE_P(Forms, ReadNotesOfEachFormTest, testing::ValuesIn(AllForms), formName);

namespace {

// Sections 1 to 4: .debug_info, .line, C$$fpmap, .text; section 5 is the overlay section.
ObjectBuilder withDebugSections(ObjectBuilder file = object()) {
  file.section(".debug_info", SHT_PROGBITS);
  file.section(".line", SHT_PROGBITS);
  file.section("C$$fpmap", SHT_PROGBITS);
  file.section(".text", SHT_PROGBITS);
  return file;
}

} // namespace

TEST_P(ReadNotesOfEachFormTest, OverlayRecordsHaveAWordAndTwoSections) {
  const uint64_t wordSize = GetParam().isWide() ? 8 : 4;
  ObjectBuilder narrow = withDebugSections(GetParam().object());
  narrow.section(".overlay", SHT_ZEV_DEBUGOVERLAY)
      .entrySize(wordSize + 4)
      .addressWord(0x12345678)
      .half(1)
      .half(4)
      .addressWord(2)
      .half(2)
      .half(0)
      .bytes("abc");
  ObjectBuilder wide = withDebugSections(GetParam().object());
  wide.section(".overlay", SHT_ZEV_DEBUGOVERLAY)
      .entrySize(wordSize + 9)
      .addressWord(0x12345678)
      .word(1)
      .word(4)
      .bytes("x")
      .addressWord(2)
      .word(3)
      .word(0)
      .bytes("x");
  for (const ReadResult& result : {readGood(narrow), readGood(wide)}) {
    const auto records = result.module->getDebugOverlayRecords();
    ASSERT_THAT(records, SizeIs(2));
    EXPECT_EQ(records[0].word, 0x12345678U);
    EXPECT_EQ(records[0].debugSection, result.section(1));
    EXPECT_EQ(records[0].section, result.section(4));
    EXPECT_EQ(records[1].word, 2U);
    EXPECT_EQ(records[1].section, result.section(0));
  }
}

TEST_P(ReadNotesOfEachFormTest, OverlayRowsThatAreTooSmallAreNone) {
  const uint64_t wordSize = GetParam().isWide() ? 8 : 4;
  for (const uint64_t entrySize : {uint64_t{0}, uint64_t{1}, wordSize + 3, uint64_t{1000}}) {
    ObjectBuilder file = withDebugSections(GetParam().object());
    file.section(".overlay", SHT_ZEV_DEBUGOVERLAY)
        .entrySize(entrySize)
        .bytes(std::string(40, '\xFF'));
    EXPECT_THAT(readGood(file).module->getDebugOverlayRecords(), IsEmpty());
  }
}

TEST_F(ReadNotesTest, AnOverlayNamesADebugSectionFirst) {
  ObjectBuilder file = withDebugSections();
  file.section(".overlay", SHT_ZEV_DEBUGOVERLAY)
      .entrySize(8)
      .word(1)
      .half(1)
      .half(4)
      .word(2)
      .half(4)
      .half(4)
      .word(3)
      .half(1)
      .half(4);
  const ReadResult mended = expectMended(
      file,
      "Record #1 in debug overlay section #5 refers to section #4 which is not a debug section");
  EXPECT_THAT(mended.module->getDebugOverlayRecords(), SizeIs(2));
  ObjectBuilder nameless = withDebugSections();
  nameless.section(".overlay", SHT_ZEV_DEBUGOVERLAY).entrySize(8).word(1).half(0).half(99);
  expectMended(nameless, "Record #0 in debug overlay section #5 refers to section #0 which is not "
                         "a debug section");
}

TEST_F(ReadNotesTest, AnOverlayNamesSections) {
  ObjectBuilder first = withDebugSections();
  first.section(".overlay", SHT_ZEV_DEBUGOVERLAY).entrySize(8).word(1).half(7).half(99);
  expectMended(first,
               "Record #0 in debug overlay section #5 refers to section #7 which is not a section");
  ObjectBuilder second = withDebugSections();
  second.section(".overlay", SHT_ZEV_DEBUGOVERLAY).entrySize(12).word(1).word(1).word(0x10001);
  const ReadResult mended = expectMended(
      second,
      "Record #0 in debug overlay section #5 refers to section #65537 which is not a section");
  EXPECT_THAT(mended.module->getDebugOverlayRecords(), IsEmpty());
}

namespace {

constexpr uint32_t SegmentMap = 0x40000000;

// Three segments; sections 1 and 3 are allocated, 2 is not; section 4 has the notes.
ObjectBuilder withSegments(ObjectBuilder file = object()) {
  file.type(ET_EXEC);
  for (uint32_t i = 0; i < 3; ++i)
    file.segment({.type = PT_NOTE});
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC).zeros(4);
  file.section(".comment", SHT_PROGBITS).zeros(4);
  file.section(".data", SHT_PROGBITS).flags(SHF_ALLOC | SHF_WRITE).zeros(4);
  return file;
}

} // namespace

TEST_P(ReadNotesOfEachFormTest, ANoteMapsSectionsToSegments) {
  ObjectBuilder file = withSegments(GetParam().object());
  file.section(".note", SHT_NOTE).note("other", 7, {1, 2, 3}).note("ZEV", SegmentMap, {2, 1});
  const ReadResult result = readGood(file);
  EXPECT_EQ(result.section(1)->getSegment(), result.module->getSegment(2));
  EXPECT_EQ(result.section(2)->getSegment(), nullptr);
  EXPECT_EQ(result.section(3)->getSegment(), result.module->getSegment(1));
}

TEST_F(ReadNotesTest, OtherNotesArePassedOver) {
  const auto isMapped = [this](const std::function<void(SectionBuilder&)>& describe) {
    ObjectBuilder file = withSegments();
    describe(file.section(".note", SHT_NOTE));
    return readGood(file).section(1)->getSegment() != nullptr;
  };
  EXPECT_TRUE(isMapped([](auto& notes) { notes.note("ZEV", SegmentMap, {2, 1}); }));
  EXPECT_FALSE(isMapped([](auto& notes) { notes.note("ZEV", SegmentMap + 1, {2, 1}); }));
  EXPECT_FALSE(isMapped([](auto& notes) { notes.note("ZEW", SegmentMap, {2, 1}); }));
  EXPECT_FALSE(isMapped([](auto& notes) { notes.note("ZEVZ", SegmentMap, {2, 1}); }));
  // Three bytes are not the name: its terminator counts.
  EXPECT_FALSE(isMapped([](auto& notes) {
    notes.word(3).word(8).word(SegmentMap).bytes("ZEV").zeros(1).word(2).word(1);
  }));
  EXPECT_FALSE(isMapped(
      [](auto& notes) { notes.word(4).word(8).word(SegmentMap).bytes("ZEVx").word(2).word(1); }));
  // Less than 16 bytes are no note.
  EXPECT_FALSE(isMapped([](auto& notes) { notes.word(4).word(0).word(SegmentMap).bytes("ZEV"); }));
}

TEST_F(ReadNotesTest, EachSegmentOfAMapExists) {
  ObjectBuilder file = withSegments();
  file.section(".note", SHT_NOTE).note("ZEV", SegmentMap, {2, 3});
  const ReadResult mended =
      expectMended(file, "Section/segment mapping in SHT_NOTE section #4 "
                         "maps section #3 to segment #3 which does not exist");
  EXPECT_EQ(mended.section(1)->getSegment(), mended.module->getSegment(2));
  EXPECT_EQ(mended.section(3)->getSegment(), nullptr);
}

TEST_F(ReadNotesTest, AMapHasAnEntryForEachAllocatedSection) {
  for (const std::vector<uint32_t>& words : {std::vector<uint32_t>{}, {1}, {1, 0, 1}}) {
    ObjectBuilder file = withSegments();
    file.section(".note", SHT_NOTE).note("ZEV", SegmentMap, words);
    const ReadResult mended = expectMended(
        file, "Section/segment mapping in SHT_NOTE section #4 contains " +
                  std::to_string(words.size()) + " entries, but there are 2 SHF_ALLOC sections");
    // What is missing counts as 0.
    EXPECT_EQ(mended.section(3)->getSegment(), mended.module->getSegment(0));
  }
}

TEST_F(ReadNotesTest, SegmentsOfAMapAreCheckedBeforeTheirNumber) {
  ObjectBuilder file = withSegments();
  file.section(".note", SHT_NOTE).note("ZEV", SegmentMap, {9});
  EXPECT_THAT(read(file).reports, ElementsAre(HasSubstr("maps section #1 to segment #9")));
  EXPECT_THAT(readOn(file).reports,
              ElementsAre(HasSubstr("maps section #1 to segment #9"), HasSubstr("contains 1")));
}

TEST_F(ReadNotesTest, WithoutSegmentsEvenAMissingEntryNamesOne) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC);
  file.section(".note", SHT_NOTE).note("ZEV", SegmentMap, {});
  EXPECT_THAT(read(file).reports, ElementsAre("Section/segment mapping in SHT_NOTE section #2 maps "
                                              "section #1 to segment #0 which does not exist"));
}

TEST_F(ReadNotesTest, ADescriptorIsCutAtTheEndOfItsSection) {
  ObjectBuilder file = withSegments();
  file.section(".note", SHT_NOTE)
      .word(4)
      .word(0xFFFFFFFF)
      .word(SegmentMap)
      .bytes(std::string("ZEV\0", 4))
      .word(2)
      .word(1)
      .bytes("odd");
  const ReadResult result = readGood(file);
  EXPECT_EQ(result.section(1)->getSegment(), result.module->getSegment(2));
  EXPECT_EQ(result.section(3)->getSegment(), result.module->getSegment(1));
}

TEST_F(ReadNotesTest, OddBytesOfADescriptorAreIgnored) {
  ObjectBuilder file = withSegments();
  file.section(".note", SHT_NOTE)
      .word(4)
      .word(11)
      .word(SegmentMap)
      .bytes(std::string("ZEV\0", 4))
      .word(2)
      .word(1)
      .bytes("odd");
  EXPECT_EQ(readGood(file).section(3)->getSegment()->getIndex(), 1U);
}

TEST_F(ReadNotesTest, ANameBeyondTheSectionEndsTheNotes) {
  ObjectBuilder file = withSegments();
  file.section(".note", SHT_NOTE)
      .word(0xFFFFFFFF)
      .word(8)
      .word(SegmentMap)
      .bytes(std::string("ZEV\0", 4))
      .word(2)
      .word(1);
  EXPECT_EQ(readGood(file).section(1)->getSegment(), nullptr);
}

} // namespace elfext
