// SPDX-License-Identifier: Apache-2.0
//
// The checks that go beyond reading: what each finds, says and mends. A good module has no report;
// then each module is wrong in one way, told in the library's words.

#include "elfext/interface/group.h"
#include "elfext/interface/relocation.h"
#include "elfext/interface/segment.h"
#include "elfext/src/model/module_builder.h"
#include "tests/support/reader_fixture.h"

#include <algorithm>
#include <functional>
#include <random>
#include <set>
#include <utility>

namespace elfext {

using testsupport::SegmentSpec;

namespace {

constexpr uint32_t CodeFlags = SHF_ALLOC | SHF_EXECINSTR;

// Goes on until one report, counted from 0.
class RefusingOne final : public ErrorHandler {
public:
  explicit RefusingOne(size_t refused) : m_Refused(refused) {}

  bool report(const ObjectModule&, uint32_t, const std::string& text) override {
    m_Texts.push_back(text);
    return m_Texts.size() != m_Refused + 1;
  }

  std::vector<std::string> m_Texts;

private:
  size_t m_Refused;
};

std::vector<std::string> validateWith(ObjectModule& module, bool goesOn) {
  RecordingReports reports(goesOn);
  module.setErrorHandler(&reports);
  const bool isGood = module.validate();
  EXPECT_EQ(isGood, goesOn || reports.m_Texts.empty());
  module.setErrorHandler(nullptr);
  return reports.m_Texts;
}

void expectGood(ObjectModule& module) {
  EXPECT_THAT(validateWith(module, false), IsEmpty());
}

// The one problem that the module has. The answer decides.
void expectReport(ObjectModule& module, const std::string& text) {
  EXPECT_FALSE(module.validate());
  EXPECT_THAT(validateWith(module, false), ElementsAre(text));
  EXPECT_THAT(validateWith(module, true), ElementsAre(text));
}

// The same, and whoever goes on has a good module afterwards.
void expectMended(ObjectModule& module, const std::string& text) {
  expectReport(module, text);
  expectGood(module);
}

} // namespace

// ---- What counts in all files

class ValidateTest : public testing::Test {
protected:
  ValidateTest() {
    m_Module.setFileType(ET_REL);
    m_Module.createNullSection(nullptr, 0);
    m_Text = m_Module.createSection(".text", SHT_PROGBITS, CodeFlags);
    m_Text->setSize(16);
  }

  Symbol* makeLocal(Section* section, uint32_t type = STT_NOTYPE) {
    return m_Module.createHostedSymbol("x", 0, type, STB_LOCAL, STV_DEFAULT, section);
  }

  // Relocations without a target count as static unless they are told otherwise.
  static void addRelocation(Section* section, uint64_t offset, bool isDynamic) {
    Relocation* relocation = section->addRelocation(offset, 2, nullptr);
    if (isDynamic) relocation->setDynamic();
  }

  Group* makeGroup(const std::vector<Section*>& members) {
    Group* group = m_Module.createGroup("signature", ".group", GRP_COMDAT);
    ModuleBuilder::setGroupSection(*group, m_Module.createGroupSection(".group", 0));
    for (Section* member : members) {
      group->addMember(member);
      member->addFlags(SHF_GROUP);
    }
    return group;
  }

