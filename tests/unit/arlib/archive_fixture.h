// SPDX-License-Identifier: Apache-2.0
//
// An archive on a host in memory, with a handler that remembers what it was told. Each read is done
// once more with the symbols not wanted, and must come to the same; each test ends with no file
// left open.

#pragma once

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/archive_file_writer.h"
#include "arlib/interface/contents_reader.h"
#include "tests/support/archive_builder.h"
#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"
#include "tests/support/object_builder.h"
#include "tests/support/recording_handler.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

namespace arlib {

using testing::ElementsAre;
using testing::IsEmpty;
using testsupport::Answer;
using testsupport::archive;
using testsupport::ArchiveBuilder;
using testsupport::bigEndian;
using testsupport::FaultyHost;
using testsupport::MemoryHost;
using testsupport::object;
using testsupport::RecordingHandler;
using testsupport::textOf;

inline std::vector<std::string> namesOf(const Archive& archive) {
  std::vector<std::string> names;
  for (const ArchiveMember* member : archive.getMembers())
    names.emplace_back(member->getName());
  return names;
}

inline std::vector<std::string> symbolNamesOf(const Archive& archive) {
  std::vector<std::string> names;
  for (const Symbol* symbol : archive.getSymbols())
    names.emplace_back(symbol->getName());
  return names;
}

// The member's bytes, wherever they are; they are in memory afterwards.
inline std::string contentsOf(ArchiveMember* member) {
  return member->loadContents() ? textOf(member->getContents()) : "(unreadable)";
}

// The same of one that may not be changed, piece by piece.
inline std::string contentsOf(Archive& archive, const ArchiveMember* member) {
  ContentsReader reader(archive);
  EXPECT_TRUE(reader.start(*member));
  std::string contents;
  for (std::span<const uint8_t> piece; reader.read(piece) && !piece.empty();)
    contents += textOf(piece);
  return contents;
}

// All that there is to know of each.
inline std::vector<std::string> visitedSymbolsOf(const Archive& archive) {
  std::vector<std::string> symbols;
  EXPECT_TRUE(archive.visitSymbols([&](const Symbol& symbol) {
    symbols.push_back(std::string(symbol.getName()) + (symbol.hasBuildAttributes() ? "|" : "") +
                      std::string(symbol.getAttributeText()) + " in " +
                      std::string(symbol.getDefiningMember()->getName()));
  }));
  return symbols;
}

// Nothing else comes of it where the symbols are not wanted, and their table only passes by.
inline void expectSameWithoutSymbols(std::string_view bytes, Answer answer, bool isRead,
                                     const std::vector<std::string>& reports,
                                     const std::vector<std::string>& symbols) {
  MemoryHost host;
  host.addFile("lib.a", bytes);
  RecordingHandler handler(answer);
  Archive archive(host);
  archive.setErrorHandler(&handler);
  archive.setSymbolsWanted(false);
  EXPECT_EQ(readFile("lib.a", archive), isRead);
  EXPECT_EQ(handler.reports, reports);
  EXPECT_EQ(visitedSymbolsOf(archive), symbols);
}

// What one attempt to read "lib.a" came to.
struct Reading {
  explicit Reading(std::string_view bytes, Answer answer = Answer::GoOnIfTolerable)
      : handler(answer) {
    host.addFile("lib.a", bytes);
    archive.setErrorHandler(&handler);
    isRead = readFile("lib.a", archive);
    expectSameWithoutSymbols(bytes, answer, isRead, handler.reports, visitedSymbolsOf(archive));
  }
  explicit Reading(const ArchiveBuilder& builder, Answer answer = Answer::GoOnIfTolerable)
      : Reading(std::string_view(builder.bytes()), answer) {}

  MemoryHost host;
  RecordingHandler handler;
  Archive archive{host};
  bool isRead = false;
};

// The same with no handler at all.
inline bool isReadWithoutHandler(const ArchiveBuilder& builder) {
  MemoryHost host;
  host.addFile("lib.a", builder.bytes());
  Archive archive(host);
  const bool isRead = readFile("lib.a", archive);
  EXPECT_TRUE(isRead || archive.getMembers().empty());
  EXPECT_EQ(host.openHandles(), 0u);
  return isRead;
}

class ArchiveTest : public testing::Test {
protected:
  // Files that are kept in memory can't fail later.
  ArchiveTest() {
    m_Archive.setErrorHandler(&m_Handler);
    m_Archive.getSourceFiles().setMostKept(0);
  }

  // No file may stay open that nobody reads any more.
  ~ArchiveTest() override {
    m_Archive.clear();
    EXPECT_EQ(m_Host.openHandles(), 0u);
  }

  void read(std::string_view bytes) {
    m_Host.addFile("lib.a", bytes);
    ASSERT_TRUE(readFile("lib.a", m_Archive));
  }
  void read(const ArchiveBuilder& builder) { read(std::string_view(builder.bytes())); }

  ArchiveMember* member(uint32_t index) { return m_Archive.getMembers()[index]; }

  ArchiveMember* add(const char* fileName, std::string_view bytes) {
    m_Host.addFile(fileName, bytes);
    return m_Archive.addMemberFromFile(fileName);
  }

  std::vector<std::string> reports() { return m_Handler.take(); }

  MemoryHost m_Host;
  RecordingHandler m_Handler;
  Archive m_Archive{m_Host};
};

} // namespace arlib
