// SPDX-License-Identifier: Apache-2.0
//
// What the document says of libraries: members of each kind, symbols, builds, and that a hostile
// object makes it no longer than the library is.
#include "elfext/interface/elf_constants.h"
#include "quarn-json/document.h"
#include "tests/support/faulty_host.h"
#include "tests/unit/quarn-json/json_fixture.h"

#include <cerrno>

namespace quarn_json {

namespace {

using testsupport::archive;
using testsupport::ArchiveBuilder;
using testsupport::ElfClass;
using testsupport::ElfData;
using testsupport::HeaderField;
using testsupport::object;
using testsupport::ObjectBuilder;

constexpr uint32_t Entry = 0x10000000;
constexpr uint8_t Local = elfext::STB_LOCAL;
constexpr uint8_t Global = elfext::STB_GLOBAL;

// An object that defines the names, in a section of four bytes of code. Decorations are local.
ObjectBuilder objectWith(const Words& names) {
  ObjectBuilder builder = object(ElfClass::Class32, ElfData::Little);
  builder.section(".text", elfext::SHT_PROGBITS)
      .flags(elfext::SHF_ALLOC | elfext::SHF_EXECINSTR)
      .zeros(4);
  auto& table = builder.section(".symtab", elfext::SHT_SYMTAB).link(3);
  for (const std::string& name : names)
    table.symbol(
        {.name = name, .section = 1, .binding = name.starts_with("Build") ? Local : Global});
  builder.section(".strtab", elfext::SHT_STRTAB);
  return builder;
}

class LibraryFactsTest : public JsonTest {
protected:
  // The library as it is with the table that the tool makes.
  Json libraryMadeBy(const Words& options, const std::vector<std::string>& objects) {
    Words words = {"--create", "--diag_suppress=6874,6876,6877", "lib.a"};
    words.insert(words.begin(), options.begin(), options.end());
    for (const std::string& bytes : objects) {
      words.push_back(std::to_string(words.size()) + ".o");
      m_Host.addFile(words.back(), bytes);
    }
    EXPECT_EQ(run(words).status, 0);
    Words again = options;
    again.emplace_back("lib.a");
    return libraryOf(again);
  }
};

TEST_F(LibraryFactsTest, AreOfEachLibraryInTheOrderOfTheWords) {
  m_Host.addFile("one.a", archive().bytes());
  m_Host.addFile("two.a", archive().member("x", "1").bytes());
  const Json libraries = librariesOf({"two.a", "one.a", "two.a"});
  ASSERT_EQ(libraries.size(), 3u);
  EXPECT_EQ(libraries[0], libraries[2]);
  EXPECT_EQ(libraries[1], Json::parse(R"({"file": "one.a", "attributes": null, "symbolTable": null,
                                          "members": [], "symbols": [], "variantGroups": []})"));
}

TEST_F(LibraryFactsTest, HaveTheNumbersOfAHeader) {
  const Json member = memberOf(archive().member("x", "12345").numbers(4294967295, 7, 8, "100600"));
  EXPECT_EQ(member, Json::parse(R"({"name": "x", "offset": 8, "size": 5, "date": 4294967295,
                                    "uid": 7, "gid": 8, "mode": 33152, "kind": "file"})"));
}

TEST_F(LibraryFactsTest, HaveNamesOfAnyBytes) {
  const Json member = memberOf(archive().member("a\xFF", "text"));
  EXPECT_EQ(member.at("name"), "a\xEF\xBF\xBD");
  EXPECT_EQ(member.at("nameBytes"), "61ff");
}

// Whose backslashes or folders would be cut off could not be told from others.
TEST_F(LibraryFactsTest, HaveWholeNames) {
  const Json member = memberOf(archive().longNames({"d/e\\f.o"}).memberWithNameField("/0", "text"));
  EXPECT_EQ(member.at("name"), "d/e\\f.o");
}

TEST_F(LibraryFactsTest, OfAnObjectAreSizesEntryAndAttributes) {
  ObjectBuilder builder = objectWith({"f", "BuildAttributes$$J$IEEE1"});
  builder.header(HeaderField::Entry, 0x8004);
  builder.section("START\xFF", elfext::SHT_PROGBITS).flags(elfext::SHF_ALLOC | Entry).zeros(8);
  const Json member = memberOf(archive().member("a.o", builder.bytes()));
  EXPECT_EQ(member.at("kind"), "object");
  EXPECT_EQ(member.at("sizes"), Json::parse(R"({"code": 4, "readOnlyData": 8, "readWriteData": 0,
                            "zeroInitialised": 0, "debug": 0})"));
  EXPECT_EQ(member.at("entry"), 0x8004);
  EXPECT_EQ(lineOf(member.at("entrySections")),
            "[{\"name\":\"START\xEF\xBF\xBD\",\"nameBytes\":\"5354415254ff\"}]");
  EXPECT_EQ(member.at("attributes"), "$J$IEEE1");
}

TEST_F(LibraryFactsTest, OfAnObjectOfClassTwoHaveSixtyFourBits) {
  ObjectBuilder builder = object(ElfClass::Class64, ElfData::Big);
  builder.header(HeaderField::Entry, 0xFFFFFFFFFFFFFFFF);
  const Json member = memberOf(archive().member("a.o", builder.bytes()));
  EXPECT_EQ(member.at("entry"), 0xFFFFFFFFFFFFFFFF);
}

TEST_F(LibraryFactsTest, OfAnObjectThatSaysNothingHaveNoAttributes) {
  const std::string library = archive().member("a.o", objectWith({"f"}).bytes()).bytes();
  m_Host.addFile("lib.a", library);
  EXPECT_EQ(libraryOf({"lib.a"}).at("members").at(0).at("attributes"), nullptr);
  EXPECT_NE(libraryOf({"--qobix_buildattr", "lib.a"}).at("members").at(0).at("attributes"),
            nullptr);
}

TEST_F(LibraryFactsTest, OfAForeignObjectAreItsEntry) {
  constexpr uint16_t ForeignMachine = 62;
  ObjectBuilder builder = objectWith({"f"});
  builder.machine(ForeignMachine).header(HeaderField::Entry, 16);
  const Json member = memberOf(archive().member("a.o", builder.bytes()));
  EXPECT_EQ(member.at("kind"), "foreign");
  EXPECT_EQ(member.at("entry"), 16);
  EXPECT_FALSE(member.contains("sizes"));
}

TEST_F(LibraryFactsTest, OfAnUnreadableObjectAreTheReason) {
  const std::string bytes = objectWith({"f"}).bytes();
  const Json member = memberOf(archive().member("a\xFF.o", bytes.substr(0, bytes.size() - 1)));
  EXPECT_EQ(member.at("kind"), "unreadable");
  EXPECT_THAT(member.at("reason").get<std::string>(), HasSubstr("a\xEF\xBF\xBD.o"));
}

// Bytes that pass for a header of class 2 in all but the magic.
TEST_F(LibraryFactsTest, OfAFileThatOnlyBeginsLikeAnObjectAreThoseOfAFile) {
  const Json member = memberOf(archive().member("notes.txt", std::string(100, '\2')));
  EXPECT_EQ(member.at("kind"), "file");
}

TEST_F(LibraryFactsTest, HaveTheSymbolTableAsItStands) {
  const std::string bytes = objectWith({"f"}).bytes();
  m_Host.addFile(
      "lib.a", archive()
                   .symbolTable({{"other\xFF", "b.o"}, {"f$$BuildAttributes$$junk$J$IEEE1", "a.o"}})
                   .member("a.o", bytes)
                   .member("b.o", bytes)
                   .bytes());
  const Json library = libraryOf({"lib.a"});
  EXPECT_EQ(library.at("symbolTable").at("offset"), 8);
  EXPECT_EQ(library.at("members").size(), 2u);
  EXPECT_EQ(lineOf(library.at("symbols")),
            "[{\"name\":\"other\xEF\xBF\xBD\",\"nameBytes\":\"6f74686572ff\",\"member\":1},"
            "{\"name\":\"f\",\"member\":0,\"attributes\":\"$J$IEEE1\"}]");
}

// By what the members hold now, whatever the table says; as the table that is made of them says.
TEST_F(LibraryFactsTest, TellBuildsOfOneModule) {
  const Json library = libraryMadeBy(
      {}, {objectWith({"f", "BuildAttributes$$ZEV_ISAv4$IEEE1"}).bytes(), objectWith({"g"}).bytes(),
           objectWith({"f", "BuildAttributes$$ZEV_ISAv5$IEEE1"}).bytes()});
  EXPECT_EQ(library.at("variantGroups"), Json::parse(R"([{"attributes": "$ZEV_ISAv4$IEEE1",
                             "variants": [{"member": 0, "isBase": true},
                                          {"member": 2, "isBase": false,
                                           "decoration": "$ZEV_ISAv5$IEEE1",
                                           "isComplete": true}]}])"));
  const Json& symbols = library.at("symbols");
  const auto decorated = std::find_if(symbols.begin(), symbols.end(), [](const Json& symbol) {
    return symbol.contains("attributes");
  });
  ASSERT_NE(decorated, symbols.end());
  EXPECT_EQ(decorated->at("attributes"), "$ZEV_ISAv5$IEEE1");
  EXPECT_EQ(decorated->at("member"), 2);
}

TEST_F(LibraryFactsTest, TellWhereADecorationDoesNotSayAll) {
  const Json library =
      libraryMadeBy({}, {objectWith({"f", "BuildAttributes$$J$IEEE1"}).bytes(),
                         objectWith({"f", "BuildAttributes$$R:L22$IEEE1"}).bytes()});
  const Json& variants = library.at("variantGroups").at(0).at("variants");
  EXPECT_EQ(variants.at(0).at("isComplete"), true);
  EXPECT_EQ(variants.at(1).at("isComplete"), false);
}

TEST_F(LibraryFactsTest, TakeInWhatTheLibraryNeeds) {
  m_Host.addFile("map", "lib.a $IEEE1$J\n");
  const Json library =
      libraryMadeBy({"--libattrmap=map"}, {objectWith({"f", "BuildAttributes$$IEEE1"}).bytes(),
                                           objectWith({"f", "BuildAttributes$$E$IEEE1"}).bytes()});
  EXPECT_THAT(library.at("attributes").get<std::string>(), HasSubstr("$J"));
  const Json& group = library.at("variantGroups").at(0);
  EXPECT_THAT(group.at("attributes").get<std::string>(), HasSubstr("$J"));
  EXPECT_EQ(group.at("variants").at(0).at("isBase"), true);
}

// A hundred sections whose names are the ends of one.
TEST_F(LibraryFactsTest, OfSectionsThatShareANameAreNotLongerThanTheObject) {
  constexpr uint32_t Count = 100;
  ObjectBuilder builder = object(ElfClass::Class32, ElfData::Little);
  builder.section(std::string(100000, 'n'), elfext::SHT_PROGBITS)
      .flags(elfext::SHF_ALLOC | Entry)
      .zeros(4);
  for (uint32_t i = 0; i < Count; ++i)
    builder.section("", elfext::SHT_PROGBITS).flags(elfext::SHF_ALLOC | Entry).nameOffset(1 + i);
  m_Host.addFile("lib.a", archive().member("a.o", builder.bytes()).bytes());
  const RunOutcome outcome = json({"lib.a"});
  EXPECT_THAT(outcome.output, HasSubstr("\"kind\":\"unreadable\""));
  EXPECT_LT(outcome.output.size(), 2000u);
}

TEST_F(LibraryFactsTest, LeaveTheLibraryAsItIs) {
  m_Host.addFile("lib.a", archive().member("a.o", objectWith({"f"}).bytes()).bytes());
  const std::string before = m_Host.read("lib.a");
  libraryOf({"lib.a"});
  EXPECT_EQ(m_Host.read("lib.a"), before);
}

} // namespace

