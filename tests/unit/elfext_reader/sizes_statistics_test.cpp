// SPDX-License-Identifier: Apache-2.0
//
// Which of the eight totals each byte of an object goes to, by section flags, mapping symbols and
// segments. Mapping symbols may stand anywhere, also outside of their section, and totals have more
// than 32 bits.

#include "elfext/interface/sizes_statistics.h"

#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/segment.h"
#include "elfext/src/model/module_builder.h"
#include "tests/support/reader_fixture.h"

#include <cstdio>
#include <memory>

namespace elfext {

namespace {

// Offsets of mapping symbols, as written in a symbol table.
struct Mark {
  std::string name;
  uint64_t offset;
};

constexpr uint32_t CodeFlags = SHF_ALLOC | SHF_EXECINSTR;

std::string nonZeroTotals(const SizesStatistics& sizes) {
  const std::pair<const char*, uint64_t> totals[] = {
      {"code", sizes.m_Code},
      {"literals", sizes.m_LiteralPools},
      {"rw", sizes.m_RwDataUncompressed},
      {"rw packed", sizes.m_RwDataCompressed},
      {"ro", sizes.m_RoData},
      {"zi", sizes.m_ZiData},
      {"debug", sizes.m_DebugInfo},
      {"padding", sizes.m_InternalPadding},
  };
  std::string text;
  for (const auto& [name, value] : totals) {
    if (value == 0) continue;
    text += text.empty() ? "" : ", ";
    text += std::string(name) + " " + std::to_string(value);
  }
  return text;
}

// One section of that many bytes, with mapping symbols.
ObjectBuilder marked(uint32_t flags, size_t size, const std::vector<Mark>& marks) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS).flags(flags).zeros(size);
  SectionBuilder& table = file.section(".symtab", SHT_SYMTAB).link(3);
  for (const Mark& mark : marks)
    table.symbol({.name = mark.name, .section = 1, .value = mark.offset, .binding = 0});
  file.section(".strtab", SHT_STRTAB);
  return file;
}

std::string printed(const SizesStatistics& sizes) {
  const std::unique_ptr<std::FILE, int (*)(std::FILE*)> file(std::tmpfile(), &std::fclose);
  printSizesStatistics(sizes, file.get());
  std::string text(static_cast<size_t>(std::ftell(file.get())), '\0');
  std::rewind(file.get());
  EXPECT_EQ(std::fread(text.data(), 1, text.size(), file.get()), text.size());
  return text;
}

} // namespace

class SizesStatisticsTest : public ReaderTest {
protected:
  // The totals that are not 0.
  std::string sizesOf(const ObjectBuilder& file) {
    const ReadResult result = readGood(file);
    return nonZeroTotals(computeSizesStatistics(result.module.get()));
  }

  std::string sizesOfSection(const char* name, uint32_t type, uint32_t flags, uint64_t size) {
    ObjectBuilder file = object();
    SectionBuilder& section = file.section(name, type).flags(flags);
    if (type == SHT_NOBITS)
      section.size(size);
    else
      section.zeros(size);
    return sizesOf(file);
  }

  // Segments alone, in a file with as many bytes behind the headers.
  static ObjectBuilder segmentsOnly(const std::vector<testsupport::SegmentSpec>& segments) {
    ObjectBuilder file = object().type(ET_EXEC).tail(std::string(100, '\1'));
    for (const testsupport::SegmentSpec& segment : segments)
      file.segment(segment);
    return file;
  }
};

// ---- Sections by their flags

TEST_F(SizesStatisticsTest, AnEmptyObjectHasNone) {
  EXPECT_EQ(sizesOf(object()), "");
  ObjectModule fresh;
  EXPECT_EQ(nonZeroTotals(computeSizesStatistics(&fresh)), "");
}

