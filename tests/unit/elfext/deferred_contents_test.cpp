// SPDX-License-Identifier: Apache-2.0
//
// Contents that stay in a file until they are asked for, and the file that stays open for them: who
// opens it, who is the last to let it go, and what is reported when the bytes are no longer to be
// had.

#include "elfext/interface/deferred_contents.h"

#include "elfext/interface/error_string_capture.h"
#include "module_fixture.h"
#include "tests/support/memory_host.h"

#include <memory>

namespace elfext {
namespace {

class DeferredContentsTest : public ModuleTest {
protected:
  DeferredContentsTest() {
    host.addFile("a.o", "0123456789");
    module.setFileName("a.o");
    module.setObjectName("a.o");
    support::FileHandle handle;
    EXPECT_EQ(host.openForReading("a.o", handle), 0);
    file = std::make_unique<ReferenceCountedFile>(host, handle);
  }
  ~DeferredContentsTest() override { module.clear(); }

  Section* makeDeferred(uint64_t offset, uint64_t size) {
    SectionHeader header;
    header.offset = offset;
    header.size = size;
    Section* section = makeSection();
    ModuleBuilder::adoptSize(*section, size);
    ModuleBuilder::deferContents(*section, alloclib::create<DeferredContents>(
                                               module.getObjectRegion(), file.get(), true, header));
    return section;
  }

