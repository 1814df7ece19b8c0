// SPDX-License-Identifier: Apache-2.0
//
// The host that the process runs on, in a folder of its own: real files, links, FIFOs, signals and
// limits. What it promises is what the rest builds on: no call waits for a FIFO's other end, a
// temporary is made only where nothing is, and none outlives a signal.

#include "support/interface/host.h"

#include "tests/support/bytes.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <functional>
#include <iterator>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <unistd.h>

namespace support {

namespace {

using testsupport::bytesOf;

namespace fs = std::filesystem;

class PosixHostTest : public testing::Test {
protected:
  PosixHostTest() {
    std::string name = testing::TempDir() + "quarn-host.XXXXXX";
    m_Folder = mkdtemp(name.data());
  }
  ~PosixHostTest() override { fs::remove_all(m_Folder); }

  std::string at(const std::string& leaf) const { return (m_Folder / leaf).string(); }

  void make(const std::string& leaf, const std::string& text) const {
    std::ofstream(at(leaf), std::ios::binary) << text;
  }

  std::string read(const std::string& leaf) const {
    std::ifstream stream(at(leaf), std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
  }

  std::vector<std::string> leaves() const {
    std::vector<std::string> names;
    for (const auto& entry : fs::directory_iterator(m_Folder))
      names.push_back(entry.path().filename().string());
    std::sort(names.begin(), names.end());
    return names;
  }

  FileKind kind(const std::string& leaf) {
    FileStatus status;
    const HostError error = m_Host.status(at(leaf).c_str(), status);
    EXPECT_EQ(error == 0, status.kind != FileKind::Nothing);
    return status.kind;
  }

  // Does the work in a process of its own, and returns how that ended.
  static int runApart(const std::function<void()>& work) {
    const pid_t child = fork();
    if (child == 0) {
      work();
      _exit(0);
    }
    int state = 0;
    waitpid(child, &state, 0);
    return state;
  }

  fs::path m_Folder;
  Host& m_Host = getNativeHost();
};

} // namespace

TEST_F(PosixHostTest, ReadsAtAnyOffsetAndTellsTheEnd) {
  make("file", "0123456789");
  FileHandle file;
  ASSERT_EQ(m_Host.openForReading(at("file").c_str(), file), 0);
  std::array<uint8_t, 4> bytes;
  size_t done = 99;
  EXPECT_EQ(m_Host.readAt(file, bytes, 2, done), 0);
  EXPECT_EQ(done, 4u);
  EXPECT_EQ(bytes[0], '2');
  EXPECT_EQ(m_Host.readAt(file, bytes, 8, done), 0);
  EXPECT_EQ(done, 2u);
  EXPECT_EQ(m_Host.readAt(file, bytes, 100, done), 0);
  EXPECT_EQ(done, 0u);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(PosixHostTest, FailsAtOnceWithTheErrorNumber) {
  FileHandle file;
  EXPECT_EQ(m_Host.openForReading(at("gone").c_str(), file), ENOENT);
  EXPECT_FALSE(file.isOpen());
  EXPECT_EQ(m_Host.openForWriting(m_Folder.c_str(), file), EISDIR);
  EXPECT_EQ(m_Host.openForWriting(at("no/such").c_str(), file), ENOENT);
  EXPECT_EQ(m_Host.createTemporary(at("no/such").c_str(), file), ENOENT);
  EXPECT_EQ(m_Host.openForWriting(at(std::string(256, 'x')).c_str(), file), ENAMETOOLONG);
  EXPECT_EQ(m_Host.rename(at("gone").c_str(), at("x").c_str()), ENOENT);
  EXPECT_EQ(m_Host.remove(at("gone").c_str()), ENOENT);
  EXPECT_EQ(m_Host.remove(m_Folder.c_str()), EISDIR);
  EXPECT_TRUE(fs::exists(m_Folder));
  EXPECT_EQ(m_Host.close(FileHandle{12345}), EBADF);
}

TEST_F(PosixHostTest, ReportsTheReadOfADirectory) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForReading(m_Folder.c_str(), file), 0);
  std::array<uint8_t, 4> bytes;
  size_t done = 99;
  EXPECT_EQ(m_Host.readAt(file, bytes, 0, done), EISDIR);
  EXPECT_EQ(done, 0u);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(PosixHostTest, NeverWaitsForTheOtherEndOfAFifo) {
  ASSERT_EQ(mkfifo(at("fifo").c_str(), 0600), 0);
  FileHandle file;
  EXPECT_EQ(m_Host.openForReading(at("fifo").c_str(), file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(m_Host.openForWriting(at("fifo").c_str(), file), ENXIO);
}

TEST_F(PosixHostTest, WritesAllBytesOrFails) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("abc")), 0);
  EXPECT_EQ(m_Host.write(file, {}), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("def")), 0);
  EXPECT_EQ(m_Host.flush(file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(read("file"), "abcdef");
  ASSERT_EQ(m_Host.openForWriting("/dev/full", file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("x")), ENOSPC);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(PosixHostTest, EmptiesAFileThatIsOpenedForWriting) {
  make("file", "old text");
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(read("file"), "");
}

TEST_F(PosixHostTest, MakesATemporaryOnlyWhereNothingIs) {
  make("file", "somebody's");
  fs::create_symlink("nowhere", at("link"));
  FileHandle file;
  EXPECT_EQ(m_Host.createTemporary(at("file").c_str(), file), EEXIST);
  EXPECT_EQ(m_Host.createTemporary(at("link").c_str(), file), EEXIST);
  EXPECT_EQ(read("file"), "somebody's");
  ASSERT_EQ(m_Host.createTemporary(at("new").c_str(), file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("text")), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(read("new"), "text");
  EXPECT_EQ(m_Host.remove(at("new").c_str()), 0);
}

TEST_F(PosixHostTest, FindsANameForATemporaryByItself) {
  setenv("TMPDIR", m_Folder.c_str(), 1);
  std::string first;
  std::string second;
  FileHandle file;
  EXPECT_EQ(m_Host.createUnnamedTemporary(first, file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(m_Host.createUnnamedTemporary(second, file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_NE(first, second);
  EXPECT_EQ(fs::path(first).parent_path(), m_Folder);
  EXPECT_EQ(m_Host.remove(first.c_str()), 0);
  EXPECT_EQ(m_Host.remove(second.c_str()), 0);
  setenv("TMPDIR", at("no/such/place").c_str(), 1);
  EXPECT_EQ(m_Host.createUnnamedTemporary(first, file), ENOENT);
  for (const char* place : {"", static_cast<const char*>(nullptr)}) {
    place == nullptr ? unsetenv("TMPDIR") : setenv("TMPDIR", place, 1);
    ASSERT_EQ(m_Host.createUnnamedTemporary(first, file), 0);
    EXPECT_EQ(fs::path(first).parent_path(), "/tmp");
    EXPECT_EQ(m_Host.close(file), 0);
    EXPECT_EQ(m_Host.remove(first.c_str()), 0);
  }
}

TEST_F(PosixHostTest, PutsOneFileInThePlaceOfAnother) {
  make("old", "old");
  make("new", "new");
  EXPECT_EQ(m_Host.rename(at("new").c_str(), at("old").c_str()), 0);
  EXPECT_EQ(read("old"), "new");
  EXPECT_THAT(leaves(), testing::ElementsAre("old"));
}

TEST_F(PosixHostTest, TellsWhatAFileIs) {
  make("file", "12345");
  chmod(at("file").c_str(), 0640);
  FileStatus status;
  ASSERT_EQ(m_Host.status(at("file").c_str(), status), 0);
  EXPECT_EQ(status.kind, FileKind::RegularFile);
  EXPECT_EQ(status.size, 5);
  EXPECT_EQ(status.mode, static_cast<uint32_t>(S_IFREG | 0640));
  EXPECT_EQ(status.uid, getuid());
  EXPECT_EQ(status.gid, getgid());
  EXPECT_NEAR(static_cast<double>(status.modificationTime), static_cast<double>(time(nullptr)), 60);
  fs::create_symlink("file", at("link"));
  FileStatus through;
  ASSERT_EQ(m_Host.status(at("link").c_str(), through), 0);
  EXPECT_TRUE(through.isSameFile(status));
  FileHandle file;
  ASSERT_EQ(m_Host.openForReading(at("file").c_str(), file), 0);
  ASSERT_EQ(m_Host.statusOf(file, through), 0);
  EXPECT_TRUE(through.isSameFile(status));
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(m_Host.statusOf(FileHandle{12345}, through), EBADF);
  EXPECT_EQ(through.kind, FileKind::Nothing);
}

TEST_F(PosixHostTest, KnowsTheKindsOfFiles) {
  fs::create_directory(at("dir"));
  ASSERT_EQ(mkfifo(at("fifo").c_str(), 0600), 0);
  const int socketNumber = socket(AF_UNIX, SOCK_STREAM, 0);
  sockaddr_un address = {};
  address.sun_family = AF_UNIX;
  ASSERT_LT(at("socket").size(), sizeof address.sun_path);
  std::strcpy(address.sun_path, at("socket").c_str());
  ASSERT_EQ(bind(socketNumber, reinterpret_cast<sockaddr*>(&address), sizeof address), 0);
  close(socketNumber);
  fs::create_symlink("nowhere", at("dangling"));
  EXPECT_EQ(kind("dir"), FileKind::Directory);
  EXPECT_EQ(kind("fifo"), FileKind::Special);
  EXPECT_EQ(kind("socket"), FileKind::Special);
  EXPECT_EQ(kind("dangling"), FileKind::Nothing);
  EXPECT_EQ(kind("gone"), FileKind::Nothing);
  EXPECT_EQ(kind("../../../../../../../../dev/null"), FileKind::Special);
}

TEST_F(PosixHostTest, NothingIsTheSameFileAsNothing) {
  EXPECT_FALSE(FileStatus().isSameFile(FileStatus()));
}

TEST_F(PosixHostTest, AsksWhetherAFileMayBeWritten) {
  make("file", "");
  EXPECT_TRUE(m_Host.isWritable(at("file").c_str()));
  EXPECT_FALSE(m_Host.isWritable(at("gone").c_str()));
  chmod(at("file").c_str(), 0444);
  EXPECT_EQ(m_Host.isWritable(at("file").c_str()), getuid() == 0);
}

TEST_F(PosixHostTest, SetsPermissionBitsAlone) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  m_Host.setPermissions(file, 0100751);
  FileStatus status;
  ASSERT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.mode, static_cast<uint32_t>(S_IFREG | 0751));
  EXPECT_EQ(m_Host.close(file), 0);
  m_Host.setPermissions(FileHandle{12345}, 0600);
}

TEST_F(PosixHostTest, SetsTimes) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  m_Host.setTimes(file, 1'000'000'000);
  FileStatus status;
  ASSERT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.modificationTime, 1'000'000'000);
  EXPECT_EQ(m_Host.close(file), 0);
  m_Host.setTimes(FileHandle{12345}, 0);
}

TEST_F(PosixHostTest, FollowsLinksToTheirEnd) {
  fs::create_directory(at("dir"));
  make("file", "");
  fs::create_symlink("file", at("one"));
  fs::create_symlink("dir/three", at("two"));
  fs::create_symlink("../one", at("dir/three"));
  fs::create_symlink(at("file"), at("absolute"));
  fs::create_symlink("nowhere", at("dangling"));
  EXPECT_EQ(m_Host.followLinks(at("file").c_str()), at("file"));
  EXPECT_EQ(m_Host.followLinks(at("gone").c_str()), at("gone"));
  EXPECT_EQ(m_Host.followLinks(at("one").c_str()), at("file"));
  EXPECT_EQ(m_Host.followLinks(at("two").c_str()), at("dir/../file"));
  EXPECT_EQ(m_Host.followLinks(at("absolute").c_str()), at("file"));
  EXPECT_EQ(m_Host.followLinks(at("dangling").c_str()), at("nowhere"));
}

TEST_F(PosixHostTest, GivesACircleOfLinksUpUnderItsOwnName) {
  fs::create_symlink("b", at("a"));
  fs::create_symlink("a", at("b"));
  EXPECT_EQ(m_Host.followLinks(at("a").c_str()), at("a"));
}

TEST_F(PosixHostTest, ListsADirectoryWithoutItsDots) {
  make("b", "");
  make(".hidden", "");
  fs::create_directory(at("dir"));
  fs::create_symlink("nowhere", at("dangling"));
  std::vector<std::string> names = {"old"};
  EXPECT_EQ(m_Host.listDirectory(m_Folder.c_str(), names), 0);
  EXPECT_THAT(names, testing::UnorderedElementsAre("b", ".hidden", "dir", "dangling"));
  EXPECT_EQ(m_Host.listDirectory(at("gone").c_str(), names), ENOENT);
  EXPECT_TRUE(names.empty());
  EXPECT_EQ(m_Host.listDirectory(at("b").c_str(), names), ENOTDIR);
}

TEST_F(PosixHostTest, LosesNoTemporaryToASignal) {
  for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGPIPE}) {
    const int state = runApart([&] {
      installSignalCleanUp();
      FileHandle file;
      for (const char* leaf : {"one", "two", "three", "four"})
        if (m_Host.createTemporary(at(leaf).c_str(), file) != 0) _exit(1);
      // What was renamed or removed is no temporary any more.
      if (m_Host.rename(at("two").c_str(), at("kept").c_str()) != 0) _exit(1);
      if (m_Host.remove(at("three").c_str()) != 0) _exit(1);
      make("three", "somebody's");
      std::raise(signal);
    });
    EXPECT_TRUE(WIFSIGNALED(state) && WTERMSIG(state) == signal) << signal;
    EXPECT_THAT(leaves(), testing::ElementsAre("kept", "three"));
    fs::remove(at("kept"));
    fs::remove(at("three"));
  }
}

TEST_F(PosixHostTest, KeepsIgnoringWhatItsParentIgnores) {
  const int state = runApart([] {
    std::signal(SIGHUP, SIG_IGN);
    installSignalCleanUp();
    std::raise(SIGHUP);
  });
  EXPECT_TRUE(WIFEXITED(state) && WEXITSTATUS(state) == 0);
}

TEST_F(PosixHostTest, WorksWithMoreTemporariesThanItCanRemember) {
  for (int i = 0; i < 40; ++i) {
    FileHandle file;
    ASSERT_EQ(m_Host.createTemporary(at(std::to_string(i)).c_str(), file), 0);
    EXPECT_EQ(m_Host.close(file), 0);
  }
  for (int i = 0; i < 40; ++i)
    EXPECT_EQ(m_Host.remove(at(std::to_string(i)).c_str()), 0);
  EXPECT_TRUE(leaves().empty());
}

TEST_F(PosixHostTest, TakesAFileSizeLimitForAFailedWrite) {
  const int state = runApart([&] {
    installSignalCleanUp();
    const rlimit limit = {10, 10};
    setrlimit(RLIMIT_FSIZE, &limit);
    FileHandle file;
    if (m_Host.openForWriting(at("file").c_str(), file) != 0) _exit(1);
    _exit(m_Host.write(file, bytesOf("more than ten bytes")) == EFBIG ? 0 : 2);
  });
  EXPECT_TRUE(WIFEXITED(state) && WEXITSTATUS(state) == 0) << state;
}

} // namespace support
