// SPDX-License-Identifier: Apache-2.0
//
// Objects of machines that are none of ours: an archive that is told to take them publishes what
// they define, in either class and byte order, and takes nothing else of them for its own.

#include "tests/unit/arlib/archive_fixture.h"

namespace arlib {

namespace {

using elfext::ObjectOutline;
using testsupport::ElfClass;
using testsupport::ElfData;
using testsupport::HeaderField;
using testsupport::ObjectBuilder;
using testsupport::SymbolSpec;

constexpr uint16_t ForeignMachine = 62;
constexpr uint32_t SymbolTableType = 2;
constexpr uint32_t StringTableType = 3;
constexpr uint16_t Undefined = 0;
constexpr uint16_t Common = 0xFFF2;
constexpr uint16_t OwnIndexOfTheMachine = 0xFF02;
constexpr uint8_t Local = 0;
constexpr uint8_t Weak = 2;
constexpr uint8_t Unique = 10;
// A section type that has a meaning for our machines only, and there a rule for its link.
constexpr uint32_t OwnTypeOfTheMachine = 0x70000002;

ObjectBuilder foreignObject(const std::vector<SymbolSpec>& symbols,
                            ElfClass elfClass = ElfClass::Class64, ElfData data = ElfData::Little) {
  ObjectBuilder builder = object(elfClass, data);
  builder.machine(ForeignMachine);
  auto& table = builder.section(".symtab", SymbolTableType).link(2);
  for (const SymbolSpec& symbol : symbols)
    table.symbol(symbol);
  builder.section(".strtab", StringTableType);
  return builder;
}

// An archive that takes in files and is written as "lib.a".
struct Library {
  Library() {
    archive.setErrorHandler(&handler);
    archive.setMachines(ObjectOutline::Machines::Any);
  }
  void add(const char* name, const std::string& bytes) {
    host.addFile(name, bytes);
    EXPECT_NE(archive.addMemberFromFile(name), nullptr);
  }
  std::vector<std::string> write() {
    EXPECT_TRUE(writeFile("lib.a", archive));
    Archive written(host);
    EXPECT_TRUE(readFile("lib.a", written));
    return visitedSymbolsOf(written);
  }

