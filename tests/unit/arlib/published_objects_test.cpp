// SPDX-License-Identifier: Apache-2.0
//
// What the rebuild of the symbol table makes of objects: builds of one module, members that can't
// be read, attributes, and which of the symbols then fit best. Objects come from the object
// builder; groups of builds are held against comparing each member with each, and a library made to
// be slow must not be.

#include "tests/unit/arlib/archive_fixture.h"

#include "arlib/interface/minor_variants.h"
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/error_string_capture.h"
#include "elfext/interface/object_module.h"

#include <algorithm>
#include <cstring>
#include <ctime>
#include <deque>
#include <random>
#include <unordered_set>

namespace arlib {

namespace {

using elfext::FullAttr;
using elfext::parseAttributeString;
using Names = std::vector<std::string>;

// The groups that these members form; a member is its names.
class GroupsOf {
public:
  explicit GroupsOf(const std::vector<Names>& members) {
    for (const Names& names : members) {
      SymbolNameList& list = m_Lists.emplace_back(m_Region.get());
      for (const std::string& name : names)
        list.add(std::string_view(name));
      m_Members.push_back({nullptr, 0, &list, NamesKey(list)});
    }
  }

  [[nodiscard]] std::vector<VariantGroup> find() const { return findMinorVariants(m_Members); }

private:
  alloclib::RegionOwner m_Region{alloclib::RegionGeneral::Create(1024, "names of a test")};
  std::deque<SymbolNameList> m_Lists;
  std::vector<HostingMember> m_Members;
};

std::vector<VariantGroup> groupsOf(const std::vector<Names>& members) {
  return GroupsOf(members).find();
}

// What comparing each with each gives.
std::vector<VariantGroup> groupsByComparison(std::vector<Names> members) {
  for (Names& names : members)
    std::sort(names.begin(), names.end());
  std::vector<VariantGroup> groups;
  std::vector<bool> isClaimed(members.size());
  for (uint32_t i = 0; i < members.size(); ++i) {
    VariantGroup group;
    for (uint32_t j = i; j < members.size(); ++j) {
      if (isClaimed[j] || members[j] != members[i]) continue;
      isClaimed[j] = true;
      group.push_back(j);
    }
    if (group.size() > 1) groups.push_back(group);
  }
  return groups;
}

// A name of eight bytes by which members that define nothing else would all come to the same place
// of a table that has as many places as `places` divides by.
Names nameThatHashesTo(uint64_t multiple, uint64_t places) {
  constexpr uint64_t Factor = 0x9E3779B97F4A7C15;
  uint64_t inverse = Factor; // by Newton's steps, each of which doubles the bits that are right
  for (int step = 0; step < 6; ++step)
    inverse *= 2 - Factor * inverse;
  uint64_t word = multiple * places ^ 1;
  word ^= word >> 32;
  word = word * inverse ^ sizeof word;
  std::string name(sizeof word, '\0');
  std::memcpy(name.data(), &word, sizeof word);
  return {name};
}

// As many places as the last two tables have together that so many elements take.
uint64_t placesOfTables(uint32_t elementCount) {
  std::unordered_set<uint32_t> table;
  uint64_t before = 1;
  uint64_t last = 1;
  for (uint32_t i = 0; i < elementCount; ++i) {
    table.insert(i);
    if (table.bucket_count() == last) continue;
    before = last;
    last = table.bucket_count();
  }
  return before * last;
}

using MinorVariantsTest = ArchiveTest;

struct Definition {
  std::string name;
  uint8_t binding = elfext::STB_LOCAL;
  uint16_t section = elfext::SHN_ABS;
};

std::string objectWith(const std::vector<Definition>& definitions) {
  std::vector<testsupport::SymbolSpec> symbols;
  for (const Definition& definition : definitions)
    symbols.push_back(
        {.name = definition.name, .section = definition.section, .binding = definition.binding});
  return testsupport::objectWithSymbols(symbols).bytes();
}

// Members a.o, b.o and c.o, of which the second can't be read.
class UnreadableMemberTest : public ArchiveTest {
protected:
  UnreadableMemberTest() {
    add("a.o", objectWith({{"f", elfext::STB_GLOBAL}}));
    const std::string broken = objectWith({{"g", elfext::STB_GLOBAL}});
    add("b.o", broken.substr(0, broken.size() - 1));
    add("c.o", objectWith({{"h", elfext::STB_GLOBAL}}));
  }

