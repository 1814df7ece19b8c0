// SPDX-License-Identifier: Apache-2.0
//
// The five ways to an object's bytes: what each reads, when, who closes the file, and what is
// reported when the host fails.
//
// Hosts in memory count what is open and read; a faulty one fails each call in turn.

#include "elfext/interface/deferred_contents_selector.h"
#include "elfext/interface/preemption.h"
#include "elfext/interface/raw_data_block.h"
#include "tests/support/bytes.h"
#include "tests/support/faulty_host.h"
#include "tests/support/reader_fixture.h"

#include <algorithm>
#include <cerrno>
#include <optional>

namespace elfext {

namespace {

constexpr uint64_t LargestEagerFile = 0x100000;

enum class Way { WholeFile, PartOfFile, Memory, OpenFile, PartOfOpenFile };

constexpr Way AllWays[] = {Way::WholeFile, Way::PartOfFile, Way::Memory, Way::OpenFile,
                           Way::PartOfOpenFile};

std::string wayName(const testing::TestParamInfo<Way>& info) {
  const char* names[] = {"WholeFile", "PartOfFile", "Memory", "OpenFile", "PartOfOpenFile"};
  return names[static_cast<size_t>(info.param)];
}

bool isOpenedByCaller(Way way) {
  return way == Way::OpenFile || way == Way::PartOfOpenFile;
}

bool isFileOpened(Way way) {
  return way == Way::WholeFile || way == Way::PartOfFile;
}

// Remembers what it is asked about, and defers what it is told to.
class ListedSelector final : public DeferredContentsSelector {
public:
  explicit ListedSelector(std::vector<uint32_t> deferred = {}) : m_Deferred(std::move(deferred)) {}

  bool isDeferred(const Section& section, uint64_t size) override {
    m_Asked.push_back(section.getIndex());
    m_Sizes.push_back(size);
    return std::find(m_Deferred.begin(), m_Deferred.end(), section.getIndex()) != m_Deferred.end();
  }

  std::vector<uint32_t> m_Asked;
  std::vector<uint64_t> m_Sizes;

private:
  std::vector<uint32_t> m_Deferred;
};

std::string textOf(const Section& section) {
  return std::string(reinterpret_cast<const char*>(section.getContents()),
                     section.getContentsSize());
}

constexpr uint32_t Text = 1;
constexpr uint32_t Data = 2;
constexpr uint32_t Padding = 5;

// Code, data and a symbol; with `padding`, also a section of so many bytes.
ObjectBuilder sample(size_t padding = 0) {
  ObjectBuilder file = object();
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).bytes("code");
  file.section(".data", SHT_PROGBITS).flags(SHF_ALLOC | SHF_WRITE).bytes("data");
  file.section(".symtab", SHT_SYMTAB).link(4).symbol({.name = "main", .section = Text});
  file.section(".strtab", SHT_STRTAB);
  file.section(".padding", SHT_PROGBITS).zeros(padding);
  return file;
}

ObjectBuilder largeSample() {
  return sample(LargestEagerFile);
}

// One of each table, so far from each other that each is read by itself.
ObjectBuilder tablesApart(uint16_t type) {
  constexpr size_t Apart = 0x20000;
  ObjectBuilder file = object().type(type);
  const auto table = [&file](const char* name, uint32_t kind) -> SectionBuilder& {
    file.section("gap", SHT_PROGBITS).zeros(Apart);
    return file.section(name, kind);
  };
  // The tables have the even numbers.
  table(".symtab", SHT_SYMTAB).link(4).symbol({.name = "main", .section = 1});
  table(".strtab", SHT_STRTAB);
  table(".shndx", SHT_SYMTAB_SHNDX).link(2).word(0).word(0);
  table(".rel", SHT_REL).link(2).info(1).relocation({});
  table(".note", SHT_NOTE).note("v", 1, {1});
  table(".group", SHT_GROUP).link(2).info(1).word(1).word(14);
  table(".member", SHT_PROGBITS).flags(SHF_GROUP).zeros(4);
  table(".dynstr", SHT_STRTAB);
  table(".dynsym", SHT_DYNSYM).link(16).symbol({.name = "shown", .section = 1});
  table(".dynamic", SHT_DYNAMIC).link(16).dynamic(DT_VERDEFNUM, 1).dynamic(DT_NULL, 0);
  table(".versym", SHT_GNU_versym).link(18).half(0).half(1);
  table(".verdef", SHT_GNU_verdef).link(16).zeros(20);
  table("end", SHT_PROGBITS);
  return file;
}

} // namespace

class ReadElfFileTest : public ReaderTest {
protected:
  // The object alone in "a.o", and among other bytes in "lib.a".
  void put(const std::string& bytes) {
    m_Bytes = bytes;
    m_Host.addFile("a.o", bytes);
    m_Host.addFile("lib.a", "<<" + bytes + ">>");
  }
  void put(const ObjectBuilder& file) { put(file.bytes()); }