  ObjectModule m_Module;
  Section* m_Text;
};

TEST_F(ValidateTest, AGoodModuleHasNoReports) {
  expectGood(m_Module);
  m_Module.setErrorHandler(nullptr);
  EXPECT_TRUE(m_Module.validate());
  ObjectModule empty;
  expectGood(empty);
}

TEST_F(ValidateTest, JumpSlotsAllHaveAddendsOrAllHaveNone) {
  const auto addSlot = [](Section* section, uint32_t type, bool isDynamic, bool hasAddend) {
    Relocation* slot =
        hasAddend ? section->addRelocation(section->getRelocationCount() * 4, type, nullptr, 8)
                  : section->addRelocation(section->getRelocationCount() * 4, type, nullptr);
    if (isDynamic) slot->setDynamic();
  };
  Section* table = m_Module.createSection(".got", SHT_PROGBITS, SHF_ALLOC);
  addSlot(table, R_ZEV_JUMP_SLOT, true, false);
  addSlot(table, R_ZEV_JUMP_SLOT, true, false);
  addSlot(table, R_ZEV_JUMP_SLOT, false, true);
  addSlot(table, R_ZEV64_JUMP_SLOT, true, true);
  expectGood(m_Module);
  addSlot(m_Text, R_ZEV_JUMP_SLOT, true, true);
  expectReport(m_Module, "Relocations in PLT and GOT include some with addends and some without");
  m_Module.setMachine(EM_ZEV64);
  expectGood(m_Module);
}

TEST_F(ValidateTest, ANullSectionIsBlank) {
  const std::function<void(Section&)> faults[] = {
      [](Section& section) { section.setName("name"); },
      [](Section& section) { section.setFlags(SHF_WRITE); },
      [](Section& section) { section.setAddress(4); },
      [](Section& section) { ModuleBuilder::adoptSize(section, 4); },
      [this](Section& section) { ModuleBuilder::adoptLink(section, m_Text); },
      [](Section& section) {
        ModuleBuilder::setAuxiliary(section, false);
        section.setInfo(4);
        ModuleBuilder::setAuxiliary(section, true);
      },
  };
  for (uint32_t index : {0U, 2U}) {
    if (index == 2) m_Module.createNullSection(nullptr, 0);
    Section& section = *m_Module.getSection(index);
    for (const auto& fault : faults) {
      fault(section);
      expectMended(m_Module, "SHT_NULL section #" + std::to_string(index) +
                                 " does not have completely null details");
      EXPECT_TRUE(section.isAuxiliary());
      EXPECT_EQ(section.getName(), nullptr);
    }
  }
}

TEST_F(ValidateTest, TheFirstSectionIsANullSection) {
  ObjectModule module;
  Section* first = module.createSection(".text", SHT_PROGBITS, 0);
  Section* second = module.createSection(".data", SHT_PROGBITS, 0);
  expectMended(module, "Section #0 has type 1 (SHT_PROGBITS) instead of SHT_NULL");
  EXPECT_EQ(module.getSectionCount(), 3U);
  EXPECT_EQ(module.getSection(0)->getType(), SHT_NULL);
  EXPECT_EQ(first->getIndex(), 1U);
  EXPECT_EQ(second->getIndex(), 2U);
  ObjectModule strange;
  strange.createSection(".strange", 12345, 0);
  expectMended(strange, "Section #0 has type 12345 instead of SHT_NULL");
}

TEST_F(ValidateTest, AuxiliarySectionsHaveNoSymbols) {
  Section* table = m_Module.createStringTableSection(".strtab", 0);
  Section* attributes = m_Module.createBuildAttributesSection(".attributes", 0);
  makeLocal(table);
  m_Module.createHostedDynamicSymbol("y", 0, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT, attributes);
  EXPECT_THAT(validateWith(m_Module, true),
              ElementsAre("Auxiliary section #2 has at least one symbol defined in it",
                          "Auxiliary section #3 has at least one symbol defined in it"));
  ModuleBuilder::setReadConditions(m_Module, ReadCondition_HasRelocationInAuxiliarySection);
  EXPECT_THAT(validateWith(m_Module, false),
              ElementsAre("Auxiliary section #2 has at least one symbol defined in it"));
  ModuleBuilder::setReadConditions(m_Module, ReadCondition_HasSymbolInAuxiliarySection);
  expectGood(m_Module);
}

TEST_F(ValidateTest, AuxiliarySectionsHaveNoRelocations) {
  Section* attributes = m_Module.createBuildAttributesSection(".attributes", 0);
  addRelocation(attributes, 0, false);
  expectReport(m_Module, "Auxiliary section #2 has at least one relocation in it");
  ModuleBuilder::setReadConditions(m_Module, ReadCondition_HasSymbolInAuxiliarySection);
  expectReport(m_Module, "Auxiliary section #2 has at least one relocation in it");
  ModuleBuilder::setReadConditions(m_Module, ReadCondition_HasRelocationInAuxiliarySection);
  expectGood(m_Module);
}

TEST_F(ValidateTest, OffsetsOfRelocationsRepeatOnlyIfNobodyMinds) {
  Section* data = m_Module.createSection(".data", SHT_PROGBITS, SHF_ALLOC);
  for (Section* section : {m_Text, data}) {
    addRelocation(section, 4, false);
    addRelocation(section, 4, true);
    addRelocation(section, 8, false);
  }
  ModuleBuilder::setReadConditions(m_Module, ReadCondition_ChecksRepeatedRelocations);
  expectGood(m_Module);
  addRelocation(data, 8, false);
  expectReport(m_Module, "Multiple static relocations at offset 8 in section #2");
  addRelocation(m_Text, 4, true);
  addRelocation(m_Text, 4, true);
  EXPECT_THAT(validateWith(m_Module, true),
              ElementsAre("Multiple dynamic relocations at offset 4 in section #1",
                          "Multiple dynamic relocations at offset 4 in section #1",
                          "Multiple static relocations at offset 8 in section #2"));
  ModuleBuilder::setReadConditions(m_Module, ~ReadCondition_ChecksRepeatedRelocations);
  expectGood(m_Module);
}

TEST_F(ValidateTest, OffsetsRepeatWhereAnEarlierRelocationOfTheKindHasThem) {
  std::mt19937 random(1);
  ModuleBuilder::setReadConditions(m_Module, ReadCondition_ChecksRepeatedRelocations);
  for (uint32_t round = 0; round < 200; ++round) {
    m_Text->removeAllRelocations();
    std::set<std::pair<bool, uint64_t>> known;
    std::vector<std::string> expected;
    for (uint64_t i = random() % 16; i > 0; --i) {
      const bool isDynamic = random() % 2 == 0;
      const uint64_t offset = UINT64_MAX - random() % 8;
      addRelocation(m_Text, offset, isDynamic);
      if (!known.emplace(isDynamic, offset).second)
        expected.push_back(std::string("Multiple ") + (isDynamic ? "dynamic" : "static") +
                           " relocations at offset " + std::to_string(offset) + " in section #1");
    }
    EXPECT_EQ(validateWith(m_Module, true), expected);
  }
}

TEST_F(ValidateTest, AnObjectHasNoSegments) {
  m_Module.createSegment(PT_NOTE, 0, 0, 0, 0, 0, 0, 0);
  expectReport(m_Module, "Program header table is non-empty although file is not executable");
}

TEST_F(ValidateTest, AnIndexTableHasTwoFlags) {
  Section* table = m_Module.createSection(".exidx", SHT_ZEV_EXIDX, 0);
  table->setLink(m_Text);
  expectReport(m_Module, "SHT_ZEV_EXIDX section #2 should have SHF_ALLOC (2) and "
                         "SHF_LINK_ORDER (128) flags set");
  table->setFlags(SHF_ALLOC | SHF_WRITE);
  expectReport(m_Module, "SHT_ZEV_EXIDX section #2 should have SHF_LINK_ORDER (128) flag set");
  table->setFlags(SHF_LINK_ORDER);
  expectReport(m_Module, "SHT_ZEV_EXIDX section #2 should have SHF_ALLOC (2) flag set");
  table->setFlags(SHF_ALLOC | SHF_LINK_ORDER | SHF_WRITE);
  expectGood(m_Module);
}

TEST_F(ValidateTest, AnIndexTableLinksToCode) {
  const std::string text = "sh_link field of SHT_ZEV_EXIDX section #2 should point to a "
                           "SHT_PROGBITS section with SHF_ALLOC and SHF_EXECINSTR flags set";
  Section* table = m_Module.createSection(".exidx", SHT_ZEV_EXIDX, SHF_ALLOC | SHF_LINK_ORDER);
  expectReport(m_Module, text);
  table->setLink(m_Module.createSection(".bss", SHT_NOBITS, CodeFlags));
  expectReport(m_Module, text);
  table->setLink(m_Text);
  expectGood(m_Module);
  m_Text->setFlags(SHF_ALLOC);
  expectReport(m_Module, text);
  m_Text->setFlags(SHF_EXECINSTR);
  expectReport(m_Module, text);
  m_Text->setFlags(CodeFlags | SHF_WRITE);
  expectGood(m_Module);
}

TEST_F(ValidateTest, TheGroupFlagNeedsAGroup) {
  m_Text->addFlags(SHF_GROUP);
  expectMended(m_Module, "Section #1 has the SHF_GROUP flag set but is not referenced by any "
                         "SHT_GROUP section");
  EXPECT_EQ(m_Text->getFlags(), CodeFlags);
}

TEST_F(ValidateTest, AGroupNeedsTheGroupFlag) {
  makeGroup({m_Text});
  expectGood(m_Module);
  m_Text->setFlags(CodeFlags);
  expectMended(m_Module, "Section #1 is referenced by SHT_GROUP section #2 but does not have the "
                         "SHF_GROUP flag set");
  EXPECT_EQ(m_Text->getFlags(), CodeFlags | SHF_GROUP);
}

TEST_F(ValidateTest, OnlyItsGroupRefersToALocalSymbolOfAGroup) {
  Section* data = m_Module.createSection(".data", SHT_PROGBITS, SHF_ALLOC);
  Section* debug = m_Module.createSection(".debug", SHT_PROGBITS, 0);
  RelocationSection* relocations = m_Module.createRelocationSection(".rel", SHT_REL, 0);
  ModuleBuilder::setTarget(*relocations, debug, false);
  Group* group = makeGroup({m_Text, data});
  Symbol* local = makeLocal(m_Text);
  data->addRelocation(0, 2, local);
  m_Text->addRelocation(0, 2, makeLocal(debug));
  debug->addRelocation(0, 2, nullptr);
  debug->addRelocation(4, 2, m_Module.createAbsoluteSymbol("a", 0, 0, STB_LOCAL, STV_DEFAULT));
  debug->addRelocation(
      8, 2, m_Module.createHostedDynamicSymbol("d", 0, 0, STB_LOCAL, STV_DEFAULT, m_Text));
  expectGood(m_Module);
  debug->addRelocation(12, 2, local);
  // The one to a dynamic symbol is in no section; so this is the third row.
  const std::string text = "Relocation #2 in section #4 references a local symbol in section #1 "
                           "which is not in the same group as its target section #3";
  expectReport(m_Module, text);
  local->setBinding(STB_GLOBAL);
  expectGood(m_Module);
  local->setBinding(STB_LOCAL);
  group->removeMember(m_Text);
  m_Text->setFlags(CodeFlags);
  expectGood(m_Module);
}

TEST_F(ValidateTest, ALocalSymbolOfAGroupIsNoneOfAnotherGroup) {
  Section* data = m_Module.createSection(".data", SHT_PROGBITS, SHF_ALLOC);
  makeGroup({m_Text});
  makeGroup({data});
  data->addRelocation(0, 2, makeLocal(m_Text));
  expectReport(m_Module, "Relocation #0 in section #0 references a local symbol in section #1 "
                         "which is not in the same group as its target section #2");
}

TEST_F(ValidateTest, ARelocationInNoSectionIsNamedByItsPlaceAmongThoseOfItsTarget) {
  Section* data = m_Module.createSection(".data", SHT_PROGBITS, SHF_ALLOC);
  ModuleBuilder::setTarget(*m_Module.createRelocationSection(".rel", SHT_REL, 0), data, false);
  makeGroup({m_Text});
  Symbol* local = makeLocal(m_Text);
  addRelocation(data, 0, false);
  data->addRelocation(4, 2, local, 8);
  data->addRelocation(8, 2, local);
  const std::string end = " references a local symbol in section #1 which is not in the same group "
                          "as its target section #2";
  EXPECT_THAT(validateWith(m_Module, true), ElementsAre("Relocation #1 in section #0" + end,
                                                        "Relocation #1 in section #3" + end));
}

TEST_F(ValidateTest, SomeSectionsAreNotRelocated) {
  Section* note = m_Module.createSection(".note", SHT_NOTE, 0);
  RelocationSection* relocations = m_Module.createRelocationSection(".rel", SHT_REL, 0);
  ModuleBuilder::setTarget(*relocations, note, false);
  m_Module.createRelocationSection(".rel", SHT_REL, 0);
  ModuleBuilder::setRelocatable(*note, true);
  expectGood(m_Module);
  ModuleBuilder::setRelocatable(*note, false);
  const std::string end =
      " in section #3 has target section #2 which should not be relocated at all";
  // Of a section without relocations, the first row stands for all of it.
  expectReport(m_Module, "Relocation #0" + end);
  ModuleBuilder::setRelocatable(*note, true);
  addRelocation(note, 0, false);
  expectGood(m_Module);
  ModuleBuilder::setRelocatable(*note, false);
  expectReport(m_Module, "Relocation #0" + end);
  ModuleBuilder::setRelocatable(*note, true);
  addRelocation(note, 4, false);
  addRelocation(note, 4, true);
  ModuleBuilder::setRelocatable(*note, false);
  EXPECT_THAT(validateWith(m_Module, true),
              ElementsAre("Relocation #0" + end, "Relocation #1" + end));
}

TEST_F(ValidateTest, ASectionSymbolHasASection) {
  const std::string end = " has type STT_SECTION but is not defined relative to a section";
  m_Module.createAbsoluteSymbol("a", 0, STT_SECTION, STB_LOCAL, STV_DEFAULT);
  expectReport(m_Module, "Symbol #1" + end);
  m_Module.createCommonDynamicSymbol("c", 4, STT_SECTION, STB_LOCAL, STV_DEFAULT);
  EXPECT_THAT(validateWith(m_Module, true), ElementsAre("Symbol #1" + end, "Symbol #1" + end));
  m_Module.createSymbolTableSection(".symtab", SHT_SYMTAB, 0);
  m_Module.createSymbolTableSection(".dynsym", SHT_DYNSYM, 0);
  EXPECT_THAT(validateWith(m_Module, true),
              ElementsAre("Symbol #1 in symbol table section #2" + end,
                          "Symbol #1 in dynamic symbol table section #3" + end));
}

TEST_F(ValidateTest, ASectionSymbolOfAnObjectHasNoSizeOrTheSections) {
  Symbol* symbol = makeLocal(m_Text, STT_SECTION);
  expectGood(m_Module);
  symbol->setSize(16);
  expectGood(m_Module);
  for (const uint64_t size : {uint64_t{3}, uint64_t{17}, uint64_t{1} << 40}) {
    symbol->setSize(size);
    expectReport(m_Module, "Symbol #1, the STT_SECTION symbol for section #1, has size " +
                               std::to_string(size) +
                               " which should be either zero or the section's size 16");
  }
  symbol->setType(STT_OBJECT);
  expectGood(m_Module);
}

TEST_F(ValidateTest, ALocalSymbolIsDefined) {
  m_Module.createUndefinedSymbol("g", 0, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT);
  m_Module.createUndefinedSymbol("w", 0, STT_NOTYPE, STB_WEAK, STV_DEFAULT);
  m_Module.createCommonSymbol("c", 4, STT_NOTYPE, STB_LOCAL, STV_DEFAULT);
  expectGood(m_Module);
  m_Module.createUndefinedDynamicSymbol("d", 0, STT_NOTYPE, STB_LOCAL, STV_DEFAULT);
  expectReport(m_Module, "Dynamic symbol #1 has binding STB_LOCAL but is undefined");
  m_Module.createUndefinedSymbol("l", 0, STT_NOTYPE, STB_LOCAL, STV_DEFAULT);
  EXPECT_THAT(validateWith(m_Module, true),
              ElementsAre("Symbol #4 has binding STB_LOCAL but is undefined",
                          "Dynamic symbol #1 has binding STB_LOCAL but is undefined"));
}

// One fault for each check, in the order of the checks.
TEST_F(ValidateTest, ChecksHaveAnOrderAndEndAtARefusal) {
  const auto makeFaults = [](ObjectModule& module) {
    module.setFileType(ET_REL);
    ModuleBuilder::setReadConditions(module, ReadCondition_ChecksRepeatedRelocations);
    Section* text = module.createSection(".text", SHT_PROGBITS, CodeFlags | SHF_GROUP);
    module.createNullSection("null", 0);
    Section* auxiliary = module.createBuildAttributesSection(".attributes", 0);
    module.createHostedSymbol("h", 0, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT, auxiliary);
    auxiliary->addRelocation(0, R_ZEV_JUMP_SLOT, nullptr)->setDynamic();
    auxiliary->addRelocation(0, R_ZEV_JUMP_SLOT, nullptr, 4)->setDynamic();
    module.createSegment(PT_LOAD, 0, 0, 0, 0, 0, 0, 0);
    module.createSection(".exidx", SHT_ZEV_EXIDX, 0);
    Section* note = module.createSection(".note", SHT_NOTE, 0);
    module.createGroup("", nullptr, 0)->addMember(note);
    Symbol* local = module.createHostedSymbol("l", 0, STT_SECTION, STB_LOCAL, 0, note);
    local->setSize(1);
    text->addRelocation(0, 2, local);
    ModuleBuilder::setRelocatable(*note, true);
    note->addRelocation(0, 2, nullptr);
    ModuleBuilder::setRelocatable(*note, false);
    ModuleBuilder::setTarget(*module.createRelocationSection(".rel", SHT_REL, 0), note, false);
    module.createUndefinedSymbol("u", 0, STT_SECTION, STB_LOCAL, 0);
    module.createUndefinedDynamicSymbol("u", 0, STT_SECTION, STB_LOCAL, 0);
  };
  const std::vector<std::string> inOrder = {
      "Relocations in PLT and GOT include some with addends and some without",
      "SHT_NULL section #1 does not have completely null details",
      "Section #0 has type 1 (SHT_PROGBITS) instead of SHT_NULL",
      "Auxiliary section #3 has at least one symbol defined in it",
      "Auxiliary section #3 has at least one relocation in it",
      "Multiple dynamic relocations at offset 0 in section #3",
      "Program header table is non-empty although file is not executable",
      "SHT_ZEV_EXIDX section #4 should have SHF_ALLOC (2) and SHF_LINK_ORDER (128) flags set",
      "sh_link field of SHT_ZEV_EXIDX section #4 should point to a SHT_PROGBITS section with "
      "SHF_ALLOC and SHF_EXECINSTR flags set",
      "Section #1 has the SHF_GROUP flag set but is not referenced by any SHT_GROUP section",
      "Section #5 is referenced by SHT_GROUP section #0 but does not have the SHF_GROUP flag set",
      "Relocation #0 in section #0 references a local symbol in section #5 which is not in the "
      "same group as its target section #1",
      "Relocation #0 in section #6 has target section #5 which should not be relocated at all",
      "Symbol #2, the STT_SECTION symbol for section #5, has size 1 which should be either zero or "
      "the section's size 0",
      "Symbol #3 has type STT_SECTION but is not defined relative to a section",
      "Symbol #1 has type STT_SECTION but is not defined relative to a section",
      "Symbol #3 has binding STB_LOCAL but is undefined",
      "Dynamic symbol #1 has binding STB_LOCAL but is undefined",
  };
  for (size_t refused = 0; refused <= inOrder.size(); ++refused) {
    ObjectModule module;
    makeFaults(module);
    RefusingOne handler(refused);
    module.setErrorHandler(&handler);
    EXPECT_EQ(module.validate(), refused == inOrder.size());
    const size_t told = std::min(refused + 1, inOrder.size());
    EXPECT_THAT(
        handler.m_Texts,
        testing::ElementsAreArray(inOrder.begin(), inOrder.begin() + static_cast<ptrdiff_t>(told)));
  }
}

// ---- What says where a relocation stands in its file

// Sections 1 to 4: .text in a group, a note, symbols and their strings. Symbol 1 is for the group
// alone.
class ValidateRelocationsTest : public ReaderTest {
protected:
  ValidateRelocationsTest() {
    m_File.section(".text", SHT_PROGBITS).flags(CodeFlags | SHF_GROUP).zeros(16);
    m_File.section(".note", SHT_NOTE).zeros(16);
    m_File.section(".symtab", SHT_SYMTAB).link(4).symbol({.name = "x", .section = 1, .binding = 0});
    m_File.section(".strtab", SHT_STRTAB);
    m_File.section(".group", SHT_GROUP).link(3).info(1).word(GRP_COMDAT).word(1);
    m_File.section(".data", SHT_PROGBITS).zeros(16);
  }
  static constexpr uint32_t Note = 2;
  static constexpr uint32_t Data = 6;

