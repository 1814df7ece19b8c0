// SPDX-License-Identifier: Apache-2.0
//
// The fixed records of the format, got from bytes and put back: file header, section header,
// program header, symbol and relocation, in both classes and byte orders. Bytes are written field
// by field from the format's description, so that a field that is read from another's place shows.

#include "elfext/src/bytes/elf_records.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace elfext {

namespace {

constexpr RecordFormat Formats[] = {{false, true}, {false, false}, {true, true}, {true, false}};

// Field after field; a width of 0 is that of an address.
struct Field {
  uint64_t value;
  size_t width;
};

std::vector<uint8_t> fileBytes(RecordFormat format, const std::vector<Field>& fields) {
  std::vector<uint8_t> bytes;
  for (const Field& field : fields) {
    const size_t width = field.width != 0 ? field.width : format.isWide ? 8 : 4;
    for (size_t i = 0; i < width; ++i) {
      const size_t place = format.isLittle ? i : width - 1 - i;
      bytes.push_back(static_cast<uint8_t>(field.value >> (8 * place)));
    }
  }
  return bytes;
}

// The record, got from the bytes and put back, gives the bytes again.
template <class Record>
void expectSameBytes(RecordFormat format, const Record& record, const std::vector<uint8_t>& bytes) {
  std::vector<uint8_t> put(bytes.size());
  putRecord(format, record, put.data());
  EXPECT_EQ(put, bytes);
}

} // namespace

TEST(ElfRecordsTest, HaveTheSizesOfTheirClass) {
  EXPECT_EQ(fileHeaderSize(false), 52U);
  EXPECT_EQ(fileHeaderSize(true), 64U);
  EXPECT_EQ(sectionHeaderSize(false), 40U);
  EXPECT_EQ(sectionHeaderSize(true), 64U);
  EXPECT_EQ(programHeaderSize(false), 32U);
  EXPECT_EQ(programHeaderSize(true), 56U);
  EXPECT_EQ(symbolRowSize(false), 16U);
  EXPECT_EQ(symbolRowSize(true), 24U);
  EXPECT_EQ(relocationRowSize(false, false), 8U);
  EXPECT_EQ(relocationRowSize(true, false), 16U);
  EXPECT_EQ(relocationRowSize(false, true), 12U);
  EXPECT_EQ(relocationRowSize(true, true), 24U);
}

TEST(ElfRecordsTest, AFixedFormatIsTheOneAskedForAndAConstant) {
  for (const RecordFormat format : Formats) {
    const RecordFormat fixed = withFixedFormat(format, [](auto fixedFormat) {
      constexpr RecordFormat Known = fixedFormat;
      return Known;
    });
    EXPECT_EQ(fixed, format);
  }
}

TEST(ElfRecordsTest, WordsAreReadAndWrittenInTheFilesOrder) {
  const uint8_t bytes[] = {1, 2, 3, 4, 5, 6, 7, 8};
  EXPECT_EQ(getWord<uint16_t>(bytes, true), 0x0201);
  EXPECT_EQ(getWord<uint16_t>(bytes, false), 0x0102);
  EXPECT_EQ(getWord<uint32_t>(bytes + 1, true), 0x05040302U);
  EXPECT_EQ(getWord<uint32_t>(bytes + 1, false), 0x02030405U);
  EXPECT_EQ(getWord<uint64_t>(bytes, true), 0x0807060504030201U);
  EXPECT_EQ(getWord<uint64_t>(bytes, false), 0x0102030405060708U);
  uint8_t put[8];
  putWord(uint64_t{0x0102030405060708}, false, put);
  EXPECT_EQ(std::memcmp(put, bytes, 8), 0);
  putWord(uint64_t{0x0807060504030201}, true, put);
  EXPECT_EQ(std::memcmp(put, bytes, 8), 0);
}

TEST(ElfRecordsTest, FileHeader) {
  for (const RecordFormat format : Formats) {
    std::vector<Field> fields;
    for (uint64_t i = 0; i < 16; ++i)
      fields.push_back({i + 0x80, 1});
    for (const Field& field : std::vector<Field>{{0x0102, 2},
                                                 {0x0304, 2},
                                                 {0x05060708, 4},
                                                 {0x11121314, 0},
                                                 {0x21222324, 0},
                                                 {0x31323334, 0},
                                                 {0x41424344, 4},
                                                 {0x5152, 2},
                                                 {0x6162, 2},
                                                 {0x7172, 2},
                                                 {0x8182, 2},
                                                 {0x9192, 2},
                                                 {0xA1A2, 2}})
      fields.push_back(field);
    const std::vector<uint8_t> bytes = fileBytes(format, fields);
    ASSERT_EQ(bytes.size(), fileHeaderSize(format.isWide));
    FileHeader header;
    getRecord(format, bytes.data(), header);
    EXPECT_EQ(header.ident[15], 0x8F);
    EXPECT_EQ(header.type, 0x0102);
    EXPECT_EQ(header.machine, 0x0304);
    EXPECT_EQ(header.version, 0x05060708U);
    EXPECT_EQ(header.entry, 0x11121314U);
    EXPECT_EQ(header.phoff, 0x21222324U);
    EXPECT_EQ(header.shoff, 0x31323334U);
    EXPECT_EQ(header.flags, 0x41424344U);
    EXPECT_EQ(header.ehsize, 0x5152);
    EXPECT_EQ(header.phentsize, 0x6162);
    EXPECT_EQ(header.phnum, 0x7172);
    EXPECT_EQ(header.shentsize, 0x8182);
    EXPECT_EQ(header.shnum, 0x9192);
    EXPECT_EQ(header.shstrndx, 0xA1A2);
    expectSameBytes(format, header, bytes);
  }
}