  // The file is opened behind the faulty host's back.
  bool readBy(Way way, DeferredContentsSelector* selector = nullptr) {
    switch (way) {
    case Way::WholeFile:
      return readElfFile(m_Faulty, "a.o", *m_Module, selector);
    case Way::PartOfFile:
      return readElfFile(m_Faulty, "lib.a", 2, m_Bytes.size(), *m_Module, selector);
    case Way::Memory:
      return readElfFile(m_Faulty, "a.o", lentBytes(), *m_Module, selector);
    case Way::OpenFile:
      return readElfFile(m_Faulty, open("a.o"), *m_Module, selector);
    case Way::PartOfOpenFile:
      break;
    }
    return readElfFile(m_Faulty, open("lib.a"), 2, m_Bytes.size(), *m_Module, selector);
  }

  std::span<const uint8_t> lentBytes() const { return testsupport::bytesOf(m_Bytes); }

  support::FileHandle open(const char* name) {
    support::FileHandle handle;
    EXPECT_EQ(m_Host.openForReading(name, handle), 0);
    return handle;
  }

  void makeModule() {
    m_Module.emplace();
    m_Module->setObjectName("a.o");
    m_Module->setErrorHandler(&m_Reports);
  }

  // Each call of the read fails in turn, until one read meets no failure.
  void expectEachFailureReported(Way way, DeferredContentsSelector* selector) {
    for (uint64_t call = 1;; ++call) {
      m_Reports.m_Texts.clear();
      makeModule();
      m_Faulty.failCall(call, EIO);
      const size_t handlesBefore = m_Host.openHandles();
      const bool isRead = readBy(way, selector);
      if (m_Faulty.getFailedOperation().empty()) {
        EXPECT_TRUE(isRead);
        EXPECT_GT(call, way == Way::Memory ? 0U : 1U);
        m_Faulty.failCall(0, 0);
        return;
      }
      SCOPED_TRACE(m_Faulty.getFailedOperation() + " as call " + std::to_string(call));
      EXPECT_FALSE(isRead);
      EXPECT_THAT(m_Reports.m_Texts,
                  ElementsAre("I/O error reading file 'a.o': Input/output error"));
      EXPECT_TRUE(m_Module->isEmpty());
      EXPECT_EQ(m_Host.openHandles(), handlesBefore + (isOpenedByCaller(way) ? 1 : 0));
    }
  }

  ReadElfFileTest() { makeModule(); }

  std::string m_Bytes;
  testsupport::FaultyHost m_Faulty{m_Host};
  RecordingReports m_Reports{false};
  std::optional<ObjectModule> m_Module;
};

class ReadElfFileInEachWayTest : public ReadElfFileTest, public testing::WithParamInterface<Way> {};

INSTANTIATE_TEST_SUITE_P(Ways, ReadElfFileInEachWayTest, testing::ValuesIn(AllWays), wayName);

TEST_P(ReadElfFileInEachWayTest, FillsTheModule) {
  put(sample());
  ASSERT_TRUE(readBy(GetParam()));
  EXPECT_THAT(m_Reports.m_Texts, IsEmpty());
  EXPECT_EQ(m_Module->getSectionCount(), 7U);
  EXPECT_STREQ(m_Module->getSection(Text)->getName(), ".text");
  EXPECT_EQ(textOf(*m_Module->getSection(Text)), "code");
  EXPECT_STREQ(m_Module->getSymbol(1)->getName(), "main");
}

TEST_P(ReadElfFileInEachWayTest, LeavesNoFileOfItsOwnOpenForASmallObject) {
  put(sample());
  ASSERT_TRUE(readBy(GetParam()));
  EXPECT_EQ(m_Host.openHandles(), isOpenedByCaller(GetParam()) ? 1U : 0U);
}

TEST_P(ReadElfFileInEachWayTest, LooksForTheContentsOfALargeObjectWhenTheyAreWanted) {
  put(largeSample());
  ASSERT_TRUE(readBy(GetParam()));
  if (!isOpenedByCaller(GetParam())) {
    EXPECT_LT(m_Host.getBytesRead(), LargestEagerFile / 2);
  }
  EXPECT_EQ(m_Host.openHandles(), GetParam() == Way::Memory ? 0U : 1U);
  EXPECT_FALSE(m_Module->hasDeferredContents());
  EXPECT_EQ(textOf(*m_Module->getSection(Data)), "data");
  m_Module.reset();
  EXPECT_EQ(m_Host.openHandles(), isOpenedByCaller(GetParam()) ? 1U : 0U);
}

TEST_P(ReadElfFileInEachWayTest, ReportsEachFailureOfTheHostWithASmallObject) {
  put(sample());
  expectEachFailureReported(GetParam(), nullptr);
}

TEST_P(ReadElfFileInEachWayTest, ReportsEachFailureOfTheHostWithALargeObject) {
  put(largeSample());
  expectEachFailureReported(GetParam(), nullptr);
}