  // The next section; each of its rows refers to symbol 1 or to none.
  void relocationSection(uint32_t target, const std::vector<uint32_t>& symbols,
                         uint32_t type = SHT_REL) {
    SectionBuilder& section = m_File.section(".rel", type).link(3).info(target);
    for (const uint32_t symbol : symbols)
      section.relocation({.symbol = symbol});
  }

  static std::string leaves(uint32_t row, uint32_t section) {
    return "Relocation #" + std::to_string(row) + " in section #" + std::to_string(section) +
           " references a local symbol in section #1 which is not in the same group as its target "
           "section #6";
  }
  static std::string isNotAllowed(uint32_t row, uint32_t section, uint32_t target = Note) {
    return "Relocation #" + std::to_string(row) + " in section #" + std::to_string(section) +
           " has target section #" + std::to_string(target) +
           " which should not be relocated at all";
  }

  ObjectBuilder m_File = object();
};

TEST_F(ValidateRelocationsTest, EachIsNamedByItsOwnSectionAndRow) {
  relocationSection(Data, {0, 1});
  relocationSection(Data, {1, 0, 1});
  relocationSection(Data, {0, 0, 1}, SHT_RELA);
  relocationSection(Data, {1}, SHT_RELA);
  const ReadResult result = readGood(m_File);
  EXPECT_THAT(validateWith(*result.module, false), ElementsAre(leaves(1, 7)));
  EXPECT_THAT(validateWith(*result.module, true),
              ElementsAre(leaves(1, 7), leaves(0, 8), leaves(2, 8), leaves(2, 9), leaves(0, 10)));
}

TEST_F(ValidateRelocationsTest, ItsRowMovesWithThoseInFrontOfIt) {
  relocationSection(Data, {0, 1});
  relocationSection(Data, {0, 1});
  const ReadResult result = readGood(m_File);
  Section* data = result.section(Data);
  data->removeRelocation(data->getRelocation(0));
  EXPECT_THAT(validateWith(*result.module, true), ElementsAre(leaves(0, 7), leaves(1, 8)));
  data->setRelocationIndex(data->getRelocation(2), 0);
  EXPECT_THAT(validateWith(*result.module, true), ElementsAre(leaves(0, 8), leaves(0, 7)));
  data->addRelocation(0, 2, result.symbol(1));
  EXPECT_THAT(validateWith(*result.module, true),
              ElementsAre(leaves(0, 8), leaves(0, 7), leaves(1, 7)));
}

TEST_F(ValidateRelocationsTest, ItIsInASectionOfItsKind) {
  relocationSection(Data, {0, 1});
  relocationSection(Data, {0, 1});
  relocationSection(Data, {0}, SHT_RELA);
  const ReadResult result = readGood(m_File);
  result.section(Data)->getRelocation(1)->setAddend(4);
  EXPECT_THAT(validateWith(*result.module, true), ElementsAre(leaves(0, 9), leaves(1, 8)));
  result.section(Data)->getRelocation(1)->clearAddend();
  EXPECT_THAT(validateWith(*result.module, true), ElementsAre(leaves(1, 7), leaves(1, 8)));
  result.module->deleteSection(result.section(7));
  EXPECT_THAT(validateWith(*result.module, true), ElementsAre(leaves(1, 7), leaves(3, 7)));
  auto* other = static_cast<RelocationSection*>(result.section(7));
  ModuleBuilder::setTarget(*other, result.section(1), false);
  EXPECT_THAT(validateWith(*result.module, true), ElementsAre(leaves(1, 0), leaves(3, 0)));
}

TEST_F(ValidateRelocationsTest, EachRowOfASectionThatIsNotRelocatedIsTold) {
  relocationSection(Note, {});
  relocationSection(Note, {0, 0});
  relocationSection(Data, {0});
  relocationSection(Note, {0}, SHT_RELA);
  relocationSection(3, {});
  const ReadResult result = readGood(m_File);
  ModuleBuilder::setReadConditions(*result.module, ReadCondition_HasRelocationInAuxiliarySection);
  const std::vector<std::string> inOrder = {isNotAllowed(0, 7), isNotAllowed(0, 8),
                                            isNotAllowed(1, 8), isNotAllowed(0, 10),
                                            isNotAllowed(0, 11, 3)};
  EXPECT_EQ(validateWith(*result.module, true), inOrder);
  for (size_t refused = 0; refused < inOrder.size(); ++refused) {
    RefusingOne handler(refused);
    result.module->setErrorHandler(&handler);
    EXPECT_FALSE(result.module->validate());
    EXPECT_EQ(handler.m_Texts.size(), refused + 1);
  }
  result.module->setErrorHandler(nullptr);
}

// ---- What counts in files whose addresses are laid out

// Read from a file, as the distances between regions come from there: .text and .data of 16 bytes
// each, .bss of 8, and .comment of 4 bytes that are not loaded.
class ValidateLinkedTest : public ReaderTest {
protected:
  static constexpr uint64_t Address = 0x8000; // of the start of the file

