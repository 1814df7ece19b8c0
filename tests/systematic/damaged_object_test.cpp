// SPDX-License-Identifier: Apache-2.0
//
// Every prefix of three small objects that have everything, and each of their bytes set to 0x00,
// 0xFF and its complement: the tool never crashes or hangs on them, says of each one thing that it
// knows to say or nothing, and keeps it byte for byte. Many damaged objects are members of one
// archive, so that one run meets them all.
//
// A damage stands for what becomes of files: a download that was cut, a disk that lies, a linker
// that was killed, somebody who tries what happens.

#include "elfext/interface/elf_constants.h"
#include "tests/support/archive_builder.h"
#include "tests/support/object_builder.h"
#include "tests/support/tool_folder.h"
#include "tests/systematic/two_roads.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <iterator>
#include <set>
#include <sstream>

namespace testsupport {

namespace {

using namespace elfext;

using Lines = std::vector<std::string>;
using Names = std::set<std::string>;

constexpr uint32_t EntryFlag = 0x10000000;
constexpr uint32_t SegmentMapNote = 0x40000000;
constexpr size_t MembersAtOnce = 400;

// ---- The objects

// Groups, symbols of all kinds, relocations, debug sections.
std::string groupedObject() {
  ObjectBuilder file = object(ElfClass::Class32, ElfData::Little);
  file.section(".text.f", SHT_PROGBITS)
      .flags(SHF_ALLOC | SHF_EXECINSTR | SHF_GROUP | EntryFlag)
      .zeros(16);
  file.section(".rel.text.f", SHT_REL)
      .flags(SHF_GROUP)
      .link(6)
      .info(1)
      .relocation({.offset = 4, .symbol = 4, .type = 2})
      .relocation({.offset = 8, .symbol = 7, .type = 2});
  file.section(".data", SHT_PROGBITS).flags(SHF_ALLOC | SHF_WRITE).bytes("12345678");
  file.section(".bss", SHT_NOBITS).flags(SHF_ALLOC | SHF_WRITE).size(64);
  file.section(".group", SHT_GROUP).link(6).info(4).word(GRP_COMDAT).word(1).word(2);
  file.section(".symtab", SHT_SYMTAB)
      .link(8)
      .info(4)
      .symbol({.section = 1, .type = STT_SECTION, .binding = STB_LOCAL})
      .symbol({.name = "$a", .section = 1, .binding = STB_LOCAL})
      .symbol({.name = "$d", .section = 1, .value = 8, .binding = STB_LOCAL})
      .symbol({.name = "f", .section = 1, .size = 8, .type = STT_FUNC})
      .symbol({.name = "limit", .section = SHN_ABS, .value = 9})
      .symbol({.name = "pool", .section = SHN_COMMON, .value = 4, .size = 12})
      .symbol({.name = "wanted"})
      .symbol({.name = "far", .section = SHN_XINDEX, .type = STT_OBJECT});
  SectionBuilder& indexes = file.section(".symtab_shndx", SHT_SYMTAB_SHNDX).link(6);
  for (const uint32_t index : {0U, 0U, 0U, 0U, 0U, 0U, 0U, 0U, 3U})
    indexes.word(index);
  file.section(".strtab", SHT_STRTAB);
  file.section(".debug_info", SHT_PROGBITS).bytes("debug");
  file.section("overlay", SHT_ZEV_DEBUGOVERLAY).entrySize(12).word(0).word(9).word(1);
  return file.bytes();
}

// All that dynamic linking needs.
std::string sharedObject() {
  ObjectBuilder file = object(ElfClass::Class32, ElfData::Big).type(ET_DYN);
  file.segment({.flags = PF_R | PF_X, .offset = 116, .vaddr = 0x8000, .filesz = 8, .memsz = 8});
  file.segment({.type = PT_DYNAMIC, .flags = PF_R, .offset = 0});
  file.section(".text", SHT_PROGBITS)
      .flags(SHF_ALLOC | SHF_EXECINSTR)
      .address(0x8000)
      .bytes("codecode");
  file.section(".dynstr", SHT_STRTAB).flags(SHF_ALLOC);
  file.section(".dynsym", SHT_DYNSYM)
      .flags(SHF_ALLOC)
      .link(2)
      .symbol({.name = "out", .section = 1, .value = 0x8000})
      .symbol({.name = "in"});
  file.section(".hash", SHT_HASH).flags(SHF_ALLOC).link(3).word(1).word(3).word(1).zeros(12);
  file.section(".rel.dyn", SHT_REL)
      .flags(SHF_ALLOC)
      .link(3)
      .info(1)
      .relocation({.offset = 0x8004, .symbol = 2, .type = 22});
  file.section(".gnu.version", SHT_GNU_versym).link(3).half(0).half(2).half(3);
  SectionBuilder& defined = file.section(".gnu.version_d", SHT_GNU_verdef).link(2);
  defined.half(1).half(VER_FLG_BASE).half(1).half(1).word(0).word(20).word(28);
  defined.textOffset("libself").word(0);
  defined.half(1).half(0).half(2).half(1).word(0).word(20).word(0).textOffset("v1").word(0);
  SectionBuilder& required = file.section(".gnu.version_r", SHT_GNU_verneed).link(2);
  required.half(1).half(1).textOffset("libother").word(16).word(0);
  required.word(0).half(0).half(3).textOffset("w1").word(0);
  file.section(".preempt", SHT_ZEV_PREEMPTMAP)
      .flags(SHF_ALLOC)
      .link(2)
      .address(0x9000)
      .word(1)
      .textOffset("out")
      .textOffset("libself")
      .textOffset("libother")
      .word(0);
  file.section(".dynamic", SHT_DYNAMIC)
      .flags(SHF_ALLOC)
      .link(2)
      .dynamicText(DT_NEEDED, "libother")
      .dynamicText(DT_SONAME, "libself")
      .dynamicText(DT_RPATH, "/lib")
      .dynamic(DT_INIT, 0x8000)
      .dynamic(DT_FLAGS, DF_BIND_NOW)
      .dynamic(DT_VERDEFNUM, 2)
      .dynamic(DT_VERNEEDNUM, 1)
      .dynamic(DT_ZEV_PREEMPTMAP, 0x9000)
      .dynamic(DT_NULL, 0);
  file.section(".note", SHT_NOTE).note("ZEV", SegmentMapNote, {0, 0, 0, 0, 0, 0, 1});
  return file.bytes();
}

// Segments with bytes of their own, a section without bytes in one, relocations with addends.
std::string wideObject() {
  ObjectBuilder file = object(ElfClass::Class64, ElfData::Little).type(ET_EXEC).machine(EM_ZEV64);
  file.header(HeaderField::Entry, 0x8004);
  file.segment({.flags = PF_R | PF_X, .offset = 176, .vaddr = 0x8000, .filesz = 13, .memsz = 64});
  file.segment({.type = PT_NOTE, .flags = PF_R, .offset = 184, .filesz = 4, .memsz = 4});
  file.section(".text", SHT_PROGBITS)
      .flags(SHF_ALLOC | SHF_EXECINSTR | EntryFlag)
      .address(0x8000)
      .bytes("code!");
  file.section(".rodata", SHT_PROGBITS).flags(SHF_ALLOC).address(0x8008).bytes("const");
  file.section(".bss", SHT_NOBITS)
      .flags(SHF_ALLOC | SHF_WRITE)
      .address(0x800D)
      .offset(189)
      .size(16);
  file.section(".rela.text", SHT_RELA)
      .link(5)
      .info(1)
      .relocation({.offset = 0x8000, .symbol = 2, .type = 1026, .addend = -4});
  file.section(".symtab", SHT_SYMTAB)
      .link(6)
      .info(2)
      .symbol({.name = "$x", .section = 1, .value = 0x8000, .binding = STB_LOCAL})
      .symbol({.name = "start", .section = 1, .value = 0x8004, .size = 1, .type = STT_FUNC})
      .symbol({.name = "$$BuildAttributes$v", .section = SHN_ABS})
      .symbol({.name = "zero", .section = 3, .value = 0x800D, .type = STT_OBJECT});
  file.section(".strtab", SHT_STRTAB);
  file.section(".note", SHT_NOTE).note("ZEV", SegmentMapNote, {0, 0, 0});
  return file.bytes();
}

// ---- The damages

struct Member {
  std::string name;
  std::string what; // was done to it
  std::string bytes;
};

std::string memberName(size_t number) {
  return "m" + std::to_string(number) + ".o";
}

std::vector<Member> damagedForms(const std::string& good) {
  std::vector<Member> members;
  const auto add = [&members](std::string what, std::string bytes) {
    members.push_back({memberName(members.size()), std::move(what), std::move(bytes)});
  };
  for (size_t size = 0; size < good.size(); ++size)
    add("prefix of " + std::to_string(size) + " bytes", good.substr(0, size));
  for (size_t position = 0; position < good.size(); ++position) {
    for (const int value : {0x00, 0xFF, ~good[position] & 0xFF}) {
      std::string damaged = good;
      damaged[position] = static_cast<char>(value);
      add("byte " + std::to_string(position) + " as " + std::to_string(value), damaged);
    }
  }
  return members;
}

// ---- What is said of them

// All that may be said of an object, with N for numbers and without the names of section types.
const Names& knownReports() {
  static const Names Reports = {
      "I/O error writing file 'MEMBER': Unknown error -N",
      "Section header table is empty",
      "ELF header refers to section-name string table section #N but the last section is #N",
      "Symbol table section #N refers to string table section #N but the last section is #N",
      "Relocation section #N refers to symbol table section #N but the last section is #N",
      "Group section #N refers to symbol table section #N but the last section is #N",
      "Group section #N refers to member section #N but the last section is #N",
      "Relocation section #N refers to target section #N but the last section is #N",
      "SHT_SYMTAB_SHNDX section #N refers to symbol table section #N but the last section is #N",
      "Hash section #N refers to symbol table section #N but the last section is #N",
      "Preemption map section #N refers to string table section #N but the last section is #N",
      "Dynamic section #N refers to string table section #N but the last section is #N",
      "Link field of section #N refers to target section #N but the last section is #N",
      "ELF header refers to section-name string table section #N but that section has type #N "
      "instead of SHT_STRTAB",
      "Symbol table section #N refers to string table section #N but that section has type #N "
      "instead of SHT_STRTAB",
      "Relocation section #N refers to symbol table section #N but that section has type #N "
      "instead of SHT_SYMTAB or SHT_DYNSYM",
      "Group section #N refers to symbol table section #N but that section has type #N instead of "
      "SHT_SYMTAB or SHT_DYNSYM",
      "SHT_SYMTAB_SHNDX section #N refers to symbol table section #N but that section has type #N "
      "instead of SHT_SYMTAB or SHT_DYNSYM",
      "Hash section #N refers to symbol table section #N but that section has type #N instead of "
      "SHT_DYNSYM",
      "Preemption map section #N refers to string table section #N but that section has type #N "
      "instead of SHT_STRTAB",
      "Dynamic section #N refers to string table section #N but that section has type #N instead "
      "of SHT_STRTAB",
      "Section name field for section #N specifies a nonzero string table offset, but there is no "
      "section-name string table",
      "Section name field for section #N specifies a string table offset N which is beyond the end "
      "of the section-name string table (length N)",
      "Group section #N refers to symbol #N but its associated symbol table section #N only "
      "contains N symbols",
      "SHT_SYMTAB_SHNDX sections #N and #N are both associated with the same symbol table section "
      "#N",
      "SHT_SYMTAB_SHNDX section #N contains N entries, but its associated symbol table section #N "
      "contains N",
      "Symbol #N in symbol table section #N refers to offset N in string table section #N, which "
      "is only N bytes long",
      "Symbol #N in symbol table section #N has SHN_XINDEX section field, but there is no "
      "SHT_SYMTAB_SHNDX section associated with the symbol table",
      "Symbol #N in symbol table section #N is defined in section #N but the last section is #N",
      "Symbol #N in symbol table section #N has type STT_SECTION but is not defined relative to a "
      "section",
      "Relocation #N in relocation section #N refers to symbol #N but its associated symbol table "
      "section #N only contains N symbols",
      "Section #N belongs to group section #N and also to group section #N",
      "Build attributes in section #N are corrupted",
      "String table section #N is completely empty",
      "String table section #N starts with a non-zero byte value",
      "String table section #N ends with a non-zero byte value",
      "String table section #N starts and ends with a non-zero byte value",
      "ELF file has unrecognised type code N (we handle types N-N)",
      "ELF file has invalid endianness code N (should be N or N)",
      "ELF file has unsupported version code N (we only handle version N)",
      "ELF file has unsupported machine code N (we only handle EM_ZEV = N)",
      "Section #N specifies its entry size as N (should be N)",
      "Section #N has length N, which is not a multiple of N",
      "Sections #N and #N overlap in the file",
      "File is not an ELF file (wrong magic number)",
      "File is not N-bit ELF",
      "Record #N in debug overlay section #N refers to section #N which is not a debug section",
      "Record #N in debug overlay section #N refers to section #N which is not a section",
      "Section/segment mapping in SHT_NOTE section #N contains N entries, but there are N "
      "SHF_ALLOC sections",
      "Section/segment mapping in SHT_NOTE section #N maps section #N to segment #N which does not "
      "exist",
  };
  return Reports;
}

void replace(std::string& text, const std::string& from, const std::string& to) {
  const size_t place = text.find(from);
  if (place != std::string::npos) text.replace(place, from.size(), to);
}

// The form that the reports are known in.
std::string normalised(std::string text, const std::string& member) {
  replace(text, "'" + member + "'", "'MEMBER'");
  replace(text, " in dynamic symbol table", " in symbol table");
  const size_t typeName = text.find(" (SHT_");
  if (typeName != std::string::npos) text.erase(typeName, text.find(')', typeName) + 1 - typeName);
  std::string form;
  for (const char letter : text) {
    const bool isDigit = std::isdigit(static_cast<unsigned char>(letter)) != 0;
    if (!isDigit) form += letter;
    if (isDigit && !form.ends_with('N')) form += 'N';
  }
  return form;
}

Lines linesOf(const std::string& text) {
  std::istringstream stream(text);
  Lines lines;
  for (std::string line; std::getline(stream, line);)
    lines.push_back(line);
  return lines;
}

// The member that a line of the rebuild is about.
std::string expectReport(const std::string& line) {
  const std::string start = "Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols "
                            "defined in archive member #";
  const size_t name = line.find('\'', start.size()) + 1;
  const size_t text = line.find("': ", name);
  if (!line.starts_with(start) || name == 0 || text == std::string::npos) {
    ADD_FAILURE() << line;
    return "";
  }
  const std::string member = line.substr(name, text - name);
  EXPECT_EQ(knownReports().count(normalised(line.substr(text + 3), member)), 1U) << line;
  return member;
}

// Many damages leave the object with the names that it had, and so with many like it.
bool isAboutVariants(const std::string& line) {
  return line.starts_with("Warning: L6876W: Minor variants of archive member 'm") &&
         line.ends_with(".o' include multiple base variants");
}

// The members that have a row in the table of sizes.
Names sizedMembers(const std::string& output) {
  Names members;
  for (const std::string& line : linesOf(output))
    members.insert(line.substr(line.rfind(' ') + 1));
  members.erase("");
  members.erase("Name");
  members.erase("TOTAL");
  return members;
}

// A whole header, and the class; only the lesser class also needs the magic number.
bool isElfImage(const std::string& bytes) {
  if (bytes.size() < 52) return false;
  if (bytes[4] == 2) return bytes.size() >= 64;
  return bytes[4] == 1 && bytes.starts_with("\x7F"
                                            "ELF");
}

struct NamedObject {
  const char* name;
  std::string (*make)();
};

void PrintTo(const NamedObject& object, std::ostream* stream) {
  *stream << object.name;
}

class DamagedObject : public testing::TestWithParam<NamedObject> {
protected:
  // Inserts a good object behind these members, so that all are read.
  void meet(const std::vector<Member>& members) {
    ArchiveBuilder builder = archive();
    Names objects = {"new.o"};
    for (const Member& member : members) {
      builder.member(member.name, member.bytes);
      if (isElfImage(member.bytes)) objects.insert(member.name);
    }
    m_Folder.write("lib.a", builder.bytes());
    m_Folder.write("new.o", GetParam().make());
    const ToolRun insertion = m_Folder.run({"-r", "lib.a", "new.o"});
    ASSERT_EQ(insertion.status, 0) << insertion.errors;
    expectKept(members);
    const Names refused = refusedMembers(insertion.errors);
    const ToolRun sizes = m_Folder.run({"--sizes", "lib.a"});
    expectSilence(sizes);
    Names readable;
    std::set_difference(objects.begin(), objects.end(), refused.begin(), refused.end(),
                        std::inserter(readable, readable.end()));
    EXPECT_EQ(sizedMembers(sizes.output), readable);
    expectSilence(m_Folder.run({"--entries", "lib.a"}));
    expectSilence(m_Folder.run({"--zs", "lib.a"}));
  }