TEST(ElfRecordsTest, SectionHeader) {
  for (const RecordFormat format : Formats) {
    const std::vector<uint8_t> bytes = fileBytes(
        format, {{1, 4}, {2, 4}, {3, 0}, {4, 0}, {5, 0}, {6, 0}, {7, 4}, {8, 4}, {9, 0}, {10, 0}});
    ASSERT_EQ(bytes.size(), sectionHeaderSize(format.isWide));
    SectionHeader header;
    getRecord(format, bytes.data(), header);
    EXPECT_EQ(header.name, 1U);
    EXPECT_EQ(header.type, 2U);
    EXPECT_EQ(header.flags, 3U);
    EXPECT_EQ(header.addr, 4U);
    EXPECT_EQ(header.offset, 5U);
    EXPECT_EQ(header.size, 6U);
    EXPECT_EQ(header.link, 7U);
    EXPECT_EQ(header.info, 8U);
    EXPECT_EQ(header.addralign, 9U);
    EXPECT_EQ(header.entsize, 10U);
    expectSameBytes(format, header, bytes);
  }
}

TEST(ElfRecordsTest, ProgramHeaderHasItsFlagsElsewhereInClass2) {
  for (const RecordFormat format : Formats) {
    const std::vector<uint8_t> bytes =
        format.isWide
            ? fileBytes(format, {{1, 4}, {2, 4}, {3, 8}, {4, 8}, {5, 8}, {6, 8}, {7, 8}, {8, 8}})
            : fileBytes(format, {{1, 4}, {3, 4}, {4, 4}, {5, 4}, {6, 4}, {7, 4}, {2, 4}, {8, 4}});
    ASSERT_EQ(bytes.size(), programHeaderSize(format.isWide));
    ProgramHeader header;
    getRecord(format, bytes.data(), header);
    EXPECT_EQ(header.type, 1U);
    EXPECT_EQ(header.flags, 2U);
    EXPECT_EQ(header.offset, 3U);
    EXPECT_EQ(header.vaddr, 4U);
    EXPECT_EQ(header.paddr, 5U);
    EXPECT_EQ(header.filesz, 6U);
    EXPECT_EQ(header.memsz, 7U);
    EXPECT_EQ(header.align, 8U);
    expectSameBytes(format, header, bytes);
  }
}

TEST(ElfRecordsTest, SymbolHasItsFieldsInAnotherOrderInClass2) {
  for (const RecordFormat format : Formats) {
    const std::vector<uint8_t> bytes =
        format.isWide ? fileBytes(format, {{1, 4}, {2, 1}, {3, 1}, {4, 2}, {5, 8}, {6, 8}})
                      : fileBytes(format, {{1, 4}, {5, 4}, {6, 4}, {2, 1}, {3, 1}, {4, 2}});
    ASSERT_EQ(bytes.size(), symbolRowSize(format.isWide));
    SymbolRow row;
    getRecord(format, bytes.data(), row);
    EXPECT_EQ(row.name, 1U);
    EXPECT_EQ(row.info, 2);
    EXPECT_EQ(row.other, 3);
    EXPECT_EQ(row.shndx, 4);
    EXPECT_EQ(row.value, 5U);
    EXPECT_EQ(row.size, 6U);
    expectSameBytes(format, row, bytes);
  }
}

TEST(ElfRecordsTest, RelocationSplitsItsInfoAsTheClassSays) {
  for (const RecordFormat format : Formats) {
    const uint64_t info = format.isWide ? 0x0000ABCD'00000102 : 0x00ABCD02;
    const std::vector<uint8_t> bytes = fileBytes(format, {{0x44, 0}, {info, 0}, {~uint64_t{4}, 0}});
    ASSERT_EQ(bytes.size(), relocationRowSize(format.isWide, true));
    RelocationRow row;
    getRecord(format, true, bytes.data(), row);
    EXPECT_EQ(row.offset, 0x44U);
    EXPECT_EQ(row.symbol, 0xABCDU);
    EXPECT_EQ(row.type, format.isWide ? 0x102U : 0x02U);
    EXPECT_EQ(row.addend, -5);
    std::vector<uint8_t> put(bytes.size());
    putRecord(format, true, row, put.data());
    EXPECT_EQ(put, bytes);
    getRecord(format, false, bytes.data(), row);
    EXPECT_EQ(row.addend, 0);
  }
}

} // namespace elfext
