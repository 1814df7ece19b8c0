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
#include <fcntl.h>
#include <functional>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <sys/xattr.h>
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

  static constexpr const char* AccessList = "system.posix_acl_access";

  // As the host keeps it in that attribute.
  static std::vector<uint8_t> listOfSomebody() {
    std::vector<uint8_t> list = {2, 0, 0, 0}; // the version
    const auto add = [&list](uint8_t tag, uint8_t rights, uint32_t id) {
      list.insert(list.end(), {tag, 0, rights, 0});
      for (int shift = 0; shift < 32; shift += 8)
        list.push_back(static_cast<uint8_t>(id >> shift));
    };
    constexpr uint32_t Nobody = 0xFFFFFFFF;
    add(0x01, 6, Nobody); // the owner reads and writes,
    add(0x02, 4, 77);     // somebody else reads,
    add(0x04, 0, Nobody); // the group does nothing,
    add(0x10, 4, Nobody); // nobody but the owner ever does more than read,
    add(0x20, 0, Nobody); // and all others do nothing
    return list;
  }

  static std::vector<uint8_t> accessListOf(const std::string& name) {
    std::vector<uint8_t> list(1024);
    const ssize_t size = getxattr(name.c_str(), AccessList, list.data(), list.size());
    list.resize(size < 0 ? 0 : static_cast<size_t>(size));
    return list;
  }

  // A temporary that can have a name on its own disk alone, and a name on another one; the name is
  // empty where there is no other disk, or no file without a name.
  std::string makeForElsewhere(TemporaryFile& file) {
    FileStatus here;
    FileStatus there;
    EXPECT_EQ(m_Host.status(getFolder().c_str(), here), 0);
    if (m_Host.status("/dev/shm", there) != 0 || here.device == there.device) return "";
    EXPECT_EQ(m_Host.createTemporary(at("new").c_str(), 0600, file), 0);
    if (!file.hasName) return "/dev/shm/quarn-host." + std::to_string(getpid());
    EXPECT_EQ(m_Host.close(file.handle), 0);
    m_Host.removeUnfinished();
    return "";
  }

  // A sanitizer takes faults for its own; the tool's process has none of its handlers.
  static void forgetSanitizers() {
    for (const int signal : {SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGABRT, SIGTRAP})
      std::signal(signal, SIG_DFL);
  }

  // Ends by a full stack.
  static int fillStack(int depth) { // NOLINT(misc-no-recursion)
    volatile char filler[1024] = {};
    filler[0] = static_cast<char>(depth);
    return depth < 0 ? filler[0] : fillStack(depth + 1) + filler[0];
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
  EXPECT_EQ(createNamed(at("link"), file), EEXIST);
  EXPECT_THAT(leaves(), testing::ElementsAre("link"));
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

TEST_F(PosixHostTest, MakesAFileAsProtectedAsAnother) {
  make("old", "");
  make("new", "");
  chmod(at("old").c_str(), 0640);
  const bool hasAttributes = setxattr(at("old").c_str(), "user.note", "text", 4, 0) == 0;
  FileStatus status;
  ASSERT_EQ(m_Host.status(at("old").c_str(), status), 0);
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("new").c_str(), file), 0);
  m_Host.copyProtection(at("old").c_str(), status, file);
  EXPECT_EQ(m_Host.endWriting(file, at("new").c_str(), true), 0);
  ASSERT_EQ(m_Host.status(at("new").c_str(), status), 0);
  EXPECT_EQ(status.mode & 07777U, 0640U);
  char note[8] = {};
  EXPECT_EQ(getxattr(at("new").c_str(), "user.note", note, sizeof note), hasAttributes ? 4 : -1);
  EXPECT_STREQ(note, hasAttributes ? "text" : "");
}

TEST_F(PosixHostTest, KeepsAccessLists) {
  make("old", "");
  make("new", "");
  const std::vector<uint8_t> list = listOfSomebody();
  if (setxattr(at("old").c_str(), AccessList, list.data(), list.size(), 0) != 0)
    GTEST_SKIP() << "this file system has no access lists";
  FileStatus status;
  ASSERT_EQ(m_Host.status(at("old").c_str(), status), 0);
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("new").c_str(), file), 0);
  m_Host.copyProtection(at("old").c_str(), status, file);
  EXPECT_EQ(m_Host.endWriting(file, at("new").c_str(), true), 0);
  EXPECT_EQ(accessListOf(at("new")), list);
}