  MemoryHost host;
  RecordingHandler handler{Answer::GoOnIfTolerable};
  Archive archive{host};
};

std::vector<std::string> publishedBy(const ObjectBuilder& builder,
                                     std::vector<std::string>* reports = nullptr) {
  Library library;
  library.add("x.o", builder.bytes());
  std::vector<std::string> symbols = library.write();
  if (reports != nullptr) *reports = library.handler.reports;
  if (reports == nullptr) {
    EXPECT_THAT(library.handler.reports, IsEmpty());
  }
  return symbols;
}

TEST(ForeignObjects, ArePublishedInEitherClassAndByteOrder) {
  for (const ElfClass elfClass : {ElfClass::Class32, ElfClass::Class64}) {
    for (const ElfData data : {ElfData::Little, ElfData::Big}) {
      EXPECT_THAT(publishedBy(foreignObject({{.name = "main", .section = 1}}, elfClass, data)),
                  ElementsAre("main in x.o"));
    }
  }
}

TEST(ForeignObjects, AreRefusedUnlessTheyAreAskedFor) {
  Library library;
  library.archive.setMachines(ObjectOutline::Machines::Own);
  library.add("x.o", foreignObject({{.name = "main", .section = 1}}).bytes());
  EXPECT_THAT(library.write(), IsEmpty());
  EXPECT_EQ(library.handler.reports.size(), 1U);
}

TEST(ForeignObjects, PublishEveryDefinitionThatIsNotLocal) {
  EXPECT_THAT(publishedBy(foreignObject({{.name = "hidden", .section = 1, .binding = Local},
                                         {.name = "wanted", .section = Undefined},
                                         {.name = "strong", .section = 1},
                                         {.name = "weak", .section = 1, .binding = Weak},
                                         {.name = "unique", .section = 1, .binding = Unique},
                                         {.name = "common", .section = Common},
                                         {.name = "large", .section = OwnIndexOfTheMachine},
                                         {.name = "", .section = 1}})),
              ElementsAre("strong in x.o", "weak in x.o", "unique in x.o", "common in x.o",
                          "large in x.o"));
}

TEST(ForeignObjects, MayHaveSectionsOfTheirMachinesOwnKind) {
  ObjectBuilder builder = foreignObject({{.name = "main", .section = 1}});
  builder.section(".own", OwnTypeOfTheMachine).link(99).info(99).entrySize(7).bytes("12345");
  EXPECT_THAT(publishedBy(builder), ElementsAre("main in x.o"));
}

TEST(ForeignObjects, WithoutSymbolTablePublishNothing) {
  ObjectBuilder builder = object(ElfClass::Class64);
  builder.machine(ForeignMachine).section(".text", 1).zeros(4);
  EXPECT_THAT(publishedBy(builder), IsEmpty());
}

TEST(ForeignObjects, WithExtendedNumberingArePublished) {
  EXPECT_THAT(publishedBy(foreignObject({{.name = "main", .section = 0xFFFF}}).extendedNumbering()),
              ElementsAre("main in x.o"));
}

// Two of the same symbols would be two builds of one module, if anybody could tell the builds.
TEST(ForeignObjects, AreNeverVariantsOfEachOther) {
  Library library;
  const std::string bytes = foreignObject({{.name = "main", .section = 1}}).bytes();
  library.add("x.o", bytes);
  library.add("y.o", bytes);
  EXPECT_THAT(library.write(), ElementsAre("main in x.o", "main in y.o"));
  EXPECT_THAT(library.handler.reports, IsEmpty());
}

TEST(ForeignObjects, StandBesideOurOwn) {
  Library library;
  library.add("own.o", testsupport::objectThatDefines("own").bytes());
  library.add("foreign.o", foreignObject({{.name = "foreign", .section = 1}}).bytes());
  library.add("own2.o", testsupport::objectThatDefines("own2").bytes());
  EXPECT_THAT(library.write(),
              ElementsAre("own in own.o", "foreign in foreign.o", "own2 in own2.o"));
}

// The fifth byte of a text may happen to be that of class 2.
TEST(ForeignObjects, AreToldFromPlainFilesByTheirMagic) {
  Library library;
  library.add("notes.txt", std::string(4, 'n') + '\2' + std::string(100, 'n'));
  EXPECT_THAT(library.write(), IsEmpty());
  EXPECT_THAT(library.handler.reports, IsEmpty());
}

struct Damage {
  const char* what;
  ObjectBuilder builder;
};

// Bytes that pass for a header of class 64 in all but the magic.
TEST(ForeignObjects, HaveAnOutlineAndPlainFilesAnEmptyOne) {
  Library library;
  library.add("foreign.o", foreignObject({{"f"}}).bytes());
  library.add("plain.bin", std::string(200, '\2'));
  AttributeRecords records(elfext::parseAttributeString);
  ObjectReading reading{records};
  reading.outline.setMachines(ObjectOutline::Machines::Any);
  EXPECT_TRUE(reading.outline.isEmpty());
  alloclib::RegionOwner region(alloclib::RegionGeneral::Create(1024, "names of a test"));
  SymbolNameList names(region.get());
  std::optional<elfext::FullAttr> attributes;
  std::string reason;
  const auto* type = ElfImageArchiveMemberType::getInstance();
  const auto members = library.archive.getMembers();
  EXPECT_TRUE(type->getPublished(members[0], reading, names, attributes, reason));
  EXPECT_FALSE(reading.outline.isEmpty());
  EXPECT_TRUE(type->getPublished(members[1], reading, names, attributes, reason));
  EXPECT_TRUE(reading.outline.isEmpty());
}

TEST(ForeignObjects, ThatAreDamagedAreToldOfAndPublishNothing) {
  const std::vector<SymbolSpec> symbols = {{.name = "main", .section = 1}};
  std::vector<Damage> damages;
  const auto damaged = [&](const char* what) -> ObjectBuilder& {
    return damages.emplace_back(Damage{what, foreignObject(symbols)}).builder;
  };
  damaged("section headers outside").header(HeaderField::ShOff, 0x10000000);
  damaged("too many section headers").header(HeaderField::ShNum, 0xFEFF);
  damaged("no such version").header(HeaderField::Version, 9);
  damaged("no such type").header(HeaderField::Type, 9);
  for (const auto& [what, link] :
       {std::pair("no such string table", 9U), std::pair("strings that are none", 1U)}) {
    ObjectBuilder builder = object(ElfClass::Class64);
    builder.machine(ForeignMachine).section(".symtab", SymbolTableType).link(link).symbol({});
    damages.push_back({what, builder});
  }
  const auto withTable = [&](const char* what, auto change) {
    ObjectBuilder builder = object(ElfClass::Class64);
    builder.machine(ForeignMachine);
    auto& table = builder.section(".symtab", SymbolTableType).link(2);
    auto& strings = builder.section(".strtab", StringTableType);
    table.symbol({.name = "main", .section = 1});
    change(table, strings);
    damages.push_back({what, builder});
  };
  withTable("rows outside", [](auto& table, auto&) { table.offset(0x7FFFFFFF); });
  withTable("rows of another size", [](auto& table, auto&) { table.entrySize(5); });
  withTable("half a row", [](auto& table, auto&) { table.bytes("x"); });
  withTable("strings outside", [](auto&, auto& strings) { strings.size(0x7FFFFFFF); });
  withTable("strings without an end", [](auto&, auto& strings) { strings.size(2); });
  withTable("a name outside",
            [](auto& table, auto&) { table.symbol({.section = 1, .nameOffset = 0x10000}); });
  for (const Damage& damage : damages) {
    std::vector<std::string> reports;
    EXPECT_THAT(publishedBy(damage.builder, &reports), IsEmpty()) << damage.what;
    EXPECT_EQ(reports.size(), 1U) << damage.what;
  }
}

// Only the first table counts: a thousand tables of the same rows cost as much as one.
TEST(ForeignObjects, HaveOneSymbolTable) {
  ObjectBuilder builder = foreignObject({{.name = "main", .section = 1}});
  builder.section(".symtab", SymbolTableType).link(2).symbol({.name = "other", .section = 1});
  EXPECT_THAT(publishedBy(builder), ElementsAre("main in x.o"));
}

} // namespace

} // namespace arlib
