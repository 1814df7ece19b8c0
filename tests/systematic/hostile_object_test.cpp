// SPDX-License-Identifier: Apache-2.0
//
// Objects of about a megabyte that were made to keep the tool busy: tables that lie over one
// another, lists of lists, names that all are the same half megabyte, counts beyond all numbers.
// Each is read or refused in little time and memory, and is a member like any other.
//
// Each object has a name for what it multiplies, and the report that it costs, if any. It is
// inserted and reported on by the real program, with a bound on time and memory (hostile_object.h),
// and compared on both roads.

#include "elfext/interface/elf_constants.h"
#include "tests/systematic/hostile_object.h"

namespace testsupport {

namespace {

using namespace elfext;

// ---- Sections

std::string manySections() {
  ObjectBuilder file = object();
  for (uint32_t i = 0; i < ManySections; ++i)
    file.section(".data", SHT_PROGBITS).flags(SHF_ALLOC | SHF_WRITE).bytes("4321");
  return file.bytes();
}

std::string sectionsWithALongName() {
  ObjectBuilder file = object().header(HeaderField::ShStrNdx, 1);
  file.section("", SHT_STRTAB).bytes(longName());
  for (uint32_t i = 0; i < ManySections; ++i)
    file.section("", SHT_PROGBITS).nameOffset(1 + i).flags(SHF_ALLOC);
  return file.bytes();
}

// Sections 1 to 4 are what the others may link to; those are tables of one type that all claim the
// same megabyte of zeros, each from a little farther on.
std::string tablesOverOneAnother(uint32_t type, uint32_t link) {
  ObjectBuilder file = object();
  file.section(".strtab", SHT_STRTAB);
  file.section(".symtab", SHT_SYMTAB).link(1).symbol({.name = "s", .section = 4});
  file.section(".dynsym", SHT_DYNSYM).link(1).symbol({.name = "d", .section = 4});
  file.section(".text", SHT_PROGBITS).zeros(Megabyte + 4096);
  const uint64_t offset = file.offsetOf(4);
  for (uint32_t i = 5; i < ManySections; ++i) {
    file.section("", type)
        .link(link)
        .info(link == 2 ? 1 : 0)
        .offset(offset + i % 48)
        .size(Megabyte / 48 * 48);
  }
  return file.bytes();
}

template <uint32_t Type, uint32_t Link = 0>
std::string overlapping() {
  return tablesOverOneAnother(Type, Link);
}

// ---- Relocations

std::string manyRelocations() {
  std::string rows;
  for (uint32_t i = 0; i < 200000; ++i)
    put(rows, {0, 1 << 8});
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(4);
  file.section(".strtab", SHT_STRTAB);
  file.section(".symtab", SHT_SYMTAB).link(2).symbol({.name = "s", .section = 1});
  file.section(".rel.text", SHT_REL).link(3).info(1).bytes(rows);
  return file.bytes();
}

std::string manyRelocationSections() {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(4);
  file.section(".strtab", SHT_STRTAB);
  file.section(".symtab", SHT_SYMTAB).link(2).symbol({.name = "s", .section = 1});
  for (uint32_t i = 4; i < ManySections; ++i)
    file.section("", SHT_REL).link(3).info(1).relocation({.symbol = 1});
  return file.bytes();
}

// Code of which each section has a mapping symbol, a relocation, and a group of its own.
std::string sectionsWithEverything() {
  constexpr uint32_t Count = 20000;
  std::string rows(16, '\0');
  for (uint32_t i = 0; i < Count; ++i)
    put(rows, {1, 0, 0, symbolInfo(Local, 0, 3 + 3 * i)});
  ObjectBuilder file = withSymbols(rows, std::string("\0$a\0", 4));
  for (uint32_t i = 0; i < Count; ++i) {
    const uint32_t code = 3 + 3 * i;
    file.section("", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR | SHF_GROUP).bytes("code");
    file.section("", SHT_REL).link(2).info(code).relocation({.symbol = 1 + i});
    file.section("", SHT_GROUP).link(2).info(1 + i).word(0).word(code).word(code + 1);
  }
  return file.bytes();
}

// ---- Groups

std::string groupOfEverything() {
  ObjectBuilder file = withSymbols(symbolRows(1, symbolInfo(0, 0, 0)), std::string(1, '\0'));
  SectionBuilder& group = file.section(".group", SHT_GROUP).link(2).info(1).word(GRP_COMDAT);
  for (uint32_t i = 4; i < ManySections; ++i) {
    file.section(".data", SHT_PROGBITS).flags(SHF_ALLOC | SHF_GROUP);
    group.word(i);
  }
  return file.bytes();
}

std::string groupsOfGroups() {
  ObjectBuilder file = withSymbols(symbolRows(1, symbolInfo(0, 0, 0)), std::string(1, '\0'));
  for (uint32_t i = 3; i < ManySections; ++i)
    file.section("", SHT_GROUP).link(2).info(1).word(GRP_COMDAT).word(i + 1);
  return file.bytes();
}

std::string groupsOfTheSame() {
  ObjectBuilder file = withSymbols(symbolRows(1, symbolInfo(0, 0, 0)), std::string(1, '\0'));
  for (uint32_t i = 3; i < ManySections; ++i)
    file.section("", SHT_GROUP).link(2).info(1).word(GRP_COMDAT).word(1);
  return file.bytes();
}

std::string groupsWithOneLongSignature() {
  ObjectBuilder file = withSymbols(symbolRows(1, symbolInfo(1, 0, 0), 1), longName());
  for (uint32_t i = 3; i < ManySections / 4; ++i)
    file.section("", SHT_GROUP).link(2).info(1).word(GRP_COMDAT);
  return file.bytes();
}

std::string groupsWithLongSignatures() {
  constexpr uint32_t Count = ManySections / 4;
  ObjectBuilder file = withSymbols(symbolRows(Count, symbolInfo(1, 0, 0), 1, 1), longName());
  for (uint32_t i = 1; i < Count; ++i)
    file.section("", SHT_GROUP).link(2).info(i).word(GRP_COMDAT);
  return file.bytes();
}

// The last link is bad, so that all that was made has to go again.
std::string groupsThatGo() {
  ObjectBuilder file = withSymbols(symbolRows(1, symbolInfo(1, 0, 0), 1), longName());
  for (uint32_t i = 3; i < ManySections / 4; ++i)
    file.section("", SHT_GROUP).link(2).info(1).word(GRP_COMDAT);
  file.section("", SHT_GROUP).link(2).info(1).word(GRP_COMDAT).word(ManySections);
  return file.bytes();
}

// ---- Symbols

constexpr uint32_t ManySymbols = 30000;

std::string symbolsWithALongName(uint32_t count, uint32_t binding, uint32_t section, uint32_t step,
                                 const std::string& strings) {
  const std::string rows = symbolRows(count, symbolInfo(binding, 0, section), 1, step);
  ObjectBuilder file = withSymbols(rows, strings);
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(16);
  file.segment({.offset = file.offsetOf(3) + 32, .filesz = 16, .memsz = 16});
  return file.bytes();
}

template <uint32_t Binding, uint32_t Section, uint32_t Step, char Letter = 'n'>
std::string sameName() {
  return symbolsWithALongName(ManySymbols, Binding, Section, Step, longName(Letter));
}

// Names of more than 2 GiB in all.
template <uint32_t Step>
std::string tooManyNames() {
  return symbolsWithALongName(5000, Global, 3, Step, longName());
}

std::string namesOfAQuarterGigabyte() {
  return symbolsWithALongName(35000, Global, 3, 0, '\0' + std::string(8000, 'n') + '\0');
}

// Mapping symbols and others in turn, all over the code and many at one place.
std::string mappingSymbols() {
  std::string rows(16, '\0');
  const std::string strings = std::string("\0$a\0$d\0$t\0n\0", 12);
  for (uint32_t i = 0; i < 2 * ManySymbols; ++i) {
    const uint32_t name = i % 16 == 0 ? 1 + 3 * (i / 16 % 3) : 10;
    put(rows, {name, i < ManySymbols ? i / 16 : 7, 0, symbolInfo(0, 0, 3)});
  }
  ObjectBuilder file = withSymbols(rows, strings);
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(65536);
  return file.bytes();
}

// Symbol tables over one another, each with a table of section indexes of which the symbols use
// but every second one, and the others are bad. The last symbol table may use those.
std::string symbolTablesWithBadIndexes(bool areLastUsed) {
  std::string rows(16, '\0');
  std::string indexes(4, '\0');
  for (uint32_t i = 0; i < 20000; ++i) {
    put(rows, {0, 0, 0, symbolInfo(0, 0, i % 2 == 0 ? SHN_XINDEX : 1)});
    put(indexes, {i % 2 == 0 ? 1 : 0xFFFFFFFF});
  }
  ObjectBuilder file = object();
  file.section("", SHT_STRTAB).zeros(1);
  file.section("", SHT_PROGBITS).bytes(rows);
  file.section("", SHT_PROGBITS).bytes(indexes);
  const uint64_t rowsAt = file.offsetOf(2);
  const uint64_t indexesAt = file.offsetOf(3);
  for (uint32_t i = 4; i < 12000; i += 2) {
    const uint32_t skipped = (i / 2 - 2) * 2;
    const uint32_t count = 20001 - skipped;
    file.section("", SHT_SYMTAB).link(1).offset(rowsAt).size(count * 16);
    file.section("", SHT_SYMTAB_SHNDX).link(i).offset(indexesAt + skipped * 4).size(count * 4);
  }
  if (areLastUsed) {
    file.section("", SHT_SYMTAB).link(1).offset(rowsAt).size(70 * 16);
    file.section("", SHT_SYMTAB_SHNDX).link(12000).offset(indexesAt + 4).size(70 * 4);
  }
  return file.bytes();
}

template <bool AreLastUsed>
std::string badIndexes() {
  return symbolTablesWithBadIndexes(AreLastUsed);
}

// ---- Dynamic data

std::string neededLibraries(uint32_t tag) {
  std::string tags;
  for (uint32_t i = 0; i < 60000; ++i)
    put(tags, {tag, 1 + i});
  put(tags, {DT_NULL, 0});
  ObjectBuilder file = object().type(ET_DYN);
  file.section("", SHT_STRTAB).bytes(longName());
  file.section("", SHT_DYNAMIC).link(1).bytes(tags);
  return file.bytes();
}

template <uint32_t Tag>
std::string dynamicTexts() {
  return neededLibraries(Tag);
}

std::string preemptionMaps() {
  std::string map;
  for (uint32_t i = 0; i < 20000; ++i)
    put(map, {1, 1, 1, 1});
  std::string tags;
  for (uint32_t i = 0; i < 60000; ++i)
    put(tags, {DT_ZEV_PREEMPTMAP, 0x1000 + 16 * i});
  ObjectBuilder file = object().type(ET_DYN);
  file.section("", SHT_STRTAB).bytes(longName());
  file.section("", SHT_ZEV_PREEMPTMAP).link(1).address(0x1000).bytes(map);
  file.section("", SHT_DYNAMIC).link(1).bytes(tags);
  return file.bytes();
}

std::string manyDynamicSections() {
  ObjectBuilder file = object().type(ET_DYN);
  file.section("", SHT_STRTAB).zeros(1);
  for (uint32_t i = 2; i < ManySections; ++i)
    file.section("", SHT_DYNAMIC).link(1).dynamic(DT_ZEV_PREEMPTMAP, i);
  return file.bytes();
}

// Chains of versions that run into one another, for many symbols.
std::string versions() {
  std::string required;
  for (uint32_t i = 0; i < 20000; ++i)
    put(required, {0xFFFF0001, 1, 16, 16});
  std::string words;
  for (uint32_t i = 0; i < 10001; ++i)
    put(words, {0x00020002});
  ObjectBuilder file = object().type(ET_DYN);
  file.section("", SHT_STRTAB).bytes(longName());
  file.section("", SHT_DYNSYM).link(1).bytes(symbolRows(20001, symbolInfo(1, 0, 0), 1));
  file.section("", SHT_GNU_verneed).link(1).bytes(required);
  file.section("", SHT_GNU_versym).link(2).bytes(words);
  file.section("", SHT_DYNAMIC).link(1).dynamic(DT_VERNEEDNUM, 0xFFFFFFFF);
  return file.bytes();
}

// ---- Segments and notes

// As many as there can be.
constexpr uint32_t MostSegments = 65534;
constexpr uint32_t MostSections = 65000;

std::string segmentsAndEmptySections(uint32_t segmentType, uint64_t memorySize) {
  ObjectBuilder file = object().type(ET_EXEC);
  for (uint32_t i = 0; i < MostSegments; ++i)
    file.segment({.type = segmentType, .offset = 52, .memsz = memorySize});
  for (uint32_t i = 1; i < MostSections; ++i)
    file.section("", SHT_NOBITS).flags(SHF_ALLOC).offset(52).address(1).size(4);
  return file.bytes();
}

// All begin and end elsewhere, in the file and in memory; their bytes are those of their headers.
std::string staggeredSegmentsAndEmptySections() {
  constexpr uint64_t Range = uint64_t{32} * MostSegments;
  const auto scatter = [](uint64_t number) { return number * 2654435761 % Range; };
  ObjectBuilder file = object().type(ET_EXEC);
  for (uint32_t i = 0; i < MostSegments; ++i) {
    const uint64_t offset = scatter(i);
    const uint64_t address = scatter(i + MostSegments);
    file.segment({.offset = 52 + offset,
                  .vaddr = address,
                  .filesz = scatter(i + 2 * MostSegments) % (Range - offset),
                  .memsz = scatter(i + 3 * MostSegments) % 4096});
  }
  for (uint32_t i = 1; i < MostSections; ++i)
    file.section("", SHT_NOBITS)
        .flags(SHF_ALLOC)
        .offset(52 + scatter(i + 5))
        .address(scatter(i + 7))
        .size(i % 4096);
  return file.bytes();
}

template <uint32_t SegmentType, uint64_t MemorySize>
std::string segmentsTimesSections() {
  return segmentsAndEmptySections(SegmentType, MemorySize);
}

std::string segmentsOverOneAnother() {
  ObjectBuilder file = object().type(ET_EXEC);
  for (uint32_t i = 0; i < 30000; ++i)
    file.segment({.offset = i, .filesz = Megabyte - 2 * i, .memsz = Megabyte});
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(64);
  return file.tail(std::string(2 * Megabyte, 'x')).bytes();
}

std::string notesOfNoSections() {
  std::string notes;
  for (uint32_t i = 0; i < 40000; ++i)
    put(notes, {4, 0, 0x40000000, 'Z' | 'E' << 8 | 'V' << 16});
  ObjectBuilder file = object();
  for (uint32_t i = 1; i < ManySections; ++i)
    file.section("", SHT_PROGBITS);
  file.section(".note", SHT_NOTE).bytes(notes);
  return file.bytes();
}

std::string debugOverlays() {
  std::string rows;
  for (uint32_t i = 0; i < 80000; ++i)
    put(rows, {0, 1, 1});
  ObjectBuilder file = object();
  file.section(".debug" + std::string(LongNameSize, 'n'), SHT_PROGBITS);
  file.section("", SHT_ZEV_DEBUGOVERLAY).entrySize(12).bytes(rows);
  return file.bytes();
}

// ---- Counts

std::string sectionCount(uint64_t count, ElfClass elfClass) {
  ObjectBuilder file = object(elfClass).extendedNumbering();
  file.sectionZero().size(count);
  file.section(".data", SHT_PROGBITS).zeros(Megabyte);
  return file.bytes();
}

template <uint64_t Count, ElfClass Class>
std::string claimedSections() {
  return sectionCount(Count, Class);
}

template <uint64_t Size, uint32_t Type>
std::string claimedSize() {
  ObjectBuilder file = object(ElfClass::Class64);
  file.section(".strtab", SHT_STRTAB);
  file.section(".symtab", SHT_SYMTAB).link(1).symbol({.name = "s", .section = 3});
  file.section(".data", SHT_PROGBITS).zeros(Megabyte);
  file.section("", Type).link(2).info(3).size(Size);
  return file.bytes();
}

std::string claimedSegments() {
  ObjectBuilder file = object(ElfClass::Class64).type(ET_EXEC).header(HeaderField::PhOff, 64);
  file.header(HeaderField::PhNum, 0xFFFE);
  file.section(".data", SHT_PROGBITS).zeros(Megabyte);
  return file.bytes();
}

std::string endlessSegment() {
  ObjectBuilder file = object(ElfClass::Class64).type(ET_EXEC);
  file.segment({.offset = 64, .filesz = UINT64_MAX, .memsz = UINT64_MAX});
  file.section(".data", SHT_PROGBITS).zeros(Megabyte);
  return file.bytes();
}

constexpr char Overlap[] = "overlap in the file";
constexpr char Outside[] = "I/O error writing file";
constexpr uint64_t Two32 = uint64_t{1} << 32;
constexpr uint64_t Two63 = uint64_t{1} << 63;

// clang-format off
const Hostile Hostiles[] = {
  {"Sections",                    manySections,                                    ""},
  {"SectionsWithALongName",       sectionsWithALongName,                           ""},
  {"OverlappingSections",         overlapping<SHT_PROGBITS>,                       Overlap},
  {"OverlappingStrings",          overlapping<SHT_STRTAB>,                         Overlap},
  {"OverlappingSymbolTables",     overlapping<SHT_SYMTAB, 1>,                      Overlap},
  {"OverlappingDynamicSymbols",   overlapping<SHT_DYNSYM, 1>,                      Overlap},
  {"OverlappingRelocations",      overlapping<SHT_REL, 2>,                         Overlap},
  {"OverlappingAddends",          overlapping<SHT_RELA, 2>,                        Overlap},
  {"OverlappingGroups",           overlapping<SHT_GROUP, 2>,                       Overlap},
  {"OverlappingHashes",           overlapping<SHT_HASH, 3>,                        Overlap},
  {"OverlappingDynamicSections",  overlapping<SHT_DYNAMIC, 1>,                     Overlap},
  {"OverlappingNotes",            overlapping<SHT_NOTE>,                           Overlap},
  {"OverlappingVersions",         overlapping<SHT_GNU_verdef, 1>,                  Overlap},
  {"OverlappingMaps",             overlapping<SHT_ZEV_PREEMPTMAP, 1>,              Overlap},
  {"OverlappingAttributes",       overlapping<SHT_ZEV_ATTRIBUTES>,                 Overlap},
  {"OverlappingOverlays",         overlapping<SHT_ZEV_DEBUGOVERLAY>,               Overlap},
  {"OverlappingUnusedIndexes",    badIndexes<false>,                               Overlap},
  {"OverlappingUsedIndexes",      badIndexes<true>,                                "Symbol #1 in symbol table section #12000 is defined in section #4294967295"},
  {"Relocations",                 manyRelocations,                                 ""},
  {"RelocationSections",          manyRelocationSections,                          ""},
  {"SectionsWithEverything",      sectionsWithEverything,                          ""},
  {"GroupOfEverything",           groupOfEverything,                               ""},
  {"GroupsOfGroups",              groupsOfGroups,                                  ""},
  {"GroupsOfTheSame",             groupsOfTheSame,                                 "and also to group"},
  {"GroupsWithOneLongSignature",  groupsWithOneLongSignature,                      ""},
  {"GroupsWithLongSignatures",    groupsWithLongSignatures,                        ""},
  {"GroupsThatGo",                groupsThatGo,                                    "refers to member section"},
  {"LocalsOfOneName",             sameName<Local, 3, 0>,                           ""},
  {"LocalsOfLongNames",           sameName<Local, 3, 1>,                           ""},
  {"UndefinedOfOneName",          sameName<Global, SHN_UNDEF, 0>,                  ""},
  {"AbsoluteOfOneName",           sameName<Local, SHN_ABS, 0>,                     ""},
  {"AbsoluteOfLongNames",         sameName<Local, SHN_ABS, 1, '$'>,                ""},
  {"MappingSymbols",              mappingSymbols,                                  ""},
  {"NeededLibraries",             dynamicTexts<DT_NEEDED>,                         ""},
  {"LibraryNames",                dynamicTexts<DT_SONAME>,                         ""},
  {"SearchPaths",                 dynamicTexts<DT_RPATH>,                          ""},
  {"PreemptionMaps",              preemptionMaps,                                  ""},
  {"DynamicSections",             manyDynamicSections,                             ""},
  {"Versions",                    versions,                                        ""},
  {"LoadsTimesSections",          segmentsTimesSections<PT_LOAD, 4>,               ""},
  {"SegmentsTimesSections",       segmentsTimesSections<PT_NULL, 3>,               ""},
  {"StaggeredLoadsTimesSections", staggeredSegmentsAndEmptySections,               ""},
  {"SegmentsOverOneAnother",      segmentsOverOneAnother,                          ""},
  {"NotesOfNoSections",           notesOfNoSections,                               ""},
  {"DebugOverlays",               debugOverlays,                                   ""},
  {"Claims2To32Sections",         claimedSections<Two32 - 1, ElfClass::Class32>,   Outside},
  {"Claims2To63Sections",         claimedSections<Two63, ElfClass::Class64>,       Outside},
  {"Claims2To32Bytes",            claimedSize<Two32, SHT_PROGBITS>,                Outside},
  {"Claims2To63Bytes",            claimedSize<Two63, SHT_PROGBITS>,                Outside},
  {"Claims2To63BytesOfNone",      claimedSize<Two63, SHT_NOBITS>,                  ""},
  {"Claims2To63BytesOfNull",      claimedSize<Two63, SHT_NULL>,                    ""},
  {"Claims2To63Relocations",      claimedSize<Two63 / 24 * 24, SHT_RELA>,          Outside},
  {"Claims2To63Symbols",          claimedSize<Two63 / 24 * 24, SHT_DYNSYM>,        Outside},
  {"ClaimsTooManySegments",       claimedSegments,                                 Outside},
  {"ClaimsAnEndlessSegment",      endlessSegment,                                  Outside},
};
// clang-format on

} // namespace

TEST_P(HostileObject, IsReadOrRefusedInLittleTimeAndMemory) {
  expectHarmless(GetParam());
}

TEST_P(HostileObject, IsTheSameInItsTablesAndAsAModel) {
  expectSameOnBothRoads(GetParam().make());
}

INSTANTIATE_TEST_SUITE_P(Tool, HostileObject, testing::ValuesIn(Hostiles),
                         [](const auto& instance) { return instance.param.name; });

// There is no symbol table that could hold them.
TEST_F(HostileObject, HasMoreNamesToPublishThanAnArchiveCanHold) {
  const std::string old = m_Folder.read("lib.a");
  for (std::string (*make)() : {tooManyNames<0>, tooManyNames<1>}) {
    write(make);
    const ToolRun insertion = run({"-r", "lib.a", "x.o"});
    EXPECT_EQ(insertion.status, 1);
    EXPECT_THAT(insertion.errors, testing::HasSubstr("'lib.a' : File too large"));
    EXPECT_EQ(m_Folder.read("lib.a"), old);
    EXPECT_THAT(m_Folder.leaves(), testing::ElementsAre("lib.a", "x.o"));
  }
}

// Of which some are the same, in one object and in two.
TEST_F(HostileObject, PublishesNamesThatShareTheirBytesOnce) {
  const std::string old = m_Folder.read("lib.a");
  write(sameName<Global, 3, 0>);
  m_Folder.write("y.o", m_Folder.read("x.o"));
  EXPECT_EQ(run({"-r", "--unique_symbols", "lib.a", "x.o", "y.o"}).status, 0);
  std::string error;
  const std::vector<ParsedMember> members = parseArchive(m_Folder.read("lib.a"), error);
  ASSERT_FALSE(members.empty());
  EXPECT_EQ(members.front().contents.size(), 4 + 4 + LongNameSize + 1);
  m_Folder.write("lib.a", old);
  write(tooManyNames<1>);
  EXPECT_EQ(run({"-r", "--unique_symbols", "lib.a", "x.o"}).status, 1);
}

// The table is far larger than all else, and never in memory.
TEST_F(HostileObject, PublishesNamesOfFarMoreBytesThanItHas) {
  write(namesOfAQuarterGigabyte);
  EXPECT_EQ(run({"-r", "lib.a", "x.o"}).status, 0);
}

// Names that are more bytes than the object has are each published whole, in their order.
TEST_F(HostileObject, PublishesNamesThatShareTheirBytes) {
  const std::string strings = std::string("\0first-second-third\0fourth\0", 27);
  std::string rows(16, '\0');
  std::string wanted;
  for (const uint32_t place : {14U, 20U, 1U, 7U, 26U, 8U, 1U, 25U}) {
    for (uint32_t i = 0; i < 100; ++i) {
      put(rows, {place, 0, 0, symbolInfo(Global, 0, 3)});
      if (strings[place] != '\0') wanted += strings.c_str() + place + std::string(1, '\0');
    }
  }
  ObjectBuilder file = withSymbols(rows, strings);
  file.section(".text", SHT_PROGBITS).zeros(16);
  m_Folder.write("x.o", file.bytes());
  EXPECT_EQ(m_Folder.run({"-r", "lib.a", "x.o"}).status, 0);
  std::string error;
  const std::vector<ParsedMember> members = parseArchive(m_Folder.read("lib.a"), error);
  ASSERT_FALSE(members.empty());
  EXPECT_TRUE(members.front().contents.ends_with(wanted));
  EXPECT_EQ(members.front().contents.size(), 4 + 700 * 4 + wanted.size());
}

} // namespace testsupport
