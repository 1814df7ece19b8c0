// SPDX-License-Identifier: Apache-2.0
//
// What each kind of file region says of its size, its alignment and its record in a layout; and
// what two regions have in common, at borders, for empty ones, and at the end of 64 bits, where a
// sum would wrap.

#include "elfext/interface/data_structure.h"
#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/segment.h"
#include "module_fixture.h"

namespace elfext {
namespace {

using Alignment = std::pair<uint64_t, uint64_t>;

Alignment alignmentOf(const FileRegion& region) {
  Alignment alignment;
  region.getAlignment(&alignment.first, &alignment.second);
  return alignment;
}

class FileRegionTest : public ModuleTest {
protected:
  void expectStructure(FileRegion& region, uint64_t offset, uint32_t kind, uint64_t size) {
    DataStructure* structure = region.createDataStructure(module.getObjectRegion(), offset);
    EXPECT_EQ(structure->getKind(), kind);
    EXPECT_EQ(structure->getSize(), size);
    EXPECT_EQ(structure->getFileOffset(), offset);
    structure->setFileOffset(offset + 4);
    EXPECT_EQ(structure->getFileOffset(), offset + 4);
  }
  Segment* makeSegment(uint64_t offset, uint64_t filesz, uint64_t vaddr = 0, uint64_t align = 1) {
    return module.createSegment(PT_LOAD, offset, vaddr, 0, filesz, filesz, PF_R, align);
  }
};

TEST_F(FileRegionTest, TellsItsExtent) {
  Section* section = makeSection({1, 2, 3});
  uint64_t offset = 1;
  uint64_t size = 1;
  EXPECT_FALSE(section->getFileExtent(&offset, &size));
  EXPECT_EQ(offset, 0u);
  EXPECT_EQ(size, 3u);
  section->setFileOffset(64);
  EXPECT_TRUE(section->getFileExtent(&offset, &size));
  EXPECT_EQ(offset, 64u);
  EXPECT_EQ(section->getFileOffset(), 64u);
  EXPECT_TRUE(section->getFileExtent(nullptr, nullptr));
  section->clearFileOffset();
  EXPECT_FALSE(section->getFileExtent(&offset, nullptr));
  EXPECT_EQ(offset, 0u);
}

TEST_F(FileRegionTest, PutsTheElfHeaderAtTheStart) {
  ELFHeader& header = module.getElfHeader();
  EXPECT_EQ(alignmentOf(header), Alignment(0, 4));
  EXPECT_EQ(header.getFileSize(), 60u);
  ModuleBuilder::setElfHeaderSize(module, 52);
  EXPECT_EQ(header.getFileSize(), 52u);
  header.setFileOffset(0);
  EXPECT_TRUE(header.getFileExtent(nullptr, nullptr));
  EXPECT_EQ(header.getDataStore(), nullptr);
  expectStructure(header, 0, 0, 52);
  EXPECT_ASSERTION(header.setFileOffset(4), "offset == 0");
  EXPECT_ASSERTION(header.createDataStructure(module.getObjectRegion(), 4), "currentOffset == 0");
}

TEST_F(FileRegionTest, SizesTheSectionHeaderTableByItsEntries) {
  SectionHeaderTable& table = module.getSectionHeaderTable();
  table.setEntryCount(3);
  EXPECT_EQ(table.getEntrySize(), 40u);
  EXPECT_EQ(table.getFileSize(), 120u);
  EXPECT_EQ(alignmentOf(table), Alignment(0, 4));
  table.setAlignment(8);
  EXPECT_EQ(alignmentOf(table), Alignment(0, 8));
  EXPECT_EQ(table.getDataStore(), nullptr);
  expectStructure(table, 100, 1, 120);
}

TEST_F(FileRegionTest, SizesTheProgramHeaderTableByItsEntries) {
  ProgramHeaderTable& table = module.getProgramHeaderTable();
  table.setEntryCount(2);
  EXPECT_EQ(table.getFileSize(), 64u);
  EXPECT_EQ(alignmentOf(table), Alignment(0, 4));
  table.setAlignment(8);
  EXPECT_EQ(alignmentOf(table), Alignment(0, 8));
  expectStructure(table, 52, 2, 64);
}

TEST_F(FileRegionTest, SizesEntriesIn64Bits) {
  SectionHeaderTable& table = module.getSectionHeaderTable();
  table.setEntrySize(0xFFFF);
  table.setEntryCount(0xFFFFFFFF);
  EXPECT_EQ(table.getFileSize(), uint64_t{0xFFFF} * 0xFFFFFFFF);
}

TEST_F(FileRegionTest, AlignsASegmentAsItsAddresses) {
  Segment* segment = makeSegment(0x100, 0x20, 0x8104, 0x1000);
  EXPECT_EQ(alignmentOf(*segment), Alignment(0x104, 0x1000));
  EXPECT_EQ(segment->getFileSize(), 0x20u);
  EXPECT_EQ(segment->getFileOffset(), 0x100u);
  segment->setAlignment(16);
  EXPECT_EQ(segment->getSegmentAlignment(), 0x1000u);
  EXPECT_EQ(segment->getDataStore(), nullptr);
  expectStructure(*segment, 0x100, 4, 0x20);
}

TEST_F(FileRegionTest, TakesASegmentWithoutAlignment) {
  EXPECT_EQ(alignmentOf(*makeSegment(0, 0, 0x8104, 0)), Alignment(0, 1));
}

TEST_F(FileRegionTest, AlignsBookkeepingSectionsTo4) {
  for (uint32_t type :
       {SHT_SYMTAB, SHT_RELA, SHT_HASH, SHT_REL, SHT_DYNSYM, SHT_GROUP, SHT_SYMTAB_SHNDX}) {
    Section* section = module.createSectionOfType(nullptr, type, 0);
    section->setAlignment(1);
    EXPECT_EQ(alignmentOf(*section), Alignment(0, 4)) << type;
  }
}

TEST_F(FileRegionTest, DoesNotAlignSectionsWithoutBytes) {
  for (uint32_t type : {SHT_NULL, SHT_NOBITS}) {
    Section* section = module.createSectionOfType(nullptr, type, 0);
    section->setAlignment(16);
    EXPECT_EQ(alignmentOf(*section), Alignment(0, 1)) << type;
  }
}

TEST_F(FileRegionTest, AlignsOtherSectionsTo4AtMost) {
  for (uint32_t type : {SHT_PROGBITS, SHT_STRTAB, SHT_DYNAMIC, SHT_NOTE, SHT_ZEV_EXIDX}) {
    Section* section = module.createSectionOfType(nullptr, type, 0);
    for (const auto& [alignment, inFile] :
         {Alignment(0, 1), Alignment(1, 1), Alignment(2, 2), Alignment(4, 4), Alignment(16, 4)}) {
      section->setAlignment(alignment);
      EXPECT_EQ(alignmentOf(*section), Alignment(0, inFile)) << type;
    }
  }
}

TEST_F(FileRegionTest, RecordsSectionsWithTheirSizeInTheFile) {
  Section* section = makeSection({1, 2, 3});
  expectStructure(*section, 8, 3, 3);
  Section* zeroed = makeSection(".bss", SHT_NOBITS);
  zeroed->setSize(100);
  expectStructure(*zeroed, 8, 3, 0);
}

// ---- Raw data blocks

TEST_F(FileRegionTest, KeepsTheBytesOfARawDataBlock) {
  Segment* segment = makeSegment(0, 100);
  RawDataBlock* block = module.createRawDataBlock(segment, 4);
  EXPECT_EQ(block->getSegment(), segment);
  EXPECT_EQ(block->getSize(), 4u);
  EXPECT_EQ(block->getFileSize(), 4u);
  EXPECT_EQ(alignmentOf(*block), Alignment(0, 1));
  EXPECT_EQ(block->getDataStore(), block);
  EXPECT_TRUE(block->isModifiable());
  const uint8_t bytes[] = {1, 2, 3, 4};
  EXPECT_TRUE(block->write(0, bytes, 4));
  uint8_t read[2] = {};
  EXPECT_TRUE(block->read(1, read, 2));
  EXPECT_THAT(read, testing::ElementsAre(2, 3));
  EXPECT_THAT(elements(module.getRawDataBlocks()), testing::ElementsAre(block));
}

TEST_F(FileRegionTest, ShowsTheBytesThatARawDataBlockIsGiven) {
  const uint8_t bytes[] = {1, 2, 3, 4};
  RawDataBlock* block = module.createRawDataBlock(makeSegment(0, 100), 4);
  ModuleBuilder::getBuffer(*block).borrow(bytes, 4);
  uint8_t read[2] = {};
  EXPECT_TRUE(block->read(2, read, 2));
  EXPECT_THAT(read, testing::ElementsAre(3, 4));
}

TEST_F(FileRegionTest, HasNoRecordForARawDataBlock) {
  RawDataBlock* block = module.createRawDataBlock(makeSegment(0, 100), 4);
  EXPECT_ASSERTION(block->createDataStructure(module.getObjectRegion(), 0),
                   "!\"We shouldn't be here\"");
}

// ---- Overlaps

class OverlapTest : public FileRegionTest {
protected:
  OverlapTest() : first(makeSegment(0, 100)), second(makeSegment(0, 50)) {}