  // The names that the table holds.
  std::string publishedNames() {
    const std::string table = contentsOf(m_Archive, m_Archive.getSymbolTable());
    return table.substr(4 + 4 * static_cast<unsigned char>(table[3]));
  }
};

class AttributesOfMemberTest : public ArchiveTest {
protected:
  bool ask(ArchiveMember* asked, bool useObjectAttributes) {
    return ElfImageArchiveMemberType::getInstance()->getBuildAttributes(asked, m_Attributes,
                                                                        useObjectAttributes);
  }

  FullAttr m_Attributes;
};

class BestSymbolsTest : public ArchiveTest {
protected:
  // A library whose members define "f" with these attribute texts; "-" for none.
  void publish(const std::vector<std::string>& texts) {
    std::vector<ArchiveBuilder::Symbol> symbols = {{"g", "m0"}};
    for (size_t i = 0; i < texts.size(); ++i) {
      symbols.emplace_back(texts[i] == "-" ? "f" : "f$$BuildAttributes$" + texts[i],
                           "m" + std::to_string(i));
    }
    ArchiveBuilder builder = archive().symbolTable(symbols);
    for (size_t i = 0; i < texts.size(); ++i)
      builder.member("m" + std::to_string(i), object().bytes());
    read(builder);
  }

  // The members of the symbols that were found, as "m0 m1".
  std::string best(std::string_view required, std::string_view name = "f") {
    SymbolList list;
    const bool isFound = m_Archive.findBestSymbols(name, parseAttributeString(required), list);
    std::string members;
    for (uint32_t i = 0; i < list.getSize(); ++i)
      members += (i == 0 ? "" : " ") + std::string(list[i]->getDefiningMember()->getName());
    return isFound ? members : "none";
  }
};

} // namespace

TEST_F(MinorVariantsTest, HaveTheSameNamesInAnyOrder) {
  EXPECT_THAT(groupsOf({{"a", "b"}, {"b", "a"}}), ElementsAre(VariantGroup{0, 1}));
  EXPECT_THAT(groupsOf({{"a", "b"}, {"a", "c"}}), IsEmpty());
  EXPECT_THAT(groupsOf({{"a"}, {"a", "b"}}), IsEmpty());
}

TEST_F(MinorVariantsTest, HaveThemWithTheSameMultiplicities) {
  EXPECT_THAT(groupsOf({{"a", "a", "b"}, {"a", "b", "b"}}), IsEmpty());
  EXPECT_THAT(groupsOf({{"a", "a", "b"}, {"a", "b", "a"}}), ElementsAre(VariantGroup{0, 1}));
}

TEST_F(MinorVariantsTest, FormGroupsInTheOrderOfTheirFirstMembers) {
  EXPECT_THAT(groupsOf({{"x"}, {"b"}, {"a"}, {"a"}, {"b"}, {"y"}, {"b"}}),
              ElementsAre(VariantGroup{1, 4, 6}, VariantGroup{2, 3}));
}

TEST_F(MinorVariantsTest, AreWhatComparingEachWithEachFinds) {
  std::mt19937 random(20);
  for (int round = 0; round < 200; ++round) {
    std::vector<Names> members(random() % 12);
    for (Names& names : members) {
      for (uint32_t left = random() % 4; left > 0; --left)
        names.push_back(std::string(1, static_cast<char>('a' + random() % 3)));
    }
    EXPECT_EQ(groupsOf(members), groupsByComparison(members));
  }
}

TEST_F(MinorVariantsTest, AreFoundAmongManyMembersOfOneName) {
  std::vector<Names> members;
  for (int i = 0; i < 20000; ++i)
    members.push_back({"name" + std::to_string(i % 10000)});
  EXPECT_EQ(groupsOf(members).size(), 10000u);
}

// Of the processor's time, so that neighbours on it count for little.
TEST_F(MinorVariantsTest, AreFoundInLittleTimeWhateverTheirNames) {
  constexpr uint32_t Count = 60000;
  const uint64_t places = placesOfTables(Count);
  std::vector<Names> members;
  for (uint32_t i = 0; i < Count; ++i)
    members.push_back(nameThatHashesTo(i + 1, places));
  members.push_back(members.front());
  const GroupsOf hostile(members);
  const std::clock_t start = std::clock();
  EXPECT_THAT(hostile.find(), ElementsAre(VariantGroup{0, Count}));
  EXPECT_LT(std::clock() - start, CLOCKS_PER_SEC);
}

TEST_F(MinorVariantsTest, AreNotPublishedWithoutAHandlerWhereTheyCollide) {
  add("a.o", objectWith({{"f", elfext::STB_GLOBAL}}));
  add("b.o", objectWith({{"f", elfext::STB_GLOBAL}}));
  m_Archive.setErrorHandler(nullptr);
  EXPECT_FALSE(m_Archive.updateAuxiliaryMembers());
  m_Archive.setErrorHandler(&m_Handler);
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(reports(), ElementsAre("1 Minor variant group containing archive member #0 'a.o' "
                                     "includes multiple base variants"));
}

TEST_F(MinorVariantsTest, AreToldOfInTheLibrarysOwnWords) {
  add("a.o", objectWith({{"f", elfext::STB_GLOBAL}, {"BuildAttributes$$J$IEEE1"}}));
  add("b.o", objectWith({{"f", elfext::STB_GLOBAL}, {"BuildAttributes$$R:L22$IEEE1"}}));
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(reports(),
              ElementsAre("1 Member #1 'b.o' of minor variant group beginning witharchive member "
                          "#0 'a.o' includes attribute(s) with nosymbol decoration representation",
                          "1 Minor variant group containing archive member #0 'a.o' includes no "
                          "base variant"));
}

TEST_F(MinorVariantsTest, StopAtTheFirstReportThatIsAnsweredSo) {
  RecordingHandler handler(Answer::GiveUp);
  m_Archive.setErrorHandler(&handler);
  add("a.o", objectWith({{"f", elfext::STB_GLOBAL}, {"BuildAttributes$$IEEE1$STKCKD"}}));
  add("b.o", objectWith({{"f", elfext::STB_GLOBAL}, {"BuildAttributes$$IEEE1$STKCKD"}}));
  m_Archive.setLibraryAttributes(parseAttributeString("$IEEE1$~STKCKD"));
  EXPECT_FALSE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getSymbolTable(), nullptr);
  EXPECT_EQ(handler.take().size(), 1u);
}