  static uint64_t textOffset(size_t segments) { return 52 + 32 * segments; }

  // Offsets and addresses of segments are relative to .text.
  static ObjectBuilder linked(const std::vector<SegmentSpec>& segments) {
    const uint64_t start = textOffset(segments.size());
    ObjectBuilder file = object().type(ET_EXEC);
    file.section(".text", SHT_PROGBITS).flags(CodeFlags).address(Address + start).zeros(16);
    file.section(".data", SHT_PROGBITS)
        .flags(SHF_ALLOC | SHF_WRITE)
        .address(Address + start + 16)
        .zeros(16);
    file.section(".bss", SHT_NOBITS)
        .flags(SHF_ALLOC | SHF_WRITE)
        .address(Address + start + 32)
        .size(8);
    file.section(".comment", SHT_PROGBITS).zeros(4);
    for (SegmentSpec segment : segments) {
      segment.offset += start;
      segment.vaddr += Address + start;
      file.segment(segment);
    }
    return file;
  }

  static SegmentSpec load(uint64_t offset, uint64_t size) {
    return {.offset = offset, .vaddr = offset, .filesz = size, .memsz = size, .align = 4};
  }

  // A segment of the headers or in front of them; the offset is that in the file.
  static SegmentSpec inFront(uint32_t type, uint64_t offset, uint64_t size, size_t segments) {
    const uint64_t back = offset - textOffset(segments);
    return {.type = type, .offset = back, .vaddr = back, .filesz = size, .memsz = size};
  }

