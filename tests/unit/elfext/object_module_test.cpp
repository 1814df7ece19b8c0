// SPDX-License-Identifier: Apache-2.0
//
// The module as a whole: what a fresh one says, its names, its header, its dynamic data; and which
// setters make the auxiliary sections stale.

#include "elfext/interface/object_module.h"

#include "elfext/interface/file_version_definition.h"
#include "elfext/interface/group.h"
#include "elfext/interface/library_search_path.h"
#include "elfext/interface/needed_library.h"
#include "elfext/interface/preemption.h"
#include "elfext/interface/segment.h"
#include "module_fixture.h"

#include <cstring>

namespace elfext {
namespace {

using ObjectModuleTest = ModuleTest;

TEST_F(ObjectModuleTest, StartsWithTheHeaderOfANewFile) {
  EXPECT_EQ(module.getMachine(), 40u);
  EXPECT_EQ(module.getElfClass(), 1u);
  EXPECT_FALSE(module.isClass64());
  EXPECT_EQ(module.getDataEncoding(), 1u);
  EXPECT_EQ(module.getLittleEndian(), 1u);
  EXPECT_TRUE(module.isLittleEndian());
  EXPECT_EQ(module.getOsAbi(), 0u);
  EXPECT_EQ(module.getAbiVersion(), 0u);
  EXPECT_EQ(module.getFileType(), 0u);
  EXPECT_EQ(module.getEntry(), 0u);
  EXPECT_EQ(module.getElfFlags(), 0u);
  EXPECT_EQ(module.getIdentVersion(), 1u);
  EXPECT_EQ(module.getElfVersion(), 1u);
  EXPECT_EQ(module.getReadConditions(), 0u);
  EXPECT_EQ(module.getElfHeaderSize(), 60u);
  EXPECT_EQ(module.getSectionHeaderOffset(), 0u);
  EXPECT_EQ(module.getProgramHeaderOffset(), 0u);
  EXPECT_EQ(module.getStoredSectionCount(), 0u);
  EXPECT_EQ(module.getStoredProgramHeaderCount(), 0u);
  EXPECT_EQ(module.getSectionHeaderEntrySize(), 40u);
  EXPECT_EQ(module.getProgramHeaderEntrySize(), 32u);
}

TEST_F(ObjectModuleTest, StartsWithoutNamesOrDynamicData) {
  EXPECT_EQ(module.getReadBuffer(), nullptr);
  EXPECT_EQ(ModuleBuilder::getImageSource(module), nullptr);
  EXPECT_EQ(module.getErrorHandler(), nullptr);
  EXPECT_EQ(module.getFileName(), nullptr);
  EXPECT_EQ(module.getObjectName(), nullptr);
  EXPECT_EQ(module.getSoname(), nullptr);
  EXPECT_FALSE(module.hasDynamicFlags());
  EXPECT_EQ(module.getFileVersionDefinition(), nullptr);
  EXPECT_TRUE(module.getDebugOverlayRecords().empty());
  for (uint32_t value = 0; value < DynamicValue_Count; ++value) {
    EXPECT_FALSE(module.hasDynamicValue(static_cast<DynamicValue>(value)));
    EXPECT_EQ(module.getDynamicValue(static_cast<DynamicValue>(value)), 0u);
  }
}

TEST_F(ObjectModuleTest, StartsEmpty) {
  EXPECT_TRUE(module.isEmpty());
  EXPECT_FALSE(module.hasDeferredContents());
  EXPECT_TRUE(module.loadDeferredContents());
  EXPECT_FALSE(module.indexesAreFrozen());
  EXPECT_FALSE(module.areAuxiliarySectionsUpToDate());
  EXPECT_TRUE(module.areSortedViewsUpToDate());
  EXPECT_EQ(module.getSectionCount(), 0u);
  EXPECT_EQ(module.getSymbolCount(), 0u);
  EXPECT_EQ(module.getDynamicSymbolCount(), 0u);
  EXPECT_EQ(module.getSegmentCount(), 0u);
  EXPECT_EQ(module.getObjectModule(), &module);
  BuildAttributes inherited;
  module.getInheritedBuildAttributes(inherited);
  EXPECT_TRUE(inherited == BuildAttributes());
}

TEST(ObjectModuleRegionsTest, AreTwoThatGoWithTheModule) {
  const alloclib::Session session;
  testing::internal::CaptureStderr();
  alloclib::setTraceLevel(1);
  { const ObjectModule module; }
  alloclib::setTraceLevel(0);
  const std::string trace = testing::internal::GetCapturedStderr();
  const size_t objects = trace.find("elfext::ObjectModule::ObjectRegion");
  const size_t containers = trace.find("elfext::ObjectModule::ContainerRegion");
  EXPECT_NE(objects, std::string::npos);
  EXPECT_NE(containers, std::string::npos);
  EXPECT_LT(objects, containers);
}

// ---- Names

TEST_F(ObjectModuleTest, CopiesItsFileName) {
  char name[] = "a.o";
  module.setFileName(name);
  EXPECT_NE(module.getFileName(), name);
  EXPECT_STREQ(module.getFileName(), "a.o");
  const char* kept = module.getFileName();
  module.setFileName("a.o");
  EXPECT_EQ(module.getFileName(), kept);
  module.setFileName("b.o");
  EXPECT_STREQ(module.getFileName(), "b.o");
  module.setFileName(nullptr);
  EXPECT_EQ(module.getFileName(), nullptr);
}

TEST_F(ObjectModuleTest, IsCalledByItsPathOrByArchiveAndMember) {
  char name[] = "dir/a.o";
  module.setObjectName(name);
  EXPECT_NE(module.getObjectName(), name);
  EXPECT_STREQ(module.getObjectName(), "dir/a.o");
  module.setObjectName("lib.a", "a.o");
  EXPECT_STREQ(module.getObjectName(), "lib.a(a.o)");
  module.setObjectName(nullptr);
  EXPECT_EQ(module.getObjectName(), nullptr);
  EXPECT_ASSERTION(module.setObjectName(nullptr, "a.o"), "archiveName != NULL");
  EXPECT_ASSERTION(module.setObjectName("lib.a", nullptr), "memberName != NULL");
}

TEST_F(ObjectModuleTest, KeepsTextsAsCopiesOrAsTheyAre) {
  const char text[] = "text";
  const auto keepText = [this](const char* name) {
    return module.createSection(name, SHT_PROGBITS, 0)->getName();
  };
  EXPECT_EQ(keepText(nullptr), nullptr);
  EXPECT_NE(keepText(text), text);
  EXPECT_STREQ(keepText(text), text);
  ModuleBuilder::setNamesInBuffer(module, true);
  EXPECT_EQ(keepText(text), text);
}

class NotedSource final : public ImageSource {
public:
  explicit NotedSource(int& ends) : m_Ends(ends) {}
  ~NotedSource() override { ++m_Ends; }
  const uint8_t* view(uint64_t, uint64_t) override { return nullptr; }
  [[nodiscard]] support::HostError getHostError() const override { return 0; }

private:
  int& m_Ends;
};

TEST_F(ObjectModuleTest, EndsItsImageWhenItIsCleared) {
  int ends = 0;
  ModuleBuilder::adoptImageSource(module, std::make_unique<NotedSource>(ends));
  EXPECT_NE(ModuleBuilder::getImageSource(module), nullptr);
  EXPECT_EQ(ends, 0);
  module.clear();
  EXPECT_EQ(ends, 1);
  EXPECT_EQ(ModuleBuilder::getImageSource(module), nullptr);
}

TEST(ObjectModuleImageTest, EndsWithTheModule) {
  const alloclib::Session session;
  int ends = 0;
  {
    ObjectModule module;
    ModuleBuilder::adoptImageSource(module, std::make_unique<NotedSource>(ends));
  }
  EXPECT_EQ(ends, 1);
}

// ---- Header

TEST_F(ObjectModuleTest, SizesItsHeadersByClass) {
  module.setElfClass(2);
  EXPECT_TRUE(module.isClass64());
  EXPECT_EQ(module.getElfHeaderSize(), 64u);
  EXPECT_EQ(module.getElfHeader().getFileSize(), 64u);
  EXPECT_EQ(module.getSectionHeaderEntrySize(), 64u);
  EXPECT_EQ(module.getSectionHeaderTable().getEntrySize(), 64u);
  EXPECT_EQ(module.getProgramHeaderEntrySize(), 56u);
  EXPECT_EQ(module.getProgramHeaderTable().getEntrySize(), 56u);
  module.setElfClass(1);
  EXPECT_FALSE(module.isClass64());
  EXPECT_EQ(module.getElfHeaderSize(), 60u);
  EXPECT_EQ(module.getSectionHeaderTable().getEntrySize(), 40u);
  EXPECT_EQ(module.getProgramHeaderTable().getEntrySize(), 32u);
  module.setElfClass(3);
  EXPECT_EQ(module.getElfHeaderSize(), 64u);
}

TEST_F(ObjectModuleTest, AlignsItsHeaderTablesByClass) {
  uint64_t remainder = 1;
  uint64_t alignment = 0;
  module.setElfClass(2);
  module.getSectionHeaderTable().getAlignment(&remainder, &alignment);
  EXPECT_EQ(remainder, 0u);
  EXPECT_EQ(alignment, 8u);
  module.getProgramHeaderTable().getAlignment(&remainder, &alignment);
  EXPECT_EQ(alignment, 8u);
  module.setElfClass(1);
  module.getSectionHeaderTable().getAlignment(&remainder, &alignment);
  EXPECT_EQ(alignment, 4u);
  module.getProgramHeaderTable().getAlignment(&remainder, &alignment);
  EXPECT_EQ(alignment, 4u);
}

TEST_F(ObjectModuleTest, LeavesTheProgramHeaderTableOfARelocatableFileAlone) {
  uint64_t remainder = 0;
  uint64_t alignment = 0;
  module.setFileType(ET_REL);
  module.setElfClass(2);
  module.getProgramHeaderTable().getAlignment(&remainder, &alignment);
  EXPECT_EQ(alignment, 4u);
  EXPECT_EQ(module.getProgramHeaderTable().getEntrySize(), 32u);
  EXPECT_EQ(module.getProgramHeaderEntrySize(), 56u);
  EXPECT_EQ(module.getSectionHeaderTable().getEntrySize(), 64u);
}

TEST_F(ObjectModuleTest, IsLittleEndianByItsEncoding) {
  for (uint32_t encoding : {0u, 2u, 3u}) {
    module.setDataEncoding(encoding);
    EXPECT_EQ(module.getDataEncoding(), encoding);
    EXPECT_EQ(module.getLittleEndian(), 0u);
  }
  module.setDataEncoding(1);
  EXPECT_EQ(module.getLittleEndian(), 1u);
  module.setLittleEndian(0);
  EXPECT_EQ(module.getDataEncoding(), 2u);
  module.setLittleEndian(1);
  EXPECT_EQ(module.getDataEncoding(), 1u);
}

TEST_F(ObjectModuleTest, MakesTheAuxiliarySectionsStaleWithEachHeaderField) {
  EXPECT_TRUE(makesStale([&] { module.setMachine(183); }));
  EXPECT_TRUE(makesStale([&] { module.setFileType(2); }));
  EXPECT_TRUE(makesStale([&] { module.setEntry(3); }));
  EXPECT_TRUE(makesStale([&] { module.setElfFlags(4); }));
  EXPECT_TRUE(makesStale([&] { module.setOsAbi(5); }));
  EXPECT_TRUE(makesStale([&] { module.setAbiVersion(6); }));
  EXPECT_TRUE(makesStale([&] { module.setIdentVersion(7); }));
  EXPECT_TRUE(makesStale([&] { module.setElfVersion(8); }));
  EXPECT_TRUE(makesStale([&] { module.setElfClass(2); }));
  EXPECT_TRUE(makesStale([&] { module.setDataEncoding(2); }));
  EXPECT_TRUE(makesStale([&] { module.setLittleEndian(1); }));
  EXPECT_EQ(module.getMachine(), 183u);
  EXPECT_EQ(module.getFileType(), 2u);
  EXPECT_EQ(module.getEntry(), 3u);
  EXPECT_EQ(module.getElfFlags(), 4u);
  EXPECT_EQ(module.getOsAbi(), 5u);
  EXPECT_EQ(module.getAbiVersion(), 6u);
  EXPECT_EQ(module.getIdentVersion(), 7u);
  EXPECT_EQ(module.getElfVersion(), 8u);
}

TEST_F(ObjectModuleTest, TakesWhatAFileSaysOfItsHeaders) {
  ModuleBuilder::setElfHeaderSize(module, 52);
  ModuleBuilder::setSectionHeaderOffset(module, uint64_t{1} << 40);
  ModuleBuilder::setProgramHeaderOffset(module, uint64_t{1} << 41);
  ModuleBuilder::setStoredSectionCount(module, 3);
  ModuleBuilder::setStoredProgramHeaderCount(module, 4);
  ModuleBuilder::setSectionHeaderEntrySize(module, 41);
  ModuleBuilder::setProgramHeaderEntrySize(module, 33);
  EXPECT_EQ(module.getElfHeaderSize(), 52u);
  EXPECT_EQ(module.getElfHeader().getFileSize(), 52u);
  EXPECT_EQ(module.getSectionHeaderOffset(), uint64_t{1} << 40);
  EXPECT_EQ(module.getProgramHeaderOffset(), uint64_t{1} << 41);
  EXPECT_EQ(module.getStoredSectionCount(), 3u);
  EXPECT_EQ(module.getStoredProgramHeaderCount(), 4u);
  EXPECT_EQ(module.getSectionHeaderTable().getEntrySize(), 41u);
  EXPECT_EQ(module.getProgramHeaderTable().getEntrySize(), 33u);
}

// ---- Dynamic data

TEST_F(ObjectModuleTest, KeepsDynamicValues) {
  module.setDynamicValue(DynamicValue_Init, 0);
  EXPECT_TRUE(module.hasDynamicValue(DynamicValue_Init));
  EXPECT_FALSE(module.hasDynamicValue(DynamicValue_Fini));
  for (uint32_t value = 0; value < DynamicValue_Count; ++value)
    module.setDynamicValue(static_cast<DynamicValue>(value), value + 1);
  for (uint32_t value = 0; value < DynamicValue_Count; ++value)
    EXPECT_EQ(module.getDynamicValue(static_cast<DynamicValue>(value)), value + 1);
}

TEST_F(ObjectModuleTest, UnitesDynamicFlags) {
  module.addDynamicFlags(0);
  EXPECT_TRUE(module.hasDynamicFlags());
  EXPECT_EQ(module.getDynamicFlags(), 0u);
  module.addDynamicFlags(DF_SYMBOLIC);
  module.addDynamicFlags(DF_BIND_NOW);
  EXPECT_EQ(module.getDynamicFlags(), DF_SYMBOLIC | DF_BIND_NOW);
}

TEST_F(ObjectModuleTest, KeepsSonameVersionAndOverlayRecords) {
  module.setSoname("lib.so.1");
  EXPECT_STREQ(module.getSoname(), "lib.so.1");
  FileVersionDefinition* version = module.createFileVersionDefinition("lib.so.1", 1, VER_FLG_BASE);
  EXPECT_TRUE(module.isEmpty());
  module.setFileVersionDefinition(version);
  EXPECT_EQ(module.getFileVersionDefinition(), version);
  EXPECT_FALSE(module.isEmpty());
  Section* section = makeSection();
  module.addDebugOverlayRecord({7, section, section});
  ASSERT_EQ(module.getDebugOverlayRecords().size(), 1u);
  EXPECT_EQ(module.getDebugOverlayRecords()[0].word, 7u);
}

// ---- Objects

TEST_F(ObjectModuleTest, IsNotEmptyWithAnyOfItsObjects) {
  makeSection();
  EXPECT_FALSE(module.isEmpty());
  module.clear();
  EXPECT_TRUE(module.isEmpty());
  module.createGroup("g", nullptr, 0);
  EXPECT_FALSE(module.isEmpty());
  module.clear();
  makeAbsolute("a");
  EXPECT_FALSE(module.isEmpty());
  module.clear();
  makeUndefinedDynamic("a");
  EXPECT_FALSE(module.isEmpty());
  module.clear();
  module.createNeededLibrary("l");
  EXPECT_FALSE(module.isEmpty());
  module.clear();
  module.createLibrarySearchPath("p", DT_RPATH);
  EXPECT_FALSE(module.isEmpty());
  module.clear();
  module.createPreemption("s", "d");
  EXPECT_FALSE(module.isEmpty());
  module.clear();
  EXPECT_TRUE(module.isEmpty());
  module.createSegment(PT_LOAD, 0, 0, 0, 0, 0, 0, 0);
  EXPECT_TRUE(module.isEmpty());
}

TEST_F(ObjectModuleTest, MakesSegmentsOfProgramHeaders) {
  const Segment* segment = module.createSegment(PT_LOAD, 1, 2, 3, 4, 5, 6, 7);
  EXPECT_EQ(segment->getType(), PT_LOAD);
  EXPECT_EQ(segment->getFileOffset(), 1u);
  EXPECT_EQ(segment->getVirtualAddress(), 2u);
  EXPECT_EQ(segment->getPhysicalAddress(), 3u);
  EXPECT_EQ(segment->getFileSize(), 4u);
  EXPECT_EQ(segment->getMemorySize(), 5u);
  EXPECT_EQ(segment->getFlags(), 6u);
  EXPECT_EQ(segment->getSegmentAlignment(), 7u);
}

TEST_F(ObjectModuleTest, MakesLibrariesPathsAndPreemptions) {
  EXPECT_STREQ(module.createNeededLibrary("lib.so")->getName(), "lib.so");
  const LibrarySearchPath* path = module.createLibrarySearchPath("/lib", DT_RUNPATH);
  EXPECT_STREQ(path->getPath(), "/lib");
  EXPECT_EQ(path->getTag(), DT_RUNPATH);
  Preemption* preemption = module.createPreemption("symbol", "new.so");
  EXPECT_STREQ(preemption->getSymbolName(), "symbol");
  EXPECT_STREQ(preemption->getPreemptingDllName(), "new.so");
  EXPECT_EQ(preemption->getPreemptedDllCount(), 0u);
  EXPECT_TRUE(makesStale([&] { preemption->addPreemptedDll("old.so"); }));
  preemption->addPreemptedDll("older.so");
  EXPECT_EQ(preemption->getPreemptedDllCount(), 2u);
  EXPECT_STREQ(preemption->getPreemptedDllName(1), "older.so");
}

TEST_F(ObjectModuleTest, WantsTexts) {
  EXPECT_ASSERTION(module.createGroup(nullptr, "", 0), "signature != NULL");
  EXPECT_ASSERTION(module.createNeededLibrary(nullptr), "name != NULL");
  EXPECT_ASSERTION(module.createLibrarySearchPath(nullptr, 0), "path != NULL");
  EXPECT_ASSERTION(module.createPreemption(nullptr, ""), "symbolName != NULL");
  EXPECT_ASSERTION(module.createPreemption("", nullptr), "preemptingDllName != NULL");
}

TEST_F(ObjectModuleTest, MakesGroupsAndKnowsTheComdatOnes) {
  module.createGroup("sig", nullptr, 0);
  EXPECT_EQ(module.findComdatGroup("sig"), nullptr);
  Group* group = module.createGroup("sig", ".group", GRP_COMDAT);
  Group* second = module.createGroup("sig", ".group", GRP_COMDAT | 2);
  EXPECT_EQ(module.findComdatGroup("sig"), group);
  EXPECT_EQ(module.findComdatGroup("other"), nullptr);
  EXPECT_STREQ(second->getSignature(), "sig");
  EXPECT_STREQ(second->getName(), ".group");
  EXPECT_EQ(second->getFlags(), 3u);
  EXPECT_TRUE(second->isComdat());
  EXPECT_EQ(second->getIndex(), 2u);
  EXPECT_EQ(second->getGroupSection(), nullptr);
  GroupSection* section = module.createGroupSection(".group", 0);
  ModuleBuilder::setGroupSection(*second, section);
  EXPECT_EQ(second->getGroupSection(), section);
  EXPECT_ASSERTION((void)module.findComdatGroup(nullptr), "signature != NULL");
}

TEST_F(ObjectModuleTest, MakesACommentSection) {
  const Section* section = module.createCommentSection("one", "two", 3, "four");
  EXPECT_EQ(section->getType(), SHT_PROGBITS);
  EXPECT_STREQ(section->getName(), ".comment");
  const std::string expected("one\0two\3four\0", 13);
  ASSERT_EQ(section->getSize(), expected.size());
  EXPECT_EQ(std::memcmp(section->getContents(), expected.data(), expected.size()), 0);
}

TEST_F(ObjectModuleTest, MakesNothingWhileIndexesAreFrozen) {
  Section* section = makeSection();
  module.setIndexesFrozen(true);
  EXPECT_TRUE(module.indexesAreFrozen());
  const char* expression = "!m_IndexesFrozen";
  EXPECT_ASSERTION(makeSection(), expression);
  EXPECT_ASSERTION(module.createStringTableSection("", 0), expression);
  EXPECT_ASSERTION(makeAbsolute("a"), expression);
  EXPECT_ASSERTION(makeHostedDynamic("a", section), expression);
  EXPECT_ASSERTION(module.createSegment(0, 0, 0, 0, 0, 0, 0, 0), expression);
  EXPECT_ASSERTION(module.createGroup("", "", 0), expression);
  EXPECT_ASSERTION(module.createNeededLibrary(""), expression);
  EXPECT_ASSERTION(module.createLibrarySearchPath("", 0), expression);
  EXPECT_ASSERTION(module.createPreemption("", ""), expression);
  EXPECT_ASSERTION(module.deleteSection(section), expression);
  EXPECT_ASSERTION(module.clear(), expression);
}

TEST_F(ObjectModuleTest, MakesTheAuxiliarySectionsStaleWithEachObject) {
  Section* section = makeSection();
  EXPECT_TRUE(makesStale([&] { makeSection(); }));
  EXPECT_TRUE(makesStale([&] { makeAbsolute("a"); }));
  EXPECT_FALSE(module.areSortedViewsUpToDate());
  EXPECT_TRUE(makesStale([&] { makeHosted("a", section); }));
  EXPECT_TRUE(makesStale([&] { module.createGroup("", "", 0); }));
  Segment* segment = nullptr;
  EXPECT_TRUE(makesStale([&] { segment = module.createSegment(0, 0, 0, 0, 0, 0, 0, 0); }));
  EXPECT_TRUE(makesStale([&] { module.createRawDataBlock(segment, 1); }));
  EXPECT_TRUE(makesStale([&] { module.createNeededLibrary(""); }));
  EXPECT_TRUE(makesStale([&] { module.createLibrarySearchPath("", 0); }));
  EXPECT_TRUE(makesStale([&] { module.createPreemption("", ""); }));
}

TEST_F(ObjectModuleTest, HostsSymbolsInItsOwnSectionsOnly) {
  ObjectModule other;
  Section* foreign = other.createSection("", SHT_PROGBITS, 0);
  EXPECT_ASSERTION(makeHosted("a", foreign), "section->m_ObjectModule == this");
  EXPECT_ASSERTION(makeHosted("a", nullptr), "section != NULL");
}

TEST_F(ObjectModuleTest, ReservesRoomWithoutMakingAnything) {
  module.reserveSections(100);
  module.reserveSymbols(100);
  module.reserveDynamicSymbols(100);
  EXPECT_EQ(module.getSectionCount(), 0u);
  EXPECT_EQ(module.getSymbolCount(), 0u);
  EXPECT_EQ(module.getDynamicSymbolCount(), 0u);
}

} // namespace
} // namespace elfext
