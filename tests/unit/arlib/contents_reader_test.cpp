// SPDX-License-Identifier: Apache-2.0
//
// Reading contents in pieces, of members in files and in memory, small and large. A file that
// fails, ends too early or was written to meanwhile must be reported; half a member must never pass
// for a whole one.

#include "arlib/interface/contents_reader.h"

#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>

namespace arlib {

namespace {

class ContentsReaderTest : public ArchiveTest {
protected:
  static std::string readAll(ContentsReader& reader, const ArchiveMember& member) {
    std::string text;
    if (!reader.start(member)) return "(failed)";
    std::span<const uint8_t> piece;
    do {
      if (!reader.read(piece)) return "(failed)";
      text += textOf(piece);
    } while (!piece.empty());
    return text;
  }
};

} // namespace

TEST_F(ContentsReaderTest, ReadsMembersOfAnySizeInAnyOrder) {
  std::string large(700'001, '.');
  for (size_t i = 0; i < large.size(); ++i)
    large[i] = static_cast<char>(i ^ (i >> 9));
  read(archive().member("a", "small").member("b", large).member("c", "").member("d", "x"));
  ContentsReader reader(m_Archive);
  for (const uint32_t index : {1u, 0u, 3u, 1u, 2u, 0u}) {
    const std::vector<std::string> expected = {"small", large, "", "x"};
    EXPECT_EQ(readAll(reader, *member(index)), expected[index]);
  }
  EXPECT_TRUE(reader.finish());
  EXPECT_TRUE(reader.finish());
}

TEST_F(ContentsReaderTest, ReadsFromFilesAndFromMemory) {
  read(archive().member("a", "archive"));
  add("b", "file");
  m_Archive.addMember("c", 0, 0, 0, 0)->setContents("memory", 6);
  ContentsReader reader(m_Archive);
  EXPECT_EQ(readAll(reader, *member(1)), "file");
  EXPECT_EQ(readAll(reader, *member(2)), "memory");
  EXPECT_EQ(readAll(reader, *member(0)), "archive");
}

TEST_F(ContentsReaderTest, KeepsAFileOpenFromMemberToMember) {
  read(archive().member("a", "1").member("b", "2").member("c", "3"));
  FaultyHost host(m_Host);
  Archive archive(host);
  ASSERT_TRUE(readFile("lib.a", archive));
  host.failCall(0, 0);
  ContentsReader reader(archive);
  for (const ArchiveMember* each : archive.getMembers())
    readAll(reader, *each);
  EXPECT_TRUE(reader.finish());
  EXPECT_LE(host.getCallCount(), 3u);
}

TEST_F(ContentsReaderTest, ReportsEachKindOfFailure) {
  m_Host.addFile("x", "1234");
  FaultyHost host(m_Host);
  Archive archive(host);
  archive.setErrorHandler(&m_Handler);
  archive.getSourceFiles().setMostKept(0);
  const ArchiveMember* added = archive.addMemberFromFile("x");
  ContentsReader reader(archive);
  std::span<const uint8_t> piece;
  archive.closeFiles();
  host.failCall(1, EMFILE);
  EXPECT_TRUE(reader.start(*added));
  EXPECT_FALSE(reader.read(piece));
  EXPECT_EQ(reader.getError(), EMFILE);
  host.failCall(3, EIO);
  EXPECT_TRUE(reader.start(*added));
  EXPECT_FALSE(reader.read(piece));
  EXPECT_EQ(reader.getError(), EIO);
  host.failCall(1, EIO);
  EXPECT_FALSE(reader.finish());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'x': Too many open files",
                                     "0 I/O error reading file 'x': Input/output error",
                                     "0 I/O error reading file 'x': Input/output error"));
}

TEST_F(ContentsReaderTest, ReportsAFileThatEndsTooEarlyWithoutAReason) {
  const ArchiveMember* added = add("x", "1234");
  m_Host.at("x").bytes = "123";
  ContentsReader reader(m_Archive);
  EXPECT_EQ(readAll(reader, *added), "(failed)");
  EXPECT_EQ(reader.getError(), 0);
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'x'"));
}

TEST_F(ContentsReaderTest, ReadsWhatIsKeptInMemory) {
  m_Archive.getSourceFiles().setMostKept(1000);
  const ArchiveMember* added = add("x", "1234");
  const ArchiveMember* empty = add("y", "");
  m_Host.addFile("x", "another");
  ContentsReader reader(m_Archive);
  EXPECT_EQ(readAll(reader, *added), "1234");
  EXPECT_EQ(readAll(reader, *empty), "");
  EXPECT_TRUE(reader.finish());
  EXPECT_EQ(m_Host.openHandles(), 0u);
}

// Bytes of before and after would make a member that nobody has ever seen.
TEST_F(ContentsReaderTest, ReportsAFileThatWasWrittenToMeanwhile) {
  const ArchiveMember* grown = add("x", "1234");
  const ArchiveMember* rewritten = add("y", "1234");
  const ArchiveMember* kept = add("z", "1234");
  ContentsReader reader(m_Archive);
  EXPECT_EQ(readAll(reader, *grown), "1234");
  m_Host.at("x").bytes += "5";
  EXPECT_FALSE(reader.finish());
  EXPECT_EQ(reader.getError(), support::FileHasChanged);
  EXPECT_FALSE(reader.start(*rewritten));
  EXPECT_EQ(readAll(reader, *rewritten), "1234");
  m_Host.at("y").modificationTime += 1;
  EXPECT_FALSE(reader.start(*kept));
  EXPECT_EQ(readAll(reader, *kept), "1234");
  EXPECT_TRUE(reader.finish());
  EXPECT_THAT(reports(), ElementsAre("0 I/O error reading file 'x': Stale file handle",
                                     "0 I/O error reading file 'x': Stale file handle",
                                     "0 I/O error reading file 'y': Stale file handle"));
}

} // namespace arlib
