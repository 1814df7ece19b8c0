// SPDX-License-Identifier: Apache-2.0
//
// What objects say of how they were built, in attribute sections and in the names of symbols, and
// which of the two holds. Objects come from the object builder; each corruption of a section is
// reported once, and what was said before it is kept or dropped as stated.

#include "elfext/interface/attribute_string.h"
#include "elfext/interface/build_attributes_cache.h"
#include "elfext/interface/build_attributes_writer.h"
#include "elfext/src/model/module_builder.h"
#include "tests/support/attribute_bytes.h"
#include "tests/support/faulty_host.h"
#include "tests/support/reader_fixture.h"

#include <cerrno>

namespace elfext {

using namespace testsupport;

using ReadAttributesTest = ReaderTest;
using ReadAttributesOfEachFormTest = EachFormTest;

INSTANTIATE_TEST_SUITE_P(Forms, ReadAttributesOfEachFormTest, testing::ValuesIn(AllForms),
                         formName);

namespace {

constexpr const char* Corrupt = "Build attributes in section #6 are corrupted";

// Sections 1 to 5: string table, symbol table, .text, .data, .bss. Symbols: as given.
ObjectBuilder withSymbols(const std::vector<testsupport::SymbolSpec>& symbols,
                          ObjectBuilder file = object()) {
  file.section(".strtab", SHT_STRTAB);
  testsupport::SectionBuilder& table = file.section(".symtab", SHT_SYMTAB).link(1);
  table.info(static_cast<uint32_t>(symbols.size() + 1));
  for (testsupport::SymbolSpec symbol : symbols) {
    symbol.binding = STB_LOCAL;
    table.symbol(symbol);
  }
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(8);
  file.section(".data", SHT_PROGBITS).flags(SHF_ALLOC | SHF_WRITE).zeros(8);
  file.section(".bss", SHT_PROGBITS).flags(SHF_ALLOC | SHF_WRITE).zeros(8);
  return file;
}

const std::vector<testsupport::SymbolSpec> ThreeSymbols = {
    {.name = "first", .section = 3}, {.name = "second", .section = 4}, {.name = "third"}};

// Section 6 has the attributes.
ObjectBuilder withAttributes(std::string_view section,
                             const std::vector<testsupport::SymbolSpec>& symbols = ThreeSymbols,
                             ObjectBuilder file = object()) {
  file = withSymbols(symbols, std::move(file));
  file.section(".ZEV.attributes", SHT_ZEV_ATTRIBUTES).bytes(section);
  return file;
}

// The object's own attributes of vendor "qobix"; "none" if it has none of any kind.
std::string ownTags(const ObjectWithBuildAttributes& object) {
  const BuildAttributes* own = object.getOwnBuildAttributes();
  if (own == nullptr) return "none";
  std::string bytes;
  own->encodeQobix(bytes);
  return bytes;
}

// The text of the object's own attributes; "none" if it has none.
std::string ownText(const ObjectWithBuildAttributes& object) {
  const BuildAttributes* own = object.getOwnBuildAttributes();
  return own == nullptr ? "none" : printAttributeString(own->getFullAttr());
}

// What is printed of the attributes that the text gives by itself.
std::string saidBy(const std::string& text) {
  return printAttributeString(BuildAttributes(text).getFullAttr());
}

std::string blockOf(const ObjectWithBuildAttributes& object, std::string_view vendor) {
  const BuildAttributesBlock* block = object.findBlock(vendor);
  return block == nullptr ? "none" : textOf(block->getData());
}

testsupport::SymbolSpec decoration(const std::string& text, uint16_t section = SHN_ABS) {
  return {.name = "BuildAttributes$" + text, .section = section};
}

testsupport::SymbolSpec decorationOf(const std::string& base, const std::string& text) {
  return {.name = base + "$$BuildAttributes$" + text, .section = SHN_ABS};
}

const std::string V4 = "$ZEV_ISAv4$A:L22$X:L11$S22$IEEE1$IW$EBA8";
const std::string V5 = "$ZEV_ISAv5$A:L22$X:L11$S22$IEEE1$IW$EBA8";
const std::string V6 = "$ZEV_ISAv6$A:L22$X:L11$S22$IEEE1$IW$EBA8";

} // namespace

// ---- Sections

TEST_P(ReadAttributesOfEachFormTest, ASectionSpeaksOfTheFileSectionsAndSymbols) {
  const bool isLittle = GetParam().data == ElfData::Little;
  const std::string section = attributeSection(
      {vendorPart("qobix", {symbolPart({2}, tag(30, 4)), sectionPart({3, 5}, tag(30, 2)),
                            filePart(tag(6, 10) + tag(7, 65))}),
       vendorPart("ZEV", {filePart(tag(18, 1))}), vendorPart("other", {sectionPart({4}, "bytes")})},
      isLittle);
  const ReadResult result = readGood(withAttributes(section, ThreeSymbols, GetParam().object()));
  const ObjectModule& module = *result.module;
  EXPECT_EQ(ownTags(module), tag(6, 10) + tag(7, 65));
  EXPECT_EQ(module.getHighestTagsVersion(), 1u);
  EXPECT_EQ(ownTags(*result.section(3)), tag(30, 2));
  EXPECT_EQ(result.section(5)->getOwnBuildAttributes(), result.section(3)->getOwnBuildAttributes());
  EXPECT_EQ(ownTags(*result.section(4)), "none");
  EXPECT_EQ(ownTags(*result.symbol(1)), "none");
  EXPECT_EQ(ownTags(*result.symbol(2)), tag(30, 4));
  EXPECT_EQ(blockOf(module, "qobix"), tag(6, 10) + tag(7, 65));
  EXPECT_EQ(blockOf(module, "ZEV"), tag(18, 1));
  EXPECT_EQ(blockOf(*result.section(4), "other"), "bytes");
  EXPECT_EQ(result.section(3)->findBlock("qobix"), result.section(5)->findBlock("qobix"));
  EXPECT_TRUE(module.isBuildAttributesSectionUpToDate());
  BuildAttributes effective;
  result.symbol(1)->getEffectiveBuildAttributes(effective);
  EXPECT_EQ(effective.getNumericTag(6), 10u);
  EXPECT_EQ(effective.getNumericTag(30), 2u);
}

TEST_P(ReadAttributesOfEachFormTest, ASectionThatIsMadeAnewIsTheSame) {
  const bool isLittle = GetParam().data == ElfData::Little;
  const std::string section =
      attributeSection({vendorPart("qobix", {filePart(tag(6, 10)), sectionPart({3, 5}, tag(30, 2)),
                                             symbolPart({2}, tag(30, 4))}),
                        vendorPart("ZEV", {filePart(tag(18, 1)), sectionPart({3}, tag(20, 1))}),
                        vendorPart("other", {filePart("x"), symbolPart({1, 2}, "")})},
                       isLittle);
  const ReadResult result = readGood(withAttributes(section, ThreeSymbols, GetParam().object()));
  ModuleBuilder::setBuildAttributesSectionUpToDate(*result.module, false);
  updateBuildAttributesSection(*result.module);
  const Section& made = *result.section(6);
  EXPECT_EQ(textOf({made.getContents(), made.getContentsSize()}), section);
  // The tags say the same as the blocks.
  updateBuildAttributesBlocks(*result.module);
  updateBuildAttributesSection(*result.module);
  EXPECT_EQ(textOf({made.getContents(), made.getContentsSize()}), section);
}

TEST_F(ReadAttributesTest, AnObjectWithoutAttributesHasNone) {
  const ReadResult result = readGood(withSymbols(ThreeSymbols));
  EXPECT_EQ(ownTags(*result.module), "none");
  EXPECT_EQ(result.module->getHighestTagsVersion(), 0u);
  EXPECT_EQ(ownTags(*readGood(withAttributes("A")).module), "none");
}

TEST_F(ReadAttributesTest, TheFileComesBeforeItsPartsInEachSection) {
  ObjectBuilder file = withSymbols(ThreeSymbols);
  file.section("one", SHT_ZEV_ATTRIBUTES)
      .bytes(attributeSection(
          {vendorPart("qobix", {sectionPart({3}, tag(30, 1)), filePart(tag(6, 1) + tag(7, 65))})}));
  file.section("two", SHT_ZEV_ATTRIBUTES)
      .bytes(attributeSection({vendorPart(
          "qobix", {filePart(tag(6, 2)), sectionPart({3}, tag(38, 1)), filePart(tag(8, 1))})}));
  const ReadResult result = readGood(file);
  // What comes later adds to what is there; of the blocks the last one stays.
  EXPECT_EQ(ownTags(*result.module), tag(6, 2) + tag(7, 65) + tag(8, 1));
  EXPECT_EQ(blockOf(*result.module, "qobix"), tag(8, 1));
  EXPECT_EQ(ownTags(*result.section(3)), tag(30, 1) + tag(38, 1));
}

TEST_F(ReadAttributesTest, VendorsAddToOneSet) {
  const ReadResult result = readGood(withAttributes(attributeSection(
      {vendorPart("ZEV", {sectionPart({3}, tag(16, 2) + tag(18, 2))}),
       vendorPart("qobix", {sectionPart({3}, tag(6, 1))}),
       vendorPart("Qobix", {filePart(tag(6, 1))}), vendorPart("ZEV2", {filePart(tag(18, 9))})})));
  EXPECT_EQ(ownTags(*result.section(3)), tag(6, 1) + tag(24, 2));
  EXPECT_EQ(result.section(3)->getOwnBuildAttributes()->getNumericTag(ZevTag::Tag_ZV_eba), 2u);
  EXPECT_EQ(result.module->getHighestTagsVersion(), 2u);
  EXPECT_EQ(ownTags(*result.module), "none");
}

TEST_F(ReadAttributesTest, ARunThatIsMalformedSaysWhatStandsBeforeTheFault) {
  const ReadResult result = readGood(withAttributes(
      attributeSection({vendorPart("qobix", {filePart(tag(6, 10) + tag(1, 1) + tag(7, 65))}),
                        vendorPart("ZEV", {filePart(tag(18, 1) + "\x84")})})));
  EXPECT_EQ(ownTags(*result.module), tag(6, 10));
  EXPECT_EQ(result.module->getHighestTagsVersion(), 1u);
}

// Sets that compare equal are one, though one of them may know more.
TEST_F(ReadAttributesTest, ATagThatIsNotComparedIsLostBehindASetWithoutIt) {
  const ReadResult result = readGood(withAttributes(attributeSection({vendorPart(
      "qobix", {filePart(tag(6, 10)), filePart(tag(40, 1)), sectionPart({3}, tag(40, 1)),
                sectionPart({4}, tag(30, 1)), sectionPart({4}, tag(40, 1) + tag(30, 2))})})));
  EXPECT_EQ(ownTags(*result.module), tag(6, 10));
  EXPECT_EQ(blockOf(*result.module, "qobix"), tag(40, 1));
  EXPECT_EQ(ownTags(*result.section(3)), tag(40, 1));
  EXPECT_EQ(ownTags(*result.section(4)), tag(40, 1) + tag(30, 2));
}

TEST_F(ReadAttributesTest, OlderCompilersLeftTagsOut) {
  // Rounding as it is chosen at run time needs the whole model.
  const ReadResult result = readGood(withAttributes(
      attributeSection({vendorPart("qobix", {filePart(tag(6, 10) + tag(19, 1) + tag(23, 1))})})));
  EXPECT_EQ(ownTags(*result.module), tag(6, 10) + tag(19, 1) + tag(23, 3));
}

// ---- Corrupted sections

TEST_P(ReadAttributesOfEachFormTest, ACorruptedSectionIsReported) {
  const bool isLittle = GetParam().data == ElfData::Little;
  const std::string section =
      attributeSection({vendorPart("qobix", {filePart(tag(6, 10)), sectionPart({3}, tag(30, 2)),
                                             symbolPart({1, 9}, tag(30, 4))}),
                        vendorPart("ZEV", {filePart(tag(18, 1))})},
                       isLittle);
  const ReadResult mended =
      expectMended(withAttributes(section, ThreeSymbols, GetParam().object()), Corrupt);
  // Blocks stay, but nothing follows from them.
  EXPECT_EQ(ownTags(*mended.module), "none");
  EXPECT_EQ(ownTags(*mended.section(3)), "none");
  EXPECT_EQ(ownTags(*mended.symbol(1)), "none");
  EXPECT_EQ(mended.module->getHighestTagsVersion(), 0u);
  EXPECT_EQ(blockOf(*mended.module, "qobix"), tag(6, 10));
}

TEST_F(ReadAttributesTest, EachCorruptionIsReported) {
  const std::string good = attributeSection({vendorPart("qobix", {filePart(tag(6, 10))})});
  for (const std::string& section :
       {std::string(), std::string("B"), good.substr(0, good.size() - 1), good + '\0',
        "A" + subsection("vendor"), "A" + subsection(ntbs("v") + "\4")})
    expectMended(withAttributes(section), Corrupt);
}

TEST_F(ReadAttributesTest, IndicesAreThoseOfSectionsAndSymbols) {
  const auto section = [](const AttributePart& part) {
    return withAttributes(attributeSection({vendorPart("qobix", {part})}));
  };
  // There are sections 0 to 7: those above, the attributes and the names.
  EXPECT_EQ(ownTags(*readGood(section(sectionPart({1, 7}, tag(6, 1)))).section(7)), tag(6, 1));
  EXPECT_EQ(ownTags(*readGood(section(symbolPart({1, 3}, tag(6, 1)))).symbol(3)), tag(6, 1));
  for (const uint32_t index : {8U, 9U, 0xFFFFFFFFU})
    expectMended(section(sectionPart({1, index, 7}, tag(6, 1))), Corrupt);
  for (const uint32_t index : {4U, 5U, 0xFFFFFFFFU})
    expectMended(section(symbolPart({1, index, 3}, tag(6, 1))), Corrupt);
  // A list of nothing is well.
  EXPECT_EQ(ownTags(*readGood(section(sectionPart({}, tag(6, 1)))).section(1)), "none");
  // An index of 0 takes a number that is too long.
  expectMended(section({Tag_Section, std::string("\x80\x80\x80\x80\x10") + '\0' + tag(6, 1)}),
               Corrupt);
}

// A long run that is for many symbols, each of which has something else already.
TEST_F(ReadAttributesTest, SymbolsThatTakeTooManyStepsCorruptASection) {
  std::vector<testsupport::SymbolSpec> symbols;
  std::vector<AttributePart> parts;
  std::vector<uint32_t> all;
  for (uint32_t i = 1; i <= 100; ++i) {
    symbols.push_back({.name = "f", .section = 3});
    parts.push_back(symbolPart({i}, tag(6, i)));
    all.push_back(i);
  }
  const auto longRun = [&](size_t size) {
    std::vector<AttributePart> whole = parts;
    whole.push_back(symbolPart(all, tag(5, std::string(size, 'x'))));
    return withAttributes(attributeSection({vendorPart("qobix", whole)}), symbols);
  };
  readGood(longRun(1000));
  expectMended(longRun(30000), Corrupt);
}

TEST_F(ReadAttributesTest, WithoutSymbolsThereIsNoIndex) {
  ObjectBuilder file = object();
  file.section(".ZEV.attributes", SHT_ZEV_ATTRIBUTES)
      .bytes(attributeSection({vendorPart("qobix", {symbolPart({1}, tag(6, 1))})}));
  expectMended(file, "Build attributes in section #1 are corrupted");
}

TEST_F(ReadAttributesTest, ACorruptedSectionEndsTheLookAtSections) {
  ObjectBuilder file =
      withAttributes(attributeSection({vendorPart("qobix", {filePart(tag(6, 1))})}));
  file.section("bad", SHT_ZEV_ATTRIBUTES).bytes("B");
  file.section("good", SHT_ZEV_ATTRIBUTES)
      .bytes(attributeSection({vendorPart("qobix", {filePart(tag(6, 2))})}));
  file.section("worse", SHT_ZEV_ATTRIBUTES).bytes("C");
  const ReadResult mended = expectMended(file, "Build attributes in section #7 are corrupted");
  EXPECT_EQ(ownTags(*mended.module), "none");
}

// A file of a size that isn't read at once.
TEST_F(ReadAttributesTest, ASectionThatCannotBeReadIsNoCorruptedOne) {
  constexpr size_t Apart = 0x200000;
  ObjectBuilder file = object();
  file.section("large", SHT_PROGBITS).zeros(Apart);
  file.section(".ZEV.attributes", SHT_ZEV_ATTRIBUTES)
      .bytes(attributeSection({vendorPart("qobix", {filePart(tag(6, 10))})}));
  file.section("large", SHT_PROGBITS).zeros(Apart);
  const std::string bytes = file.bytes();
  m_Host.addFile("lib.a", bytes);
  testsupport::FaultyHost host(m_Host);
  uint64_t call = 0;
  for (bool isRead = false; !isRead;) {
    host.failCall(++call, EIO);
    RecordingReports reports(true);
    ObjectModule module;
    module.setObjectName("a.o");
    module.setErrorHandler(&reports);
    isRead = readElfFile(host, "lib.a", 0, bytes.size(), module, nullptr);
    module.setErrorHandler(nullptr);
    if (host.getFailedOperation().empty()) break;
    EXPECT_THAT(reports.m_Texts, ElementsAre("I/O error reading file 'a.o': Input/output error"))
        << host.getFailedOperation() << ' ' << call;
  }
  EXPECT_GT(call, 3u);
}

// ---- Decoration symbols

TEST_P(ReadAttributesOfEachFormTest, DecorationsStandForModuleSectionsAndSymbols) {
  const ReadResult result = readGood(withSymbols(
      {decoration(V4), decoration(V5, 4), {.name = "main", .section = 3}, decorationOf("main", V6)},
      GetParam().object()));
  EXPECT_EQ(ownText(*result.module), V4);
  EXPECT_EQ(ownText(*result.section(4)), V5);
  EXPECT_EQ(ownText(*result.section(3)), "none");
  EXPECT_EQ(ownText(*result.symbol(3)), V6);
  EXPECT_EQ(ownText(*result.symbol(4)), "none");
  EXPECT_STREQ(result.symbol(4)->getName(), ("main$$BuildAttributes$" + V6).c_str());
  EXPECT_EQ(result.module->getOwnBuildAttributes()->getNumericTag(Tag_CPU_arch), 1u);
}

TEST_F(ReadAttributesTest, ADecorationIsForTheFirstSymbolOfItsName) {
  const ReadResult result = readGood(withSymbols({decorationOf("f", V4),
                                                  {.name = "g", .section = 3},
                                                  {.name = "f", .section = 3},
                                                  {.name = "f", .section = 4},
                                                  {.name = "f$$x", .section = 4},
                                                  decorationOf("f$$x", V5)}));
  EXPECT_EQ(ownText(*result.symbol(3)), V4);
  EXPECT_EQ(ownText(*result.symbol(4)), "none");
  EXPECT_EQ(ownText(*result.symbol(5)), V5);
  EXPECT_EQ(ownText(*result.symbol(2)), "none");
  EXPECT_EQ(ownText(*result.module), "none");
}

TEST_F(ReadAttributesTest, ADecorationForNothingIsDropped) {
  const ReadResult result = readGood(
      withSymbols({decorationOf("missing", V4),
                   decorationOf("", V4),
                   {.name = "a", .section = 3},
                   {.name = "aBuildAttributes$b$$BuildAttributes$c", .section = SHN_ABS},
                   // Cut at the first of these, it is for nobody.
                   {.name = "aa$$BuildAttributes$b$$BuildAttributes$c", .section = SHN_ABS}}));
  EXPECT_EQ(ownText(*result.module), "none");
  for (uint32_t index = 1; index <= 5; ++index)
    EXPECT_EQ(ownText(*result.symbol(index)), "none") << index;
}

TEST_F(ReadAttributesTest, OnlySomeSymbolsAreDecorations) {
  const ReadResult result =
      readGood(withSymbols({decoration(V4, SHN_UNDEF),
                            decoration(V4, SHN_COMMON),
                            {.name = "main", .section = 3},
                            {.name = "main$$BuildAttributes$" + V5, .section = 3},
                            {.name = "xBuildAttributes$" + V5, .section = SHN_ABS},
                            {.name = "BuildAttributes", .section = SHN_ABS},
                            {.name = "buildattributes$" + V5, .section = SHN_ABS}}));
  EXPECT_EQ(ownText(*result.module), "none");
  EXPECT_EQ(ownText(*result.symbol(3)), "none");
  EXPECT_EQ(ownText(*result.section(3)), "none");
}

TEST_F(ReadAttributesTest, AnEmptyTextIsOneToo) {
  const ReadResult result = readGood(withSymbols({decoration("")}));
  EXPECT_EQ(ownText(*result.module), saidBy(""));
  EXPECT_EQ(ownText(*readGood(withSymbols({decoration("ZEV_ISAv4")})).module), saidBy(""));
}

// The later one wins, tag by tag.
TEST_F(ReadAttributesTest, DecorationsOfOneTargetAreUnited) {
  const ReadResult result = readGood(withSymbols({decoration(V4 + "$ENUMINT"), decoration(V5)}));
  const BuildAttributes* own = result.module->getOwnBuildAttributes();
  ASSERT_NE(own, nullptr);
  EXPECT_EQ(*own, BuildAttributes::getUnion(BuildAttributes(V4 + "$ENUMINT"), BuildAttributes(V5)));
  EXPECT_EQ(own->getNumericTag(Tag_CPU_arch), 3u);
  EXPECT_EQ(own->getNumericTag(Tag_ABI_enum_size), 2u);
}

TEST_F(ReadAttributesTest, EqualTextsShareOneSet) {
  const ReadResult result = readGood(withSymbols({decoration(V4, 3), decoration(V4, 4)}));
  EXPECT_NE(result.section(3)->getOwnBuildAttributes(), nullptr);
  EXPECT_EQ(result.section(3)->getOwnBuildAttributes(), result.section(4)->getOwnBuildAttributes());
}

// ---- Sections and decorations

namespace {

ObjectBuilder withBoth(uint32_t version, const testsupport::SymbolSpec& symbol) {
  return withAttributes(
      attributeSection({vendorPart("qobix", {filePart(tag(6, 10)), sectionPart({4}, tag(30, 2))}),
                        vendorPart("ZEV", {sectionPart({5}, tag(18, version))})}),
      {{.name = "main", .section = 3}, symbol});
}

} // namespace

TEST_F(ReadAttributesTest, ASectionOfANewToolOutranksDecorations) {
  for (const testsupport::SymbolSpec& symbol :
       {decoration(V4), decoration(V4, 4), decorationOf("main", V4)}) {
    ObjectBuilder file = withBoth(1, symbol);
    file.segment({.type = PT_NULL}); // reads without segments have no such conditions
    const ReadResult result = readGood(file);
    EXPECT_EQ(ownTags(*result.module), tag(6, 10));
    EXPECT_EQ(ownTags(*result.section(4)), tag(30, 2));
    EXPECT_EQ(ownTags(*result.symbol(1)), "none");
    const uint32_t conditions = result.module->getReadConditions();
    EXPECT_NE(conditions & ReadCondition_HasBuildAttributesSymbol, 0u);
    EXPECT_NE(conditions & ReadCondition_HasBuildAttributesSection, 0u);
  }
}

TEST_F(ReadAttributesTest, DecorationsOutrankTheSectionOfAnOldTool) {
  // Of the version a byte counts.
  for (const uint32_t version : {0U, 256U}) {
    const ReadResult hosted = readGood(withBoth(version, decoration(V4, 4)));
    EXPECT_EQ(ownTags(*hosted.module), "none");
    EXPECT_EQ(ownText(*hosted.section(4)), V4);
    EXPECT_EQ(ownTags(*hosted.section(5)), "none");
    EXPECT_EQ(blockOf(*hosted.module, "qobix"), tag(6, 10));
    const ReadResult ofSymbol = readGood(withBoth(version, decorationOf("main", V5)));
    EXPECT_EQ(ownTags(*ofSymbol.module), "none");
    EXPECT_EQ(ownText(*ofSymbol.symbol(1)), V5);
    // Even one that is for nobody.
    EXPECT_EQ(ownTags(*readGood(withBoth(version, decorationOf("nobody", V5))).module), "none");
  }
}

TEST_F(ReadAttributesTest, AnOldSectionHoldsWhereThereAreNoDecorations) {
  const ReadResult result = readGood(withBoth(0, decoration(V4, SHN_UNDEF)));
  EXPECT_EQ(ownTags(*result.module), tag(6, 10));
}

TEST_F(ReadAttributesTest, DecorationsHoldWhereTheSectionIsCorrupted) {
  const std::string section = attributeSection(
      {vendorPart("ZEV", {filePart(tag(18, 1))}), vendorPart("qobix", {sectionPart({99}, "")})});
  const ReadResult mended = expectMended(withAttributes(section, {decoration(V4)}), Corrupt);
  EXPECT_EQ(ownText(*mended.module), V4);
}

// ---- Every prefix

TEST_F(ReadAttributesTest, EachPrefixOfASectionIsReadOrReported) {
  const std::string whole = attributeSection(
      {vendorPart("qobix", {filePart(tag(6, 10) + tag(5, "cpu")), sectionPart({3, 4}, tag(30, 2)),
                            symbolPart({1, 3}, tag(32, 1, "x") + "\x41" + tag(6, 0))}),
       vendorPart("ZEV", {filePart(tag(18, 1)), symbolPart({2}, tag(4, 1))})});
  for (size_t size = 0; size < whole.size(); ++size) {
    const ReadResult result = read(withAttributes(whole.substr(0, size)));
    if (result.isRead)
      EXPECT_THAT(result.reports, IsEmpty()) << size;
    else
      EXPECT_THAT(result.reports, ElementsAre(Corrupt)) << size;
  }
}

} // namespace elfext