TEST_F(MinorVariantsTest, StopWhereADifferenceThatCannotBeToldIsAnsweredSo) {
  RecordingHandler handler(Answer::GiveUp);
  m_Archive.setErrorHandler(&handler);
  add("a.o", objectWith({{"f", elfext::STB_GLOBAL}, {"BuildAttributes$$J$IEEE1"}}));
  add("b.o", objectWith({{"f", elfext::STB_GLOBAL}, {"BuildAttributes$$R:L22$IEEE1"}}));
  EXPECT_FALSE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getSymbolTable(), nullptr);
  EXPECT_THAT(
      handler.take(),
      ElementsAre("1 Member #1 'b.o' of minor variant group beginning witharchive member "
                  "#0 'a.o' includes attribute(s) with nosymbol decoration representation"));
}

// Which names the table has is told elsewhere; here, that who asks beforehand gets the same answer.
TEST_F(MinorVariantsTest, HaveADecorationUnlessTheyAreTheBase) {
  AttributeRecords records(parseAttributeString);
  const std::vector<FullAttr> builds = {parseAttributeString("$ZEV_ISAv4$IEEE1"),
                                        parseAttributeString("$ZEV_ISAv5$IEEE1")};
  const FullAttr common = computeCommonAttributes(builds);
  EXPECT_FALSE(computeDecoration(builds[0], common, records).has_value());
  const std::optional<Decoration> decoration = computeDecoration(builds[1], common, records);
  ASSERT_TRUE(decoration.has_value());
  EXPECT_EQ(decoration->text, "$ZEV_ISAv5$IEEE1");
  EXPECT_TRUE(decoration->isComplete);
}

