// SPDX-License-Identifier: Apache-2.0
//
// The archives of docs/formats.md, as the archive library reads them: the bytes of each dump are
// read without a report, told of field by field in the document's own words, and written back as
// they were. A digit or word of the document that the code doesn't agree with fails here.

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/archive_file_writer.h"
#include "arlib/interface/archive_format.h"
#include "tests/docs/document.h"
#include "tests/support/memory_host.h"
#include "tests/support/recording_handler.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sstream>

namespace documents {
namespace {

using arlib::Archive;
using arlib::ArchiveMember;
using arlib::Symbol;

// Tells of each byte of an archive what was read from it.
class ArchiveTeller {
public:
  ArchiveTeller(const Archive& archive, std::string_view bytes)
      : m_Archive(archive), m_Dump(bytes) {}

  std::string tell() {
    m_Dump.tell(arlib::ArchiveMagic.size(), "\"!<arch>\", newline");
    for (ArchiveMember* member : m_Archive.getMembers())
      tellMember(*member);
    EXPECT_EQ(m_Dump.rest(), "");
    return m_Dump.text();
  }

private:
  void tellMember(ArchiveMember& member) {
    tellHeader(member);
    if (&member == m_Archive.getSymbolTable())
      tellSymbolTable();
    else if (&member == m_Archive.getFileNameTable())
      tellLongNames();
    else
      tellContents(member);
    if (member.getSize() % 2 != 0) m_Dump.tell(1, "padding");
  }

  std::string nameMeaning(const ArchiveMember& member) const {
    if (&member == m_Archive.getSymbolTable()) return "the symbol table";
    if (&member == m_Archive.getFileNameTable()) return "the long-name table";
    if (member.getFileNameTableOffset() == ArchiveMember::NoFileNameTableOffset)
      return inQuotes(member.getName());
    return "at " + std::to_string(member.getFileNameTableOffset()) +
           " in the table: " + inQuotes(member.getName());
  }

  void tellHeader(const ArchiveMember& member) {
    std::ostringstream mode;
    mode << std::oct << member.getMode();
    m_Dump.tell(arlib::NameField.width, "name: " + nameMeaning(member));
    m_Dump.tell(arlib::DateField.width, "date: " + std::to_string(member.getDate()));
    m_Dump.tell(arlib::UidField.width, "uid: " + std::to_string(member.getUid()));
    m_Dump.tell(arlib::GidField.width, "gid: " + std::to_string(member.getGid()));
    m_Dump.tell(arlib::ModeField.width, "mode: " + mode.str());
    m_Dump.tell(arlib::SizeField.width, "size: " + std::to_string(member.getSize()));
    m_Dump.tell(arlib::MagicField.width, "\"`\", newline");
  }

  void tellContents(ArchiveMember& member) {
    ASSERT_TRUE(member.loadContents());
    const std::span<const uint8_t> bytes = member.getContents();
    const std::string text(bytes.begin(), bytes.end());
    m_Dump.tell(bytes.size(), "contents: " + inQuotes(text));
  }

  void tellSymbolTable() {
    m_Dump.tell(4, "symbols: " + std::to_string(m_Archive.getSymbols().size()));
    for (const Symbol* symbol : m_Archive.getSymbols()) {
      const ArchiveMember& member = *symbol->getDefiningMember();
      m_Dump.tell(4, "of the member at " + std::to_string(member.getOffset()) + ", " +
                         inQuotes(member.getName()));
    }
    for (const Symbol* symbol : m_Archive.getSymbols())
      tellSymbolName(*symbol);
  }

  void tellSymbolName(const Symbol& symbol) {
    const std::string_view name = symbol.getName();
    if (!symbol.hasBuildAttributes()) {
      m_Dump.tell(name.size() + 1, inQuotes(name) + ", NUL");
      return;
    }
    m_Dump.tell(name.size(), inQuotes(name));
    m_Dump.tell(arlib::AttributeMarker.size(), inQuotes(arlib::AttributeMarker));
    m_Dump.tell(symbol.getAttributeText().size() + 1,
                inQuotes(symbol.getAttributeText()) + ", NUL");
  }

  void tellLongNames() {
    for (const ArchiveMember* member : m_Archive.getMembers()) {
      if (member->getFileNameTableOffset() != ArchiveMember::NoFileNameTableOffset)
        m_Dump.tell(member->getName().size() + arlib::LongNameTerminator.size(),
                    inQuotes(member->getName()) + ", \"/\", newline");
    }
  }

  const Archive& m_Archive;
  DumpWriter m_Dump;
};

// Reads it without a report, and writes it back as it was.
void expectToldAsIn(const std::string& dump) {
  const std::string bytes = bytesOfDump(dump);
  testsupport::MemoryHost host;
  host.addFile("lib.a", bytes);
  testsupport::RecordingHandler handler;
  Archive archive(host);
  archive.setErrorHandler(&handler);
  ASSERT_TRUE(readFile("lib.a", archive));
  EXPECT_EQ(ArchiveTeller(archive, bytes).tell(), dump);
  EXPECT_TRUE(writeFile("again.a", archive));
  EXPECT_EQ(host.read("again.a"), bytes);
  EXPECT_THAT(handler.reports, testing::IsEmpty());
}

TEST(FormatsDocument, TellsOfEachByteOfAnArchive) {
  expectToldAsIn(example("archive"));
}

// That the tool makes it of its two files is for a transcript to show.
TEST(FormatsDocument, TellsOfEachByteOfANormalisedArchive) {
  expectToldAsIn(example("archive-normalised"));
}

} // namespace
} // namespace documents
