// SPDX-License-Identifier: Apache-2.0
//
// Objects that hold code for the optimiser of a link alone: their ELF symbols say nothing, and what
// they define stands in records of their compiler's own.

#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

using elfext::ObjectOutline;
using testsupport::ElfClass;
using testsupport::ElfData;
using testsupport::ObjectBuilder;

constexpr uint16_t ForeignMachine = 62;
constexpr uint32_t Contents = 1;
constexpr uint32_t SymbolTableType = 2;
constexpr uint32_t StringTableType = 3;
constexpr uint16_t Common = 0xFFF2;
constexpr char Definition = 0;
constexpr char WeakDefinition = 1;
constexpr char Reference = 2;
constexpr char WeakReference = 3;
constexpr char CommonDefinition = 4;
constexpr char UnknownKind = 5;

// Name, group, kind, visibility, size and slot.
std::string record(const std::string& name, char kind = Definition, const std::string& group = "") {
  return name + '\0' + group + '\0' + kind + '\0' + std::string(12, '\1');
}

struct ObjectOptions {
  uint16_t machine = ForeignMachine;
  bool isSlim = true;
  ElfClass elfClass = ElfClass::Class64;
  ElfData data = ElfData::Little;
};

// The records' section is the third.
ObjectBuilder ltoObject(const std::string& records, const ObjectOptions& options = {}) {
  ObjectBuilder builder = object(options.elfClass, options.data);
  builder.machine(options.machine);
  auto& table = builder.section(".symtab", SymbolTableType).link(2);
  table.symbol({.name = options.isSlim ? "__gnu_lto_slim" : "fat", .section = Common});
  builder.section(".strtab", StringTableType);
  builder.section(".gnu.lto_.symtab.1a2b", Contents).bytes(records);
  return builder;
}

class LtoObjects : public testing::Test {
protected:
  LtoObjects() {
    m_Archive.setErrorHandler(&m_Handler);
    m_Archive.setMachines(ObjectOutline::Machines::Any);
  }
  std::vector<std::string> publishedBy(const ObjectBuilder& builder) {
    m_Host.addFile("x.o", builder.bytes());
    EXPECT_NE(m_Archive.addMemberFromFile("x.o"), nullptr);
    EXPECT_TRUE(writeFile("lib.a", m_Archive));
    Archive written(m_Host);
    EXPECT_TRUE(readFile("lib.a", written));
    return visitedSymbolsOf(written);
  }
  [[nodiscard]] const std::vector<std::string>& reports() const { return m_Handler.reports; }

  MemoryHost m_Host;
  RecordingHandler m_Handler{Answer::GoOnIfTolerable};
  Archive m_Archive{m_Host};
};

class DamagedLtoObjects : public LtoObjects {
protected:
  void expectRefusal(const ObjectBuilder& builder) {
    EXPECT_THAT(publishedBy(builder), IsEmpty());
    EXPECT_EQ(reports().size(), 1U);
  }
};

} // namespace

TEST_F(LtoObjects, PublishWhatTheirRecordsDefine) {
  EXPECT_THAT(publishedBy(ltoObject(record("strong") + record("weak", WeakDefinition, "group") +
                                    record("wanted", Reference) + record("welcome", WeakReference) +
                                    record("") + record("common", CommonDefinition) +
                                    record("unknown", UnknownKind))),
              ElementsAre("strong in x.o", "weak in x.o", "common in x.o"));
  EXPECT_THAT(reports(), IsEmpty());
}

TEST_F(LtoObjects, AreReadInEitherClassAndByteOrder) {
  for (const ElfClass elfClass : {ElfClass::Class32, ElfClass::Class64}) {
    for (const ElfData data : {ElfData::Little, ElfData::Big}) {
      m_Archive.clear();
      EXPECT_THAT(publishedBy(ltoObject(record("main"), {.elfClass = elfClass, .data = data})),
                  ElementsAre("main in x.o"));
    }
  }
}

