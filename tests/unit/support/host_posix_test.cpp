// SPDX-License-Identifier: Apache-2.0
//
// What the POSIX host does with links, FIFOs, modes, signals and limits: no call waits for a FIFO's
// other end, a temporary is made only where nothing is, and none outlives a signal.

#include "tests/support/bytes.h"
#include "tests/unit/support/host_fixture.h"

#include <gmock/gmock.h>

#include <cerrno>
#include <csignal>
#include <cstring>
#include <functional>
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

class PosixHostTest : public HostTest {
protected:
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
};

} // namespace

TEST_F(PosixHostTest, NeverWaitsForTheOtherEndOfAFifo) {
  ASSERT_EQ(mkfifo(at("fifo").c_str(), 0600), 0);
  FileHandle file;
  EXPECT_EQ(m_Host.openForReading(at("fifo").c_str(), file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  EXPECT_EQ(m_Host.openForWriting(at("fifo").c_str(), file), ENXIO);
}

TEST_F(PosixHostTest, TellsThatADiskIsFull) {
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting("/dev/full", file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("x")), ENOSPC);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(PosixHostTest, MakesNoTemporaryThroughALink) {
  fs::create_symlink("nowhere", at("link"));
  FileHandle file;
  EXPECT_EQ(m_Host.createTemporary(at("link").c_str(), file), EEXIST);
}

TEST_F(PosixHostTest, HasAPlaceForTemporariesThatNobodyNames) {
  std::string name;
  FileHandle file;
  for (const char* place : {"", static_cast<const char*>(nullptr)}) {
    testsupport::setTemporaryPlace(place);
    ASSERT_EQ(m_Host.createUnnamedTemporary(name, file), 0);
    EXPECT_EQ(fs::path(name).parent_path(), "/tmp");
    EXPECT_EQ(m_Host.close(file), 0);
    EXPECT_EQ(m_Host.remove(name.c_str()), 0);
  }
}

TEST_F(PosixHostTest, TellsWhoseAFileIs) {
  make("file", "12345");
  chmod(at("file").c_str(), 0640);
  FileStatus status;
  ASSERT_EQ(m_Host.status(at("file").c_str(), status), 0);
  EXPECT_EQ(status.mode, static_cast<uint32_t>(S_IFREG | 0640));
  EXPECT_EQ(status.uid, getuid());
  EXPECT_EQ(status.gid, getgid());
  fs::create_symlink("file", at("link"));
  FileStatus through;
  ASSERT_EQ(m_Host.status(at("link").c_str(), through), 0);
  EXPECT_TRUE(through.isSameFile(status));
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

TEST_F(PosixHostTest, AsksForTheUserWhetherAFileMayBeWritten) {
  make("file", "");
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

TEST_F(PosixHostTest, ListsLinksThatLeadNowhere) {
  fs::create_symlink("nowhere", at("dangling"));
  std::vector<std::string> names;
  EXPECT_EQ(m_Host.listDirectory(getFolder().c_str(), names), 0);
  EXPECT_THAT(names, testing::ElementsAre("dangling"));
}

TEST_F(PosixHostTest, FindsNamesInTheOrderOfTheirBytes) {
  for (const char* leaf : {"b.o", "B.o", "a.o", "A.O"})
    make(leaf, "");
  std::vector<std::string> names;
  EXPECT_EQ(m_Host.findNames(getFolder() + "/", "*.o", names), 0);
  EXPECT_THAT(names, testing::ElementsAre("B.o", "a.o", "b.o"));
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