  // Each is told once.
  static Names refusedMembers(const std::string& errors) {
    Names refused;
    for (const std::string& line : linesOf(errors)) {
      if (isAboutVariants(line)) continue;
      EXPECT_TRUE(refused.insert(expectReport(line)).second) << line;
    }
    return refused;
  }

  static void expectSilence(const ToolRun& run) {
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.errors, "");
  }

  void expectKept(const std::vector<Member>& members) const {
    std::string error;
    const std::vector<ParsedMember> kept = parseArchive(m_Folder.read("lib.a"), error);
    EXPECT_EQ(error, "");
    ASSERT_EQ(kept.size(), members.size() + 2); // the symbol table and the new one
    for (size_t i = 0; i < members.size(); ++i)
      EXPECT_TRUE(kept[i + 1].contents == members[i].bytes) << members[i].what;
    EXPECT_EQ(kept.back().contents, GetParam().make());
  }

  ToolFolder m_Folder;
};

} // namespace

TEST_P(DamagedObject, IsNoneAtFirst) {
  m_Folder.write("x.o", GetParam().make());
  const ToolRun insertion = m_Folder.run({"--create", "lib.a", "x.o"});
  EXPECT_EQ(insertion.status, 0);
  EXPECT_EQ(insertion.errors, "");
  EXPECT_THAT(sizedMembers(m_Folder.run({"--sizes", "lib.a"}).output), testing::ElementsAre("x.o"));
}