TEST_P(ReadElfFileInEachWayTest, ReportsEachFailureOfTheHostWhereTablesLieApart) {
  for (const uint16_t type : std::initializer_list<uint16_t>{ET_REL, ET_DYN}) {
    put(tablesApart(type));
    expectEachFailureReported(GetParam(), nullptr);
  }
}

TEST_P(ReadElfFileInEachWayTest, ReportsEachFailureOfTheHostWithDeferredContents) {
  put(largeSample());
  ListedSelector selector({Text});
  expectEachFailureReported(GetParam(), &selector);
}

TEST_P(ReadElfFileInEachWayTest, FailsQuietlyWithoutAHandler) {
  put("no object, but sixteen bytes and more");
  m_Module->setErrorHandler(nullptr);
  EXPECT_FALSE(readBy(GetParam()));
  EXPECT_TRUE(m_Module->isEmpty());
}

TEST_P(ReadElfFileInEachWayTest, EmptiesTheModuleWhenItFails) {
  put(sample());
  ASSERT_TRUE(readBy(GetParam()));
  put("too short");
  EXPECT_FALSE(readBy(GetParam()));
  EXPECT_TRUE(m_Module->isEmpty());
  EXPECT_EQ(m_Module->getReadBuffer(), nullptr);
  EXPECT_THAT(m_Reports.m_Texts, ElementsAre(Truncated));
}

TEST_P(ReadElfFileInEachWayTest, TakesAnEmptyObjectForATruncatedOne) {
  put("");
  if (GetParam() == Way::Memory) m_Bytes.reserve(1);
  EXPECT_FALSE(readBy(GetParam()));
  EXPECT_THAT(m_Reports.m_Texts, ElementsAre(Truncated));
}

TEST_P(ReadElfFileInEachWayTest, TakesTheBytesThatAreThereForTheWholeObject) {
  const std::string bytes = sample().bytes();
  put(bytes.substr(0, bytes.size() - 1));
  EXPECT_FALSE(readBy(GetParam()));
  EXPECT_THAT(m_Reports.m_Texts, ElementsAre(Truncated));
}

// The name of a module can't change while contents are in the file of the old one.
TEST_P(ReadElfFileInEachWayTest, TakesThePlaceOfContentsThatAreStillInAFile) {
  put(largeSample());
  m_Host.addFile("before.o", m_Bytes);
  for (const bool isNamed : {false, true}) {
    const size_t handlesBefore = m_Host.openHandles();
    ListedSelector selector({Text});
    ASSERT_TRUE(isNamed ? readElfFile(m_Faulty, "before.o", *m_Module, &selector)
                        : readElfFile(m_Faulty, open("before.o"), *m_Module, &selector));
    ASSERT_TRUE(m_Module->hasDeferredContents());
    put(sample());
    ASSERT_TRUE(readBy(GetParam()));
    EXPECT_THAT(m_Reports.m_Texts, IsEmpty());
    EXPECT_EQ(textOf(*m_Module->getSection(Text)), "code");
    EXPECT_EQ(m_Host.openHandles(), handlesBefore + (isOpenedByCaller(GetParam()) ? 1 : 0));
  }
}

TEST_P(ReadElfFileInEachWayTest, MayBeGivenANameThatIsTheModulesOwn) {
  if (isOpenedByCaller(GetParam())) return;
  ObjectBuilder file = sample();
  file.section("a.o", SHT_PROGBITS);
  file.section("lib.a", SHT_PROGBITS);
  put(file);
  ASSERT_TRUE(readBy(GetParam()));
  const char* name = m_Module->getSection(GetParam() == Way::PartOfFile ? 7 : 6)->getName();
  if (GetParam() == Way::WholeFile)
    EXPECT_TRUE(readElfFile(m_Faulty, name, *m_Module, nullptr));
  else if (GetParam() == Way::PartOfFile)
    EXPECT_TRUE(readElfFile(m_Faulty, name, 2, m_Bytes.size(), *m_Module, nullptr));
  else
    EXPECT_TRUE(readElfFile(m_Faulty, name, lentBytes(), *m_Module, nullptr));
  EXPECT_STREQ(m_Module->getFileName(), GetParam() == Way::PartOfFile ? nullptr : "a.o");
}

TEST_P(ReadElfFileInEachWayTest, MaySkipABadMachineAndHoldsNothingThen) {
  put(largeSample().machine(3));
  RecordingReports agreeing(true);
  m_Module->setErrorHandler(&agreeing);
  ListedSelector selector({Text});
  EXPECT_TRUE(readBy(GetParam(), &selector));
  EXPECT_TRUE(m_Module->isEmpty());
  EXPECT_EQ(m_Host.openHandles(), isOpenedByCaller(GetParam()) ? 1U : 0U);
}

