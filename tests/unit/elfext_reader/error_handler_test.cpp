// SPDX-License-Identifier: Apache-2.0
//
// The texts of all reports, in the order of their operations. Users and other tools know them, so
// each is compared to the letter; and what a handler may answer is held for each failure.

#include "elfext/interface/error_handler.h"

#include "elfext/interface/elf_constants.h"
#include "elfext/interface/error_string_capture.h"
#include "elfext/interface/object_module.h"
#include "elfext/src/reports/low_level_result.h"
#include "elfext/src/reports/read_reporter.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <cstring>
#include <functional>

namespace elfext {

namespace {

using Call = std::function<bool(ErrorHandler& handler, const ObjectModule& module)>;

struct Case {
  const char* text;
  Call call;
};

const Case Cases[] = {
    {"Out of memory", [](auto& h, auto& m) { return h.outOfMemory(m); }},
    {"I/O error reading file 'a.o': Permission denied",
     [](auto& h, auto& m) { return h.ioErrorReading(m, EACCES); }},
    {"I/O error writing file 'a.o': Unknown error -1",
     [](auto& h, auto& m) { return h.ioErrorWriting(m, -1); }},
    {"Section header table is empty",
     [](auto& h, auto& m) { return h.emptySectionHeaderTable(m); }},
    {"ELF header refers to section-name string table section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.sectionNameTableOutOfRange(m, 7, 4); }},
    {"Symbol table section #2 refers to string table section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.symbolTableLinkOutOfRange(m, 2, 7, 4); }},
    {"Relocation section #2 refers to symbol table section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.relocationLinkOutOfRange(m, 2, 7, 4); }},
    {"Group section #2 refers to symbol table section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.groupLinkOutOfRange(m, 2, 7, 4); }},
    {"Group section #2 refers to member section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.groupMemberOutOfRange(m, 2, 7, 4); }},
    {"Relocation section #2 refers to target section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.relocationTargetOutOfRange(m, 2, 7, 4); }},
    {"SHT_SYMTAB_SHNDX section #2 refers to symbol table section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.shndxLinkOutOfRange(m, 2, 7, 4); }},
    {"Hash section #2 refers to symbol table section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.hashLinkOutOfRange(m, 2, 7, 4); }},
    {"Preemption map section #2 refers to string table section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.preemptionMapLinkOutOfRange(m, 2, 7, 4); }},
    {"Dynamic section #2 refers to string table section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.dynamicLinkOutOfRange(m, 2, 7, 4); }},
    {"Link field of section #2 refers to target section #7 but the last section is #4",
     [](auto& h, auto& m) { return h.sectionLinkOutOfRange(m, 2, 7, 4); }},
    {"ELF header refers to section-name string table section #3 but that section has type #2 "
     "(SHT_SYMTAB) instead of SHT_STRTAB",
     [](auto& h, auto& m) { return h.sectionNameTableOfWrongType(m, 3, SHT_SYMTAB); }},
    {"Symbol table section #2 refers to string table section #3 but that section has type #1 "
     "(SHT_PROGBITS) instead of SHT_STRTAB",
     [](auto& h, auto& m) { return h.symbolTableLinkOfWrongType(m, 2, 3, SHT_PROGBITS); }},
    {"Relocation section #2 refers to symbol table section #3 but that section has type #3 "
     "(SHT_STRTAB) instead of SHT_SYMTAB or SHT_DYNSYM",
     [](auto& h, auto& m) { return h.relocationLinkOfWrongType(m, 2, 3, SHT_STRTAB); }},
    {"Group section #2 refers to symbol table section #3 but that section has type #11 "
     "(SHT_DYNSYM) instead of SHT_SYMTAB or SHT_DYNSYM",
     [](auto& h, auto& m) { return h.groupLinkOfWrongType(m, 2, 3, SHT_DYNSYM); }},
    {"SHT_SYMTAB_SHNDX section #2 refers to symbol table section #3 but that section has type #17 "
     "(SHT_GROUP) instead of SHT_SYMTAB or SHT_DYNSYM",
     [](auto& h, auto& m) { return h.shndxLinkOfWrongType(m, 2, 3, SHT_GROUP); }},
    {"Hash section #2 refers to symbol table section #3 but that section has type #2 "
     "(SHT_SYMTAB) instead of SHT_DYNSYM",
     [](auto& h, auto& m) { return h.hashLinkOfWrongType(m, 2, 3, SHT_SYMTAB); }},
    {"Preemption map section #2 refers to string table section #3 but that section has type "
     "#1879048195 (SHT_ZEV_ATTRIBUTES) instead of SHT_STRTAB",
     [](auto& h, auto& m) { return h.preemptionMapLinkOfWrongType(m, 2, 3, SHT_ZEV_ATTRIBUTES); }},
    {"Dynamic section #2 refers to string table section #3 but that section has type #12345 "
     "instead of SHT_STRTAB",
     [](auto& h, auto& m) { return h.dynamicLinkOfWrongType(m, 2, 3, 12345); }},
    {"Section name field for section #2 specifies a nonzero string table offset, but there is no "
     "section-name string table",
     [](auto& h, auto& m) { return h.nameWithoutNameTable(m, 2); }},
    {"Section name field for section #2 specifies a string table offset 99 which is beyond the end "
     "of the section-name string table (length 20)",
     [](auto& h, auto& m) { return h.sectionNameOutOfRange(m, 2, 99, 20); }},
    {"Group section #2 refers to symbol #9 but its associated symbol table section #3 only "
     "contains 5 symbols",
     [](auto& h, auto& m) { return h.groupSignatureOutOfRange(m, 2, 9, 3, 5); }},
    {"SHT_SYMTAB_SHNDX sections #2 and #3 are both associated with the same symbol table section "
     "#1",
     [](auto& h, auto& m) { return h.secondShndxSection(m, 2, 3, 1); }},
    {"SHT_SYMTAB_SHNDX section #2 contains 4 entries, but its associated symbol table section #1 "
     "contains 5",
     [](auto& h, auto& m) { return h.shndxCountDiffers(m, 2, 4, 1, 5); }},
    {"Symbol #6 in symbol table section #2 refers to offset 99 in string table section #3, which "
     "is only 20 bytes long",
     [](auto& h, auto& m) {
       return h.symbolNameOutOfRange(m, {6, 2, false}, 99, 3, 20);
     }},
    {"Symbol #6 in dynamic symbol table section #2 refers to offset 99 in string table section #3, "
     "which is only 20 bytes long",
     [](auto& h, auto& m) {
       return h.symbolNameOutOfRange(m, {6, 2, true}, 99, 3, 20);
     }},
    {"Symbol #6 in symbol table section #2 has SHN_XINDEX section field, but there is no "
     "SHT_SYMTAB_SHNDX section associated with the symbol table",
     [](auto& h, auto& m) {
       return h.symbolWithoutShndxSection(m, {6, 2, false});
     }},
    {"Symbol #6 in dynamic symbol table section #2 is defined in section #65280 but the last "
     "section is #4",
     [](auto& h, auto& m) {
       return h.symbolSectionOutOfRange(m, {6, 2, true}, 65280, 4);
     }},
    {"Symbol #6 in symbol table section #2 has type STT_SECTION but is not defined relative to a "
     "section",
     [](auto& h, auto& m) {
       return h.sectionSymbolNotHosted(m, {6, 2, false});
     }},
    {"Symbol #6 in dynamic symbol table section #2 has type STT_SECTION but is not defined "
     "relative to a section",
     [](auto& h, auto& m) {
       return h.sectionSymbolNotHosted(m, {6, 2, true});
     }},
    {"Symbol #6 has type STT_SECTION but is not defined relative to a section",
     [](auto& h, auto& m) {
       return h.sectionSymbolNotHosted(m, {6, 0, true});
     }},
    {"Symbol #6, the STT_SECTION symbol for section #2, has size 3 which should be either zero or "
     "the section's size 8",
     [](auto& h, auto& m) { return h.sectionSymbolSizeDiffers(m, 6, 2, 3, 8); }},
    {"Symbol #6, a STT_SECTION symbol in section #2, has size 9 which should be at most the "
     "section's size 8",
     [](auto& h, auto& m) { return h.sectionSymbolTooLarge(m, 6, 2, 9, 8); }},
    {"Relocation #0 in relocation section #2 refers to symbol #9 but its associated symbol table "
     "section #3 only contains 5 symbols",
     [](auto& h, auto& m) { return h.relocationSymbolOutOfRange(m, 0, 2, 9, 3, 5); }},
    {"Section #1 belongs to group section #2 and also to group section #3",
     [](auto& h, auto& m) { return h.sectionInTwoGroups(m, 1, 2, 3); }},
    {"Build attributes in section #2 are corrupted",
     [](auto& h, auto& m) { return h.corruptBuildAttributes(m, 2); }},
    {"String table section #2 is completely empty",
     [](auto& h, auto& m) { return h.emptyStringTable(m, 2); }},
    {"String table section #3 starts and ends with a non-zero byte value",
     [](auto& h, auto& m) { return h.stringTableNotZeroEnded(m, 3, true, true); }},
    {"String table section #3 starts with a non-zero byte value",
     [](auto& h, auto& m) { return h.stringTableNotZeroEnded(m, 3, true, false); }},
    {"String table section #3 ends with a non-zero byte value",
     [](auto& h, auto& m) { return h.stringTableNotZeroEnded(m, 3, false, true); }},
    {"ELF file has unrecognised type code 5 (we handle types 1-4)",
     [](auto& h, auto& m) { return h.unrecognisedFileType(m, 5); }},
    {"ELF file has invalid endianness code 3 (should be 1 or 2)",
     [](auto& h, auto& m) { return h.invalidDataEncoding(m, 3); }},
    {"ELF file has unsupported version code 2 (we only handle version 1)",
     [](auto& h, auto& m) { return h.unsupportedVersion(m, 2); }},
    {"ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)",
     [](auto& h, auto& m) { return h.unsupportedMachine(m, 3); }},
    {"Section #2 specifies its entry size as 17 (should be 16)",
     [](auto& h, auto& m) { return h.wrongEntrySize(m, 2, 17, 16); }},
    {"Section #2 has length 17, which is not a multiple of 16",
     [](auto& h, auto& m) { return h.sizeNotMultiple(m, 2, 17, 16); }},
    {"Relocations in PLT and GOT include some with addends and some without",
     [](auto& h, auto& m) { return h.mixedJumpSlotAddends(m); }},
    {"SHT_NULL section #2 does not have completely null details",
     [](auto& h, auto& m) { return h.nullSectionNotNull(m, 2); }},
    {"Section #0 has type 1 (SHT_PROGBITS) instead of SHT_NULL",
     [](auto& h, auto& m) { return h.firstSectionNotNull(m, SHT_PROGBITS); }},
    {"Auxiliary section #2 has at least one symbol defined in it",
     [](auto& h, auto& m) { return h.auxiliarySectionHostsSymbol(m, 2); }},
    {"Auxiliary section #2 has at least one relocation in it",
     [](auto& h, auto& m) { return h.auxiliarySectionRelocated(m, 2); }},
    {"Multiple dynamic relocations at offset 8 in section #2",
     [](auto& h, auto& m) { return h.repeatedDynamicRelocation(m, 8, 2); }},
    {"Multiple static relocations at offset 8 in section #2",
     [](auto& h, auto& m) { return h.repeatedStaticRelocation(m, 8, 2); }},
    {"Program header table is non-empty although file is not executable",
     [](auto& h, auto& m) { return h.unexpectedSegments(m); }},
    {"Loadable section #2 is not contained in a loadable segment",
     [](auto& h, auto& m) { return h.loadableSectionOutsideSegments(m, 2); }},
    {"Non-loadable section #2 is contained in loadable segment #1",
     [](auto& h, auto& m) { return h.otherSectionInLoadableSegment(m, 2, 1); }},
    {"Loadable segments #1 appears before #2 in the file but after it in memory",
     [](auto& h, auto& m) { return h.loadableSegmentsOutOfOrder(m, 1, 2); }},
    {"Loadable segments #1 and #2 overlap",
     [](auto& h, auto& m) { return h.loadableSegmentsOverlap(m, 1, 2); }},
    {"Sections #1 and #2 overlap in the file",
     [](auto& h, auto& m) { return h.sectionsOverlap(m, 1, 2); }},
    {"Segments #1 and #2 both have type PT_INTERP",
     [](auto& h, auto& m) { return h.secondInterpreterSegment(m, 1, 2); }},
    {"Segments #1 and #2 both have type PT_PHDR",
     [](auto& h, auto& m) { return h.secondHeaderTableSegment(m, 1, 2); }},
    {"PT_LOAD segment #1 comes before PT_INTERP segment #2",
     [](auto& h, auto& m) { return h.loadableBeforeInterpreter(m, 1, 2); }},
    {"PT_LOAD segment #1 comes before PT_PHDR segment #2",
     [](auto& h, auto& m) { return h.loadableBeforeHeaderTable(m, 1, 2); }},
    {"PT_PHDR segment #0 has size 32 bytes, smaller than the actual size of the program header "
     "table (64)",
     [](auto& h, auto& m) { return h.headerTableSegmentTooSmall(m, 0, 32, 64); }},
    {"Loadable segment #0's virtual address 33 and its file offset 64 are not congruent modulo its "
     "alignment 4",
     [](auto& h, auto& m) { return h.segmentNotCongruent(m, 0, 33, 64, 4); }},
    {"Loadable section #2's virtual address 33 is not a multiple of its alignment 4",
     [](auto& h, auto& m) { return h.sectionMisaligned(m, 2, 33, 4); }},
    {"No loadable segments exist", [](auto& h, auto& m) { return h.noLoadableSegments(m); }},
    {"First loadable segment #0 has 52 bytes unmapped at the start, but 84 are needed",
     [](auto& h, auto& m) { return h.noRoomForHeaders(m, 0, 52, 84); }},
    {"SHT_ZEV_EXIDX section #2 should have SHF_ALLOC (2) and SHF_LINK_ORDER (128) flags set",
     [](auto& h, auto& m) { return h.indexTableFlagsMissing(m, 2, 130); }},
    {"SHT_ZEV_EXIDX section #2 should have SHF_ALLOC (2) flag set",
     [](auto& h, auto& m) { return h.indexTableFlagsMissing(m, 2, 2); }},
    {"SHT_ZEV_EXIDX section #2 should have SHF_LINK_ORDER (128) flag set",
     [](auto& h, auto& m) { return h.indexTableFlagsMissing(m, 2, 128); }},
    {"sh_link field of SHT_ZEV_EXIDX section #2 should point to a SHT_PROGBITS section with "
     "SHF_ALLOC and SHF_EXECINSTR flags set",
     [](auto& h, auto& m) { return h.indexTableLinkUnsuitable(m, 2); }},
    {"Section #2 has the SHF_GROUP flag set but is not referenced by any SHT_GROUP section",
     [](auto& h, auto& m) { return h.groupFlagWithoutGroup(m, 2); }},
    {"Section #2 is referenced by SHT_GROUP section #1 but does not have the SHF_GROUP flag set",
     [](auto& h, auto& m) { return h.memberWithoutGroupFlag(m, 2, 1); }},
    {"Relocation #4 in section #2 references a local symbol in section #5 which is not in the same "
     "group as its target section #1",
     [](auto& h, auto& m) { return h.relocationLeavesGroup(m, 4, 2, 5, 1); }},
    {"Relocation #4 in section #2 has target section #1 which should not be relocated at all",
     [](auto& h, auto& m) { return h.relocationNotAllowed(m, 4, 2, 1); }},
    {"Dynamic symbol #3 has binding STB_LOCAL but is undefined",
     [](auto& h, auto& m) { return h.localSymbolUndefined(m, 3, true); }},
    {"Symbol #3 has binding STB_LOCAL but is undefined",
     [](auto& h, auto& m) { return h.localSymbolUndefined(m, 3, false); }},
    {"File is not an ELF file (wrong magic number)",
     [](auto& h, auto& m) { return h.wrongMagic(m); }},
    {"File is not 32-bit ELF", [](auto& h, auto& m) { return h.wrongClass(m); }},
    {"Segment #0 and segment #1 have alignment constraints which cannot both be satisfied given "
     "their relative offset",
     [](auto& h, auto& m) { return h.segmentAlignmentConflict(m, 0, 1); }},
    {"Segment #0 and section #1 have alignment constraints which cannot both be satisfied given "
     "their relative offset",
     [](auto& h, auto& m) { return h.sectionAlignmentConflict(m, 0, 1); }},
    {"Segment #0 and program header table have alignment constraints which cannot both be "
     "satisfied given their relative offset",
     [](auto& h, auto& m) { return h.programHeaderTableAlignmentConflict(m, 0); }},
    {"Segment #0 and section header table have alignment constraints which cannot both be "
     "satisfied given their relative offset",
     [](auto& h, auto& m) { return h.sectionHeaderTableAlignmentConflict(m, 0); }},
    {"Segment #0 and ELF header have alignment constraints which cannot both be satisfied given "
     "their relative offset",
     [](auto& h, auto& m) { return h.elfHeaderAlignmentConflict(m, 0); }},
    {"Record #0 in debug overlay section #2 refers to section #3 which is not a debug section",
     [](auto& h, auto& m) { return h.overlayOfOtherSection(m, 0, 2, 3); }},
    {"Record #0 in debug overlay section #2 refers to section #99 which is not a section",
     [](auto& h, auto& m) { return h.overlayOfNoSection(m, 0, 2, 99); }},
    {"Section/segment mapping in SHT_NOTE section #2 contains 3 entries, but there are 4 SHF_ALLOC "
     "sections",
     [](auto& h, auto& m) { return h.segmentMapCountDiffers(m, 2, 3, 4); }},
    {"Section/segment mapping in SHT_NOTE section #2 maps section #1 to segment #7 which does not "
     "exist",
     [](auto& h, auto& m) { return h.segmentMapOutOfRange(m, 2, 1, 7); }},
};

class Agreeing final : public ErrorHandler {
public:
  bool report(const ObjectModule&, uint32_t sectionIndex, const std::string&) override {
    m_SectionIndex = sectionIndex;
    return true;
  }

  uint32_t m_SectionIndex = 0;
};

} // namespace

class ErrorHandlerTest : public testing::Test {
protected:
  ErrorHandlerTest() { m_Module.setObjectName("a.o"); }

  ObjectModule m_Module;
  ElfextErrorStringCapture m_Capture;
  Agreeing m_Agreeing;
};

TEST_F(ErrorHandlerTest, WordsEachReport) {
  for (const Case& each : Cases) {
    EXPECT_FALSE(each.call(m_Capture, m_Module));
    EXPECT_EQ(m_Capture.getText(), each.text);
  }
}

TEST_F(ErrorHandlerTest, PassesOnTheAnswerOfReport) {
  for (const Case& each : Cases)
    EXPECT_TRUE(each.call(m_Agreeing, m_Module)) << each.text;
}

TEST_F(ErrorHandlerTest, TellsWhichSectionIsToBlame) {
  EXPECT_TRUE(m_Agreeing.relocationLinkOutOfRange(m_Module, 2, 7, 4));
  EXPECT_EQ(m_Agreeing.m_SectionIndex, 2);
  EXPECT_TRUE(m_Agreeing.symbolWithoutShndxSection(m_Module, {6, 5, false}));
  EXPECT_EQ(m_Agreeing.m_SectionIndex, 5);
  EXPECT_TRUE(m_Agreeing.wrongMagic(m_Module));
  EXPECT_EQ(m_Agreeing.m_SectionIndex, 0);
}

TEST_F(ErrorHandlerTest, LeavesOutTheNameAndTheSystemTextOfAnIoErrorThatHasNone) {
  EXPECT_FALSE(m_Capture.ioErrorReading(m_Module, 0));
  EXPECT_EQ(m_Capture.getText(), "I/O error reading file 'a.o'");
  m_Module.setObjectName(nullptr);
  EXPECT_FALSE(m_Capture.ioErrorWriting(m_Module, 0));
  EXPECT_EQ(m_Capture.getText(), "I/O error writing file");
  EXPECT_FALSE(m_Capture.ioErrorWriting(m_Module, ENOENT));
  EXPECT_EQ(m_Capture.getText(), "I/O error writing file: No such file or directory");
}

TEST_F(ErrorHandlerTest, CaptureStartsEmptyAndKeepsTheLastText) {
  EXPECT_EQ(m_Capture.getText(), "");
  EXPECT_FALSE(m_Capture.wrongMagic(m_Module));
  EXPECT_FALSE(m_Capture.outOfMemory(m_Module));
  EXPECT_EQ(m_Capture.getText(), "Out of memory");
}

TEST_F(ErrorHandlerTest, LowLevelResultsBecomeReports) {
  m_Module.setErrorHandler(&m_Capture);
  EXPECT_TRUE(mapLowLevelResult(ReadReporter(m_Module), LowLevelResult::Success));
  EXPECT_EQ(m_Capture.getText(), "");
  const std::pair<uint8_t, const char*> results[] = {
      {1, "I/O error writing file 'a.o': Unknown error -1"},
      {2, "I/O error reading file 'a.o': Unknown error -1"},
      {3, "File is not an ELF file (wrong magic number)"},
      {5, "File is not 32-bit ELF"},
      {6, "Out of memory"},
  };
  for (const auto& [code, text] : results) {
    EXPECT_FALSE(mapLowLevelResult(ReadReporter(m_Module), LowLevelResult{code}));
    EXPECT_EQ(m_Capture.getText(), text);
  }
}

TEST_F(ErrorHandlerTest, ALowLevelFailureWithoutHandlerIsStillAFailure) {
  EXPECT_FALSE(mapLowLevelResult(ReadReporter(m_Module), LowLevelResult::OutsideImage));
}

using ErrorHandlerDeathTest = ErrorHandlerTest;

TEST_F(ErrorHandlerDeathTest, NobodyMayGoOnAfterALowLevelFailure) {
  m_Module.setErrorHandler(&m_Agreeing);
  for (const uint8_t code : std::initializer_list<uint8_t>{1, 2, 3, 5, 6}) {
    EXPECT_DEATH(static_cast<void>(mapLowLevelResult(ReadReporter(m_Module), LowLevelResult{code})),
                 "!err_response");
  }
  EXPECT_DEATH(static_cast<void>(mapLowLevelResult(ReadReporter(m_Module), LowLevelResult{4})),
               "Should never get here");
}

} // namespace elfext
