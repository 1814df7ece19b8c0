// SPDX-License-Identifier: Apache-2.0
//
// The library on every damaged form of a good archive: what can be read can be written, and what
// was written can be read again.
//
// Damaged forms: every prefix, and every byte of headers and tables set to 0x00, 0xFF and its
// complement (damaged_archives.h). It never matters here which report comes, but that nothing
// beyond the bytes is looked at, and that what passes for an archive is one.

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/archive_file_writer.h"
#include "tests/support/memory_host.h"
#include "tests/support/recording_handler.h"
#include "tests/systematic/damaged_archives.h"

#include <gtest/gtest.h>

namespace arlib {

namespace {

using testsupport::Answer;
using testsupport::MemoryHost;
using testsupport::RecordingHandler;

std::vector<std::string> contentsOf(Archive& archive) {
  std::vector<std::string> all;
  for (ArchiveMember* member : archive.getMembers()) {
    if (member->isAuxiliary()) continue;
    EXPECT_TRUE(member->loadContents());
    const auto bytes = member->getContents();
    all.push_back(std::string(member->getName()) + ":" + std::string(bytes.begin(), bytes.end()));
  }
  return all;
}

// Whether the first member would be taken for a table: it has no name, and no table stands before
// it. Such an archive can be written, but says something else when it is read.
bool beginsWithoutAName(const Archive& archive) {
  const auto members = archive.getMembers();
  return !members.empty() && !members.front()->isAuxiliary() && members.front()->getName().empty();
}

void readWriteAndReadAgain(const std::string& bytes, Answer answer, SymbolTableMode mode) {
  MemoryHost host;
  host.addFile("lib.a", bytes);
  RecordingHandler handler(answer);
  Archive archive(host);
  archive.setErrorHandler(&handler);
  if (!readFile("lib.a", archive)) {
    EXPECT_FALSE(handler.reports.empty());
    EXPECT_TRUE(archive.getMembers().empty());
    EXPECT_EQ(host.read("lib.a"), bytes);
    EXPECT_EQ(host.openHandles(), 0u);
    return;
  }
  handler.take();
  host.addFile("new.o", testsupport::object().bytes());
  ASSERT_NE(archive.addMemberFromFile("new.o"), nullptr);
  archive.setSymbolTableMode(mode);
  const std::vector<std::string> before = contentsOf(archive);
  ASSERT_TRUE(writeFile("lib.a", archive));
  EXPECT_TRUE(handler.reports.empty());
  EXPECT_EQ(host.openHandles(), 0u);
  EXPECT_EQ(host.getNames(), (std::vector<std::string>{"lib.a", "new.o"}));
  if (beginsWithoutAName(archive)) return;
  Archive again(host);
  again.setErrorHandler(&handler);
  ASSERT_TRUE(readFile("lib.a", again));
  EXPECT_TRUE(handler.reports.empty()) << handler.reports.front();
  EXPECT_EQ(contentsOf(again), before);
}

void tryAll(const std::string& what, const std::string& bytes) {
  SCOPED_TRACE(what);
  for (const Answer answer : {Answer::GiveUp, Answer::GoOnIfTolerable, Answer::GoOnIfPossible}) {
    for (const SymbolTableMode mode : {SymbolTableMode::Always, SymbolTableMode::Never})
      readWriteAndReadAgain(bytes, answer, mode);
  }
}

} // namespace

TEST(DamagedArchive, IsReadAndWrittenOrRefusedAtEveryPrefix) {
  testsupport::forEachPrefix(tryAll);
}

TEST(DamagedArchive, IsReadAndWrittenOrRefusedForEveryChangedByte) {
  testsupport::forEachChangedByte(tryAll);
}

TEST(DamagedArchive, IsReadableOnlyWhereAMemberEnds) {
  std::string error;
  const std::string good = testsupport::goodArchive();
  std::vector<size_t> ends = {8};
  for (const auto& member : testsupport::parseArchive(good, error))
    ends.push_back(member.offset + 60 + member.contents.size() + member.contents.size() % 2);
  // Symbols point at members that a short prefix no longer has; that is tolerable.
  testsupport::forEachPrefix([&](const std::string& what, const std::string& bytes) {
    MemoryHost host;
    host.addFile("lib.a", bytes);
    RecordingHandler handler;
    Archive archive(host);
    archive.setErrorHandler(&handler);
    EXPECT_EQ(readFile("lib.a", archive),
              std::find(ends.begin(), ends.end(), bytes.size()) != ends.end())
        << what;
  });
}

} // namespace arlib