TEST_F(MinorVariantsTest, SayWhetherADecorationCanTellAllOfTheDifference) {
  AttributeRecords records(parseAttributeString);
  const FullAttr builds[] = {parseAttributeString("$J$IEEE1"),
                             parseAttributeString("$R:L22$IEEE1")};
  const FullAttr common = computeCommonAttributes(builds);
  EXPECT_TRUE(computeDecoration(builds[0], common, records)->isComplete);
  EXPECT_FALSE(computeDecoration(builds[1], common, records)->isComplete);
}

TEST_F(MinorVariantsTest, TakeWhatTheLibraryNeedsEvenIfNoTargetHasBoth) {
  FullAttr attributes = parseAttributeString("$IEEE1$STKCKD");
  EXPECT_TRUE(addLibraryAttributes(attributes, nullptr));
  EXPECT_EQ(attributes, parseAttributeString("$IEEE1$STKCKD"));
  const FullAttr possible = parseAttributeString("$IEEE1$J");
  EXPECT_TRUE(addLibraryAttributes(attributes, &possible));
  EXPECT_EQ(elfext::printAttributeString(attributes), "$J$IEEE1$STKCKD");
  const FullAttr impossible = parseAttributeString("$IEEE1$~STKCKD");
  EXPECT_FALSE(addLibraryAttributes(attributes, &impossible));
}

TEST_F(MinorVariantsTest, MakeTheTableStaleByOtherLibraryAttributes) {
  read(archive().symbolTable({{"s", "a.o"}}).member("a.o", "no object"));
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_NE(m_Archive.getSymbolTable(), nullptr);
  m_Archive.setLibraryAttributes(parseAttributeString("$J"));
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(m_Archive.getSymbolTable(), nullptr);
}

TEST_F(MinorVariantsTest, LibraryAttributesStay) {
  read(archive().symbolTable({}).member("a.o", "text"));
  EXPECT_EQ(m_Archive.getLibraryAttributes(), nullptr);
  m_Archive.setLibraryAttributes(parseAttributeString("$J"));
  m_Archive.clear();
  ASSERT_NE(m_Archive.getLibraryAttributes(), nullptr);
  EXPECT_EQ(*m_Archive.getLibraryAttributes(), parseAttributeString("$J"));
}

TEST_F(UnreadableMemberTest, IsToldOfAndHasNoEntries) {
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(publishedNames(), std::string("f\0h\0", 4));
  EXPECT_THAT(reports(), ElementsAre("2 Unable to read symbols defined in archive member #1 'b.o': "
                                     "I/O error writing file 'b.o': Unknown error -1"));
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(reports(), IsEmpty());
}

// The host's failure is not the object's: a table without what it defines would be wrong.
TEST_F(UnreadableMemberTest, IsNoneThatTheHostCannotGive) {
  const std::string bytes = objectWith({{"g", elfext::STB_GLOBAL}});
  add("large.o", bytes + std::string(100000, 'x'));
  m_Archive.closeFiles();
  m_Host.at("large.o").isUnreadable = true;
  EXPECT_FALSE(m_Archive.updateAuxiliaryMembers());
  EXPECT_THAT(reports(), ElementsAre(testing::HasSubstr("'b.o'"),
                                     "0 I/O error reading file 'large.o': Permission denied"));
  EXPECT_EQ(m_Archive.getSymbolTable(), nullptr);
  m_Host.at("large.o").isUnreadable = false;
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(publishedNames(), std::string("f\0h\0g\0", 6));
}

TEST_F(UnreadableMemberTest, EndsTheCollectionWhereTheAnswerIsToStop) {
  RecordingHandler handler(Answer::GiveUp);
  m_Archive.setErrorHandler(&handler);
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(publishedNames(), std::string("f\0", 2));
  EXPECT_EQ(handler.take().size(), 1u);
}

TEST_F(UnreadableMemberTest, EndsTheCollectionWhereNobodyAnswers) {
  m_Archive.setErrorHandler(nullptr);
  EXPECT_TRUE(m_Archive.updateAuxiliaryMembers());
  EXPECT_EQ(publishedNames(), std::string("f\0", 2));
}