TEST_P(DamagedObject, IsReadOrRefusedAndKept) {
  const std::vector<Member> members = damagedForms(GetParam().make());
  for (size_t first = 0; first < members.size(); first += MembersAtOnce) {
    const size_t end = std::min(first + MembersAtOnce, members.size());
    const std::vector<Member> some(members.begin() + static_cast<ptrdiff_t>(first),
                                   members.begin() + static_cast<ptrdiff_t>(end));
    SCOPED_TRACE(some.front().name + ", " + some.front().what + ", and those behind it");
    meet(some);
    // One by one, to see which it was.
    for (const Member& member : HasFatalFailure() ? some : std::vector<Member>()) {
      SCOPED_TRACE(member.what);
      meet({member});
    }
    if (HasFailure()) return;
  }
}

TEST_P(DamagedObject, IsTheSameInItsTablesAndAsAModel) {
  for (const Member& member : damagedForms(GetParam().make())) {
    SCOPED_TRACE(member.what);
    expectSameOnBothRoads(member.bytes);
    if (HasFailure()) return;
  }
}

INSTANTIATE_TEST_SUITE_P(Tool, DamagedObject,
                         testing::Values(NamedObject{"Grouped", groupedObject},
                                         NamedObject{"Shared", sharedObject},
                                         NamedObject{"Wide", wideObject}),
                         [](const auto& instance) { return instance.param.name; });

} // namespace testsupport