  testsupport::MemoryHost host;
  std::unique_ptr<ReferenceCountedFile> file;
};

std::string textOf(const Section& section) {
  return std::string(reinterpret_cast<const char*>(section.getContents()),
                     section.getContentsSize());
}

TEST_F(DeferredContentsTest, AreLoadedOnRequest) {
  Section* section = makeDeferred(2, 3);
  EXPECT_TRUE(section->isContentsDeferred());
  EXPECT_TRUE(module.hasDeferredContents());
  EXPECT_TRUE(section->loadDeferredContents());
  EXPECT_FALSE(section->isContentsDeferred());
  EXPECT_FALSE(module.hasDeferredContents());
  EXPECT_EQ(textOf(*section), "234");
}

TEST_F(DeferredContentsTest, AreThereAlreadyInOtherSections) {
  Section* section = makeSection({1});
  EXPECT_FALSE(section->isContentsDeferred());
  EXPECT_TRUE(section->loadDeferredContents());
}

TEST_F(DeferredContentsTest, AreLoadedForADataStore) {
  Section* section = makeDeferred(2, 3);
  DataStore* store = section->getDataStore();
  ASSERT_NE(store, nullptr);
  char bytes[3] = {};
  EXPECT_TRUE(store->read(0, bytes, 3));
  EXPECT_EQ(std::string(bytes, 3), "234");
}

TEST_F(DeferredContentsTest, AreReadFromWhereTheHeaderSaid) {
  Section* section = makeDeferred(2, 3);
  section->setFileOffset(7);
  ModuleBuilder::adoptSize(*section, 1);
  EXPECT_TRUE(section->loadDeferredContents());
  EXPECT_EQ(textOf(*section), "234");
}

TEST_F(DeferredContentsTest, AreNeitherReadNorWrittenBefore) {
  Section* section = makeDeferred(2, 4);
  char byte = 0;
  EXPECT_ASSERTION((void)section->getContents(), "!isContentsDeferred()");
  EXPECT_ASSERTION((void)section->getContentsSize(), "!isContentsDeferred()");
  EXPECT_ASSERTION((void)section->getByte(0), "!isContentsDeferred()");
  EXPECT_ASSERTION((void)section->get32(0), "!isContentsDeferred()");
  EXPECT_ASSERTION((void)section->getUnaligned32(0), "!isContentsDeferred()");
  EXPECT_ASSERTION(section->read(0, &byte, 1), "!isContentsDeferred()");
  EXPECT_ASSERTION(section->setByte(0, 0), "!isContentsDeferred()");
  EXPECT_ASSERTION(section->write(0, &byte, 1), "!isContentsDeferred()");
  EXPECT_ASSERTION(section->appendByte(0), "!isContentsDeferred()");
}

TEST_F(DeferredContentsTest, CloseTheFileWithTheLastOfThem) {
  Section* first = makeDeferred(0, 1);
  Section* second = makeDeferred(1, 1);
  EXPECT_EQ(file->getCount(), 2u);
  EXPECT_TRUE(second->loadDeferredContents());
  EXPECT_EQ(file->getCount(), 1u);
  EXPECT_TRUE(file->isOpen());
  EXPECT_TRUE(first->loadDeferredContents());
  EXPECT_FALSE(file->isOpen());
  EXPECT_EQ(host.openHandles(), 0u);
}

TEST_F(DeferredContentsTest, KeepTheFileOpenForAReaderThatHoldsIt) {
  file->addReference();
  EXPECT_TRUE(makeDeferred(0, 1)->loadDeferredContents());
  EXPECT_TRUE(file->isOpen());
  EXPECT_EQ(file->release(), 0);
  EXPECT_FALSE(file->isOpen());
}

TEST_F(DeferredContentsTest, AreLoadedAllTogether) {
  Section* first = makeDeferred(0, 1);
  makeSection({1});
  Section* second = makeDeferred(1, 2);
  EXPECT_TRUE(module.loadDeferredContents());
  EXPECT_EQ(textOf(*first), "0");
  EXPECT_EQ(textOf(*second), "12");
}

TEST_F(DeferredContentsTest, ReportAFailureAndCloseTheFile) {
  ElfextErrorStringCapture capture;
  module.setErrorHandler(&capture);
  Section* good = makeDeferred(0, 1);
  Section* bad = makeDeferred(8, 3);
  Section* never = makeDeferred(1, 1);
  EXPECT_FALSE(module.loadDeferredContents());
  EXPECT_FALSE(good->isContentsDeferred());
  EXPECT_TRUE(bad->isContentsDeferred());
  EXPECT_TRUE(never->isContentsDeferred());
  EXPECT_EQ(capture.getText(), "I/O error writing file 'a.o': Unknown error -1");
  EXPECT_FALSE(file->isOpen());
  EXPECT_EQ(host.openHandles(), 0u);
  EXPECT_EQ(bad->getDataStore(), nullptr);
}

TEST_F(DeferredContentsTest, FailQuietlyWithoutAHandler) {
  EXPECT_FALSE(makeDeferred(8, 3)->loadDeferredContents());
}

TEST_F(DeferredContentsTest, FailForMoreThanABufferHolds) {
  EXPECT_FALSE(makeDeferred(0, uint64_t{1} << 32)->loadDeferredContents());
}

class AcceptingHandler final : public ErrorHandler {
public:
  bool report(const ObjectModule&, uint32_t, const std::string&) override { return true; }
};

TEST_F(DeferredContentsTest, LeaveNothingToGoOnWithWhenTheyFail) {
  AcceptingHandler handler;
  module.setErrorHandler(&handler);
  Section* section = makeDeferred(8, 3);
  EXPECT_ASSERTION((void)section->loadDeferredContents(), "!err_response");
}

TEST_F(DeferredContentsTest, MayBeEmpty) {
  Section* section = makeDeferred(0, 0);
  EXPECT_TRUE(section->loadDeferredContents());
  EXPECT_EQ(section->getContents(), nullptr);
}

TEST_F(DeferredContentsTest, NeedAFile) {
  EXPECT_ASSERTION(DeferredContents(nullptr, true, SectionHeader()),
                   "referenceCountedFile != NULL");
}

TEST_F(DeferredContentsTest, AreNowhereElseThanInTheFile) {
  Section* section = makeSection();
  ModuleBuilder::deferContents(
      *section, alloclib::create<DeferredContents>(module.getObjectRegion(), file.get(), false,
                                                   SectionHeader()));
  EXPECT_ASSERTION((void)section->loadDeferredContents(), "false");
}

TEST_F(DeferredContentsTest, TieTheModuleToItsFileName) {
  makeDeferred(0, 1);
  module.setFileName("a.o");
  EXPECT_ASSERTION(module.setFileName("b.o"), "!hasDeferredContents()");
  EXPECT_ASSERTION(module.setLittleEndian(0), "!hasDeferredContents()");
  EXPECT_TRUE(module.loadDeferredContents());
  module.setFileName("b.o");
  EXPECT_STREQ(module.getFileName(), "b.o");
}

TEST_F(DeferredContentsTest, CloseTheFileWhenTheyAreDeleted) {
  Section* section = makeDeferred(0, 1);
  module.deleteSection(section);
  EXPECT_EQ(host.openHandles(), 0u);
}

TEST(DeferredContentsOfAModuleTest, CloseTheFileWhenTheModuleGoes) {
  const alloclib::Session session;
  testsupport::MemoryHost host;
  host.addFile("a.o", "0123456789");
  support::FileHandle handle;
  ASSERT_EQ(host.openForReading("a.o", handle), 0);
  ReferenceCountedFile file(host, handle);
  {
    ObjectModule module;
    for (int count = 0; count < 3; ++count)
      ModuleBuilder::deferContents(*module.createSection("", SHT_PROGBITS, 0),
                                   alloclib::create<DeferredContents>(
                                       module.getObjectRegion(), &file, true, SectionHeader()));
    ASSERT_TRUE(FileRegion::link(*module.getSection(0), *module.getSection(1), 4));
    EXPECT_TRUE(file.isOpen());
  }
  EXPECT_FALSE(file.isOpen());
}

} // namespace
} // namespace elfext