// What the host can't give is no fault of an object, so there is nothing that the document could
// say.
TEST_F(LibraryFactsTest, AreAllOrNoneWhereTheHostFails) {
  testsupport::ArchiveBuilder library = archive();
  for (const char* name : {"a.o", "b.o"})
    library.member(name,
                   objectWith({"f", "BuildAttributes$$P"}).tail(std::string(70000, 'x')).bytes());
  // Whose sizes rest on bytes that nothing else asks for.
  library.member("c.o", objectWith({"g"})
                            .segment({.filesz = 60000, .memsz = 60000})
                            .tail(std::string(70000, 'x'))
                            .bytes());
  m_Host.addFile("lib.a", library.bytes());
  const std::string whole = json({"lib.a"}).output;
  testsupport::FaultyHost faulty(m_Host);
  uint32_t failures = 0;
  for (uint64_t call = 1;; ++call) {
    faulty.failCall(call, EIO);
    const RunOutcome outcome = runWork(jsonMain, "quarn-json", {"lib.a"}, faulty);
    if (faulty.getFailedOperation().empty()) break;
    EXPECT_EQ(outcome.output, outcome.status == 0 ? whole : "") << faulty.getFailedOperation();
    EXPECT_EQ(outcome.status == 0, outcome.errors.empty()) << outcome.errors;
    failures += outcome.status != 0;
  }
  EXPECT_GT(failures, 5U);
}

TEST_F(LibraryFactsTest, AreNoneWhereTheDiskHasNoRoomForThem) {
  const std::string first(Document::MostInMemory / 2, 'a');
  const std::string second(Document::MostInMemory / 2, 'b');
  m_Host.addFile(
      "lib.a", archive().longNames({first, second}).member(first, "x").member(second, "y").bytes());
  EXPECT_EQ(json({"lib.a"}).status, 0);
  m_Host.setRoom(0);
  const RunOutcome outcome = json({"lib.a"});
  EXPECT_EQ(outcome.status, 1);
  EXPECT_EQ(outcome.output, "");
  EXPECT_EQ(outcome.errors,
            "quarn-json: Error: L6843E: Writing file '/tmp/quarn.1' : No space left "
            "on device\n");
}

} // namespace quarn_json