TEST_F(SizesStatisticsTest, SectionsThatAreNotLoadedCountOnlyAsDebugInformation) {
  for (const char* name : {".debug", ".debug_info", ".debugger", ".line", ".linear", "C$$fpmap"})
    EXPECT_EQ(sizesOfSection(name, SHT_PROGBITS, 0, 7), "debug 7") << name;
  for (const char* name :
       {".comment", "", ".debu", ".lin", "debug", "x.debug", "C$$fpmap2", "C$$fpma", ".Debug"})
    EXPECT_EQ(sizesOfSection(name, SHT_PROGBITS, 0, 7), "") << name;
  // Other flags change nothing.
  EXPECT_EQ(sizesOfSection(".debug", SHT_PROGBITS, SHF_WRITE | SHF_EXECINSTR, 7), "debug 7");
  EXPECT_EQ(sizesOfSection(".data", SHT_PROGBITS, SHF_WRITE | SHF_EXECINSTR, 7), "");
  EXPECT_EQ(sizesOfSection(".debug", SHT_NOBITS, 0, 7), "debug 7");
}

TEST_F(SizesStatisticsTest, ADebugSectionThatIsLoadedCountsByItsFlags) {
  EXPECT_EQ(sizesOfSection(".debug_info", SHT_PROGBITS, SHF_ALLOC, 7), "ro 7");
  EXPECT_EQ(sizesOfSection(".debug_info", SHT_PROGBITS, SHF_ALLOC | SHF_WRITE, 7),
            "rw 7, rw packed 7");
}

TEST_F(SizesStatisticsTest, FlagsAreLookedAtInOneOrder) {
  EXPECT_EQ(sizesOfSection(".s", SHT_PROGBITS, SHF_ALLOC, 7), "ro 7");
  EXPECT_EQ(sizesOfSection(".s", SHT_PROGBITS, SHF_ALLOC | SHF_WRITE, 7), "rw 7, rw packed 7");
  EXPECT_EQ(sizesOfSection(".s", SHT_PROGBITS, CodeFlags, 7), "literals 7");
  EXPECT_EQ(sizesOfSection(".s", SHT_PROGBITS, CodeFlags | SHF_WRITE, 7), "literals 7");
  EXPECT_EQ(sizesOfSection(".s", SHT_NOBITS, SHF_ALLOC, 7), "zi 7");
  EXPECT_EQ(sizesOfSection(".s", SHT_NOBITS, CodeFlags | SHF_WRITE, 7), "zi 7");
  EXPECT_EQ(sizesOfSection(".s", SHT_NOTE, SHF_ALLOC, 8), "ro 8");
  EXPECT_EQ(sizesOfSection(".s", SHT_INIT_ARRAY, SHF_ALLOC | SHF_WRITE, 8), "rw 8, rw packed 8");
  EXPECT_EQ(sizesOfSection(".s", SHT_ZEV_EXIDX, SHF_ALLOC | SHF_LINK_ORDER, 8), "ro 8");
}

TEST_F(SizesStatisticsTest, SectionsAddUp) {
  ObjectBuilder file = object();
  for (const size_t size : {1U, 20U, 300U}) {
    file.section(".text", SHT_PROGBITS).flags(CodeFlags).zeros(size);
    file.section(".data", SHT_PROGBITS).flags(SHF_ALLOC | SHF_WRITE).zeros(size * 2);
    file.section(".rodata", SHT_PROGBITS).flags(SHF_ALLOC).zeros(size * 3);
    file.section(".bss", SHT_NOBITS).flags(SHF_ALLOC | SHF_WRITE).size(size * 4);
    file.section(".debug_x", SHT_PROGBITS).zeros(size * 5);
  }
  EXPECT_EQ(sizesOf(file), "literals 321, rw 642, rw packed 642, ro 963, zi 1284, debug 1605");
}

TEST_F(SizesStatisticsTest, TotalsHaveMoreThan32Bits) {
  ObjectBuilder file = object(ElfClass::Class64);
  for (int i = 0; i < 3; ++i)
    file.section(".bss", SHT_NOBITS).flags(SHF_ALLOC | SHF_WRITE).size(0xFFFFFFFF);
  EXPECT_EQ(sizesOf(file), "zi 12884901885");
}

// ---- Stretches of executable sections

