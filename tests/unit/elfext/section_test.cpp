// SPDX-License-Identifier: Apache-2.0
//
// Sections: their attributes, their contents, and the classes of the auxiliary ones; which links
// they may have, and which setters make the auxiliary sections stale.

#include "elfext/interface/group.h"
#include "elfext/interface/segment.h"
#include "elfext/src/bytes/elf_records.h"
#include "module_fixture.h"

namespace elfext {
namespace {

using SectionTest = ModuleTest;

struct ClassRow {
  uint32_t type;
  bool isAuxiliary;
  bool isRelocatable;
  uint64_t entrySize32;
  uint64_t entrySize64;
};

// clang-format off
constexpr ClassRow ClassRows[] = {
    {SHT_NULL,             true,  true,   0,  0},
    {SHT_PROGBITS,         false, true,   0,  0},
    {SHT_SYMTAB,           true,  false, 16, 24},
    {SHT_STRTAB,           true,  false,  0,  0},
    {SHT_RELA,             true,  false, 12, 24},
    {SHT_HASH,             true,  false,  0,  0},
    {SHT_DYNAMIC,          true,  true,   0,  0},
    {SHT_NOTE,             false, false,  0,  0},
    {SHT_NOBITS,           false, true,   0,  0},
    {SHT_REL,              true,  false,  8, 16},
    {SHT_SHLIB,            false, true,   0,  0},
    {SHT_DYNSYM,           true,  false, 16, 24},
    {SHT_INIT_ARRAY,       false, true,   0,  0},
    {SHT_GROUP,            true,  false,  4,  4},
    {SHT_SYMTAB_SHNDX,     true,  false,  4,  4},
    {SHT_GNU_verdef,       true,  false,  0,  0},
    {SHT_GNU_verneed,      true,  false,  0,  0},
    {SHT_GNU_versym,       true,  false,  0,  0},
    {SHT_ZEV_EXIDX,        false, true,   0,  0},
    {SHT_ZEV_PREEMPTMAP,   true,  false,  0,  0},
    {SHT_ZEV_ATTRIBUTES,   true,  true,   0,  0},
    {SHT_ZEV_DEBUGOVERLAY, true,  true,   0,  0},
    {0x12345678,           false, true,   0,  0},
};
// clang-format on

TEST_F(SectionTest, IsOfTheClassThatItsTypeHas) {
  for (const ClassRow& row : ClassRows) {
    for (uint32_t elfClass : {ELFCLASS32, ELFCLASS64}) {
      module.setElfClass(elfClass);
      const Section* section = module.createSectionOfType("name", row.type, SHF_ALLOC);
      EXPECT_EQ(section->getType(), row.type);
      EXPECT_EQ(section->getFlags(), SHF_ALLOC);
      EXPECT_STREQ(section->getName(), "name");
      EXPECT_EQ(section->isAuxiliary(), row.isAuxiliary) << row.type;
      EXPECT_EQ(section->isRelocatable(), row.isRelocatable) << row.type;
      const uint64_t entrySize = elfClass == ELFCLASS64 ? row.entrySize64 : row.entrySize32;
      EXPECT_EQ(section->getEntrySize(), entrySize) << row.type;
      EXPECT_EQ(expectedEntrySize(row.type, elfClass), entrySize) << row.type;
      EXPECT_EQ(hasOwnSectionClass(row.type), row.isAuxiliary) << row.type;
      EXPECT_EQ(section->getSize(), 0u);
    }
  }
}

TEST_F(SectionTest, IsPlainOnlyForTypesWithoutAClass) {
  for (const ClassRow& row : ClassRows) {
    if (!row.isAuxiliary) continue;
    EXPECT_EXIT(module.createSection("name", row.type, 0), testing::ExitedWithCode(1),
                "type != SHT_NULL && type != SHT_STRTAB");
  }
}

TEST_F(SectionTest, JoinsTheListOfItsType) {
  StringTableSection* strings = module.createStringTableSection("a", 0);
  StringTableSection* moreStrings = module.createStringTableSection("b", 0);
  EXPECT_THAT(elements(module.getStringTableSections()),
              testing::ElementsAre(strings, moreStrings));
  SymbolTableSection* symtab = module.createSymbolTableSection("a", SHT_SYMTAB, 0);
  SymbolTableSection* dynsym = module.createSymbolTableSection("a", SHT_DYNSYM, 0);
  EXPECT_THAT(elements(module.getSymtabSections()), testing::ElementsAre(symtab));
  EXPECT_THAT(elements(module.getDynsymSections()), testing::ElementsAre(dynsym));
  GroupSection* group = module.createGroupSection("a", 0);
  EXPECT_THAT(elements(module.getGroupSections()), testing::ElementsAre(group));
  HashSection* hash = module.createHashSection("a", 0);
  EXPECT_THAT(elements(module.getHashSections()), testing::ElementsAre(hash));
  ShndxSection* shndx = module.createShndxSection("a", 0);
  EXPECT_THAT(elements(module.getShndxSections()), testing::ElementsAre(shndx));
  PreemptionMapSection* map = module.createPreemptionMapSection("a", 0);
  EXPECT_THAT(elements(module.getPreemptionMapSections()), testing::ElementsAre(map));
  VerdefSection* verdef = module.createVerdefSection("a", 0);
  EXPECT_THAT(elements(module.getVerdefSections()), testing::ElementsAre(verdef));
  VerneedSection* verneed = module.createVerneedSection("a", 0);
  EXPECT_THAT(elements(module.getVerneedSections()), testing::ElementsAre(verneed));
  VersymSection* versym = module.createVersymSection("a", 0);
  EXPECT_THAT(elements(module.getVersymSections()), testing::ElementsAre(versym));
  DynamicSection* dynamic = module.createDynamicSection("a", 0);
  EXPECT_THAT(elements(module.getDynamicSections()), testing::ElementsAre(dynamic));
  DebugOverlaySection* overlay = module.createDebugOverlaySection("a", 0);
  EXPECT_THAT(elements(module.getDebugOverlaySections()), testing::ElementsAre(overlay));
  BuildAttributesSection* attributes = module.createBuildAttributesSection("a", 0);
  EXPECT_THAT(elements(module.getBuildAttributesSections()), testing::ElementsAre(attributes));
}

TEST_F(SectionTest, OnlyRelocationSectionsAreRelocationSections) {
  for (const ClassRow& row : ClassRows) {
    Section* section = module.createSectionOfType("name", row.type, 0);
    const Section* constant = section;
    const bool isOne = row.type == SHT_REL || row.type == SHT_RELA;
    EXPECT_EQ(section->asRelocationSection(), isOne ? section : nullptr) << row.type;
    EXPECT_EQ(constant->asRelocationSection(), isOne ? section : nullptr) << row.type;
  }
}

TEST_F(SectionTest, TellsWhoUsesAStringTable) {
  StringTableSection* table = module.createStringTableSection(".strtab", 0);
  EXPECT_FALSE(table->isSectionNameTable());
  EXPECT_FALSE(table->isLinkedBySymtab());
  EXPECT_FALSE(table->isLinkedByDynsym());
  EXPECT_FALSE(table->isLinkedByOther());
  ModuleBuilder::markSectionNameTable(*table);
  EXPECT_TRUE(table->isSectionNameTable());
  EXPECT_FALSE(table->isLinkedBySymtab());
  ModuleBuilder::markLinkedBySymtab(*table);
  EXPECT_TRUE(table->isLinkedBySymtab());
  EXPECT_FALSE(table->isLinkedByDynsym());
  ModuleBuilder::markLinkedByDynsym(*table);
  EXPECT_TRUE(table->isLinkedByDynsym());
  EXPECT_FALSE(table->isLinkedByOther());
  ModuleBuilder::markLinkedByOther(*table);
  EXPECT_TRUE(table->isLinkedByOther());
}

TEST_F(SectionTest, TiesASymbolTableToItsHelpers) {
  SymbolTableSection* table = module.createSymbolTableSection(".symtab", SHT_SYMTAB, 0);
  EXPECT_EQ(table->getShndxSection(), nullptr);
  EXPECT_EQ(table->getHashSection(), nullptr);
  ShndxSection* shndx = module.createShndxSection(".symtab_shndx", 0);
  HashSection* hash = module.createHashSection(".hash", 0);
  ModuleBuilder::setShndxSection(*table, shndx);
  ModuleBuilder::setHashSection(*table, hash);
  EXPECT_EQ(table->getShndxSection(), shndx);
  EXPECT_EQ(table->getHashSection(), hash);
}

TEST_F(SectionTest, KeepsTheSignatureSymbolOfAGroupSection) {
  GroupSection* section = module.createGroupSection(".group", 0);
  ModuleBuilder::setSignatureSymbolIndex(*section, 7);
  EXPECT_EQ(section->getSignatureSymbolIndex(), 7u);
}

// ---- Attributes

TEST_F(SectionTest, StartsEmpty) {
  const Section* section = makeSection();
  EXPECT_EQ(section->getAddress(), 0u);
  EXPECT_EQ(section->getSize(), 0u);
  EXPECT_EQ(section->getAlignment(), 0u);
  EXPECT_EQ(section->getLink(), nullptr);
  EXPECT_EQ(section->getInfo(), 0u);
  EXPECT_EQ(section->getIndex(), 0u);
  EXPECT_EQ(section->getGroup(), nullptr);
  EXPECT_EQ(section->getSegment(), nullptr);
  EXPECT_EQ(section->getContents(), nullptr);
  EXPECT_EQ(section->getRelocationCount(), 0u);
  EXPECT_EQ(section->getHostedSymbolCount(), 0u);
  EXPECT_EQ(section->getHostedDynamicSymbolCount(), 0u);
  EXPECT_TRUE(section->getLinkingSections().empty());
  EXPECT_EQ(section->getObjectModule(), &module);
}

TEST_F(SectionTest, MakesTheAuxiliarySectionsStaleWithEachSetter) {
  Section* section = makeSection();
  Section* other = makeSection();
  EXPECT_TRUE(makesStale([&] { section->setName("new"); }));
  EXPECT_TRUE(makesStale([&] { section->setFlags(1); }));
  EXPECT_TRUE(makesStale([&] { section->addFlags(2); }));
  EXPECT_TRUE(makesStale([&] { section->setAddress(1); }));
  EXPECT_TRUE(makesStale([&] { section->setEntrySize(1); }));
  EXPECT_TRUE(makesStale([&] { section->setLink(other); }));
  EXPECT_TRUE(makesStale([&] { section->setInfo(1); }));
  EXPECT_TRUE(makesStale([&] { section->setSize(1); }));
  EXPECT_TRUE(makesStale([&] { section->addSize(1); }));
  EXPECT_TRUE(makesStale([&] { section->setAlignment(16); }));
  EXPECT_TRUE(makesStale([&] { section->increaseAlignment(32); }));
  EXPECT_TRUE(makesStale([&] { section->makeProgBits(); }));
}

TEST_F(SectionTest, CopiesItsName) {
  char name[] = "name";
  Section* section = module.createSection(name, SHT_PROGBITS, 0);
  EXPECT_NE(section->getName(), name);
  const char* kept = section->getName();
  section->setName("name");
  EXPECT_EQ(section->getName(), kept);
  char other[] = "other";
  section->setName(other);
  EXPECT_NE(section->getName(), other);
  EXPECT_STREQ(section->getName(), "other");
  section->setName(nullptr);
  EXPECT_EQ(section->getName(), nullptr);
}

TEST_F(SectionTest, KeepsTheOldTextForAnEqualName) {
  Section* section = makeSection(".text");
  EXPECT_FALSE(makesStale([&] { section->setName(".text"); }));
}

TEST_F(SectionTest, CopiesItsNameUnlessItIsInTheBuffer) {
  char name[] = "name";
  ModuleBuilder::setNamesInBuffer(module, true);
  Section* section = module.createSection(name, SHT_PROGBITS, 0);
  EXPECT_EQ(section->getName(), name);
  // A name that is set later is the client's, not the buffer's.
  section->setName(name + 1);
  EXPECT_NE(section->getName(), name + 1);
  EXPECT_STREQ(section->getName(), "ame");
  section->setName(nullptr);
  EXPECT_EQ(section->getName(), nullptr);
}

TEST_F(SectionTest, AddsFlags) {
  Section* section = makeSection();
  section->setFlags(SHF_ALLOC);
  section->addFlags(SHF_WRITE);
  EXPECT_EQ(section->getFlags(), SHF_ALLOC | SHF_WRITE);
}

TEST_F(SectionTest, MovesItsSymbolsWithItsAddress) {
  Section* section = makeSection();
  const Symbol* symbol = makeHosted("a", section, 4);
  SymbolList found;
  EXPECT_TRUE(module.getSymbolsAtAddress(4, Symbol::Class_All, &found));
  section->setAddress(0x1000);
  EXPECT_FALSE(module.getSymbolsAtAddress(4, Symbol::Class_All, &found));
  EXPECT_TRUE(module.getSymbolsAtAddress(0x1004, Symbol::Class_All, &found));
  EXPECT_EQ(found[0], symbol);
}

TEST_F(SectionTest, TakesPowersOfTwoAsAlignment) {
  Section* section = makeSection();
  for (uint64_t alignment : {uint64_t{0}, uint64_t{1}, uint64_t{8}, uint64_t{1} << 63}) {
    section->setAlignment(alignment);
    EXPECT_EQ(section->getAlignment(), alignment);
  }
  EXPECT_ASSERTION(section->setAlignment(12), "(alignment & ~(alignment & (0 - alignment))) == 0");
  EXPECT_ASSERTION(section->increaseAlignment(12),
                   "(alignment & ~(alignment & (0 - alignment))) == 0");
}

TEST_F(SectionTest, IncreasesItsAlignmentOnly) {
  Section* section = makeSection();
  section->setAlignment(16);
  EXPECT_FALSE(makesStale([&] { section->increaseAlignment(8); }));
  EXPECT_EQ(section->getAlignment(), 16u);
  section->increaseAlignment(32);
  EXPECT_EQ(section->getAlignment(), 32u);
}

TEST_F(SectionTest, SizesItsContents) {
  Section* section = makeSection();
  section->setSize(10);
  EXPECT_EQ(section->getSize(), 10u);
  EXPECT_EQ(section->getFileSize(), 10u);
  EXPECT_EQ(section->getContentsSize(), 10u);
  EXPECT_EQ(section->addSize(5), 10u);
  EXPECT_EQ(section->getSize(), 15u);
  EXPECT_EQ(section->getContentsSize(), 10u);
}

TEST_F(SectionTest, HasNoContentsAsNobits) {
  Section* section = makeSection(".bss", SHT_NOBITS);
  section->setSize(100);
  EXPECT_EQ(section->getSize(), 100u);
  EXPECT_EQ(section->getFileSize(), 0u);
  EXPECT_EQ(section->getContents(), nullptr);
}

TEST_F(SectionTest, GetsContentsWhenItBecomesProgbits) {
  Section* section = makeSection(".bss", SHT_NOBITS);
  section->setSize(100);
  section->makeProgBits();
  EXPECT_EQ(section->getType(), SHT_PROGBITS);
  EXPECT_EQ(section->getContentsSize(), 100u);
  EXPECT_EQ(section->getFileSize(), 100u);
}

TEST_F(SectionTest, KnowsWhoLinksToIt) {
  Section* first = makeSection();
  Section* second = makeSection();
  Section* target = makeSection();
  Section* other = makeSection();
  first->setLink(target);
  second->setLink(target);
  EXPECT_EQ(first->getLink(), target);
  EXPECT_THAT(elements(target->getLinkingSections()), testing::ElementsAre(first, second));
  first->setLink(other);
  EXPECT_THAT(elements(target->getLinkingSections()), testing::ElementsAre(second));
  EXPECT_THAT(elements(other->getLinkingSections()), testing::ElementsAre(first));
}

TEST_F(SectionTest, LinksWithinItsModuleOnly) {
  ObjectModule otherModule;
  Section* foreign = otherModule.createSection("", SHT_PROGBITS, 0);
  Section* section = makeSection();
  EXPECT_ASSERTION(section->setLink(nullptr), "link != NULL");
  EXPECT_ASSERTION(section->setLink(foreign), "link->m_ObjectModule == m_ObjectModule");
}

TEST_F(SectionTest, IsNotEditedWhenAuxiliary) {
  Section* section = module.createStringTableSection(".strtab", 0);
  EXPECT_ASSERTION(section->setLink(section), "!m_IsAuxiliary");
  EXPECT_ASSERTION(section->setInfo(1), "!m_IsAuxiliary");
  EXPECT_ASSERTION(section->setSize(1), "!m_IsAuxiliary");
  EXPECT_ASSERTION(section->makeProgBits(), "!m_IsAuxiliary");
  EXPECT_ASSERTION(section->setByte(0, 1), "!m_IsAuxiliary");
  EXPECT_ASSERTION(section->appendByte(1), "!m_IsAuxiliary");
  EXPECT_FALSE(section->isModifiable());
  ModuleBuilder::setAuxiliary(*section, false);
  EXPECT_TRUE(section->isModifiable());
  section->appendByte(1);
  ModuleBuilder::setAuxiliary(*section, true);
  EXPECT_EQ(section->getByte(0), 1u);
}

TEST_F(SectionTest, AdoptsWhatAFileSaysAsItStands) {
  Section* section = module.createStringTableSection(".strtab", 0);
  Section* target = makeSection();
  SectionHeader header;
  header.addr = 1;
  header.offset = 2;
  header.info = 3;
  header.addralign = 12;
  header.entsize = 4;
  ModuleBuilder::adoptHeader(*section, header);
  ModuleBuilder::adoptSize(*section, 5);
  ModuleBuilder::adoptLink(*section, target);
  EXPECT_EQ(section->getAddress(), 1u);
  EXPECT_TRUE(section->getFileExtent(nullptr, nullptr));
  EXPECT_EQ(section->getFileOffset(), 2u);
  EXPECT_EQ(section->getInfo(), 3u);
  EXPECT_EQ(section->getAlignment(), 12u);
  EXPECT_EQ(section->getEntrySize(), 4u);
  EXPECT_EQ(section->getSize(), 5u);
  EXPECT_EQ(section->getLink(), target);
  EXPECT_THAT(elements(target->getLinkingSections()), testing::ElementsAre(section));
}

TEST_F(SectionTest, RemembersItsSegment) {
  Segment* segment = module.createSegment(PT_LOAD, 0, 0, 0, 0, 0, 0, 0);
  Section* section = makeSection();
  ModuleBuilder::setSegment(*section, segment);
  EXPECT_EQ(section->getSegment(), segment);
}

TEST_F(SectionTest, IsInTheFirstSegmentThatWhollyContainsIt) {
  Section* section = makeSection({1, 2, 3, 4});
  Segment* small = module.createSegment(PT_LOAD, 0, 0, 0, 3, 3, 0, 1);
  Segment* exact = module.createSegment(PT_LOAD, 0, 0, 0, 4, 4, 0, 1);
  Segment* large = module.createSegment(PT_LOAD, 0, 0, 0, 100, 100, 0, 1);
  uint32_t index = 99;
  EXPECT_FALSE(section->isInSegment(&index));
  EXPECT_EQ(index, 99u);
  ASSERT_TRUE(FileRegion::link(*large, *section, 96));
  EXPECT_TRUE(section->isInSegment(&index));
  EXPECT_EQ(index, 2u);
  ASSERT_TRUE(FileRegion::link(*small, *section, 0));
  EXPECT_TRUE(section->isInSegment(&index));
  EXPECT_EQ(index, 2u);
  ASSERT_TRUE(FileRegion::link(*exact, *section, 0));
  EXPECT_TRUE(section->isInSegment(&index));
  EXPECT_EQ(index, 1u);
  EXPECT_TRUE(section->isInSegment(nullptr));
}

// ---- Contents

TEST_F(SectionTest, ForwardsReadingToItsContents) {
  Section* section = makeSection({1, 2, 3, 4, 5, 6, 7, 8});
  EXPECT_EQ(section->getByte(1), 2u);
  EXPECT_EQ(section->get16(2), 0x0403u);
  EXPECT_EQ(section->get32(4), 0x08070605u);
  EXPECT_EQ(section->get64(0), 0x0807060504030201u);
  EXPECT_EQ(section->getUnaligned16(1), 0x0302u);
  EXPECT_EQ(section->getUnaligned32(1), 0x05040302u);
  EXPECT_EQ(section->getUnaligned64(0), 0x0807060504030201u);
  uint8_t bytes[2] = {};
  EXPECT_TRUE(section->read(6, bytes, 2));
  EXPECT_THAT(bytes, testing::ElementsAre(7, 8));
  EXPECT_EQ(section->getDataStore(), section);
}

TEST_F(SectionTest, ForwardsWritingToItsContents) {
  Section* section = makeSection(std::vector<uint8_t>(16));
  section->setByte(0, 1);
  section->set16(2, 0x0203);
  section->set32(4, 0x04050607);
  section->set64(8, 0x08090A0B0C0D0E0F);
  const uint8_t bytes[] = {9};
  EXPECT_TRUE(section->write(1, bytes, 1));
  const std::vector<uint8_t> contents(section->getContents(), section->getContents() + 16);
  EXPECT_THAT(contents, testing::ElementsAre(1, 9, 3, 2, 7, 6, 5, 4, 15, 14, 13, 12, 11, 10, 9, 8));
}

TEST_F(SectionTest, GrowsWithEachAppend) {
  Section* section = makeSection();
  EXPECT_EQ(section->append64(1), 0u);
  EXPECT_EQ(section->append32(2), 8u);
  EXPECT_EQ(section->append16(3), 12u);
  EXPECT_EQ(section->appendByte(4), 14u);
  EXPECT_EQ(section->getSize(), 15u);
  EXPECT_EQ(section->getContentsSize(), 15u);
}

uint64_t deliverNines(void*, uint64_t, void* destination, uint64_t) {
  *static_cast<uint8_t*>(destination) = 9;
  return 1;
}

TEST_F(SectionTest, ReadsExternalContentsAndDoesNotChangeThem) {
  Section* section = makeSection();
  EXPECT_FALSE(section->hasExternalContents());
  section->setExternalContents(&deliverNines, nullptr, 4);
  EXPECT_TRUE(section->hasExternalContents());
  EXPECT_EQ(section->get32(0), 0x09090909u);
  EXPECT_FALSE(section->isModifiable());
  EXPECT_ASSERTION(section->setByte(0, 0), "!m_HasExternalContents");
  EXPECT_ASSERTION(section->append16(0), "!m_HasExternalContents");
}

TEST_F(SectionTest, HasTheAttributesOfItsModuleUnlessItHasItsOwn) {
  Section* section = makeSection();
  EXPECT_FALSE(module.inheritsBuildAttributes());
  EXPECT_TRUE(section->inheritsBuildAttributes());
  BuildAttributes inForce;
  section->getEffectiveBuildAttributes(inForce);
  EXPECT_TRUE(inForce == BuildAttributes());
  module.setOwnBuildAttributes(attributesWithArchitecture(4));
  section->getEffectiveBuildAttributes(inForce);
  EXPECT_EQ(inForce.getNumericTag(Tag_CPU_arch), 4u);
  section->setOwnBuildAttributes(attributesWithArchitecture(10));
  section->getEffectiveBuildAttributes(inForce);
  EXPECT_EQ(inForce.getNumericTag(Tag_CPU_arch), 10u);
  EXPECT_EQ(inheritedArchitecture(*section), 4u);
}

// ---- Groups

TEST_F(SectionTest, IsAMemberOfOneGroup) {
  Group* group = module.createGroup("signature", ".group", GRP_COMDAT);
  Section* first = makeSection();
  Section* second = makeSection();
  group->addMember(first);
  group->addMember(second);
  EXPECT_EQ(first->getGroup(), group);
  EXPECT_EQ(group->getMemberCount(), 2u);
  EXPECT_EQ(group->getMember(1), second);
  Group* other = module.createGroup("other", nullptr, 0);
  EXPECT_ASSERTION(other->addMember(first), "section->m_Group == NULL");
  EXPECT_ASSERTION(other->removeMember(first), "section->m_Group == this");
  group->removeMember(first);
  EXPECT_EQ(first->getGroup(), nullptr);
  EXPECT_EQ(group->getMember(0), second);
  other->addMember(first);
  EXPECT_EQ(first->getGroup(), other);
}

} // namespace
} // namespace elfext