  Segment* first;
  Segment* second;
  uint64_t inFirst = 0;
  uint64_t inSecond = 0;
  uint64_t length = 0;
};

TEST_F(OverlapTest, IsUnknownBetweenTrees) {
  EXPECT_FALSE(FileRegion::overlap(*first, *second, &inFirst, &inSecond, &length));
}

TEST_F(OverlapTest, IsTheBytesThatBothHave) {
  ASSERT_TRUE(FileRegion::link(*first, *second, 80));
  EXPECT_TRUE(FileRegion::overlap(*first, *second, &inFirst, &inSecond, &length));
  EXPECT_EQ(inFirst, 80u);
  EXPECT_EQ(inSecond, 0u);
  EXPECT_EQ(length, 20u);
  EXPECT_TRUE(FileRegion::overlap(*second, *first, &inSecond, &inFirst, &length));
  EXPECT_EQ(inFirst, 80u);
  EXPECT_EQ(inSecond, 0u);
  EXPECT_EQ(length, 20u);
  EXPECT_TRUE(FileRegion::overlap(*first, *second, nullptr, nullptr, nullptr));
}

TEST_F(OverlapTest, IsTheWholeOfARegionInside) {
  ASSERT_TRUE(FileRegion::link(*first, *second, 10));
  EXPECT_TRUE(FileRegion::overlap(*first, *second, &inFirst, &inSecond, &length));
  EXPECT_EQ(inFirst, 10u);
  EXPECT_EQ(length, 50u);
}

TEST_F(OverlapTest, IsNotWhereRegionsOnlyTouch) {
  ASSERT_TRUE(FileRegion::link(*first, *second, 100));
  EXPECT_FALSE(FileRegion::overlap(*first, *second, &inFirst, &inSecond, &length));
  EXPECT_FALSE(FileRegion::overlap(*second, *first, &inFirst, &inSecond, &length));
}

TEST_F(OverlapTest, IsNotWhereARegionIsEmpty) {
  Segment* empty = makeSegment(0, 0);
  ASSERT_TRUE(FileRegion::link(*first, *empty, 10));
  EXPECT_FALSE(FileRegion::overlap(*first, *empty, &inFirst, &inSecond, &length));
}

TEST_F(OverlapTest, DoesNotWrapAtTheEndOf64Bits) {
  Segment* huge = makeSegment(0, 0xFFFFFFFFFFFFFFFF);
  Segment* far = makeSegment(0, 0xFFFFFFFFFFFFFFFF);
  ASSERT_TRUE(FileRegion::link(*huge, *far, 0xFFFFFFFFFFFFFFF0));
  EXPECT_TRUE(FileRegion::overlap(*huge, *far, &inFirst, &inSecond, &length));
  EXPECT_EQ(inFirst, 0xFFFFFFFFFFFFFFF0u);
  EXPECT_EQ(length, 15u);
  EXPECT_FALSE(far->isWithin(*huge));
}

TEST_F(OverlapTest, TellsWhatLiesWithinARegion) {
  ASSERT_TRUE(FileRegion::link(*first, *second, 50));
  EXPECT_TRUE(second->isWithin(*first));
  EXPECT_FALSE(first->isWithin(*second));
  Segment* third = makeSegment(0, 50);
  EXPECT_FALSE(third->isWithin(*first));
  ASSERT_TRUE(FileRegion::link(*first, *third, 51));
  EXPECT_FALSE(third->isWithin(*first));
}

} // namespace
} // namespace elfext