TEST_F(LtoObjects, WithoutRecordsPublishNothing) {
  EXPECT_THAT(publishedBy(ltoObject("")), IsEmpty());
  EXPECT_THAT(reports(), IsEmpty());
}

TEST_F(LtoObjects, OfOurOwnMachinesPublishTheirRecordsToo) {
  EXPECT_THAT(
      publishedBy(ltoObject(record("main"), {.machine = 40, .elfClass = ElfClass::Class32})),
      ElementsAre("main in x.o"));
  EXPECT_THAT(reports(), IsEmpty());
}

// The option of quarn: what an archive of our machines publishes is settled.
TEST_F(LtoObjects, PublishNoRecordsWhereOnlyOurOwnMachinesCount) {
  m_Archive.setMachines(ObjectOutline::Machines::Own);
  EXPECT_THAT(
      publishedBy(ltoObject(record("main"), {.machine = 40, .elfClass = ElfClass::Class32})),
      ElementsAre("__gnu_lto_slim in x.o"));
}

TEST_F(LtoObjects, WithoutSectionNamesPublishNothing) {
  EXPECT_THAT(publishedBy(ltoObject(record("main")).nameless()), IsEmpty());
  EXPECT_THAT(reports(), IsEmpty());
}

// Its ELF symbols say the same.
TEST_F(LtoObjects, ThatHoldMachineCodeTooPublishTheirElfSymbols) {
  EXPECT_THAT(publishedBy(ltoObject(record("main"), {.isSlim = false})), ElementsAre("fat in x.o"));
}

TEST_F(LtoObjects, MergedByALinkerHaveSeveralTables) {
  ObjectBuilder builder = ltoObject(record("first"));
  builder.section(".gnu.lto_.symtab.3c4d", Contents).bytes(record("second"));
  builder.section(".gnu.lto_.symtabular", Contents).bytes("no records");
  builder.section(".gnu.lto_.ext_symtab.1a2b", Contents).bytes("no records");
  EXPECT_THAT(publishedBy(builder), ElementsAre("first in x.o", "second in x.o"));
  EXPECT_THAT(reports(), IsEmpty());
}

TEST_F(DamagedLtoObjects, WithACutRecordAreToldOf) {
  const std::string whole = record("main", Definition, "group");
  for (size_t size = 1; size < whole.size(); ++size) {
    MemoryHost host;
    RecordingHandler handler{Answer::GoOnIfTolerable};
    Archive archive(host);
    archive.setErrorHandler(&handler);
    archive.setMachines(ObjectOutline::Machines::Any);
    host.addFile("x.o", ltoObject(record("first") + whole.substr(0, size)).bytes());
    EXPECT_NE(archive.addMemberFromFile("x.o"), nullptr);
    EXPECT_TRUE(writeFile("lib.a", archive));
    EXPECT_EQ(handler.reports.size(), 1U) << size;
  }
}

TEST_F(DamagedLtoObjects, WithATableOutsideAreToldOf) {
  ObjectBuilder builder = ltoObject("");
  builder.section(".gnu.lto_.symtab.9", Contents).bytes(record("main")).offset(0x7FFFFFFF);
  expectRefusal(builder);
}

TEST_F(DamagedLtoObjects, WithASectionNameOutsideAreToldOf) {
  ObjectBuilder builder = ltoObject("");
  builder.section("x", Contents).nameOffset(0x10000);
  expectRefusal(builder);
}

TEST_F(DamagedLtoObjects, WithSectionNamesInNoStringTableAreToldOf) {
  expectRefusal(ltoObject(record("main")).header(testsupport::HeaderField::ShStrNdx, 3));
}

// A thousand tables of the same bytes would make a thousand times the names.
TEST_F(DamagedLtoObjects, WithTablesThatShareTheirBytesAreToldOf) {
  const std::string records = record("main");
  ObjectBuilder builder = ltoObject(records);
  const uint64_t offset = builder.offsetOf(3);
  for (int i = 0; i < 1000; ++i)
    builder.section(".gnu.lto_.symtab.9", Contents).offset(offset).size(1000);
  expectRefusal(builder);
}

} // namespace arlib
