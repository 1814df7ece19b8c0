// SPDX-License-Identifier: Apache-2.0
//
// Segments, what is tied to what, and the bytes that only segments have. Overlaps are reported by
// the first pair; regions that share bytes keep their distances; and which segment a section
// without bytes goes to is held rule by rule.

#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/segment.h"
#include "tests/support/reader_fixture.h"

namespace elfext {

using ReadPlacementTest = ReaderTest;
using ReadPlacementOfEachFormTest = EachFormTest;
using testsupport::SegmentSpec;

INSTANTIATE_TEST_SUITE_P(Forms, ReadPlacementOfEachFormTest, testing::ValuesIn(AllForms), formName);

namespace {

// A raw data block: its place in the file, its segment and its bytes.
std::string describe(const RawDataBlock& block) {
  uint64_t offset = 0;
  block.getFileExtent(&offset, nullptr);
  std::string bytes(block.getSize(), '\0');
  block.read(0, bytes.data(), bytes.size());
  return std::to_string(offset) + ":" + std::to_string(block.getSegment()->getIndex()) + ":" +
         bytes;
}

std::vector<std::string> blocksOf(const ReadResult& result) {
  std::vector<std::string> blocks;
  for (const RawDataBlock* block : result.module->getRawDataBlocks())
    blocks.push_back(describe(*block));
  return blocks;
}

// Bytes that are no part of a section: an ELF header, its program headers, and this.
ObjectBuilder sectionless(std::vector<SegmentSpec> segments, const std::string& bytes) {
  ObjectBuilder file = object().type(ET_EXEC).tail(bytes);
  for (const SegmentSpec& segment : segments)
    file.segment(segment);
  return file;
}

// Where the bytes of such a file are.
uint64_t tailOf(size_t segments) {
  return 52 + segments * 32;
}

bool areTied(FileRegion& first, FileRegion& second, uint64_t distance) {
  uint64_t firstOffset = 0;
  uint64_t secondOffset = 0;
  return first.getPlacement().find(&firstOffset) == second.getPlacement().find(&secondOffset) &&
         secondOffset - firstOffset == distance;
}

bool areApart(FileRegion& first, FileRegion& second) {
  uint64_t offset = 0;
  return first.getPlacement().find(&offset) != second.getPlacement().find(&offset);
}

} // namespace

TEST_P(ReadPlacementOfEachFormTest, SegmentsHaveWhatTheirHeadersSay) {
  ObjectBuilder file = GetParam().object();
  file.type(ET_DYN).segment({.type = PT_LOAD,
                             .flags = PF_R | PF_X,
                             .offset = 4,
                             .vaddr = 0x8004,
                             .paddr = 0x9004,
                             .filesz = 8,
                             .memsz = 16,
                             .align = 0x1000});
  const ReadResult result = readGood(file);
  ASSERT_EQ(result.module->getSegmentCount(), 1U);
  const Segment& segment = *result.module->getSegment(0);
  EXPECT_EQ(segment.getType(), PT_LOAD);
  EXPECT_EQ(segment.getFlags(), PF_R | PF_X);
  EXPECT_EQ(segment.getVirtualAddress(), 0x8004U);
  EXPECT_EQ(segment.getPhysicalAddress(), 0x9004U);
  EXPECT_EQ(segment.getFileSize(), 8U);
  EXPECT_EQ(segment.getMemorySize(), 16U);
  EXPECT_EQ(segment.getSegmentAlignment(), 0x1000U);
  uint64_t offset = 0;
  EXPECT_TRUE(segment.getFileExtent(&offset, nullptr));
  EXPECT_EQ(offset, 4U);
}

TEST_P(ReadPlacementOfEachFormTest, TheHeaderTablesAreRegionsOfTheFile) {
  ObjectBuilder file = GetParam().object();
  file.type(ET_EXEC).segment({.type = PT_NOTE}).segment({.type = PT_NOTE});
  file.section(".text", SHT_PROGBITS).zeros(4);
  const ReadResult result = readGood(file);
  uint64_t offset = 1;
  uint64_t size = 0;
  EXPECT_TRUE(result.module->getElfHeader().getFileExtent(&offset, &size));
  EXPECT_EQ(offset, 0U);
  EXPECT_EQ(size, GetParam().isWide() ? 64U : 52U);
  EXPECT_TRUE(result.module->getProgramHeaderTable().getFileExtent(&offset, &size));
  EXPECT_EQ(offset, file.segmentHeaderOffsetOf(0));
  EXPECT_EQ(size, GetParam().isWide() ? 112U : 64U);
  EXPECT_TRUE(result.module->getSectionHeaderTable().getFileExtent(&offset, &size));
  EXPECT_EQ(offset, file.headerOffsetOf(0));
  EXPECT_EQ(size, 3U * (GetParam().isWide() ? 64 : 40));
}

TEST_F(ReadPlacementTest, AnObjectHasNoRegionForProgramHeaders) {
  ObjectBuilder file = object().segment({.type = PT_NOTE});
  const ReadResult result = readGood(file);
  EXPECT_FALSE(result.module->getProgramHeaderTable().getFileExtent(nullptr, nullptr));
  EXPECT_FALSE(result.module->getSectionHeaderTable().getFileExtent(nullptr, nullptr));
}

TEST_F(ReadPlacementTest, OverlappingSectionsEndTheRead) {
  ObjectBuilder file = object();
  file.section(".one", SHT_PROGBITS).bytes("0123");
  file.section(".two", SHT_PROGBITS).offset(52).size(4);
  file.section(".three", SHT_PROGBITS).offset(55).size(1);
  ASSERT_EQ(file.offsetOf(1), 52U);
  expectFinal(file, "Sections #1 and #2 overlap in the file");
}

TEST_F(ReadPlacementTest, TheLowestSectionAndItsLowestPartnerAreNamed) {
  ObjectBuilder file = object();
  file.section(".free", SHT_PROGBITS).bytes("0123");
  file.section(".late", SHT_PROGBITS).bytes("0123456789");
  file.section(".inner", SHT_PROGBITS).offset(57).size(1);
  file.section(".inner", SHT_PROGBITS).offset(57).size(1);
  ASSERT_EQ(file.offsetOf(2), 56U);
  expectFinal(file, "Sections #2 and #3 overlap in the file");
}

TEST_F(ReadPlacementTest, SectionsThatTouchDoNotOverlap) {
  ObjectBuilder file = object();
  file.section(".one", SHT_PROGBITS).bytes("0123");
  file.section(".two", SHT_PROGBITS).bytes("0123");
  readGood(file);
}

TEST_F(ReadPlacementTest, SectionsWithoutBytesAndHeadersOverlapFreely) {
  ObjectBuilder file = object();
  file.section(".one", SHT_PROGBITS).bytes("0123");
  file.section(".bss", SHT_NOBITS).offset(52).size(100);
  file.section("", SHT_NULL).offset(52).size(100);
  file.section(".empty", SHT_PROGBITS).offset(53);
  file.section(".header", SHT_PROGBITS).offset(0).size(52);
  readGood(file);
}

TEST_F(ReadPlacementTest, ProblemsOfTablesComeBeforeTheOverlap) {
  ObjectBuilder file = object();
  file.section(".symtab", SHT_SYMTAB).link(2).symbol({.section = 77});
  file.section(".strtab", SHT_STRTAB);
  file.section(".again", SHT_PROGBITS).offset(52).size(1);
  EXPECT_THAT(read(file).reports,
              ElementsAre("Symbol #1 in symbol table section #1 is defined in section #77 but the "
                          "last section is #4"));
  ObjectBuilder relocations = object();
  relocations.section(".symtab", SHT_SYMTAB).link(2).symbol({.section = 1});
  relocations.section(".strtab", SHT_STRTAB);
  relocations.section(".rel", SHT_REL).link(1).relocation({}).relocation({.symbol = 2});
  relocations.section(".again", SHT_PROGBITS).offset(52).size(1);
  EXPECT_THAT(read(relocations).reports,
              ElementsAre(HasSubstr("Relocation #1 in relocation section #3 refers to symbol #2")));
  ObjectBuilder groups = object();
  groups.section(".symtab", SHT_SYMTAB).link(2).symbol({.section = 1});
  groups.section(".strtab", SHT_STRTAB);
  groups.section(".group", SHT_GROUP).link(1).word(1).word(0).word(9);
  groups.section(".again", SHT_PROGBITS).offset(52).size(1);
  EXPECT_THAT(read(groups).reports,
              ElementsAre(HasSubstr("Group section #3 refers to member section #9")));
}

TEST_F(ReadPlacementTest, GoodTablesOfAnOverlappingFileAreOnlyChecked) {
  ObjectBuilder file = object();
  file.section(".symtab", SHT_SYMTAB)
      .link(2)
      .symbol({.name = "x", .section = 1})
      .symbol({.section = 0xFFFF});
  file.section(".strtab", SHT_STRTAB);
  file.section(".shndx", SHT_SYMTAB_SHNDX).link(1).word(0).word(0).word(1);
  file.section(".rel", SHT_RELA).link(1).relocation({.symbol = 2});
  file.section(".group", SHT_GROUP).link(1).info(1).word(1).word(1).word(0);
  file.section(".again", SHT_PROGBITS).offset(52).size(1);
  expectFinal(file, "Sections #1 and #6 overlap in the file");
}

TEST_F(ReadPlacementTest, RegionsThatShareBytesAreTied) {
  ObjectBuilder file = object().type(ET_EXEC);
  file.section(".one", SHT_PROGBITS).bytes("0123");
  file.section(".two", SHT_PROGBITS).bytes("0123");
  file.section(".apart", SHT_PROGBITS).bytes("0123");
  file.segment({.offset = 84, .filesz = 5});
  ASSERT_EQ(file.offsetOf(1), 84U);
  const ReadResult result = readGood(file);
  FileRegion& segment = *result.module->getSegment(0);
  EXPECT_TRUE(areTied(segment, *result.section(1), 0));
  EXPECT_TRUE(areTied(segment, *result.section(2), 4));
  EXPECT_TRUE(areApart(segment, *result.section(3)));
  EXPECT_TRUE(areApart(segment, result.module->getElfHeader()));
  uint32_t index = 99;
  EXPECT_TRUE(result.section(1)->isInSegment(&index));
  EXPECT_EQ(index, 0U);
  EXPECT_FALSE(result.section(2)->isInSegment(&index));
}

TEST_F(ReadPlacementTest, WhatIsTiedThroughOthersIsOneTree) {
  ObjectBuilder file = object().type(ET_EXEC);
  file.section(".one", SHT_PROGBITS).bytes("0123");
  file.section(".two", SHT_PROGBITS).bytes("0123");
  file.segment({.type = PT_NOTE, .offset = 116, .filesz = 8});
  file.segment({.type = PT_NOTE, .offset = 0, .filesz = 117});
  ASSERT_EQ(file.offsetOf(1), 116U);
  const ReadResult result = readGood(file);
  EXPECT_TRUE(areTied(result.module->getElfHeader(), *result.section(2), 120));
  EXPECT_TRUE(areTied(*result.module->getSegment(1), *result.module->getSegment(0), 116));
  EXPECT_TRUE(areTied(*result.module->getSegment(1), result.module->getProgramHeaderTable(), 52));
}

TEST_F(ReadPlacementTest, NothingOfAnEarlierReadIsTied) {
  const SegmentSpec segment = {.type = PT_NOTE, .offset = 0, .filesz = 116};
  ObjectModule module;
  for (const uint64_t offset : {52U, 84U}) {
    ObjectBuilder file = object().type(ET_EXEC).segment(segment).segment(segment);
    file.header(HeaderField::PhNum, 1).header(HeaderField::PhOff, offset);
    const std::string bytes = file.bytes();
    m_Host.addFile("a.out", bytes);
    ASSERT_TRUE(readElfFile(m_Host, "a.out", 0, bytes.size(), module, nullptr));
    EXPECT_TRUE(areTied(module.getElfHeader(), module.getProgramHeaderTable(), offset));
  }
}

namespace {

// A file with these segments and a section without bytes at offset 1000, address 5000.
ObjectBuilder withBss(std::vector<SegmentSpec> segments, uint64_t size = 8) {
  ObjectBuilder file = object().type(ET_EXEC).tail(std::string(2000, '\0'));
  for (const SegmentSpec& segment : segments)
    file.segment(segment);
  file.section(".bss", SHT_NOBITS).offset(1000).address(5000).size(size);
  return file;
}

// The index of the segment that the section is tied to; -1 for none.
int holderOf(const ReadResult& result, uint32_t section = 1) {
  for (uint32_t i = 0; i < result.module->getSegmentCount(); ++i) {
    uint64_t offset = 0;
    result.module->getSegment(i)->getFileExtent(&offset, nullptr);
    if (areTied(*result.module->getSegment(i), *result.section(section), 1000 - offset))
      return static_cast<int>(i);
  }
  return -1;
}

} // namespace

TEST_F(ReadPlacementTest, ASectionWithoutBytesGoesToTheSegmentRoundItsOffset) {
  for (const uint32_t type :
       {PT_LOAD, PT_NOTE, PT_PHDR, PT_TLS, PT_ZEV_EXIDX, PT_DYNAMIC, PT_INTERP}) {
    for (const uint64_t offset : {900U, 1000U}) {
      EXPECT_EQ(holderOf(readGood(withBss(
                    {{.type = type, .offset = offset, .filesz = 1000 - offset, .memsz = 8}}))),
                0);
      EXPECT_EQ(holderOf(readGood(
                    withBss({{.type = type, .offset = offset, .filesz = 200, .memsz = 8}}))),
                0);
    }
    // Too small, beyond it, in front of it.
    EXPECT_EQ(
        holderOf(readGood(withBss({{.type = type, .offset = 900, .filesz = 200, .memsz = 7}}))),
        -1);
    EXPECT_EQ(
        holderOf(readGood(withBss({{.type = type, .offset = 900, .filesz = 99, .memsz = 200}}))),
        -1);
    EXPECT_EQ(
        holderOf(readGood(withBss({{.type = type, .offset = 1001, .filesz = 99, .memsz = 200}}))),
        -1);
  }
}

TEST_F(ReadPlacementTest, AnEmptySectionGoesToASegmentToo) {
  ObjectBuilder file = object().type(ET_EXEC).tail(std::string(2000, '\0'));
  file.segment({.offset = 900, .filesz = 200, .memsz = 200});
  file.section(".empty", SHT_PROGBITS).offset(1000);
  file.section("", SHT_NULL).offset(1000);
  file.section(".nobits", SHT_NOBITS).offset(1000);
  const ReadResult result = readGood(file);
  EXPECT_EQ(holderOf(result, 1), 0);
  EXPECT_EQ(holderOf(result, 2), -1);
  EXPECT_EQ(holderOf(result, 3), 0);
}

TEST_F(ReadPlacementTest, ABetterSegmentAlsoHoldsTheAddress) {
  // They must not overlap, since then all of them would be tied to the section.
  const SegmentSpec elsewhere = {.offset = 900, .filesz = 100, .memsz = 200};
  const SegmentSpec right = {.offset = 1000, .vaddr = 4900, .filesz = 50, .memsz = 200};
  const SegmentSpec alsoRight = {.offset = 1000, .vaddr = 4950, .memsz = 200};
  EXPECT_EQ(holderOf(readGood(withBss({elsewhere, {.offset = 1000, .filesz = 9, .memsz = 9}}))), 0);
  EXPECT_EQ(holderOf(readGood(withBss({elsewhere, right}))), 1);
  EXPECT_EQ(holderOf(readGood(withBss({elsewhere, right, alsoRight}))), 1);
  EXPECT_EQ(holderOf(readGood(withBss({right, alsoRight}))), 0);
  // The address is right, but not all of the section fits behind it.
  EXPECT_EQ(holderOf(readGood(withBss({elsewhere, right}, 101))), 0);
}

TEST_F(ReadPlacementTest, OtherSegmentsMustEndWhereTheSectionIs) {
  const uint32_t type = PT_SHLIB;
  const SegmentSpec load = {.offset = 1000, .vaddr = 4900, .filesz = 200, .memsz = 200};
  const SegmentSpec ending = {.type = type, .offset = 900, .filesz = 100, .memsz = 108};
  EXPECT_EQ(holderOf(readGood(withBss({ending}))), 0);
  EXPECT_EQ(
      holderOf(readGood(withBss({{.type = type, .offset = 900, .filesz = 100, .memsz = 107}}))),
      -1);
  EXPECT_EQ(
      holderOf(readGood(withBss({{.type = type, .offset = 900, .filesz = 101, .memsz = 200}}))),
      -1);
  EXPECT_EQ(
      holderOf(readGood(withBss({{.type = type, .offset = 900, .filesz = 100, .memsz = 50}}))), -1);
  // Such a segment is taken whatever was found before.
  EXPECT_EQ(holderOf(readGood(withBss({load, ending}))), 1);
}

TEST_F(ReadPlacementTest, TwoTypesAreJudgedByTheirEndsOnTheZevSystem) {
  for (const uint32_t type : {PT_DYNAMIC, PT_INTERP}) {
    ObjectBuilder file = withBss({{.type = type, .offset = 900, .filesz = 200, .memsz = 200}});
    EXPECT_EQ(holderOf(readGood(file)), 0);
    EXPECT_EQ(holderOf(readGood(file.osAbi(64))), -1);
    EXPECT_EQ(holderOf(readGood(
                  withBss({{.type = type, .offset = 900, .filesz = 100, .memsz = 108}}).osAbi(64))),
              0);
  }
}

TEST_F(ReadPlacementTest, BytesOfASegmentThatNothingElseHasBecomeABlock) {
  const uint64_t tail = tailOf(1);
  const ReadResult result = readGood(sectionless({{.offset = tail, .filesz = 4}}, "abcdef"));
  EXPECT_THAT(blocksOf(result), ElementsAre("84:0:abcd"));
  EXPECT_TRUE(areTied(*result.module->getSegment(0), *result.module->getRawDataBlocks()[0], 0));
}

TEST_F(ReadPlacementTest, BlocksFillTheGapsBetweenSections) {
  ObjectBuilder file = object().type(ET_EXEC);
  file.section(".one", SHT_PROGBITS).bytes("01234");
  file.section(".two", SHT_PROGBITS).bytes("01234");
  file.byteAt(89, 'a').byteAt(91, 'b').byteAt(97, 'c');
  file.segment({.offset = 84, .filesz = 14});
  ASSERT_EQ(file.offsetOf(2), 92U);
  EXPECT_THAT(blocksOf(readGood(file)), ElementsAre(std::string("89:0:a\0b", 8), "97:0:c"));
}

TEST_F(ReadPlacementTest, HeadersAreNoGapsButThoseOfProgramHeadersInAnObject) {
  ObjectBuilder file = object().type(ET_EXEC).segment({.offset = 0, .filesz = 84});
  EXPECT_THAT(blocksOf(readGood(file)), IsEmpty());
  file.type(ET_REL);
  const ReadResult result = readGood(file);
  ASSERT_THAT(result.module->getRawDataBlocks(), SizeIs(1));
  EXPECT_EQ(result.module->getRawDataBlocks()[0]->getSize(), 32U);
}

TEST_F(ReadPlacementTest, BlocksAreCutWhereSegmentsBeginAndEnd) {
  const uint64_t tail = tailOf(2);
  const ReadResult result = readGood(
      sectionless({{.offset = tail, .filesz = 6}, {.offset = tail + 2, .filesz = 2}}, "abcdef"));
  EXPECT_THAT(blocksOf(result), ElementsAre("116:0:ab", "118:0:cd", "120:0:ef"));
}

TEST_F(ReadPlacementTest, AGapGoesToTheMostWelcomeSegment) {
  const uint64_t tail = tailOf(3);
  // A PT_LOAD segment before others.
  EXPECT_THAT(blocksOf(readGood(sectionless({{.type = PT_NOTE, .offset = tail, .filesz = 2},
                                             {.type = PT_NOTE, .offset = tail, .filesz = 2},
                                             {.type = PT_LOAD, .offset = tail, .filesz = 2}},
                                            "ab"))),
              ElementsAre("148:2:ab"));
  // One whose bytes are there already before any other: the first gap has fetched them.
  EXPECT_THAT(blocksOf(readGood(sectionless({{.type = PT_LOAD, .offset = tail + 2, .filesz = 2},
                                             {.type = PT_NOTE, .offset = tail, .filesz = 4}},
                                            std::string(32, 'x') + "abcd"))),
              SizeIs(2));
  const ReadResult result =
      readGood(sectionless({{.type = PT_NOTE, .offset = tail + 2, .filesz = 2},
                            {.type = PT_LOAD, .offset = tail + 2, .filesz = 2},
                            {.type = PT_NOTE, .offset = tail, .filesz = 4}},
                           "abcd"));
  EXPECT_THAT(blocksOf(result), ElementsAre("148:2:ab", "150:2:cd"));
}

TEST_F(ReadPlacementTest, ASegmentOutsideTheFileEndsTheRead) {
  const uint64_t tail = tailOf(1);
  for (const uint32_t type : {PT_LOAD, PT_NOTE}) {
    expectFinal(sectionless({{.type = type, .offset = tail, .filesz = 5}}, "abcd"), Truncated);
    expectFinal(sectionless({{.type = type, .offset = 0xFFFFFFFF, .filesz = 1}}, "abcd"),
                Truncated);
    expectFinal(sectionless({{.type = type, .offset = 1, .filesz = 0xFFFFFFFF}}, "abcd"),
                Truncated);
    // Without bytes a segment may be anywhere.
    readGood(sectionless({{.type = type, .offset = 0xFFFFFFFF, .memsz = 0xFFFFFFFF}}, ""));
  }
}

TEST_F(ReadPlacementTest, ASegmentBeyondAllNumbersEndsTheRead) {
  for (const auto& [offset, size] :
       {std::pair<uint64_t, uint64_t>{UINT64_MAX, 1}, {1, UINT64_MAX}, {UINT64_MAX, UINT64_MAX}}) {
    ObjectBuilder file = object(ElfClass::Class64).type(ET_EXEC);
    file.segment({.type = PT_NOTE, .offset = offset, .filesz = size});
    expectFinal(file, Truncated);
  }
}

TEST_P(ReadPlacementOfEachFormTest, ConditionsTellWhatTheFirstLoadSegmentHolds) {
  const uint64_t headerSize = GetParam().isWide() ? 64 : 52;
  const auto conditions = [&](uint64_t offset, uint64_t size) {
    ObjectBuilder file = GetParam().object();
    file.type(ET_EXEC).tail(std::string(300, '\0'));
    file.section(".text", SHT_PROGBITS).zeros(4);
    file.segment({.type = PT_NOTE, .offset = 0, .filesz = 300});
    file.segment({.offset = offset, .filesz = size});
    file.segment({.offset = 0, .filesz = 300});
    return readGood(file).module->getReadConditions() & 0x7;
  };
  EXPECT_EQ(conditions(0, 1), 0x1U);
  EXPECT_EQ(conditions(0, 0), 0x0U);
  EXPECT_EQ(conditions(headerSize - 1, 1), 0x1U);
  EXPECT_EQ(conditions(headerSize, 1), 0x4U);
  EXPECT_EQ(conditions(headerSize - 1, 2), 0x5U);
  ObjectBuilder file = GetParam().object();
  file.type(ET_EXEC);
  file.section(".text", SHT_PROGBITS).zeros(4);
  file.segment({});
  const uint64_t table = file.headerOffsetOf(0);
  file.segment({.offset = table, .filesz = 1});
  EXPECT_EQ(readGood(file).module->getReadConditions() & 0x7, 0x0U);
}

TEST_F(ReadPlacementTest, ConditionsTellOfTheSectionHeaderTable) {
  ObjectBuilder file = object().type(ET_EXEC);
  file.section(".text", SHT_PROGBITS).zeros(4);
  ObjectBuilder probe = file;
  probe.segment({});
  const uint64_t table = probe.headerOffsetOf(0);
  file.segment({.offset = table + 119, .filesz = 1});
  EXPECT_EQ(readGood(file).module->getReadConditions(),
            ReadCondition_LoadOverlapsSectionHeaderTable | ReadCondition_HasCopiedStrings |
                ReadCondition_WasRead);
  // A table whose rows are said to be empty overlaps nothing.
  file.header(HeaderField::ShEntSize, 0);
  EXPECT_EQ(readGood(file).module->getReadConditions(),
            ReadCondition_HasCopiedStrings | ReadCondition_HasEmptySectionHeaderTable |
                ReadCondition_WasRead | 0U);
}

TEST_F(ReadPlacementTest, ConditionsTellOfIncongruentSegments) {
  const auto isIncongruent = [this](SegmentSpec segment) {
    segment.type = PT_NOTE;
    return (readGood(object().type(ET_EXEC).segment(segment)).module->getReadConditions() &
            ReadCondition_HasIncongruentSegment) != 0;
  };
  EXPECT_FALSE(isIncongruent({.offset = 5, .vaddr = 5, .align = 4}));
  EXPECT_FALSE(isIncongruent({.offset = 5, .vaddr = 1, .align = 4}));
  EXPECT_TRUE(isIncongruent({.offset = 5, .vaddr = 6, .align = 4}));
  EXPECT_TRUE(isIncongruent({.offset = 5, .vaddr = 6, .align = 7}));
  EXPECT_FALSE(isIncongruent({.offset = 5, .vaddr = 6, .align = 0}));
  EXPECT_FALSE(isIncongruent({.offset = 5, .vaddr = 6, .align = 1}));
}

TEST_F(ReadPlacementTest, ConditionsTellOfSymbolsAndRelocationsInAuxiliarySections) {
  ObjectBuilder file = object();
  file.section(".symtab", SHT_SYMTAB).link(2).symbol({.section = 3});
  file.section(".strtab", SHT_STRTAB);
  file.section(".data", SHT_PROGBITS).zeros(4);
  file.section(".rel", SHT_REL).link(1).info(3).relocation({});
  EXPECT_EQ(readGood(file).module->getReadConditions(), ReadCondition_WasRead);
  file.section(".symtab", SHT_SYMTAB).link(2).symbol({.section = 2});
  EXPECT_EQ(readGood(file).module->getReadConditions(),
            ReadCondition_WasRead | ReadCondition_HasSymbolInAuxiliarySection);
  file.section(".rel", SHT_REL).link(1).info(2).relocation({});
  EXPECT_EQ(readGood(file).module->getReadConditions(),
            ReadCondition_WasRead | ReadCondition_HasSymbolInAuxiliarySection |
                ReadCondition_HasRelocationInAuxiliarySection);
}

TEST_F(ReadPlacementTest, ConditionsTellOfBuildAttributesInFilesWithSegments) {
  ObjectBuilder file = object();
  file.section(".symtab", SHT_SYMTAB).link(2).symbol({.name = "BuildAttributes$x", .section = 1});
  file.section(".strtab", SHT_STRTAB);
  file.section(".attributes", SHT_ZEV_ATTRIBUTES).bytes("A");
  const uint32_t both =
      ReadCondition_HasBuildAttributesSymbol | ReadCondition_HasBuildAttributesSection;
  EXPECT_EQ(readGood(file).module->getReadConditions() & both, 0U);
  file.segment({.type = PT_NOTE});
  EXPECT_EQ(readGood(file).module->getReadConditions() & both, both);
}

// An absolute one is such a symbol also where the text begins inside of its name; and names may be
// ends of one another.
TEST_F(ReadPlacementTest, ConditionsTellOfBuildAttributesAmongAbsoluteSymbols) {
  const auto conditions = [this](const std::vector<const char*>& names) {
    ObjectBuilder file = object();
    testsupport::SectionBuilder& table = file.section(".symtab", SHT_SYMTAB).link(2);
    for (const char* name : names)
      table.symbol({.name = name, .section = SHN_ABS});
    file.section(".strtab", SHT_STRTAB);
    file.segment({.type = PT_NOTE});
    return readGood(file).module->getReadConditions() & ReadCondition_HasBuildAttributesSymbol;
  };
  EXPECT_EQ(conditions({"first", "second", "third"}), 0U);
  EXPECT_NE(conditions({"first", "second", "f$$BuildAttributes$x"}), 0U);
  EXPECT_NE(conditions({"f$$BuildAttributes$x", "second", "third"}), 0U);
}

} // namespace elfext