TEST_P(ReadElfFileInEachWayTest, ReportsAFileThatHasShrunk) {
  if (GetParam() == Way::Memory) return;
  for (const ObjectBuilder& file : {sample(), largeSample()}) {
    put(file);
    for (const char* name : {"a.o", "lib.a"}) {
      MemoryHost::File& shrunk = m_Host.at(name);
      shrunk.toldSize = static_cast<int64_t>(shrunk.bytes.size());
      shrunk.bytes.resize(100);
    }
    m_Reports.m_Texts.clear();
    EXPECT_FALSE(readBy(GetParam()));
    EXPECT_THAT(m_Reports.m_Texts, ElementsAre("I/O error reading file 'a.o'"));
  }
}

TEST_P(ReadElfFileInEachWayTest, ReportsASizeForWhichThereIsNoMemory) {
  if (GetParam() == Way::Memory) return;
  constexpr uint64_t Size = uint64_t{1} << 60;
  put(sample());
  m_Host.at("a.o").toldSize = int64_t{Size};
  m_Host.at("lib.a").toldSize = int64_t{Size} + 2;
  if (GetParam() == Way::PartOfFile)
    EXPECT_FALSE(readElfFile(m_Host, "lib.a", 2, Size, *m_Module, nullptr));
  else if (GetParam() == Way::PartOfOpenFile)
    EXPECT_FALSE(readElfFile(m_Host, open("lib.a"), 2, Size, *m_Module, nullptr));
  else
    EXPECT_FALSE(readBy(GetParam()));
  EXPECT_THAT(m_Reports.m_Texts, ElementsAre("Out of memory"));
  EXPECT_EQ(m_Host.openHandles(), isOpenedByCaller(GetParam()) ? 1U : 0U);
}

// The end of the range is in no section, so that nobody would look at it.
TEST_P(ReadElfFileInEachWayTest, ReportsARangeThatTheFileDoesNotHave) {
  for (const ObjectBuilder& file : {sample(), largeSample()}) {
    const std::string bytes = file.bytes();
    put(bytes);
    m_Bytes += "more than there is";
    m_Reports.m_Texts.clear();
    if (GetParam() != Way::PartOfFile && GetParam() != Way::PartOfOpenFile) continue;
    EXPECT_FALSE(readBy(GetParam()));
    EXPECT_THAT(m_Reports.m_Texts, ElementsAre("I/O error reading file 'a.o'"));
    EXPECT_TRUE(m_Module->isEmpty());
  }
}

// Of a file that the module has opened itself, the contents that it has not looked at may be lost
// later. It says so then, and nothing looks like data.
TEST_F(ReadElfFileTest, ContentsThatAreLostLaterAreReported) {
  for (const Way way : {Way::WholeFile, Way::PartOfFile}) {
    makeModule();
    m_Reports.m_Texts.clear();
    put(largeSample());
    ASSERT_TRUE(readBy(way));
    for (const char* name : {"a.o", "lib.a"})
      m_Host.at(name).bytes.resize(50);
    EXPECT_EQ(m_Module->getSection(Padding)->getContents(), nullptr);
    EXPECT_TRUE(m_Module->hasLostContents());
    EXPECT_THAT(m_Reports.m_Texts, ElementsAre("I/O error reading file 'a.o'"));
    m_Module->clear();
    EXPECT_FALSE(m_Module->hasLostContents());
  }
}

// A caller's file is the caller's to close, and to overwrite, when the read is over.
TEST_F(ReadElfFileTest, ACallersFileIsNotNeededAfterwards) {
  put(largeSample());
  for (const Way way : {Way::OpenFile, Way::PartOfOpenFile}) {
    makeModule();
    const char* name = way == Way::OpenFile ? "a.o" : "lib.a";
    const support::FileHandle file = open(name);
    const bool isRead = way == Way::OpenFile
                            ? readElfFile(m_Host, file, *m_Module, nullptr)
                            : readElfFile(m_Host, file, 2, m_Bytes.size(), *m_Module, nullptr);
    ASSERT_TRUE(isRead);
    ASSERT_EQ(m_Host.close(file), 0);
    m_Host.at(name).bytes.assign(m_Bytes.size() + 4, 'x');
    EXPECT_EQ(textOf(*m_Module->getSection(Text)), "code");
    EXPECT_EQ(textOf(*m_Module->getSection(Data)), "data");
    EXPECT_THAT(m_Reports.m_Texts, IsEmpty());
  }
}

TEST_F(ReadElfFileTest, AFileMayBeSharedWithOthers) {
  put(largeSample());
  support::SourceFiles files(m_Host);
  std::shared_ptr<support::SourceFile> file;
  ASSERT_EQ(files.open("lib.a", file), 0);
  ASSERT_TRUE(readElfFile(file, 2, m_Bytes.size(), *m_Module, nullptr));
  // Another file of that name is none of the module's business.
  m_Host.addFile("lib.a", "another");
  EXPECT_EQ(textOf(*m_Module->getSection(Text)), "code");
  file.reset();
  EXPECT_EQ(m_Host.openHandles(), 1U);
  EXPECT_EQ(textOf(*m_Module->getSection(Data)), "data");
  m_Module.reset();
  EXPECT_EQ(m_Host.openHandles(), 0U);
}