TEST_F(SizesStatisticsTest, CodeWithoutMappingSymbolsIsLiteralPool) {
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {})), "literals 16");
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"main", 0}, {"$b", 0}, {"$ab", 4}, {"", 8}})),
            "literals 16");
  EXPECT_EQ(sizesOf(marked(CodeFlags, 0, {{"$a", 0}})), "");
}

TEST_F(SizesStatisticsTest, MappingSymbolsSayWhatFollows) {
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 0}, {"$d", 8}})), "code 8, literals 8");
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$d", 8}, {"$a", 0}})), "code 8, literals 8");
  for (const char* name : {"$a", "$t", "$x", "$a.1", "$t.", "$x.far"})
    EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{name, 0}})), "code 16") << name;
  for (const char* name : {"$d", "$d.1", "$d.", "$d.realdat", "$d.realdata2", "$d.realdata."})
    EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 0}, {name, 4}})), "code 4, literals 12")
        << name;
}

TEST_F(SizesStatisticsTest, BytesBeforeTheFirstMappingSymbolAreLiteralPool) {
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 6}})), "code 10, literals 6");
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 15}})), "code 1, literals 15");
}

TEST_F(SizesStatisticsTest, RealDataIsDataByTheSectionsFlags) {
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 0}, {"$d.realdata", 4}})), "code 4, ro 12");
  EXPECT_EQ(sizesOf(marked(CodeFlags | SHF_WRITE, 16, {{"$a", 0}, {"$d.realdata", 4}})),
            "code 4, rw 12, rw packed 12");
  EXPECT_EQ(sizesOf(marked(CodeFlags | SHF_WRITE, 16,
                           {{"$d.realdata", 0}, {"$t", 4}, {"$d.realdata", 7}, {"$d", 15}})),
            "code 3, literals 1, rw 12, rw packed 12");
}

TEST_F(SizesStatisticsTest, TheLastMappingSymbolOfAPlaceDecides) {
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 4}, {"$d", 4}})), "literals 16");
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$d", 4}, {"$a", 4}})), "code 12, literals 4");
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 0}, {"$d.realdata", 0}, {"$d", 8}, {"$t", 8}})),
            "code 8, ro 8");
  // Symbols of other kinds at the same place do not matter.
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 0}, {"main", 0}, {"$b", 0}})), "code 16");
}

TEST_F(SizesStatisticsTest, MappingSymbolsOutsideTheSectionEndTheWalk) {
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 0}, {"$d", 17}})), "code 16");
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 0}, {"$d", 16}})), "code 16");
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 0}, {"$d", 15}})), "code 15, literals 1");
  EXPECT_EQ(sizesOf(marked(CodeFlags, 16, {{"$a", 0xFFFFFFFF}})), "literals 16");
}

TEST_F(SizesStatisticsTest, ManyMappingSymbolsShareASection) {
  std::vector<Mark> marks;
  for (uint64_t offset = 0; offset < 4000; offset += 4)
    marks.push_back({offset % 8 == 0 ? "$a" : "$d", offset});
  EXPECT_EQ(sizesOf(marked(CodeFlags, 4000, marks)), "code 2000, literals 2000");
}

TEST_F(SizesStatisticsTest, OnlyStaticSymbolsOfTheSectionMapIt) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS).flags(CodeFlags).zeros(16);
  file.section(".other", SHT_PROGBITS).flags(CodeFlags).zeros(16);
  file.section(".dynsym", SHT_DYNSYM).link(5).symbol({.name = "$a", .section = 1});
  file.section(".symtab", SHT_SYMTAB).link(5).symbol({.name = "$a", .section = 2, .value = 4});
  file.section(".strtab", SHT_STRTAB);
  EXPECT_EQ(sizesOf(file), "code 12, literals 20");
}

// ---- Bytes of segments that are in no section

// A section in the middle of what a segment loads.
class SizesOfGapsTest : public SizesStatisticsTest {
protected:
  static constexpr uint64_t FirstByte = 52 + 32;