TEST_F(AttributesOfMemberTest, AreTheMergeOfItsDecorationSymbols) {
  ArchiveMember* decorated =
      add("a.o", objectWith({{"BuildAttributes$$J$IEEE1$PRES8$EABIv2"},
                             {"f$$BuildAttributes$$X$IEEE1"},
                             {"BuildAttributes$$E$IEEE1$IW$REQ8", elfext::STB_GLOBAL},
                             {"BuildAttributes$$D$IEEE1", elfext::STB_GLOBAL, 0},
                             {"BuildAttributes$$P$IEEE1", elfext::STB_LOCAL, 1}}));
  EXPECT_TRUE(ask(decorated, false));
  EXPECT_EQ(elfext::printAttributeString(m_Attributes), "$E$P$J$D$IEEE1$IW$REQ8");
}

// Texts that share their bytes a few times are all read, and those of a trap are not.
TEST_F(AttributesOfMemberTest, AreThoseOfTheFirstMegabyteOfTexts) {
  std::string text = "BuildAttributes$";
  for (int i = 0; i < 30000; ++i)
    text += "$P";
  for (const size_t count : {2U, 20U}) {
    std::vector<Definition> symbols(count, Definition{text});
    symbols.push_back({"BuildAttributes$$J"});
    EXPECT_TRUE(ask(add("a.o", objectWith(symbols)), false));
    EXPECT_EQ(m_Attributes.m_Features.contains(elfext::features::JAVA_STATE), count == 2);
  }
}

TEST_F(AttributesOfMemberTest, AreNotToldByOtherObjects) {
  EXPECT_FALSE(ask(add("a.o", objectWith({{"f"}, {"xBuildAttributes$$J"}})), false));
  ArchiveMember* broken = add("b.o", objectWith({{"BuildAttributes$$J"}}).substr(0, 100));
  EXPECT_FALSE(ask(broken, false));
  EXPECT_FALSE(ask(broken, true));
  EXPECT_THAT(reports(), IsEmpty());
}

TEST_F(AttributesOfMemberTest, AreThoseOfTheWholeObjectIfAsked) {
  EXPECT_TRUE(ask(add("a.o", objectWith({})), true));
  EXPECT_EQ(m_Attributes, elfext::DefaultFullAttr);
  EXPECT_TRUE(ask(add("b.o", objectWith({{"BuildAttributes$$J$IEEE1"}})), true));
  EXPECT_TRUE(m_Attributes.m_Features.contains(elfext::features::JAVA_STATE));
}

TEST_F(BestSymbolsTest, AreAllWhereNoneIsDecorated) {
  publish({"-", "-"});
  EXPECT_EQ(best("$IEEE1"), "m0 m1");
  EXPECT_EQ(best("$IEEE1", "g"), "m0");
  EXPECT_EQ(best("$IEEE1", "h"), "none");
}

TEST_F(BestSymbolsTest, AreThoseThatUseMostOfWhatIsThere) {
  publish({"-", "$J$IEEE1", "$E$IEEE1", "$E$J$IEEE1"});
  EXPECT_EQ(best("$IEEE1"), "m0");
  EXPECT_EQ(best("$J$IEEE1"), "m1");
  EXPECT_EQ(best("$E$J$IEEE1"), "m3");
  EXPECT_EQ(best("$E$J$X$IEEE1"), "m3");
}

TEST_F(BestSymbolsTest, AreTheFirstAmongEqualsAndAllOfItsKind) {
  publish({"$J$IEEE1", "$E$IEEE1", "$J$IEEE1", "-"});
  EXPECT_EQ(best("$E$J$IEEE1"), "m0 m2");
}

TEST_F(BestSymbolsTest, AreNoneWhereAllNeedMore) {
  publish({"$J$IEEE1", "$E$IEEE1"});
  EXPECT_EQ(best("$IEEE1"), "none");
}

TEST_F(BestSymbolsTest, CountFlagsAndAccessesToo) {
  publish({"-", "$IEEE1$IW", "$A:L22$IEEE1$IW"});
  EXPECT_EQ(best("$IEEE1$IW"), "m1");
  EXPECT_EQ(best("$A:L22$IEEE1"), "m0");
  EXPECT_EQ(best("$A:L22$IEEE1$IW"), "m2");
}