  void expectReports(const ObjectBuilder& file, const std::vector<std::string>& texts) {
    const ReadResult result = readGood(file);
    const std::vector<std::string> first(texts.begin(), texts.begin() + (texts.empty() ? 0 : 1));
    EXPECT_EQ(validateWith(*result.module, false), first);
    EXPECT_EQ(validateWith(*result.module, true), texts);
  }
};

TEST_F(ValidateLinkedTest, AGoodFileHasNoReports) {
  for (const uint16_t type : std::initializer_list<uint16_t>{ET_EXEC, ET_DYN, ET_CORE}) {
    expectReports(linked({load(0, 32)}).type(type), {});
    expectReports(linked({load(0, 16), load(16, 16)}).type(type), {});
    expectReports(
        linked({inFront(PT_PHDR, 52, 96, 3), inFront(PT_INTERP, 52, 4, 3), load(0, 32)}).type(type),
        {});
  }
}

TEST_F(ValidateLinkedTest, SectionsThatAreLoadedLieInLoadableSegments) {
  expectReports(linked({load(0, 16)}),
                {"Loadable section #2 is not contained in a loadable segment",
                 "Loadable section #3 is not contained in a loadable segment"});
  expectReports(linked({load(0, 31)}),
                {"Loadable section #2 is not contained in a loadable segment",
                 "Loadable section #3 is not contained in a loadable segment"});
  SegmentSpec note = load(0, 16);
  note.type = PT_NOTE;
  expectReports(linked({note, load(16, 16)}),
                {"Loadable section #1 is not contained in a loadable segment"});
  ObjectBuilder file = linked({load(0, 32)});
  file.section(".empty", SHT_PROGBITS).flags(SHF_ALLOC);
  expectReports(file, {});
}

TEST_F(ValidateLinkedTest, OtherSectionsDoNot) {
  expectReports(linked({load(0, 16), load(16, 20)}),
                {"Non-loadable section #4 is contained in loadable segment #1"});
}

// Random segments, of which each section is held against each.
class ValidateHoldersTest : public ReaderTest {
protected:
  static std::string randomFile(uint32_t seed) {
    std::mt19937 random(seed);
    ObjectBuilder file = object().type(ET_EXEC);
    for (uint64_t i = random() % 8 + 1; i > 0; --i) {
      const uint32_t type = random() % 6 == 0 ? SHT_NOBITS : SHT_PROGBITS;
      SectionBuilder& section = file.section(".x", type).flags(random() % 2 * SHF_ALLOC);
      type == SHT_NOBITS ? section.size(random() % 3) : section.zeros(random() % 12);
    }
    const uint64_t segmentCount = random() % 8;
    const uint64_t start = 52 + 32 * segmentCount;
    for (uint64_t i = 0; i < segmentCount; ++i) {
      const uint64_t size = random() % 32;
      file.segment({.type = random() % 5 == 0 ? PT_NOTE : PT_LOAD,
                    .offset = start + random() % 24,
                    .filesz = size,
                    .memsz = size});
    }
    return file.tail(std::string(64, 'x')).bytes();
  }