TEST_P(ReadElfFileInEachWayTest, NamesTheModuleAfterAWholeFileOnly) {
  put(sample());
  ASSERT_TRUE(readBy(GetParam()));
  if (GetParam() == Way::WholeFile || GetParam() == Way::Memory)
    EXPECT_STREQ(m_Module->getFileName(), "a.o");
  else
    EXPECT_EQ(m_Module->getFileName(), nullptr);
  EXPECT_STREQ(m_Module->getObjectName(), "a.o");
}

TEST_P(ReadElfFileInEachWayTest, ReportsAFileThatCannotBeOpened) {
  if (!isFileOpened(GetParam())) return;
  EXPECT_FALSE(readBy(GetParam()));
  put(sample());
  m_Host.at("a.o").isUnreadable = true;
  m_Host.at("lib.a").isUnreadable = true;
  EXPECT_FALSE(readBy(GetParam()));
  EXPECT_THAT(m_Reports.m_Texts,
              ElementsAre("I/O error reading file 'a.o': No such file or directory",
                          "I/O error reading file 'a.o': Permission denied"));
}

TEST_P(ReadElfFileInEachWayTest, EmptiesTheModuleWhenTheFileCannotBeOpened) {
  if (!isFileOpened(GetParam())) return;
  put(sample());
  ASSERT_TRUE(readBy(GetParam()));
  ASSERT_EQ(m_Host.remove("a.o"), 0);
  ASSERT_EQ(m_Host.remove("lib.a"), 0);
  EXPECT_FALSE(readBy(GetParam()));
  EXPECT_TRUE(m_Module->isEmpty());
}

TEST_F(ReadElfFileTest, ADirectoryIsNoObject) {
  m_Host.addDirectory("dir");
  m_Host.at("dir").toldSize = 4096;
  EXPECT_FALSE(readElfFile(m_Host, "dir", *m_Module, nullptr));
  EXPECT_THAT(m_Reports.m_Texts, ElementsAre("I/O error reading file 'a.o': Is a directory"));
  EXPECT_EQ(m_Host.openHandles(), 0U);
}

TEST_F(ReadElfFileTest, EachFormNeedsWhatItReads) {
  const uint8_t byte = 0;
  const auto name = static_cast<const char*>(nullptr);
  const auto read = [](bool) {};
  EXPECT_DEATH(read(readElfFile(m_Host, name, *m_Module, nullptr)), "fileName != NULL");
  EXPECT_DEATH(read(readElfFile(m_Host, name, 0, 1, *m_Module, nullptr)), "fileName != NULL");
  EXPECT_DEATH(read(readElfFile(m_Host, name, std::span(&byte, 1), *m_Module, nullptr)),
               "fileName != NULL");
  EXPECT_DEATH(read(readElfFile(m_Host, "a.o", std::span<const uint8_t>(), *m_Module, nullptr)),
               "fileName != NULL && readBuffer != NULL");
  const support::FileHandle closed;
  EXPECT_DEATH(read(readElfFile(m_Host, closed, *m_Module, nullptr)), "elfFile != NULL");
  EXPECT_DEATH(read(readElfFile(m_Host, closed, 0, 1, *m_Module, nullptr)), "elfFile != NULL");
}

// ---- Memory that is lent

TEST_F(ReadElfFileTest, NothingOfLentMemoryIsCopied) {
  const ObjectBuilder file = sample();
  put(file);
  ASSERT_TRUE(readBy(Way::Memory));
  EXPECT_EQ(m_Faulty.getCallCount(), 0U);
  const uint8_t* lent = lentBytes().data();
  EXPECT_EQ(m_Module->getReadBuffer(), lent);
  EXPECT_EQ(m_Module->getSection(Text)->getContents(), lent + file.offsetOf(Text));
  for (const char* name :
       {m_Module->getSection(Text)->getName(), m_Module->getSymbol(1)->getName()}) {
    const auto* place = reinterpret_cast<const uint8_t*>(name);
    EXPECT_TRUE(place >= lent && place < lent + m_Bytes.size()) << name;
  }
}

TEST_F(ReadElfFileTest, LentMemoryIsNeverWrittenTo) {
  put(sample());
  const std::string before = m_Bytes;
  ASSERT_TRUE(readBy(Way::Memory));
  m_Module->getSection(Text)->setByte(0, 'C');
  EXPECT_EQ(textOf(*m_Module->getSection(Text)), "Code");
  EXPECT_EQ(m_Bytes, before);
}

TEST_F(ReadElfFileTest, NamesThatAreGivenLaterAreCopiedAllTheSame) {
  put(sample());
  ASSERT_TRUE(readBy(Way::Memory));
  std::string name = "later";
  m_Module->getSymbol(1)->setName(name.c_str());
  m_Module->getSection(Text)->setName(name.c_str());
  name = "reused";
  EXPECT_STREQ(m_Module->getSymbol(1)->getName(), "later");
  EXPECT_STREQ(m_Module->getSection(Text)->getName(), "later");
}