  static ObjectBuilder withGap(const std::string& gap) {
    ObjectBuilder file = object().type(ET_EXEC);
    file.section(".data", SHT_PROGBITS).flags(SHF_ALLOC).bytes("0123").alignment(4);
    file.section(".more", SHT_PROGBITS).flags(SHF_ALLOC).offset(FirstByte + 4 + gap.size()).size(4);
    file.section(".gap", SHT_PROGBITS).bytes(gap + "4567").size(0).offset(0);
    file.segment({.offset = FirstByte, .filesz = 8 + gap.size(), .memsz = 8 + gap.size()});
    return file;
  }
};

TEST_F(SizesOfGapsTest, ZerosArePaddingAndAllElseIsData) {
  EXPECT_EQ(sizesOf(withGap("")), "ro 8");
  EXPECT_EQ(sizesOf(withGap(std::string(4, '\0'))), "ro 8, padding 4");
  EXPECT_EQ(sizesOf(withGap(std::string(4, 'x'))), "ro 12");
  EXPECT_EQ(sizesOf(withGap(std::string(3, '\0') + "x")), "ro 12");
  EXPECT_EQ(sizesOf(withGap("x" + std::string(3, '\0'))), "ro 12");
}

TEST_F(SizesOfGapsTest, ALargeGapIsLookedAtToItsLastByte) {
  for (const size_t size : {4092U, 4096U, 4100U, 8192U, 10000U}) {
    std::string gap(size, '\0');
    EXPECT_EQ(sizesOf(withGap(gap)), "ro 8, padding " + std::to_string(size));
    gap.back() = '\1';
    EXPECT_EQ(sizesOf(withGap(gap)), "ro " + std::to_string(8 + size));
    gap.back() = '\0';
    gap[4095 % size] = '\1';
    EXPECT_EQ(sizesOf(withGap(gap)), "ro " + std::to_string(8 + size));
  }
}

// The walk over occupied ranges goes on, from one segment to the next, where it stood.
class SizesOfSegmentsTest : public testing::Test {
protected:
  // The header tables are behind everything else.
  SizesOfSegmentsTest() {
    ModuleBuilder::setElfHeaderSize(m_Module, 0);
    ModuleBuilder::setSectionHeaderOffset(m_Module, 1000);
    ModuleBuilder::setProgramHeaderOffset(m_Module, 1500);
    addSection(0, 0);
  }

  void addSection(uint64_t offset, uint64_t size, uint32_t type = SHT_PROGBITS) {
    Section* section = m_Module.createSection(".x", type, 0);
    ModuleBuilder::adoptSize(*section, size);
    section->setFileOffset(offset);
  }

  void addSegment(uint64_t offset, uint64_t size) {
    m_Module.createSegment(PT_LOAD, offset, 0, 0, size, size, 0, 0)->setFileOffset(offset);
  }

  uint64_t padding() { return computeSizesStatistics(&m_Module).m_InternalPadding; }

  ObjectModule m_Module;
};

TEST_F(SizesOfSegmentsTest, PaddingLiesBetweenOccupiedRanges) {
  addSection(10, 10);
  addSection(30, 10);
  addSegment(5, 40);
  // 5 to 10 and 20 to 30, and 40 to 45 as the header tables come behind.
  EXPECT_EQ(padding(), 5U + 10U + 5U);
}

TEST_F(SizesOfSegmentsTest, NothingIsCountedBehindTheLastOccupiedRange) {
  addSection(10, 10);
  addSegment(10, 100);
  ModuleBuilder::setSectionHeaderOffset(m_Module, 0);
  ModuleBuilder::setProgramHeaderOffset(m_Module, 0);
  EXPECT_EQ(padding(), 0U);
}

TEST_F(SizesOfSegmentsTest, HeadersAreOccupied) {
  addSection(190, 10);
  addSegment(0, 200);
  ModuleBuilder::setElfHeaderSize(m_Module, 52);
  ModuleBuilder::setProgramHeaderOffset(m_Module, 60);  // one row, to 92
  ModuleBuilder::setSectionHeaderOffset(m_Module, 100); // two rows, to 180
  for (const uint32_t type : {ET_EXEC, ET_REL}) {
    m_Module.setFileType(type);
    EXPECT_EQ(padding(), 8U + 8U + 10U);
  }
}

