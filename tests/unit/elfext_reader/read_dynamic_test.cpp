// SPDX-License-Identifier: Apache-2.0
//
// Dynamic sections, preemption maps and symbol versions: places in tables that are told by
// addresses, counts and texts, any of which may be wrong. Some faults are reported, others leave
// out what they spoil.

#include "elfext/interface/file_version_definition.h"
#include "elfext/interface/library_search_path.h"
#include "elfext/interface/needed_library.h"
#include "elfext/interface/preemption.h"
#include "elfext/interface/symbol_version_definition.h"
#include "elfext/interface/symbol_version_requirement.h"
#include "tests/support/reader_fixture.h"

namespace elfext {

using ReadDynamicTest = ReaderTest;
using ReadDynamicOfEachFormTest = EachFormTest;

INSTANTIATE_TEST_SUITE_P(Forms, ReadDynamicOfEachFormTest, testing::ValuesIn(AllForms), formName);

namespace {

// In class 2 only the first four bytes of a field count, which in the big-endian order are the
// upper ones.
uint64_t asFirstWord(const Form& form, uint64_t value) {
  return form.isWide() && form.data == ElfData::Big ? value << 32 : value;
}

std::vector<std::string> neededOf(const ReadResult& result) {
  std::vector<std::string> names;
  for (uint32_t i = 0; i < result.module->getNeededLibraryCount(); ++i)
    names.emplace_back(result.module->getNeededLibrary(i)->getName());
  return names;
}

// "symbol<-preempting:first,second"
std::vector<std::string> preemptionsOf(const ReadResult& result) {
  std::vector<std::string> texts;
  for (uint32_t i = 0; i < result.module->getPreemptionCount(); ++i) {
    const Preemption& preemption = *result.module->getPreemption(i);
    std::string text =
        std::string(preemption.getSymbolName()) + "<-" + preemption.getPreemptingDllName() + ":";
    for (uint32_t k = 0; k < preemption.getPreemptedDllCount(); ++k)
      text += std::string(preemption.getPreemptedDllName(k)) + ",";
    texts.push_back(text);
  }
  return texts;
}

// A dynamic section of tag and value, linked to string table section 2.
SectionBuilder& dynamic(ObjectBuilder& file) {
  SectionBuilder& section = file.section(".dynamic", SHT_DYNAMIC).link(2);
  file.section(".dynstr", SHT_STRTAB);
  return section;
}

} // namespace

TEST_P(ReadDynamicOfEachFormTest, TextsAreInTheStringTable) {
  const Form form = GetParam();
  ObjectBuilder file = form.object();
  // "\0libc\0self\0/lib\0/usr\0"
  file.section(".dynamic", SHT_DYNAMIC)
      .link(2)
      .dynamic(asFirstWord(form, DT_NEEDED), asFirstWord(form, 1))
      .dynamic(asFirstWord(form, DT_SONAME), asFirstWord(form, 6))
      .dynamic(asFirstWord(form, DT_RPATH), asFirstWord(form, 11))
      .dynamic(asFirstWord(form, DT_RUNPATH), asFirstWord(form, 16))
      .dynamic(asFirstWord(form, DT_NEEDED), asFirstWord(form, 2))
      .dynamic(asFirstWord(form, DT_NULL), 0)
      .dynamic(asFirstWord(form, DT_NEEDED), asFirstWord(form, 6));
  file.section(".dynstr", SHT_STRTAB).bytes(std::string("\0libc\0self\0/lib\0/usr\0", 21));
  const ReadResult result = readGood(file);
  EXPECT_THAT(neededOf(result), ElementsAre("libc", "ibc"));
  EXPECT_STREQ(result.module->getSoname(), "self");
  ASSERT_EQ(result.module->getLibrarySearchPathCount(), 2U);
  EXPECT_STREQ(result.module->getLibrarySearchPath(0)->getPath(), "/lib");
  EXPECT_EQ(result.module->getLibrarySearchPath(0)->getTag(), DT_RPATH);
  EXPECT_STREQ(result.module->getLibrarySearchPath(1)->getPath(), "/usr");
  EXPECT_EQ(result.module->getLibrarySearchPath(1)->getTag(), DT_RUNPATH);
}

TEST_P(ReadDynamicOfEachFormTest, OnlyTheFirstFourBytesOfAFieldCount) {
  if (!GetParam().isWide()) return;
  // Little-endian: what stands in the upper half is not seen. Big-endian: nor is the lower half.
  ObjectBuilder file = GetParam().object();
  const uint64_t noise =
      GetParam().data == ElfData::Little ? uint64_t{0x12345678} << 32 : 0x12345678;
  dynamic(file).dynamic(asFirstWord(GetParam(), DT_INIT) | noise,
                        asFirstWord(GetParam(), 77) | noise);
  EXPECT_EQ(readGood(file).module->getDynamicValue(DynamicValue_Init), 77U);
}

TEST_F(ReadDynamicTest, TextsOutsideTheTableAreLeftOut) {
  ObjectBuilder file = object();
  SectionBuilder& section = dynamic(file);
  section.dynamicText(DT_NEEDED, "libc");
  for (const uint32_t tag : {DT_NEEDED, DT_SONAME, DT_RPATH, DT_RUNPATH})
    section.dynamic(tag, 0).dynamic(tag, 6).dynamic(tag, 0xFFFFFFFF);
  const ReadResult result = readGood(file);
  EXPECT_THAT(neededOf(result), ElementsAre("libc"));
  EXPECT_EQ(result.module->getSoname(), nullptr);
  EXPECT_EQ(result.module->getLibrarySearchPathCount(), 0U);
}

TEST_F(ReadDynamicTest, WithoutStringTableThereAreNoTexts) {
  ObjectBuilder file = object();
  file.section(".dynamic", SHT_DYNAMIC).dynamic(DT_NEEDED, 1).dynamic(DT_INIT, 5);
  const ReadResult result = readGood(file);
  EXPECT_THAT(neededOf(result), IsEmpty());
  EXPECT_EQ(result.module->getDynamicValue(DynamicValue_Init), 5U);
}

TEST_F(ReadDynamicTest, ValuesAreKept) {
  ObjectBuilder file = object();
  dynamic(file)
      .dynamic(DT_INIT, 1)
      .dynamic(DT_FINI, 2)
      .dynamic(DT_INIT_ARRAY, 3)
      .dynamic(DT_FINI_ARRAY, 4)
      .dynamic(DT_INIT_ARRAYSZ, 5)
      .dynamic(DT_FINI_ARRAYSZ, 6)
      .dynamic(DT_PREINIT_ARRAY, 7)
      .dynamic(DT_PREINIT_ARRAYSZ, 8)
      .dynamic(0x12345, 9);
  const ReadResult result = readGood(file);
  const auto value = [&](DynamicValue which) { return result.module->getDynamicValue(which); };
  EXPECT_EQ(value(DynamicValue_Init), 1U);
  EXPECT_EQ(value(DynamicValue_Fini), 2U);
  EXPECT_EQ(value(DynamicValue_InitArray), 3U);
  EXPECT_EQ(value(DynamicValue_FiniArray), 4U);
  EXPECT_EQ(value(DynamicValue_InitArraySize), 5U);
  EXPECT_EQ(value(DynamicValue_FiniArraySize), 6U);
  EXPECT_EQ(value(DynamicValue_PreinitArray), 7U);
  EXPECT_EQ(value(DynamicValue_PreinitArraySize), 8U);
  EXPECT_FALSE(result.module->hasDynamicFlags());
  ObjectBuilder empty = object();
  dynamic(empty).dynamic(DT_FINI, 0);
  const ReadResult other = readGood(empty);
  EXPECT_TRUE(other.module->hasDynamicValue(DynamicValue_Fini));
  EXPECT_FALSE(other.module->hasDynamicValue(DynamicValue_Init));
}

TEST_F(ReadDynamicTest, FlagsAreGathered) {
  const auto flagsOf = [this](uint32_t tag, uint64_t value) {
    ObjectBuilder file = object();
    dynamic(file).dynamic(tag, value);
    const ReadResult result = readGood(file);
    EXPECT_TRUE(result.module->hasDynamicFlags());
    return result.module->getDynamicFlags();
  };
  EXPECT_EQ(flagsOf(DT_SYMBOLIC, 0), 2U);
  EXPECT_EQ(flagsOf(DT_TEXTREL, 0), 4U);
  EXPECT_EQ(flagsOf(DT_BIND_NOW, 0), 8U);
  EXPECT_EQ(flagsOf(DT_FLAGS, 0), 0U);
  EXPECT_EQ(flagsOf(DT_FLAGS, 0x81), 0x81U);
  ObjectBuilder file = object();
  dynamic(file).dynamic(DT_FLAGS, 1).dynamic(DT_BIND_NOW, 0).dynamic(DT_FLAGS, 0x10);
  EXPECT_EQ(readGood(file).module->getDynamicFlags(), 0x19U);
}

TEST_F(ReadDynamicTest, TheSymbolTableSizeTagIsACondition) {
  ObjectBuilder file = object();
  dynamic(file).dynamic(DT_ZEV_SYMTABSZ, 5);
  EXPECT_EQ(readGood(file).module->getReadConditions() & ReadCondition_HasSymbolTableSizeTag, 0U);
  file.segment({.type = PT_NOTE});
  EXPECT_NE(readGood(file).module->getReadConditions() & ReadCondition_HasSymbolTableSizeTag, 0U);
}

TEST_F(ReadDynamicTest, APartOfARowIsNoRow) {
  ObjectBuilder file = object();
  dynamic(file).dynamic(DT_INIT, 1).word(DT_FINI);
  const ReadResult result = readGood(file);
  EXPECT_TRUE(result.module->hasDynamicValue(DynamicValue_Init));
  EXPECT_FALSE(result.module->hasDynamicValue(DynamicValue_Fini));
}

namespace {

// Section 1 is dynamic and names the map at an address, 2 its strings, 3 the map at 0x1000.
ObjectBuilder withMap(uint64_t place, ObjectBuilder file = object()) {
  dynamic(file).dynamic(DT_ZEV_PREEMPTMAP, place);
  return file;
}

SectionBuilder& map(ObjectBuilder& file) {
  return file.section(".map", SHT_ZEV_PREEMPTMAP).link(2).address(0x1000);
}

} // namespace

TEST_F(ReadDynamicTest, APreemptionMapIsFoundByItsAddress) {
  ObjectBuilder file = withMap(0x1000);
  map(file)
      .word(2)
      .textOffset("f")
      .textOffset("new")
      .textOffset("old")
      .textOffset("older")
      .word(1)
      .word(0)
      .textOffset("new")
      .word(0)
      .word(0)
      .textOffset("f")
      .textOffset("f")
      .textOffset("f");
  EXPECT_THAT(preemptionsOf(readGood(file)), ElementsAre("f<-new:old,older,", "<-new:,"));
}

TEST_F(ReadDynamicTest, APreemptionMapMayStartInsideItsSection) {
  ObjectBuilder file = withMap(0x1010);
  map(file).zeros(16).word(1).textOffset("f").textOffset("new").textOffset("old");
  EXPECT_THAT(preemptionsOf(readGood(file)), ElementsAre("f<-new:old,"));
}

TEST_F(ReadDynamicTest, APlaceInNoSectionIsNoMap) {
  for (const uint64_t place : {0xFFFU, 0x1010U, 0xFFFFFFFFU}) {
    ObjectBuilder file = withMap(place);
    map(file).word(1).textOffset("f").textOffset("new").textOffset("old");
    EXPECT_THAT(preemptionsOf(readGood(file)), IsEmpty());
  }
}

TEST_F(ReadDynamicTest, TheFirstSectionAtTheAddressHasTheMap) {
  ObjectBuilder file = withMap(0x1000);
  file.section(".bss", SHT_NOBITS).address(0x800).size(0x1000);
  map(file).word(1).textOffset("f").textOffset("new").textOffset("old");
  EXPECT_THAT(preemptionsOf(readGood(file)), IsEmpty());
}

// The size of section 0 is the number of sections, and no stretch of addresses.
TEST_F(ReadDynamicTest, SectionZeroIsAtNoAddress) {
  ObjectBuilder file = object().extendedNumbering();
  file.section(".map", SHT_ZEV_PREEMPTMAP).link(2).word(1).textOffset("f").word(0).word(0);
  file.section(".dynstr", SHT_STRTAB);
  file.section(".dynamic", SHT_DYNAMIC).link(2).dynamic(DT_ZEV_PREEMPTMAP, 0);
  EXPECT_THAT(preemptionsOf(readGood(file)), ElementsAre("f<-:,"));
}

TEST_F(ReadDynamicTest, OnTheZevSystemTheMapIsFoundByItsPlaceInTheFile) {
  ObjectBuilder file = withMap(0x1000);
  file.osAbi(64);
  file.section(".bss", SHT_NOBITS).offset(60).size(0x1000);
  map(file).word(1).textOffset("f").textOffset("new").textOffset("old");
  EXPECT_THAT(preemptionsOf(readGood(file)), IsEmpty());
  ObjectBuilder placed = withMap(file.offsetOf(4));
  placed.osAbi(64);
  placed.section(".bss", SHT_NOBITS).offset(60).size(0x1000);
  map(placed).word(1).textOffset("f").textOffset("new").textOffset("old");
  ASSERT_EQ(placed.offsetOf(4), file.offsetOf(4));
  EXPECT_THAT(preemptionsOf(readGood(placed)), ElementsAre("f<-new:old,"));
  // Another machine has addresses there.
  EXPECT_THAT(preemptionsOf(readGood(placed.machine(183))), IsEmpty());
}

TEST_F(ReadDynamicTest, AMapEndsAtTheFirstOddity) {
  ObjectBuilder longer = withMap(0x1000);
  map(longer)
      .word(1)
      .textOffset("f")
      .textOffset("new")
      .textOffset("old")
      .word(2)
      .word(0)
      .word(0)
      .word(0);
  EXPECT_THAT(preemptionsOf(readGood(longer)), ElementsAre("f<-new:old,"));
  ObjectBuilder huge = withMap(0x1000);
  map(huge).word(0xFFFFFFFF).word(0).word(0).word(0);
  EXPECT_THAT(preemptionsOf(readGood(huge)), IsEmpty());
  ObjectBuilder outside = withMap(0x1000);
  map(outside).word(1).word(99).word(0).word(0);
  EXPECT_THAT(preemptionsOf(readGood(outside)), IsEmpty());
  ObjectBuilder outsideLater = withMap(0x1000);
  map(outsideLater)
      .word(3)
      .word(0)
      .word(0)
      .word(0)
      .word(99)
      .word(0)
      .word(1)
      .word(0)
      .word(0)
      .word(0);
  EXPECT_THAT(preemptionsOf(readGood(outsideLater)), ElementsAre("<-:,"));
  ObjectBuilder shortWord = withMap(0x1000);
  map(shortWord).bytes("abc");
  EXPECT_THAT(preemptionsOf(readGood(shortWord)), IsEmpty());
}

TEST_F(ReadDynamicTest, AMapIsReadOnce) {
  ObjectBuilder file = object();
  dynamic(file).dynamic(DT_ZEV_PREEMPTMAP, 0x1000).dynamic(DT_ZEV_PREEMPTMAP, 0x1000);
  map(file).word(1).textOffset("f").textOffset("new").textOffset("old");
  EXPECT_THAT(preemptionsOf(readGood(file)), SizeIs(1));
}

namespace {

struct Versions {
  uint64_t definitionCount = 2;
  uint64_t requirementCount = 1;
  bool hasDefinitionTag = true;
  bool hasRequirementTag = true;
  bool hasDefinitions = true;
  bool hasRequirements = true;
  bool hasVersym = true;
  size_t versymWords = 5;
};

// Sections: 1 .dynamic, 2 .dynstr, 3 .dynsym with four symbols, 4 .text, and those asked for.
// The definitions are the file's own, 1, and "v1", 2; the requirement is "w1", 3, of "libw".
ObjectBuilder withVersions(const Versions& versions, ObjectBuilder file = object()) {
  SectionBuilder& tags = dynamic(file);
  if (versions.hasDefinitionTag) tags.dynamic(DT_VERDEFNUM, versions.definitionCount);
  if (versions.hasRequirementTag) tags.dynamic(DT_VERNEEDNUM, versions.requirementCount);
  file.section(".dynsym", SHT_DYNSYM)
      .link(2)
      .symbol({.name = "defined", .section = 4})
      .symbol({.name = "hidden", .section = 4})
      .symbol({.name = "wanted"})
      .symbol({.name = "plain", .section = 4});
  file.section(".text", SHT_PROGBITS).zeros(4);
  if (versions.hasDefinitions) {
    file.section(".verdef", SHT_GNU_verdef)
        .link(2)
        .half(1)
        .half(VER_FLG_BASE)
        .half(1)
        .half(1)
        .word(0)
        .word(20)
        .word(28)
        .textOffset("libself")
        .word(0)
        .half(1)
        .half(0)
        .half(2)
        .half(2)
        .word(0)
        .word(20)
        .word(0)
        .textOffset("v1")
        .word(8)
        .textOffset("parent")
        .word(0);
  }
  if (versions.hasRequirements) {
    file.section(".verneed", SHT_GNU_verneed)
        .link(2)
        .half(1)
        .half(1)
        .textOffset("libw")
        .word(16)
        .word(0)
        .word(0)
        .half(0)
        .half(3)
        .textOffset("w1")
        .word(0);
  }
  if (versions.hasVersym) {
    SectionBuilder& words = file.section(".versym", SHT_GNU_versym).link(3);
    const uint16_t values[] = {0, 2, 0x8002, 3, 1, 0, 0};
    for (size_t i = 0; i < versions.versymWords; ++i)
      words.half(values[i]);
  }
  return file;
}

bool hasVersions(const ReadResult& result) {
  for (const Symbol* symbol : result.module->getDynamicSymbols()) {
    if (symbol->getVersionDefinition() != nullptr || symbol->getVersionRequirement() != nullptr)
      return true;
  }
  return false;
}

} // namespace

TEST_P(ReadDynamicOfEachFormTest, SymbolsHaveTheirVersions) {
  if (GetParam().isWide() && GetParam().data == ElfData::Big) return; // see asFirstWord
  const ReadResult result = readGood(withVersions({}, GetParam().object()));
  ASSERT_NE(result.module->getFileVersionDefinition(), nullptr);
  EXPECT_STREQ(result.module->getFileVersionDefinition()->name, "libself");
  EXPECT_EQ(result.module->getFileVersionDefinition()->index, 1U);
  const auto symbols = result.module->getDynamicSymbols();
  ASSERT_NE(symbols[0]->getVersionDefinition(), nullptr);
  EXPECT_STREQ(symbols[0]->getVersionDefinition()->version->name, "v1");
  EXPECT_FALSE(symbols[0]->getVersionDefinition()->isHidden);
  ASSERT_NE(symbols[1]->getVersionDefinition(), nullptr);
  EXPECT_TRUE(symbols[1]->getVersionDefinition()->isHidden);
  ASSERT_NE(symbols[2]->getVersionRequirement(), nullptr);
  EXPECT_STREQ(symbols[2]->getVersionRequirement()->versionName, "w1");
  EXPECT_STREQ(symbols[2]->getVersionRequirement()->fileName, "libw");
  EXPECT_EQ(symbols[2]->getVersionRequirement()->version, 3U);
  EXPECT_EQ(symbols[3]->getVersionDefinition(), nullptr);
}

TEST_F(ReadDynamicTest, VersionsNeedTagsAndSectionsThatAgree) {
  EXPECT_TRUE(hasVersions(readGood(withVersions({}))));
  EXPECT_FALSE(hasVersions(readGood(withVersions({.hasDefinitionTag = false}))));
  EXPECT_FALSE(hasVersions(readGood(withVersions({.hasRequirementTag = false}))));
  EXPECT_FALSE(hasVersions(readGood(withVersions({.hasDefinitions = false}))));
  EXPECT_FALSE(hasVersions(readGood(withVersions({.hasRequirements = false}))));
  EXPECT_TRUE(
      hasVersions(readGood(withVersions({.hasRequirementTag = false, .hasRequirements = false}))));
  EXPECT_TRUE(
      hasVersions(readGood(withVersions({.hasDefinitionTag = false, .hasDefinitions = false}))));
}

TEST_F(ReadDynamicTest, TheVersionWordsMustBeAsManyAsTheSymbols) {
  for (const size_t words : {size_t{4}, size_t{6}}) {
    const ReadResult result = readGood(withVersions({.versymWords = words}));
    EXPECT_FALSE(hasVersions(result));
    EXPECT_EQ(result.module->getFileVersionDefinition(), nullptr);
  }
}

TEST_F(ReadDynamicTest, WithoutVersionWordsOnlyTheDefinitionsAreRead) {
  const ReadResult result = readGood(withVersions({.hasVersym = false}));
  EXPECT_NE(result.module->getFileVersionDefinition(), nullptr);
  EXPECT_FALSE(hasVersions(result));
}

TEST_F(ReadDynamicTest, VersionCountsAreLimits) {
  const ReadResult result = readGood(withVersions({.definitionCount = 1, .requirementCount = 0}));
  EXPECT_NE(result.module->getFileVersionDefinition(), nullptr);
  EXPECT_FALSE(hasVersions(result));
  EXPECT_TRUE(hasVersions(
      readGood(withVersions({.definitionCount = 0xFFFFFFFF, .requirementCount = 0xFFFFFFFF}))));
}

TEST_F(ReadDynamicTest, RequirementsAreThoseOfEachFileAndEachOfItsVersions) {
  ObjectBuilder file = object();
  dynamic(file).dynamic(DT_VERNEEDNUM, 2);
  SectionBuilder& symbols = file.section(".dynsym", SHT_DYNSYM).link(2);
  for (const char* name : {"one", "two", "three"})
    symbols.symbol({.name = name});
  const auto version = [](SectionBuilder& section, uint16_t number, const char* name,
                          uint32_t next) {
    section.word(0).half(0).half(number).textOffset(name).word(next);
  };
  SectionBuilder& files = file.section(".verneed", SHT_GNU_verneed).link(2);
  files.half(1).half(2).textOffset("libv").word(16).word(48);
  version(files, 2, "v1", 16);
  version(files, 3, "v2", 0);
  files.half(1).half(1).textOffset("libw").word(16).word(0);
  version(files, 4, "w1", 0);
  file.section(".versym", SHT_GNU_versym).link(3).half(0).half(2).half(3).half(4);
  const ReadResult result = readGood(file);
  std::vector<std::string> all;
  for (const Symbol* symbol : result.module->getDynamicSymbols()) {
    ASSERT_NE(symbol->getVersionRequirement(), nullptr);
    all.push_back(std::string(symbol->getVersionRequirement()->versionName) + " of " +
                  symbol->getVersionRequirement()->fileName);
  }
  EXPECT_EQ(all, (std::vector<std::string>{"v1 of libv", "v2 of libv", "w1 of libw"}));
}

TEST_F(ReadDynamicTest, VersionNamesOutsideTheTableAreEmpty) {
  ObjectBuilder file = object();
  dynamic(file).dynamic(DT_VERDEFNUM, 1);
  file.section(".verdef", SHT_GNU_verdef)
      .link(2)
      .half(1)
      .half(VER_FLG_BASE)
      .half(1)
      .half(1)
      .word(0)
      .word(20)
      .word(0)
      .word(99)
      .word(0);
  EXPECT_STREQ(readGood(file).module->getFileVersionDefinition()->name, "");
  ObjectBuilder nameless = object();
  dynamic(nameless).dynamic(DT_VERDEFNUM, 1);
  nameless.section(".verdef", SHT_GNU_verdef)
      .link(2)
      .half(1)
      .half(VER_FLG_BASE)
      .half(1)
      .half(1)
      .word(0)
      .word(0xFFFFFFFF)
      .word(0xFFFFFFFF);
  EXPECT_STREQ(readGood(nameless).module->getFileVersionDefinition()->name, "");
}

} // namespace elfext