TEST_P(ReadElfFileInEachWayTest, StringsAreCopiesUnlessTheMemoryIsLent) {
  ObjectBuilder file = sample();
  file.type(ET_EXEC).segment({.type = PT_NOTE});
  put(file);
  ASSERT_TRUE(readBy(GetParam()));
  const uint32_t copied = m_Module->getReadConditions() & ReadCondition_HasCopiedStrings;
  EXPECT_EQ(copied, GetParam() == Way::Memory ? 0U : ReadCondition_HasCopiedStrings);
}

// ---- Contents that stay in the file

class ReadDeferredTest : public ReadElfFileTest {
protected:
  // The indexes of the sections that are deferred now.
  std::vector<uint32_t> deferredSections() const {
    std::vector<uint32_t> sections;
    for (const Section* section : m_Module->getSections())
      if (section->isContentsDeferred()) sections.push_back(section->getIndex());
    return sections;
  }
};

TEST_F(ReadDeferredTest, TheSelectorDecides) {
  put(largeSample());
  ListedSelector selector({Data});
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  EXPECT_THAT(selector.m_Asked, ElementsAre(1, 2, 5));
  EXPECT_THAT(selector.m_Sizes, ElementsAre(4, 4, LargestEagerFile));
  EXPECT_THAT(deferredSections(), ElementsAre(Data));
  EXPECT_EQ(m_Module->getSection(Data)->getSize(), 4U);
}

TEST_F(ReadDeferredTest, TheThresholdIsTheLargestSizeThatIsReadAtOnce) {
  put(largeSample());
  BySizeDeferredContentsSelector selector;
  EXPECT_EQ(selector.getThreshold(), 0U);
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  EXPECT_THAT(deferredSections(), ElementsAre(1, 2, 5));
  selector.setThreshold(4);
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  EXPECT_THAT(deferredSections(), ElementsAre(5));
  selector.setThreshold(3);
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  EXPECT_THAT(deferredSections(), ElementsAre(1, 2, 5));
}

TEST_F(ReadDeferredTest, OnlyWholeFilesOfMoreThanAMegabyteAreAskedAbout) {
  std::string bytes = sample().bytes();
  bytes.resize(LargestEagerFile);
  ListedSelector selector({Text});
  for (const Way way : AllWays) {
    put(bytes);
    ASSERT_TRUE(readBy(way, &selector));
  }
  EXPECT_THAT(selector.m_Asked, IsEmpty());
  bytes += '\0';
  for (const Way way : AllWays) {
    put(bytes);
    selector.m_Asked.clear();
    ASSERT_TRUE(readBy(way, &selector));
    const bool isWhole = way == Way::WholeFile || way == Way::OpenFile;
    EXPECT_EQ(!selector.m_Asked.empty(), isWhole);
    EXPECT_EQ(m_Module->hasDeferredContents(), isWhole);
  }
}

TEST_F(ReadDeferredTest, TablesThatTheReadConsumesAreNotAskedAbout) {
  ObjectBuilder file = object();
  file.section(".padding", SHT_PROGBITS).zeros(LargestEagerFile);
  file.section(".strtab", SHT_STRTAB);
  file.section(".symtab", SHT_SYMTAB).link(2).symbol({.name = "x", .section = 1});
  file.section(".dynsym", SHT_DYNSYM).link(2).symbol({.name = "x", .section = 1});
  file.section(".rel", SHT_REL).link(3).info(1).relocation({});
  file.section(".rela", SHT_RELA).link(3).info(1).relocation({});
  file.section(".shndx", SHT_SYMTAB_SHNDX).link(3).word(0).word(0);
  file.section(".group", SHT_GROUP).link(3).info(1).word(1);
  file.section(".hash", SHT_HASH).link(4).zeros(8);
  const size_t plainFrom = 10;
  for (const uint32_t type : {SHT_DYNAMIC, SHT_NOTE, SHT_GNU_verdef, SHT_GNU_verneed,
                              SHT_GNU_versym, SHT_ZEV_PREEMPTMAP, SHT_ZEV_DEBUGOVERLAY})
    file.section(".table", type).zeros(16);
  file.section(".attributes", SHT_ZEV_ATTRIBUTES).bytes("A");
  const uint32_t first = plainFrom + 8;
  for (const uint32_t type : {SHT_PROGBITS, SHT_INIT_ARRAY, SHT_ZEV_EXIDX, SHT_SHLIB, 0x6FFF0000U})
    file.section(".plain", type).zeros(4);
  file.section(".bss", SHT_NOBITS).size(4);
  file.section(".empty", SHT_PROGBITS);
  put(file);
  BySizeDeferredContentsSelector selector;
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  EXPECT_THAT(deferredSections(),
              ElementsAre(1, first, first + 1, first + 2, first + 3, first + 4));
}