TEST_F(SizesOfSegmentsTest, WhatHasNoBytesOccupiesNothing) {
  addSection(10, 10);
  addSection(22, 5, SHT_NOBITS);
  addSection(28, 0);
  addSection(30, 10);
  addSegment(10, 30);
  EXPECT_EQ(padding(), 10U);
}

TEST_F(SizesOfSegmentsTest, SegmentsWithoutBytesHaveNoPadding) {
  addSection(10, 10);
  addSegment(0, 0);
  addSegment(5, 0);
  EXPECT_EQ(padding(), 0U);
}

TEST_F(SizesOfSegmentsTest, SegmentsAreWalkedByTheirStarts) {
  addSection(10, 10);
  addSection(30, 10);
  addSegment(25, 15); // 25 to 30
  addSegment(5, 15);  // 5 to 10
  EXPECT_EQ(padding(), 5U + 5U);
}

TEST_F(SizesOfSegmentsTest, ASegmentCountsAgainWhatLiesBeforeTheWalk) {
  addSection(10, 10);
  addSection(30, 10);
  addSegment(10, 25); // 20 to 30, and the walk stands at the range from 30
  addSegment(10, 20); // the same start: in the order of the segments, 10 to 30 is counted again
  EXPECT_EQ(padding(), 10U + 20U);
}

TEST_F(SizesOfSegmentsTest, OccupiedRangesMayOverlap) {
  addSection(10, 30);
  addSection(15, 5);
  addSection(50, 5);
  addSegment(10, 45);
  EXPECT_EQ(padding(), 10U);
}

TEST_F(SizesOfSegmentsTest, ExtentsThatEndBeyondAllNumbersAreCut) {
  addSegment(UINT64_MAX - 10, 100);
  addSection(UINT64_MAX - 5, 100);
  EXPECT_EQ(padding(), 5U);
}

TEST_F(SizesOfSegmentsTest, BlocksOfRawDataAreOccupied) {
  addSegment(10, 30);
  RawDataBlock* block = m_Module.createRawDataBlock(m_Module.getSegment(0), 20);
  block->setFileOffset(15);
  const std::vector<uint8_t> zeros(20);
  block->write(0, zeros.data(), zeros.size());
  EXPECT_EQ(padding(), 5U + 5U + 20U);
  const uint8_t one = 1;
  block->write(19, &one, 1);
  EXPECT_EQ(padding(), 5U + 5U);
  EXPECT_EQ(computeSizesStatistics(&m_Module).m_RoData, 20U);
}

// ---- Files without sections

TEST_F(SizesStatisticsTest, SegmentsCountWhereThereAreNoSections) {
  EXPECT_EQ(sizesOf(segmentsOnly({{.flags = PF_X, .filesz = 10, .memsz = 14}})), "code 10, zi 4");
  EXPECT_EQ(sizesOf(segmentsOnly({{.flags = PF_R | PF_W | PF_X, .filesz = 10, .memsz = 10}})),
            "code 10");
  EXPECT_EQ(sizesOf(segmentsOnly({{.flags = PF_R | PF_W, .filesz = 10, .memsz = 14}})),
            "rw 10, rw packed 10, zi 4");
  EXPECT_EQ(sizesOf(segmentsOnly({{.flags = PF_R, .filesz = 10, .memsz = 14}})), "ro 10, zi 4");
  EXPECT_EQ(sizesOf(segmentsOnly({{.flags = PF_W, .filesz = 10, .memsz = 14}})), "");
  EXPECT_EQ(sizesOf(segmentsOnly({{.flags = 0, .filesz = 10, .memsz = 14}})), "");
  EXPECT_EQ(sizesOf(segmentsOnly({{.flags = 0xF0 | PF_R, .filesz = 10, .memsz = 10}})), "ro 10");
}

TEST_F(SizesStatisticsTest, OnlyLoadableSegmentsCount) {
  for (const uint32_t type : {PT_NULL, PT_DYNAMIC, PT_INTERP, PT_NOTE, PT_PHDR, PT_TLS})
    EXPECT_EQ(sizesOf(segmentsOnly({{.type = type, .flags = PF_X, .filesz = 10, .memsz = 14}})),
              "");
}