TEST_F(PosixHostTest, TakesNoAccessListFromItsFolder) {
  make("old", "");
  chmod(at("old").c_str(), 0660);
  constexpr uint8_t ListOfTheFolder[] = {2,    0, 0, 0,                          // the version
                                         0x01, 0, 6, 0, 0xFF, 0xFF, 0xFF, 0xFF,  // the owner,
                                         0x02, 0, 6, 0, 77,   0,    0,    0,     // somebody,
                                         0x04, 0, 0, 0, 0xFF, 0xFF, 0xFF, 0xFF,  // the group,
                                         0x10, 0, 6, 0, 0xFF, 0xFF, 0xFF, 0xFF,  // at most,
                                         0x20, 0, 0, 0, 0xFF, 0xFF, 0xFF, 0xFF}; // and others
  if (setxattr(getFolder().c_str(), "system.posix_acl_default", ListOfTheFolder,
               sizeof ListOfTheFolder, 0) != 0)
    GTEST_SKIP() << "this file system has no access lists";
  FileStatus status;
  ASSERT_EQ(m_Host.status(at("old").c_str(), status), 0);
  TemporaryFile file;
  ASSERT_EQ(m_Host.createTemporary(at("new").c_str(), 0600, file), 0);
  m_Host.copyProtection(at("old").c_str(), status, file.handle);
  EXPECT_EQ(fgetxattr(file.handle.number, "system.posix_acl_access", nullptr, 0), -1);
  ASSERT_EQ(m_Host.statusOf(file.handle, status), 0);
  EXPECT_EQ(status.mode & 07777U, 0660U);
  EXPECT_EQ(m_Host.close(file.handle), 0);
  m_Host.removeUnfinished();
}

TEST_F(PosixHostTest, WaitsForTheReaderOfAFifo) {
  ASSERT_EQ(mkfifo(at("fifo").c_str(), 0600), 0);
  const int reader = open(at("fifo").c_str(), O_RDONLY | O_NONBLOCK);
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("fifo").c_str(), file), 0);
  EXPECT_EQ(fcntl(file.number, F_GETFL) & O_NONBLOCK, 0);
  EXPECT_EQ(m_Host.endWriting(file, at("fifo").c_str(), true), 0);
  close(reader);
}

// An administrator may give a file away; nobody else may, and then it must not run as another user.
TEST_F(PosixHostTest, KeepsTheOwnerWhereItMay) {
  make("old", "");
  FileStatus status;
  ASSERT_EQ(m_Host.status(at("old").c_str(), status), 0);
  status.uid = 77;
  status.gid = 78;
  status.mode = 0106755;
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("new").c_str(), file), 0);
  m_Host.copyProtection(at("old").c_str(), status, file);
  FileStatus now;
  ASSERT_EQ(m_Host.statusOf(file, now), 0);
  EXPECT_EQ(m_Host.endWriting(file, at("new").c_str(), true), 0);
  if (getuid() == 0) {
    EXPECT_EQ(now.uid, 77);
    EXPECT_EQ(now.gid, 78);
    EXPECT_EQ(now.mode & 07777U, 06755U);
  } else {
    EXPECT_EQ(now.mode & 07777U, 0755U);
  }
}

// Nor may the group that the new file has instead do what the old one's did.
TEST_F(PosixHostTest, GivesNobodyElsesRightsAway) {
  if (getuid() != 0) GTEST_SKIP() << "the test above has shown it";
  fs::permissions(m_Folder, fs::perms::all);
  make("old", "");
  FileStatus status;
  ASSERT_EQ(m_Host.status(at("old").c_str(), status), 0);
  status.mode = 0106775;
  runApart([&] {
    FileHandle file;
    if (setgid(77) != 0 || setuid(77) != 0) _exit(1);
    if (m_Host.openForWriting(at("new").c_str(), file) != 0) _exit(2);
    m_Host.copyProtection(at("old").c_str(), status, file);
    if (m_Host.endWriting(file, at("new").c_str(), true) != 0) _exit(3);
  });
  ASSERT_EQ(m_Host.status(at("new").c_str(), status), 0);
  EXPECT_EQ(status.uid, 77);
  EXPECT_EQ(status.mode & 07777U, 0755U);
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
  FileHandle file;
  EXPECT_EQ(m_Host.createForWriting(at("dangling").c_str(), file), EEXIST);
}

