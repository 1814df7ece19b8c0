// SPDX-License-Identifier: Apache-2.0
//
// The ELF header and the two header tables: every shorter file is truncated, fields are checked in
// one order, and counts that are told elsewhere (extended numbering) are compared with the file
// before they are believed.

#include "tests/support/reader_fixture.h"

namespace elfext {

using ReadHeaderTest = ReaderTest;
using ReadHeaderOfEachFormTest = EachFormTest;

INSTANTIATE_TEST_SUITE_P(Forms, ReadHeaderOfEachFormTest, testing::ValuesIn(AllForms), formName);

TEST_P(ReadHeaderOfEachFormTest, FieldsGoToTheModule) {
  ObjectBuilder file = GetParam().object();
  file.type(ET_EXEC).machine(184).osAbi(64).byteAt(8, 3);
  file.byteAt(6, 9); // EI_VERSION is not checked
  file.header(HeaderField::Entry, 0x8001).header(HeaderField::Flags, 0x5000002);
  file.section(".text", SHT_PROGBITS).zeros(8);
  file.segment({.type = PT_NOTE});
  const ReadResult result = readGood(file);
  const ObjectModule& module = *result.module;
  const bool isWide = GetParam().isWide();
  EXPECT_EQ(module.getElfClass(), isWide ? ELFCLASS64 : ELFCLASS32);
  EXPECT_EQ(module.isLittleEndian(), GetParam().data == ElfData::Little);
  EXPECT_EQ(module.getDataEncoding(), GetParam().data == ElfData::Little ? 1U : 2U);
  EXPECT_EQ(module.getFileType(), ET_EXEC);
  EXPECT_EQ(module.getMachine(), 184U);
  EXPECT_EQ(module.getOsAbi(), 64U);
  EXPECT_EQ(module.getAbiVersion(), 3U);
  EXPECT_EQ(module.getIdentVersion(), 9U);
  EXPECT_EQ(module.getElfVersion(), 1U);
  EXPECT_EQ(module.getEntry(), 0x8001U);
  EXPECT_EQ(module.getElfFlags(), 0x5000002U);
  EXPECT_EQ(module.getElfHeaderSize(), isWide ? 64U : 52U);
  EXPECT_EQ(module.getSectionHeaderEntrySize(), isWide ? 64U : 40U);
  EXPECT_EQ(module.getProgramHeaderEntrySize(), isWide ? 56U : 32U);
  EXPECT_EQ(module.getSectionHeaderOffset(), file.headerOffsetOf(0));
  EXPECT_EQ(module.getProgramHeaderOffset(), file.segmentHeaderOffsetOf(0));
  EXPECT_EQ(module.getStoredSectionCount(), 3U);
  EXPECT_EQ(module.getStoredProgramHeaderCount(), 1U);
  EXPECT_STREQ(module.getObjectName(), "a.o");
}

TEST_P(ReadHeaderOfEachFormTest, AHeaderAloneIsAnEmptyModule) {
  const ReadResult result = readGood(GetParam().object());
  EXPECT_TRUE(result.module->isEmpty());
  EXPECT_EQ(result.module->getSegmentCount(), 0U);
  EXPECT_EQ(result.module->getReadConditions(),
            ReadCondition_WasRead | ReadCondition_HasEmptySectionHeaderTable);
}

TEST_P(ReadHeaderOfEachFormTest, EveryShorterFileIsTruncated) {
  const std::string bytes = GetParam().object().bytes();
  for (size_t size = 0; size < bytes.size(); ++size)
    EXPECT_THAT(read(bytes.substr(0, size)).reports, ElementsAre(Truncated)) << size;
}

TEST_P(ReadHeaderOfEachFormTest, ATypeOutsideOneToFourIsRefused) {
  for (const uint16_t type : std::initializer_list<uint16_t>{0, 5, 256, 0xFFFF})
    expectFinal(GetParam().object().type(type), "ELF file has unrecognised type code " +
                                                    std::to_string(type) +
                                                    " (we handle types 1-4)");
  for (const uint16_t type : std::initializer_list<uint16_t>{1, 2, 3, 4})
    EXPECT_EQ(readGood(GetParam().object().type(type)).module->getFileType(), type);
}

TEST_P(ReadHeaderOfEachFormTest, AVersionOtherThanOneIsRefused) {
  for (const uint32_t version : {0U, 2U, 0x01000000U})
    expectFinal(GetParam().object().header(HeaderField::Version, version),
                "ELF file has unsupported version code " + std::to_string(version) +
                    " (we only handle version 1)");
}

TEST_P(ReadHeaderOfEachFormTest, OnlyThreeMachinesAreKnown) {
  for (const uint16_t machine : std::initializer_list<uint16_t>{40, 183, 184})
    EXPECT_EQ(readGood(GetParam().object().machine(machine)).module->getMachine(), machine);
  for (const uint16_t machine : std::initializer_list<uint16_t>{0, 3, 41, 62, 182, 185, 0xFFFF}) {
    const ReadResult result = read(GetParam().object().machine(machine));
    EXPECT_FALSE(result.isRead);
    EXPECT_THAT(result.reports,
                ElementsAre("ELF file has unsupported machine code " + std::to_string(machine) +
                            " (we only handle EM_ZEV = 40)"));
  }
}

TEST_F(ReadHeaderTest, TheAnswerToAForeignMachineIsTheResult) {
  const ReadResult result = readOn(object().machine(3));
  EXPECT_TRUE(result.isRead);
  EXPECT_THAT(result.reports, SizeIs(1));
  EXPECT_TRUE(result.module->isEmpty());
}

TEST_F(ReadHeaderTest, TheEncodingIsOneOrTwo) {
  // All but 1 is taken for big-endian, and the type is looked at first.
  expectFinal(object(ElfClass::Class32, ElfData::Little).byteAt(5, 0),
              "ELF file has unrecognised type code 256 (we handle types 1-4)");
  expectFinal(object(ElfClass::Class32, ElfData::Big).byteAt(5, 0),
              "ELF file has invalid endianness code 0 (should be 1 or 2)");
  expectFinal(object(ElfClass::Class64, ElfData::Big).byteAt(5, 255),
              "ELF file has invalid endianness code 255 (should be 1 or 2)");
}

TEST_F(ReadHeaderTest, ChecksGoFromTypeToEncodingToVersionToMachine) {
  ObjectBuilder file = object(ElfClass::Class32, ElfData::Big).machine(3);
  file.header(HeaderField::ShOff, 1);
  EXPECT_THAT(read(file).reports, ElementsAre(HasSubstr("machine code 3")));
  file.header(HeaderField::Version, 2);
  EXPECT_THAT(read(file).reports, ElementsAre(HasSubstr("version code 2")));
  file.byteAt(5, 3);
  EXPECT_THAT(read(file).reports, ElementsAre(HasSubstr("endianness code 3")));
  file.type(9);
  EXPECT_THAT(read(file).reports, ElementsAre(HasSubstr("type code 9")));
}

TEST_F(ReadHeaderTest, TheMagicCountsInClass1Only) {
  expectFinal(object().byteAt(0, 0), "File is not an ELF file (wrong magic number)");
  expectFinal(object().byteAt(3, 'G'), "File is not an ELF file (wrong magic number)");
  readGood(object(ElfClass::Class64).byteAt(0, 0).byteAt(3, 'G'));
}

TEST_F(ReadHeaderTest, TheScrambledMagicIsAWrongOne) {
  const std::string scrambled = "\xF7\x4F\x52\x43";
  ObjectBuilder file = object();
  ObjectBuilder wide = object(ElfClass::Class64);
  for (size_t i = 0; i < 4; ++i) {
    file.byteAt(i, static_cast<uint8_t>(scrambled[i]));
    wide.byteAt(i, static_cast<uint8_t>(scrambled[i]));
  }
  expectFinal(file, "File is not an ELF file (wrong magic number)");
  readGood(wide);
}

TEST_F(ReadHeaderTest, AClassOtherThanTwoMustBeOne) {
  for (const uint8_t elfClass : std::initializer_list<uint8_t>{0, 3, 255})
    expectFinal(object().byteAt(4, elfClass), "File is not 32-bit ELF");
  // The magic is looked at before the class.
  expectFinal(object().byteAt(4, 3).byteAt(1, 0), "File is not an ELF file (wrong magic number)");
}

TEST_P(ReadHeaderOfEachFormTest, SectionHeadersMustBeInTheFile) {
  ObjectBuilder file = GetParam().object();
  file.section(".text", SHT_PROGBITS);
  const uint64_t size = file.bytes().size();
  const uint64_t tableSize = size - file.headerOffsetOf(0);
  readGood(file);
  for (const uint64_t offset : {size - tableSize + 1, size, size + 1, uint64_t{0xFFFFFFFF}})
    expectFinal(ObjectBuilder(file).header(HeaderField::ShOff, offset), Truncated);
  for (const uint64_t count : {4U, 0xFFFFU})
    expectFinal(ObjectBuilder(file).header(HeaderField::ShNum, count), Truncated);
  if (GetParam().isWide())
    expectFinal(ObjectBuilder(file).header(HeaderField::ShOff, UINT64_MAX), Truncated);
}

TEST_P(ReadHeaderOfEachFormTest, ACountOfZeroIsInTheFirstSectionHeader) {
  ObjectBuilder file = GetParam().object();
  file.extendedNumbering();
  file.section(".text", SHT_PROGBITS).zeros(4);
  const ReadResult result = readGood(file);
  EXPECT_EQ(result.module->getSectionCount(), 3U);
  EXPECT_STREQ(result.section(1)->getName(), ".text");
  EXPECT_EQ(result.module->getStoredSectionCount(), 0U);
}

TEST_P(ReadHeaderOfEachFormTest, AnExtendedCountIsComparedWithTheFile) {
  ObjectBuilder file = GetParam().object();
  file.extendedNumbering();
  file.section(".text", SHT_PROGBITS).zeros(4);
  for (const uint64_t count : {uint64_t{4}, uint64_t{0xFFFFFFFF}}) {
    ObjectBuilder changed = file;
    changed.sectionZero().size(count);
    expectFinal(changed, Truncated);
  }
  if (!GetParam().isWide()) return;
  // These would fit if they were cut to 32 bits, or times the row size to 64.
  for (const uint64_t count :
       {(uint64_t{1} << 32) + 3, uint64_t{1} << 63, (uint64_t{1} << 58) + 1}) {
    ObjectBuilder changed = file;
    changed.sectionZero().size(count);
    expectFinal(changed, Truncated);
  }
}

TEST_F(ReadHeaderTest, TheFirstSectionHeaderMustBeThereToTellTheCount) {
  const std::string bytes =
      object().header(HeaderField::ShOff, 52).tail(std::string(39, 0)).bytes();
  EXPECT_THAT(read(bytes).reports, ElementsAre(Truncated));
  readGood(bytes + '\0');
}

TEST_F(ReadHeaderTest, WithoutSectionHeadersTheNameTableIsNotLookedAt) {
  for (const uint32_t index : {1U, 7U, SHN_XINDEX})
    EXPECT_EQ(readGood(object().header(HeaderField::ShStrNdx, index)).module->getSectionCount(),
              0U);
}

TEST_F(ReadHeaderTest, AnEmptySectionHeaderTableHasNoNameTable) {
  ObjectBuilder file = object().header(HeaderField::ShOff, 52).tail(std::string(40, 0));
  EXPECT_EQ(readGood(file).module->getSectionCount(), 0U);
  expectFinal(ObjectBuilder(file).header(HeaderField::ShStrNdx, SHN_XINDEX),
              "Section header table is empty");
  expectFinal(ObjectBuilder(file).header(HeaderField::ShStrNdx, 1),
              "ELF header refers to section-name string table section #1 but the last section is "
              "#4294967295");
}

TEST_P(ReadHeaderOfEachFormTest, ProgramHeadersMustBeInTheFile) {
  ObjectBuilder file = GetParam().object();
  file.type(ET_EXEC).segment({.type = PT_NOTE}).segment({.type = PT_NOTE});
  const uint64_t size = file.bytes().size();
  EXPECT_EQ(readGood(file).module->getSegmentCount(), 2U);
  expectFinal(ObjectBuilder(file).header(HeaderField::PhNum, 3), Truncated);
  expectFinal(ObjectBuilder(file).header(HeaderField::PhNum, 0xFFFF), Truncated);
  expectFinal(ObjectBuilder(file).header(HeaderField::PhOff, size), Truncated);
  expectFinal(ObjectBuilder(file).header(HeaderField::PhOff, size + 1), Truncated);
  // Nothing is read of a table without rows, wherever it is.
  const ObjectBuilder empty =
      ObjectBuilder(file).header(HeaderField::PhNum, 0).header(HeaderField::PhOff, size + 1);
  EXPECT_EQ(readGood(empty).module->getSegmentCount(), 0U);
  const ObjectBuilder absent = ObjectBuilder(file).header(HeaderField::PhOff, 0);
  EXPECT_EQ(readGood(absent).module->getSegmentCount(), 0U);
}

TEST_F(ReadHeaderTest, AFullTableOfProgramHeadersIsRefused) {
  const ObjectBuilder file = object()
                                 .type(ET_EXEC)
                                 .header(HeaderField::PhOff, 52)
                                 .header(HeaderField::PhNum, 0xFFFF)
                                 .tail(std::string(0xFFFF * 32, '\0'));
  expectFinal(file, Truncated);
}

TEST_P(ReadHeaderOfEachFormTest, RowsHaveTheSizeOfTheClassWhateverTheHeaderSays) {
  for (const uint32_t size : {0U, 1U, 0xFFFFU}) {
    ObjectBuilder file = GetParam().object();
    file.type(ET_EXEC).header(HeaderField::ShEntSize, size).header(HeaderField::PhEntSize, size);
    file.section(".text", SHT_PROGBITS).zeros(4);
    file.segment({.type = PT_NOTE, .vaddr = 77});
    const ReadResult result = readGood(file);
    EXPECT_STREQ(result.section(1)->getName(), ".text");
    EXPECT_EQ(result.module->getSectionHeaderEntrySize(), size);
    EXPECT_EQ(result.module->getProgramHeaderEntrySize(), size);
  }
}

TEST_F(ReadHeaderTest, ModulesAreClearedBeforeTheyAreFilled) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS).zeros(4);
  const std::string bytes = file.bytes();
  m_Host.addFile("a.o", bytes);
  m_Host.addFile("bad.o", "no object");
  ObjectModule module;
  EXPECT_TRUE(readElfFile(m_Host, "a.o", 0, bytes.size(), module, nullptr));
  EXPECT_TRUE(readElfFile(m_Host, "a.o", 0, bytes.size(), module, nullptr));
  EXPECT_EQ(module.getSectionCount(), 3U);
  EXPECT_FALSE(readElfFile(m_Host, "bad.o", 0, 9, module, nullptr));
  EXPECT_TRUE(module.isEmpty());
}

TEST_F(ReadHeaderTest, WithoutAHandlerEveryProblemEndsTheRead) {
  const std::string bytes = object().machine(3).bytes();
  m_Host.addFile("a.o", bytes);
  ObjectModule module;
  EXPECT_FALSE(readElfFile(m_Host, "a.o", 0, bytes.size(), module, nullptr));
}

namespace {

class Agreeing final : public ErrorHandler {
public:
  bool report(const ObjectModule&, uint32_t, const std::string&) override { return true; }
};

} // namespace

TEST_F(ReadHeaderTest, NobodyMayGoOnWithAHeaderThatCannotBeRead) {
  Agreeing agreeing;
  ObjectModule module;
  module.setErrorHandler(&agreeing);
  for (const ObjectBuilder& file :
       {object().type(9), object(ElfClass::Class32, ElfData::Big).byteAt(5, 3),
        object().header(HeaderField::Version, 2), object().byteAt(0, 0)}) {
    const std::string bytes = file.bytes();
    m_Host.addFile("a.o", bytes);
    EXPECT_DEATH(static_cast<void>(readElfFile(m_Host, "a.o", 0, bytes.size(), module, nullptr)),
                 "!err_response");
  }
}

} // namespace elfext