TEST_F(ReadDeferredTest, ContentsAreReadWhenTheyAreLoaded) {
  put(largeSample());
  ListedSelector selector({Text, Data});
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  m_Host.at("a.o").bytes.replace(largeSample().offsetOf(Text), 4, "CODE");
  const uint64_t bytesBefore = m_Host.getBytesRead();
  ASSERT_TRUE(m_Module->getSection(Text)->loadDeferredContents());
  EXPECT_EQ(m_Host.getBytesRead(), bytesBefore + 4);
  EXPECT_EQ(textOf(*m_Module->getSection(Text)), "CODE");
  EXPECT_THAT(deferredSections(), ElementsAre(Data));
}

TEST_F(ReadDeferredTest, AllElseIsReadAtOnce) {
  ObjectBuilder file = largeSample();
  file.type(ET_EXEC).tail("between").segment({.filesz = 0});
  file.segment({.offset = file.bytes().size() + 32 - 7, .filesz = 7});
  put(file);
  ListedSelector selector({Data});
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  m_Host.at("a.o").bytes.clear();
  EXPECT_EQ(textOf(*m_Module->getSection(Text)), "code");
  ASSERT_EQ(m_Module->getRawDataBlocks().size(), 1U);
  char bytes[7] = {};
  m_Module->getRawDataBlocks()[0]->read(0, bytes, sizeof bytes);
  EXPECT_EQ(std::string(bytes, sizeof bytes), "between");
}

TEST_F(ReadDeferredTest, APreemptionMapIsReadAlsoOfContentsThatStayInTheFile) {
  constexpr uint32_t Address = 0x10000000;
  ObjectBuilder file = largeSample();
  SectionBuilder& map = file.section(".map", SHT_PROGBITS).link(4).address(Address);
  map.word(1).textOffset("symbol").textOffset("new").textOffset("old").word(0);
  file.section(".dynamic", SHT_DYNAMIC).link(4).dynamic(DT_ZEV_PREEMPTMAP, Address).dynamic(0, 0);
  put(file);
  BySizeDeferredContentsSelector selector;
  for (DeferredContentsSelector* each : {static_cast<DeferredContentsSelector*>(nullptr),
                                         static_cast<DeferredContentsSelector*>(&selector)}) {
    ASSERT_TRUE(readBy(Way::WholeFile, each));
    ASSERT_EQ(m_Module->getPreemptionCount(), 1U);
    EXPECT_STREQ(m_Module->getPreemption(0)->getSymbolName(), "symbol");
    EXPECT_EQ(m_Module->getSection(6)->isContentsDeferred(), each != nullptr);
  }
}

TEST_F(ReadDeferredTest, TheFileStaysOpenUntilTheLastContentsAreLoaded) {
  put(largeSample());
  for (const Way way : {Way::WholeFile, Way::OpenFile}) {
    ListedSelector selector({Text, Data});
    ASSERT_TRUE(readBy(way, &selector));
    EXPECT_EQ(m_Host.openHandles(), 1U);
    EXPECT_TRUE(m_Module->getSection(Data)->loadDeferredContents());
    EXPECT_EQ(m_Host.openHandles(), 1U);
    EXPECT_TRUE(m_Module->getSection(Text)->loadDeferredContents());
    EXPECT_EQ(m_Host.openHandles(), 0U);
  }
}

TEST_F(ReadDeferredTest, TheFileIsClosedWhenTheContentsAreDropped) {
  ListedSelector selector({Text, Data});
  for (const Way way : {Way::WholeFile, Way::OpenFile}) {
    put(largeSample());
    ASSERT_TRUE(readBy(way, &selector));
    m_Module->deleteSection(m_Module->getSection(Data));
    EXPECT_EQ(m_Host.openHandles(), 1U);
    m_Module->clear();
    EXPECT_EQ(m_Host.openHandles(), 0U);
    ASSERT_TRUE(readBy(way, &selector));
    makeModule();
    EXPECT_EQ(m_Host.openHandles(), 0U);
    ASSERT_TRUE(readBy(way, &selector));
    put(sample());
    ASSERT_TRUE(readBy(Way::PartOfFile));
    EXPECT_EQ(m_Host.openHandles(), 0U);
  }
}

TEST_F(ReadDeferredTest, AFileOfWhichNothingIsDeferredIsClosedByWhoOpenedIt) {
  put(largeSample());
  ListedSelector selector;
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  makeModule();
  EXPECT_EQ(m_Host.openHandles(), 0U);
  ASSERT_TRUE(readBy(Way::OpenFile, &selector));
  makeModule();
  EXPECT_EQ(m_Host.openHandles(), 1U);
}