// As the host itself: the longest chain that it follows, and the first that it does not.
TEST_F(PosixHostTest, FollowsAsManyLinksAsTheHost) {
  make("0", "");
  for (int i = 1; i <= 41; ++i)
    fs::create_symlink(std::to_string(i - 1), at(std::to_string(i)));
  FileStatus status;
  EXPECT_EQ(m_Host.status(at("40").c_str(), status), 0);
  EXPECT_EQ(m_Host.followLinks(at("40").c_str()), at("0"));
  EXPECT_EQ(m_Host.status(at("41").c_str(), status), ELOOP);
  EXPECT_EQ(m_Host.followLinks(at("41").c_str()), at("41"));
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

TEST_F(PosixHostTest, LeavesNothingUnfinishedBehindASignal) {
  for (const int signal : {SIGINT,    SIGTERM, SIGHUP,  SIGPIPE, SIGQUIT, SIGXCPU, SIGALRM,
                           SIGVTALRM, SIGPROF, SIGUSR1, SIGUSR2, SIGABRT, SIGSEGV, SIGBUS,
                           SIGFPE,    SIGILL,  SIGSYS,  SIGTRAP, SIGIO,   SIGPWR,  SIGSTKFLT}) {
    const int state = runApart([&] {
      forgetSanitizers();
      installSignalCleanUp();
      FileHandle file;
      for (const char* leaf : {"one", "two", "three", "four"})
        if (createNamed(at(leaf), file) != 0) _exit(1);
      if (m_Host.openForWriting(at("half").c_str(), file) != 0) _exit(1);
      // What was renamed or removed is not unfinished any more.
      if (m_Host.rename(at("two").c_str(), at("kept").c_str()) != 0) _exit(1);
      if (m_Host.remove(at("three").c_str()) != 0) _exit(1);
      make("three", "somebody's");
      std::raise(signal);
    });
    EXPECT_TRUE(WIFSIGNALED(state) && WTERMSIG(state) == signal) << signal << " " << state;
    EXPECT_THAT(leaves(), testing::ElementsAre("kept", "three")) << signal;
    fs::remove(at("kept"));
    fs::remove(at("three"));
  }
}

// The way out must work also where there is no stack left for it.
TEST_F(PosixHostTest, LeavesNothingUnfinishedBehindItsOwnFault) {
  const int state = runApart([&] {
    forgetSanitizers();
    installSignalCleanUp();
    FileHandle file;
    if (createNamed(at("one"), file) != 0) _exit(1);
    fillStack(0);
  });
  EXPECT_TRUE(WIFSIGNALED(state) && WTERMSIG(state) == SIGSEGV) << state;
  EXPECT_THAT(leaves(), testing::IsEmpty());
}

TEST_F(PosixHostTest, RemovesNothingThatSomebodyElseHasPutInThePlace) {
  FileHandle file;
  ASSERT_EQ(createNamed(at("one"), file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  make("other", "somebody's");
  fs::rename(at("other"), at("one"));
  m_Host.removeUnfinished();
  EXPECT_THAT(leaves(), testing::ElementsAre("one"));
}

TEST_F(PosixHostTest, RemovesTheFileBehindALinkAndNotTheLink) {
  make("file", "old");
  fs::create_symlink("file", at("link"));
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("link").c_str(), file), 0);
  EXPECT_EQ(m_Host.endWriting(file, at("link").c_str(), false), 0);
  EXPECT_THAT(leaves(), testing::ElementsAre("link"));
}

TEST_F(PosixHostTest, RemovesNoDevice) {
  fs::create_symlink("/dev/full", at("link"));
  FileHandle file;
  ASSERT_EQ(m_Host.openForWriting(at("link").c_str(), file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("x")), ENOSPC);
  EXPECT_EQ(m_Host.endWriting(file, at("link").c_str(), false), 0);
  EXPECT_TRUE(fs::exists("/dev/full"));
  EXPECT_THAT(leaves(), testing::ElementsAre("link"));
}

// What has no name goes with the process, also by a signal that nobody can catch.
TEST_F(PosixHostTest, LeavesNoTemporaryBehindAKill) {
  TemporaryFile probe;
  ASSERT_EQ(m_Host.createTemporary(at("probe").c_str(), 0600, probe), 0);
  if (probe.hasName) GTEST_SKIP() << "this file system has no files without names";
  EXPECT_EQ(m_Host.close(probe.handle), 0);
  runApart([&] {
    TemporaryFile file;
    if (m_Host.createTemporary(at("new").c_str(), 0600, file) != 0) _exit(1);
    std::raise(SIGKILL);
  });
  EXPECT_THAT(leaves(), testing::IsEmpty());
}

TEST_F(PosixHostTest, GivesNoNameThatIsTakenMeanwhile) {
  TemporaryFile file;
  ASSERT_EQ(m_Host.createTemporary(at("new").c_str(), 0600, file), 0);
  if (file.hasName) GTEST_SKIP() << "this file system has no files without names";
  make("new", "somebody's");
  EXPECT_EQ(m_Host.giveName(file, at("new").c_str()), EEXIST);
  EXPECT_EQ(m_Host.giveName(file, at("newer").c_str()), 0);
  EXPECT_EQ(m_Host.close(file.handle), 0);
  EXPECT_EQ(read("new"), "somebody's");
  EXPECT_EQ(m_Host.remove(at("newer").c_str()), 0);
}

// Another disk can't have a second name of the file, as a guarded process can't give one.
TEST_F(PosixHostTest, CopiesAFileThatItMayNotName) {
  TemporaryFile file;
  const std::string elsewhere = makeForElsewhere(file);
  if (elsewhere.empty())
    GTEST_SKIP() << "there is one file system alone, or no file without a name";
  const std::string text(1'000'000, 'x');
  EXPECT_EQ(m_Host.write(file.handle, bytesOf(text)), 0);
  m_Host.setPermissions(file.handle, 0666);
  EXPECT_EQ(m_Host.giveName(file, elsewhere.c_str()), 0);
  FileStatus there;
  ASSERT_EQ(m_Host.status(elsewhere.c_str(), there), 0);
  EXPECT_EQ(there.mode & 0777U, 0666U);
  m_Host.setPermissions(file.handle, 0640);
  EXPECT_EQ(m_Host.close(file.handle), 0);
  ASSERT_EQ(m_Host.status(elsewhere.c_str(), there), 0);
  EXPECT_EQ(there.size, 1'000'000);
  EXPECT_EQ(there.mode & 0777U, 0640U);
  EXPECT_EQ(m_Host.remove(elsewhere.c_str()), 0);
}

TEST_F(PosixHostTest, ProtectsTheCopyOfAFileThatItMayNotName) {
  TemporaryFile file;
  const std::string elsewhere = makeForElsewhere(file);
  if (elsewhere.empty())
    GTEST_SKIP() << "there is one file system alone, or no file without a name";
  if (getuid() == 0) {
    ASSERT_EQ(fchown(file.handle.number, 77, 78), 0);
  }
  FileStatus before;
  ASSERT_EQ(m_Host.statusOf(file.handle, before), 0);
  const std::vector<uint8_t> list = listOfSomebody();
  const bool hasList = fsetxattr(file.handle.number, AccessList, list.data(), list.size(), 0) == 0;
  const bool hasNote = fsetxattr(file.handle.number, "user.note", "text", 4, 0) == 0;
  EXPECT_EQ(m_Host.giveName(file, elsewhere.c_str()), 0);
  EXPECT_EQ(m_Host.close(file.handle), 0);
  FileStatus after;
  ASSERT_EQ(m_Host.status(elsewhere.c_str(), after), 0);
  EXPECT_EQ(after.uid, before.uid);
  EXPECT_EQ(after.gid, before.gid);
  EXPECT_EQ(accessListOf(elsewhere), hasList ? list : std::vector<uint8_t>{});
  // The other disk may have no attributes of users.
  const bool canHaveNote = setxattr(elsewhere.c_str(), "user.other", "", 0, 0) == 0;
  EXPECT_EQ(getxattr(elsewhere.c_str(), "user.note", nullptr, 0), hasNote && canHaveNote ? 4 : -1);
  EXPECT_EQ(m_Host.remove(elsewhere.c_str()), 0);
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