  static Segment* plainHolder(const ObjectModule& module, Section& section) {
    for (Segment* segment : module.getSegments()) {
      if (segment->getType() == PT_LOAD && section.isWithin(*segment)) return segment;
    }
    return nullptr;
  }

  static std::vector<std::string> plainReports(const ObjectModule& module) {
    std::vector<std::string> outside;
    std::vector<std::string> inside;
    for (Section* section : module.getSections()) {
      const bool isLoadable = (section->getFlags() & SHF_ALLOC) != 0;
      const Segment* holder = plainHolder(module, *section);
      const std::string number = std::to_string(section->getIndex());
      if (isLoadable && section->getSize() != 0 && holder == nullptr)
        outside.push_back("Loadable section #" + number +
                          " is not contained in a loadable segment");
      if (!isLoadable && section->getFileSize() != 0 && holder != nullptr)
        inside.push_back("Non-loadable section #" + number + " is contained in loadable segment #" +
                         std::to_string(holder->getIndex()));
    }
    outside.insert(outside.end(), inside.begin(), inside.end());
    return outside;
  }
};

TEST_F(ValidateHoldersTest, ReportsAreThoseOfHoldingEachSectionAgainstEachSegment) {
  size_t reportCount = 0;
  for (uint32_t round = 0; round < 500; ++round) {
    SCOPED_TRACE("round " + std::to_string(round));
    const ReadResult result = readGood(randomFile(round));
    const std::vector<std::string> expected = plainReports(*result.module);
    std::vector<std::string> texts = validateWith(*result.module, true);
    std::erase_if(texts,
                  [](const std::string& text) { return text.find(" contained in ") == text.npos; });
    EXPECT_EQ(texts, expected);
    reportCount += expected.size();
  }
  EXPECT_GT(reportCount, 500U);
}

TEST_F(ValidateLinkedTest, LoadableSegmentsHaveOneOrderInFileAndMemory) {
  SegmentSpec text = load(0, 16);
  text.vaddr += 0x1000;
  expectReports(linked({text, load(16, 16)}), {"Loadable segments #0 appears before #1 in the file "
                                               "but after it in memory"});
  expectReports(linked({load(16, 16), text}), {"Loadable segments #1 appears before #0 in the file "
                                               "but after it in memory"});
  expectReports(linked({load(16, 16), load(0, 16)}), {});
}

TEST_F(ValidateLinkedTest, LoadableSegmentsShareNoMemory) {
  SegmentSpec text = load(0, 16);
  text.memsz = 17;
  expectReports(linked({text, load(16, 16)}), {"Loadable segments #0 and #1 overlap"});
  expectReports(linked({load(16, 16), text}), {"Loadable segments #0 and #1 overlap"});
  text.memsz = 16;
  expectReports(linked({text, load(16, 16)}), {});
}

TEST_F(ValidateLinkedTest, ALargeSegmentMayOverlapSeveral) {
  SegmentSpec text = load(0, 16);
  text.memsz = 100;
  SegmentSpec empty = load(16, 0);
  expectReports(linked({text, empty, load(16, 16)}), {"Loadable segments #0 and #2 overlap"});
  empty.memsz = 4;
  SegmentSpec data = load(16, 16);
  data.vaddr += 20;
  expectReports(linked({text, empty, data}),
                {"Loadable segments #0 and #1 overlap", "Loadable segments #0 and #2 overlap"});
}

TEST_F(ValidateLinkedTest, SectionsOfOneTreeShareNoBytes) {
  const ReadResult result = readGood(linked({load(0, 32)}));
  ModuleBuilder::adoptSize(*result.section(1), 17);
  expectReport(*result.module, "Sections #1 and #2 overlap in the file");
}

// Which two are told must not depend on how they were sorted.
TEST_F(ValidateLinkedTest, SectionsAtOnePlaceAreToldBySizeAndNumber) {
  const uint64_t start = textOffset(1);
  ObjectBuilder file = object().type(ET_EXEC);
  for (const size_t size : std::initializer_list<size_t>{0, 0, 8})
    file.section(".text", SHT_PROGBITS).flags(CodeFlags).address(Address + start).zeros(size);
  SegmentSpec segment = load(start, 8);
  segment.vaddr += Address;
  file.segment(segment);
  const ReadResult result = readGood(file);
  ModuleBuilder::adoptSize(*result.section(1), 16);
  ModuleBuilder::adoptSize(*result.section(2), 8);
  EXPECT_EQ(validateWith(*result.module, true),
            (std::vector<std::string>{"Loadable section #1 is not contained in a loadable segment",
                                      "Sections #2 and #3 overlap in the file",
                                      "Sections #1 and #2 overlap in the file"}));
}

TEST_F(ValidateLinkedTest, SectionsOfOtherTreesHideNothing) {
  const ReadResult result = readGood(linked({load(0, 32)}));
  Section* large = result.module->createSection(".large", SHT_PROGBITS, 0);
  ModuleBuilder::adoptSize(*large, 1000);
  large->setFileOffset(0);
  expectGood(*result.module);
  ModuleBuilder::adoptSize(*result.section(1), 17);
  expectReport(*result.module, "Sections #1 and #2 overlap in the file");
}

TEST_F(ValidateLinkedTest, ThereIsOneInterpreterInFrontOfWhatIsLoaded) {
  const SegmentSpec interpreter = inFront(PT_INTERP, 52, 4, 3);
  expectReports(linked({interpreter, interpreter, load(0, 32)}),
                {"Segments #0 and #1 both have type PT_INTERP"});
  expectReports(linked({load(0, 16), interpreter, load(16, 16)}),
                {"PT_LOAD segment #0 comes before PT_INTERP segment #1"});
}

TEST_F(ValidateLinkedTest, ThereIsOneHeaderTableSegmentInFrontOfWhatIsLoaded) {
  const SegmentSpec table = inFront(PT_PHDR, 52, 96, 3);
  expectReports(linked({table, table, load(0, 32)}), {"Segments #0 and #1 both have type PT_PHDR"});
  expectReports(linked({load(0, 16), table, load(16, 16)}),
                {"PT_LOAD segment #0 comes before PT_PHDR segment #1"});
}

TEST_F(ValidateLinkedTest, TheHeaderTableSegmentHoldsTheTable) {
  expectReports(linked({inFront(PT_PHDR, 52, 64, 2), load(0, 32)}), {});
  expectReports(linked({inFront(PT_PHDR, 52, 63, 2), load(0, 32)}),
                {"PT_PHDR segment #0 has size 63 bytes, smaller than the actual size of the "
                 "program header table (64)"});
}

TEST_F(ValidateLinkedTest, LoadableSegmentsAreCongruent) {
  SegmentSpec segment = load(0, 32);
  segment.vaddr += 2;
  expectReports(linked({segment}), {"Loadable segment #0's virtual address 32854 and its file "
                                    "offset 84 are not congruent modulo its alignment 4"});
  for (const uint64_t alignment : {0U, 1U, 2U}) {
    segment.align = alignment;
    expectReports(linked({segment}), {});
  }
}

TEST_F(ValidateLinkedTest, LoadableSectionsAreAligned) {
  const ReadResult result = readGood(linked({load(0, 32)}));
  result.section(1)->setAlignment(4);
  result.section(4)->setAlignment(64);
  expectGood(*result.module);
  result.section(1)->setAlignment(8);
  expectReport(*result.module,
               "Loadable section #1's virtual address 32852 is not a multiple of its alignment 8");
}

TEST_F(ValidateLinkedTest, SomethingIsLoaded) {
  ObjectBuilder file = object().type(ET_DYN);
  file.section(".comment", SHT_PROGBITS).zeros(4);
  expectReports(file, {"No loadable segments exist"});
  file.segment({.type = PT_NOTE});
  expectReports(file, {"No loadable segments exist"});
}

TEST_F(ValidateLinkedTest, HeadersThatAreLoadedHaveRoomInFrontOfTheFirstSection) {
  SegmentSpec whole = inFront(PT_LOAD, 0, textOffset(1) + 32, 1);
  expectReports(linked({whole}), {});
  const ReadResult result = readGood(linked({whole}));
  ModuleBuilder::setElfHeaderSize(*result.module, 85);
  expectReport(*result.module,
               "First loadable segment #0 has 84 bytes unmapped at the start, but 85 are needed");
  ModuleBuilder::setElfHeaderSize(*result.module, 52);
  ModuleBuilder::setProgramHeaderOffset(*result.module, 60);
  expectReport(*result.module,
               "First loadable segment #0 has 84 bytes unmapped at the start, but 92 are needed");
  ModuleBuilder::setReadConditions(*result.module, 0);
  expectGood(*result.module);
}

TEST_F(ValidateLinkedTest, ASectionSymbolIsNoLargerThanItsSection) {
  const ReadResult result = readGood(linked({load(0, 32)}));
  Symbol* symbol = result.module->createHostedSymbol(nullptr, 0, STT_SECTION, STB_LOCAL,
                                                     STV_DEFAULT, result.section(1));
  for (const uint64_t size : {0U, 3U, 16U}) {
    symbol->setSize(size);
    expectGood(*result.module);
  }
  symbol->setSize(17);
  expectReport(*result.module, "Symbol #1, a STT_SECTION symbol in section #1, has size 17 which "
                               "should be at most the section's size 16");
}

TEST_F(ValidateLinkedTest, PlacementIsCheckedInOneOrder) {
  constexpr size_t Count = 7;
  SegmentSpec text = load(0, 15);
  text.vaddr += 3;
  text.memsz = 60;
  const SegmentSpec more = load(16, 20);
  ObjectBuilder file = linked({inFront(PT_LOAD, 0, 4, Count), inFront(PT_INTERP, 52, 4, Count),
                               inFront(PT_INTERP, 52, 4, Count), inFront(PT_PHDR, 52, 8, Count),
                               inFront(PT_PHDR, 52, 8, Count), more, text});
  file.section(".lost", SHT_PROGBITS).flags(SHF_ALLOC).zeros(4);
  const ReadResult result = readGood(file);
  ModuleBuilder::adoptSize(*result.section(2), 17);
  result.section(2)->setAlignment(64);
  EXPECT_THAT(
      validateWith(*result.module, true),
      ElementsAre(
          "Loadable section #1 is not contained in a loadable segment",
          "Loadable section #5 is not contained in a loadable segment",
          "Non-loadable section #4 is contained in loadable segment #5",
          "Loadable segments #5 and #6 overlap", "Sections #2 and #4 overlap in the file",
          "Segments #1 and #2 both have type PT_INTERP",
          "Segments #3 and #4 both have type PT_PHDR",
          "PT_LOAD segment #0 comes before PT_INTERP segment #1",
          "PT_LOAD segment #0 comes before PT_PHDR segment #3",
          "PT_PHDR segment #3 has size 8 bytes, smaller than the actual size of the program "
          "header table (224)",
          "PT_PHDR segment #4 has size 8 bytes, smaller than the actual size of the program "
          "header table (224)",
          HasSubstr("Loadable segment #6's virtual address"),
          HasSubstr("Loadable section #2's virtual address"),
          "First loadable segment #0 has 4 bytes unmapped at the start, but 52 are needed"));
}

} // namespace elfext