// He may close it at once, as where nobody was asked.
TEST_F(ReadDeferredTest, ACallersFileOfWhichNothingIsDeferredIsNotNeededAfterwards) {
  put(largeSample());
  ListedSelector selector;
  const support::FileHandle file = open("a.o");
  ASSERT_TRUE(readElfFile(m_Host, file, *m_Module, &selector));
  ASSERT_EQ(m_Host.close(file), 0);
  m_Host.at("a.o").bytes.assign(m_Bytes.size(), 'x');
  for (const Section* section : m_Module->getSections()) {
    if (section->getType() != SHT_PROGBITS) continue;
    ASSERT_NE(section->getContents(), nullptr);
    const uint64_t size = section->getContentsSize();
    EXPECT_EQ(textOf(*section), m_Bytes.substr(section->getFileOffset(), size));
  }
  EXPECT_THAT(m_Reports.m_Texts, IsEmpty());
}

TEST_F(ReadDeferredTest, ARemovedFileIsStillThereForItsContents) {
  put(largeSample());
  ListedSelector selector({Text});
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  ASSERT_EQ(m_Host.remove("a.o"), 0);
  EXPECT_TRUE(m_Module->loadDeferredContents());
  EXPECT_EQ(textOf(*m_Module->getSection(Text)), "code");
}

TEST_F(ReadDeferredTest, AFileThatHasShrunkIsReportedWhenTheContentsAreLoaded) {
  put(largeSample());
  ListedSelector selector({Text, Data});
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  m_Host.at("a.o").bytes.resize(largeSample().offsetOf(Data) + 3);
  EXPECT_TRUE(m_Module->getSection(Text)->loadDeferredContents());
  EXPECT_FALSE(m_Module->getSection(Data)->loadDeferredContents());
  EXPECT_THAT(m_Reports.m_Texts, ElementsAre(Truncated));
  EXPECT_TRUE(m_Module->getSection(Data)->isContentsDeferred());
  EXPECT_EQ(m_Module->getSection(Data)->getDataStore(), nullptr);
  EXPECT_EQ(m_Host.openHandles(), 0U);
}

TEST_F(ReadDeferredTest, AFailureOfTheHostIsReportedWhenTheContentsAreLoaded) {
  put(largeSample());
  ListedSelector selector({Text, Data});
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  m_Faulty.failCall(1, EIO);
  EXPECT_FALSE(m_Module->loadDeferredContents());
  EXPECT_EQ(m_Faulty.getFailedOperation(), "readAt");
  // The file is closed, and what else is in it can't be had either.
  EXPECT_EQ(m_Host.openHandles(), 0U);
  EXPECT_FALSE(m_Module->getSection(Data)->loadDeferredContents());
  EXPECT_THAT(m_Reports.m_Texts, ElementsAre(Truncated, Truncated));
}

TEST_F(ReadDeferredTest, AReadThatFailsAfterwardsClosesItsFile) {
  ObjectBuilder file = largeSample();
  file.section(".symtab", SHT_SYMTAB).link(4).symbol({.section = 77});
  put(file);
  ListedSelector selector({Text, Data});
  EXPECT_FALSE(readBy(Way::WholeFile, &selector));
  EXPECT_THAT(m_Reports.m_Texts, ElementsAre(HasSubstr("is defined in section #77")));
  EXPECT_TRUE(m_Module->isEmpty());
  EXPECT_EQ(m_Host.openHandles(), 0U);
}

TEST_F(ReadDeferredTest, EveryFileIsClosedOnce) {
  put(largeSample());
  ListedSelector nothing;
  ListedSelector selector({Text});
  for (DeferredContentsSelector* each : {&nothing, &selector}) {
    m_Faulty.failCall(0, 0);
    ASSERT_TRUE(readBy(Way::WholeFile, each));
    m_Module->clear();
    const uint64_t calls = m_Faulty.getCallCount();
    for (const uint64_t call : {calls, calls - 1}) {
      m_Faulty.failCall(call, EIO);
      static_cast<void>(readBy(Way::WholeFile, each));
      m_Module->clear();
      EXPECT_EQ(m_Faulty.getFailedOperation(), call == calls ? "close" : "readAt");
    }
  }
}

TEST_F(ReadDeferredTest, AReadThatFailsLeavesTheCallersFileToTheCaller) {
  ObjectBuilder file = largeSample();
  file.section(".symtab", SHT_SYMTAB).link(4).symbol({.section = 77});
  put(file);
  ListedSelector selector({Text, Data});
  EXPECT_FALSE(readBy(Way::OpenFile, &selector));
  EXPECT_EQ(m_Host.openHandles(), 1U);
}

TEST_F(ReadDeferredTest, TheSameFileIsReadAgainWhileItsContentsAreDeferred) {
  put(largeSample());
  ListedSelector selector({Text});
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  ASSERT_TRUE(readBy(Way::WholeFile, &selector));
  EXPECT_EQ(m_Host.openHandles(), 1U);
  EXPECT_TRUE(m_Module->loadDeferredContents());
  EXPECT_EQ(textOf(*m_Module->getSection(Text)), "code");
}

} // namespace elfext