// ---- One object at a time

namespace {

class ObjectMemberTest : public ArchiveTest {
protected:
  // The names, or the reason why there are none.
  std::vector<std::string> published(ArchiveMember* member) {
    const alloclib::RegionOwner region(alloclib::RegionGeneral::Create(1024, "names of a test"));
    SymbolNameList list(region.get());
    list.add("what was there before");
    std::string reason = "an old reason";
    const auto* type = ElfImageArchiveMemberType::getInstance();
    if (!type->getSymbolNames(member, list, reason)) return {"no: " + reason};
    EXPECT_EQ(reason, "");
    std::vector<std::string> names;
    for (uint32_t i = 0; i < list.getSize(); ++i)
      names.emplace_back(list[i]);
    return names;
  }
};

} // namespace

TEST_F(ObjectMemberTest, TellsTheNamesThatTheTableShouldHold) {
  ArchiveMember* member =
      add("a.o", objectWith({{"f", elfext::STB_GLOBAL}, {"local"}, {"g", elfext::STB_WEAK}}));
  EXPECT_THAT(published(member), ElementsAre("f", "g"));
  EXPECT_THAT(published(add("b.o", objectWith({}))), IsEmpty());
}

TEST_F(ObjectMemberTest, TellsWhyAnObjectHasNoNames) {
  EXPECT_THAT(published(add("a.o", object().machine(3).bytes())),
              ElementsAre("no: ELF file has unsupported machine code 3 (we only handle EM_ZEV = "
                          "40)"));
  ArchiveMember* inMemory = m_Archive.addMember("b.o", 0, 0, 0, 0);
  inMemory->setContents("x", 1);
  m_Host.setRoom(0);
  EXPECT_THAT(published(inMemory), ElementsAre("no: "));
  EXPECT_EQ(reports().size(), 1u);
}

TEST_F(ObjectMemberTest, HasNoReasonOfItsOwnWhereTheHostFails) {
  ArchiveMember* member = add("a.o", objectWith({}) + std::string(100000, 'x'));
  m_Archive.closeFiles();
  m_Host.at("a.o").isUnreadable = true;
  EXPECT_THAT(published(member), ElementsAre("no: "));
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'a.o': Permission denied"));
}

TEST_F(ObjectMemberTest, MakesAModuleOfItsObject) {
  ArchiveMember* member = add("a.o", objectWith({{"f", elfext::STB_GLOBAL}}));
  const std::unique_ptr<elfext::ObjectModule> module = member->createObjectModule(nullptr);
  ASSERT_NE(module, nullptr);
  EXPECT_STREQ(module->getSymbol(1)->getName(), "f");
  EXPECT_EQ(module->getErrorHandler(), nullptr);
  EXPECT_EQ(add("b.o", "no object")->createObjectModule(nullptr), nullptr);
  EXPECT_THAT(reports(), IsEmpty());
}

TEST_F(ObjectMemberTest, MakesAModuleOfAnObjectInMemory) {
  const std::string bytes = objectWith({{"f", elfext::STB_GLOBAL}});
  ArchiveMember* member = m_Archive.addMember("a.o", 0, 0, 0, 0);
  member->setContents(bytes.data(), static_cast<uint32_t>(bytes.size()));
  EXPECT_NE(member->createObjectModule(nullptr), nullptr);
  EXPECT_TRUE(member->getContentsLocation()->isTemporary);
  m_Host.setRoom(0);
  ArchiveMember* unflushable = m_Archive.addMember("b.o", 0, 0, 0, 0);
  unflushable->setContents("x", 1);
  EXPECT_EQ(unflushable->createObjectModule(nullptr), nullptr);
}

TEST_F(ObjectMemberTest, ReadsIntoAModuleThatReportsForItself) {
  elfext::ElfextErrorStringCapture capture;
  elfext::ObjectModule module;
  module.setErrorHandler(&capture);
  EXPECT_FALSE(add("a.o", object().machine(3).bytes())->readObjectModule(module, nullptr));
  EXPECT_THAT(std::string(capture.getText()), testing::HasSubstr("unsupported machine code 3"));
}

} // namespace arlib