TEST_F(SizesStatisticsTest, GapsBetweenSegmentsAloneAreNotCounted) {
  EXPECT_EQ(sizesOf(segmentsOnly({{.flags = PF_X, .filesz = 80, .memsz = 80},
                                  {.flags = PF_R, .offset = 100, .filesz = 20, .memsz = 30}})),
            "code 80, ro 20, zi 10");
}

TEST_F(SizesStatisticsTest, MemoryThatIsSmallerThanTheFileWrapsAsNumbersDo) {
  const ReadResult result = readGood(segmentsOnly({{.flags = PF_X, .filesz = 10, .memsz = 4}}));
  const SizesStatistics sizes = computeSizesStatistics(result.module.get());
  EXPECT_EQ(sizes.m_Code, 10U);
  EXPECT_EQ(sizes.m_ZiData, UINT64_MAX - 5);
}

TEST_F(SizesStatisticsTest, OneSectionIsEnoughToCountSections) {
  ObjectBuilder file = segmentsOnly({{.flags = PF_X, .filesz = 10, .memsz = 14}});
  file.section(".bss", SHT_NOBITS).flags(SHF_ALLOC).size(3);
  const ReadResult result = readGood(file);
  const SizesStatistics sizes = computeSizesStatistics(result.module.get());
  EXPECT_EQ(sizes.m_Code, 0U);
  EXPECT_EQ(sizes.m_ZiData, 3U);
}

TEST_F(SizesStatisticsTest, NothingIsKnownToBeCompressed) {
  ObjectBuilder file = object().type(ET_EXEC);
  file.section(".data", SHT_PROGBITS).flags(SHF_ALLOC | SHF_WRITE).zeros(8);
  file.section(".symtab", SHT_SYMTAB)
      .link(3)
      .symbol({.name = "Region$$Table$$Base", .section = 1})
      .symbol({.name = "Region$$Table$$Limit", .section = 1, .value = 8});
  file.section(".strtab", SHT_STRTAB);
  EXPECT_EQ(sizesOf(file), "rw 8, rw packed 8");
}

// ---- The module, and the report

TEST_F(SizesStatisticsTest, CountingChangesNothing) {
  const ReadResult result = readGood(marked(CodeFlags, 16, {{"$a", 0}, {"$d", 8}}));
  ObjectModule& module = *result.module;
  ModuleBuilder::setAuxiliarySectionsUpToDate(module, true);
  const SizesStatistics first = computeSizesStatistics(&module);
  EXPECT_TRUE(module.areAuxiliarySectionsUpToDate());
  EXPECT_EQ(nonZeroTotals(computeSizesStatistics(&module)), nonZeroTotals(first));
}

TEST_F(SizesStatisticsTest, AReportHasALineForEachTotal) {
  EXPECT_EQ(printed({.m_Code = 1,
                     .m_LiteralPools = 22,
                     .m_RwDataUncompressed = 333,
                     .m_RwDataCompressed = 4444,
                     .m_RoData = 55555,
                     .m_ZiData = 0,
                     .m_DebugInfo = 0xFFFFFFFF,
                     .m_InternalPadding = 0x100000007}),
            "==========================================\n"
            "Code                    :          1 bytes\n"
            "Literal pools           :         22 bytes\n"
            "RW data (uncompressed)  :        333 bytes\n"
            "RW data (compressed)    :       4444 bytes\n"
            "RO data                 :      55555 bytes\n"
            "ZI data                 :          0 bytes\n"
            "Debug info              : 4294967295 bytes\n"
            "Internal padding        :          7 bytes\n"
            "==========================================\n");
}

TEST_F(SizesStatisticsTest, ThereMustBeAModuleAndAFile) {
  EXPECT_DEATH(static_cast<void>(computeSizesStatistics(nullptr)), "objectModule != NULL");
  EXPECT_DEATH(printSizesStatistics({}, nullptr), "f != NULL");
}

} // namespace elfext
