// SPDX-License-Identifier: Apache-2.0
//
// What the Windows host does with its own kinds of names, attributes, shares and endings, which no
// other host has.

#include "support/src/windows_names.h"
#include "tests/support/bytes.h"
#include "tests/unit/support/host_fixture.h"

#include <gmock/gmock.h>

#include <cerrno>
#include <windows.h>

namespace support {

using testsupport::bytesOf;

namespace fs = std::filesystem;

namespace {

class WindowsHostTest : public HostTest {
protected:
  static std::wstring wide(const std::string& name) { return pathFrom(name).wstring(); }

  // A folder whose name has so many characters, or one more. The host that runs this knows no limit
  // in this form.
  std::string makeLongFolder(size_t length) const {
    std::wstring name = L"\\\\?\\" + fs::absolute(m_Folder).make_preferred().wstring();
    constexpr size_t PrefixSize = 4;
    while (name.size() < length + PrefixSize) {
      name += L'\\';
      name.append(std::clamp<size_t>(length + PrefixSize - name.size(), 1, 100), L'x');
      CreateDirectoryW(name.c_str(), nullptr);
    }
    return textFrom(name.substr(PrefixSize));
  }
};

} // namespace

TEST_F(WindowsHostTest, RefusesNamesThatAreNotUtf8) {
  FileHandle file;
  FileStatus status;
  std::vector<std::string> names;
  EXPECT_EQ(m_Host.openForReading("a\xFF", file), EILSEQ);
  EXPECT_EQ(m_Host.openForUpdate("a\xFF", file), EILSEQ);
  EXPECT_EQ(m_Host.openForWriting("a\xFF", file), EILSEQ);
  EXPECT_EQ(createNamed("a\xFF", file), EILSEQ);
  EXPECT_FALSE(file.isOpen());
  EXPECT_EQ(m_Host.status("a\xFF", status), EILSEQ);
  EXPECT_EQ(m_Host.rename("a\xFF", "b"), EILSEQ);
  EXPECT_EQ(m_Host.rename("a", "b\xFF"), EILSEQ);
  EXPECT_EQ(m_Host.renameNew("a", "b\xFF"), EILSEQ);
  EXPECT_EQ(m_Host.remove("a\xFF"), EILSEQ);
  EXPECT_EQ(m_Host.listDirectory("a\xFF", names), EILSEQ);
  EXPECT_EQ(m_Host.findNames("", "\xFF*", names), EILSEQ);
  EXPECT_FALSE(m_Host.isWritable("a\xFF"));
  EXPECT_EQ(m_Host.followLinks("a\xFF"), "a\xFF");
}

// The lengths around the old limit of 260, in folders and in what is behind them.
TEST_F(WindowsHostTest, TakesNamesOfAnyLength) {
  for (const size_t length : {200U, 235U, 246U, 247U, 248U, 255U, 258U, 259U, 260U, 400U}) {
    const std::string folder = makeLongFolder(length);
    for (const std::string& leaf : {std::string("a.o"), std::string(40, 'b') + ".o"}) {
      const std::string name = folder + "\\" + leaf;
      const std::string other = folder + "/other";
      FileHandle file;
      FileStatus status;
      std::vector<std::string> names;
      ASSERT_EQ(createNamed(name, file), 0) << length;
      EXPECT_EQ(m_Host.write(file, bytesOf("text")), 0);
      EXPECT_EQ(m_Host.close(file), 0);
      EXPECT_EQ(m_Host.findNames(folder + "\\", "*.o", names), 0);
      EXPECT_THAT(names, testing::ElementsAre(leaf)) << length;
      EXPECT_EQ(m_Host.findNames(folder + "/", leaf, names), 0);
      EXPECT_THAT(names, testing::ElementsAre(leaf)) << length;
      EXPECT_EQ(m_Host.listDirectory(folder.c_str(), names), 0);
      EXPECT_THAT(names, testing::ElementsAre(leaf)) << length;
      EXPECT_EQ(m_Host.status(name.c_str(), status), 0);
      EXPECT_TRUE(m_Host.isWritable(name.c_str()));
      EXPECT_EQ(m_Host.rename(name.c_str(), other.c_str()), 0);
      ASSERT_EQ(createNamed(name, file), 0);
      EXPECT_EQ(m_Host.close(file), 0);
      EXPECT_EQ(m_Host.rename(other.c_str(), name.c_str()), 0);
      EXPECT_EQ(m_Host.renameNew(name.c_str(), other.c_str()), 0);
      EXPECT_EQ(m_Host.openForReading(other.c_str(), file), 0);
      EXPECT_EQ(readAt(file, 0), "text");
      EXPECT_EQ(m_Host.close(file), 0);
      EXPECT_EQ(m_Host.remove(other.c_str()), 0);
      EXPECT_EQ(m_Host.remove((folder + "\\.\\..\\" + std::string(90, 'y')).c_str()), ENOENT);
    }
  }
}

TEST_F(WindowsHostTest, TakesTheFormWithoutALimitAsItStands) {
  const std::string folder = makeLongFolder(300);
  FileHandle file;
  for (const std::string& beginning : {std::string("\\\\?\\"), std::string("//?/")}) {
    const std::string name = beginning + folder + "\\a.o";
    EXPECT_EQ(m_Host.openForWriting(name.c_str(), file), 0) << name;
    EXPECT_EQ(m_Host.close(file), 0);
    EXPECT_EQ(m_Host.remove((folder + "\\a.o").c_str()), 0) << name;
  }
}

TEST_F(WindowsHostTest, FindsNamesWithoutRegardToCase) {
  make("Name.O", "");
  std::vector<std::string> names;
  EXPECT_EQ(m_Host.findNames(getFolder() + "\\", "nAmE.o", names), 0);
  EXPECT_THAT(names, testing::ElementsAre("Name.O"));
  EXPECT_EQ(m_Host.findNames(getFolder() + "\\", "*.o", names), 0);
  EXPECT_THAT(names, testing::ElementsAre("Name.O"));
}

TEST_F(WindowsHostTest, TakesADriveAloneForItsCurrentFolder) {
  make("a.o", "");
  const fs::path before = fs::current_path();
  fs::current_path(m_Folder);
  const std::string drive = getFolder().substr(0, 2);
  std::vector<std::string> names;
  ASSERT_EQ(drive[1], ':');
  EXPECT_EQ(m_Host.findNames(drive, "*.o", names), 0);
  EXPECT_THAT(names, testing::ElementsAre("a.o"));
  EXPECT_EQ(m_Host.findNames("", "*.o", names), 0);
  EXPECT_THAT(names, testing::ElementsAre("a.o"));
  fs::current_path(before);
}

TEST_F(WindowsHostTest, KnowsTwoModes) {
  FileHandle file;
  FileStatus status;
  ASSERT_EQ(m_Host.openForWriting(at("file").c_str(), file), 0);
  ASSERT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.mode, 0100666u);
  m_Host.setPermissions(file, 0100755);
  ASSERT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.mode, 0100666u);
  m_Host.setPermissions(file, 0100555);
  ASSERT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.mode, 0100444u);
  EXPECT_EQ(m_Host.close(file), 0);
  ASSERT_EQ(m_Host.status(getFolder().c_str(), status), 0);
  EXPECT_EQ(status.mode, 040777u);
  EXPECT_EQ(status.uid, 0);
  EXPECT_EQ(status.gid, 0);
}

TEST_F(WindowsHostTest, WritesToNoFileThatIsReadOnly) {
  make("file", "text");
  SetFileAttributesW(pathOf("file").c_str(), FILE_ATTRIBUTE_READONLY);
  EXPECT_FALSE(m_Host.isWritable(at("file").c_str()));
  // Wine leaves that to the system below, which keeps nothing from root.
  FileHandle file;
  const HANDLE handle =
      CreateFileW(pathOf("file").c_str(), GENERIC_WRITE, 0, nullptr, OPEN_EXISTING, 0, nullptr);
  if (handle == INVALID_HANDLE_VALUE) {
    EXPECT_EQ(m_Host.openForWriting(at("file").c_str(), file), EACCES);
    EXPECT_EQ(m_Host.openForUpdate(at("file").c_str(), file), EACCES);
  } else {
    CloseHandle(handle);
  }
  EXPECT_EQ(read("file"), "text");
  EXPECT_EQ(m_Host.remove(at("file").c_str()), 0);
}

TEST_F(WindowsHostTest, TellsTimesInUtc) {
  make("file", "");
  const SYSTEMTIME time = {2001, 9, 0, 9, 1, 46, 40, 250}; // the third is not looked at
  FILETIME ticks;
  ASSERT_NE(SystemTimeToFileTime(&time, &ticks), 0);
  const HANDLE handle = CreateFileW(pathOf("file").c_str(), FILE_WRITE_ATTRIBUTES, 0, nullptr,
                                    OPEN_EXISTING, 0, nullptr);
  EXPECT_NE(SetFileTime(handle, nullptr, nullptr, &ticks), 0);
  CloseHandle(handle);
  FileStatus status;
  ASSERT_EQ(m_Host.status(at("file").c_str(), status), 0);
  EXPECT_EQ(status.modificationTime, 1'000'000'000);
  EXPECT_EQ(status.modificationNanoseconds, 250'000'000u);
}

// Somebody else's handle that shares nothing with whoever deletes.
TEST_F(WindowsHostTest, TellsThatAFileIsInUse) {
  make("file", "old");
  make("new", "new");
  const HANDLE handle = CreateFileW(pathOf("file").c_str(), GENERIC_READ, FILE_SHARE_READ, nullptr,
                                    OPEN_EXISTING, 0, nullptr);
  ASSERT_NE(handle, INVALID_HANDLE_VALUE);
  FileHandle file;
  FileStatus status;
  EXPECT_EQ(m_Host.rename(at("new").c_str(), at("file").c_str()), EBUSY);
  EXPECT_EQ(m_Host.rename(at("file").c_str(), at("other").c_str()), EBUSY);
  EXPECT_EQ(m_Host.renameNew(at("file").c_str(), at("other").c_str()), EBUSY);
  EXPECT_EQ(m_Host.remove(at("file").c_str()), EBUSY);
  EXPECT_EQ(m_Host.openForWriting(at("file").c_str(), file), EBUSY);
  EXPECT_EQ(m_Host.status(at("file").c_str(), status), 0);
  EXPECT_TRUE(m_Host.isWritable(at("file").c_str()));
  EXPECT_EQ(m_Host.openForReading(at("file").c_str(), file), 0);
  EXPECT_EQ(m_Host.close(file), 0);
  CloseHandle(handle);
  EXPECT_EQ(m_Host.rename(at("new").c_str(), at("file").c_str()), 0);
  EXPECT_EQ(read("file"), "new");
}

TEST(WindowsErrors, HaveTheNumbersOfTheCLibrary) {
  const struct {
    DWORD windows;
    HostError host;
  } rows[] = {{ERROR_PATH_NOT_FOUND, ENOENT},
              {ERROR_ACCESS_DENIED, EACCES},
              {ERROR_SHARING_VIOLATION, EBUSY},
              {ERROR_USER_MAPPED_FILE, EBUSY},
              {ERROR_PIPE_BUSY, EBUSY},
              {ERROR_DISK_FULL, ENOSPC},
              {1295 /* disk quota */, ENOSPC},
              {ERROR_BUFFER_OVERFLOW, ENAMETOOLONG},
              {ERROR_BROKEN_PIPE, EPIPE},
              {ERROR_NO_DATA, EPIPE},
              {ERROR_PIPE_NOT_CONNECTED, EPIPE},
              {ERROR_OUTOFMEMORY, ENOMEM},
              {ERROR_NO_SYSTEM_RESOURCES, ENOMEM},
              {ERROR_CANT_ACCESS_FILE, ENXIO},
              {ERROR_CANT_RESOLVE_FILENAME, ELOOP},
              {ERROR_WRITE_PROTECT, EROFS},
              {ERROR_NETWORK_ACCESS_DENIED, EACCES},
              {ERROR_CRC, EIO}};
  for (const auto& row : rows)
    EXPECT_EQ(hostErrorFrom(row.windows), row.host) << row.windows;
}

TEST_F(WindowsHostTest, HasSpecialFiles) {
  FileStatus status;
  FileHandle file;
  EXPECT_EQ(m_Host.status("nul", status), 0);
  EXPECT_EQ(status.kind, FileKind::Special);
  ASSERT_EQ(m_Host.openForWriting("nul", file), 0);
  EXPECT_EQ(m_Host.write(file, bytesOf("text")), 0);
  EXPECT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.kind, FileKind::Special);
  EXPECT_EQ(m_Host.close(file), 0);
}

TEST_F(WindowsHostTest, ReadsAPipeToItsEnd) {
  const HANDLE pipe = CreateNamedPipeW(L"\\\\.\\pipe\\quarn-host-test", PIPE_ACCESS_OUTBOUND,
                                       PIPE_TYPE_BYTE, 1, 4096, 4096, 0, nullptr);
  ASSERT_NE(pipe, INVALID_HANDLE_VALUE);
  FileHandle file;
  FileHandle second;
  FileStatus status;
  ASSERT_EQ(m_Host.openSequential("\\\\.\\pipe\\quarn-host-test", file), 0);
  EXPECT_EQ(m_Host.openForReading("\\\\.\\pipe\\quarn-host-test", second), EBUSY);
  EXPECT_EQ(m_Host.statusOf(file, status), 0);
  EXPECT_EQ(status.kind, FileKind::Special);
  DWORD written = 0;
  EXPECT_NE(WriteFile(pipe, "text", 4, &written, nullptr), 0);
  std::array<uint8_t, 10> bytes;
  size_t done = 0;
  EXPECT_EQ(m_Host.readNext(file, bytes, done), 0);
  EXPECT_EQ(done, 4u);
  CloseHandle(pipe);
  EXPECT_EQ(m_Host.readNext(file, bytes, done), 0);
  EXPECT_EQ(done, 0u);
  EXPECT_EQ(m_Host.close(file), 0);
}

namespace {

// Ends the process as a user does at its console, which is one of its own.
[[noreturn]] void pressCtrlC() {
  FreeConsole();
  AllocConsole();
  SetConsoleCtrlHandler(nullptr, FALSE); // what starts the tests may ignore it
  GenerateConsoleCtrlEvent(CTRL_C_EVENT, 0);
  Sleep(10'000);
  std::_Exit(99);
}

// One of them is kept, one is somebody else's by then, and most are still open.
[[noreturn]] void makeTemporariesAndEnd(Host& host, const std::string& folder) {
  installSignalCleanUp();
  const auto at = [&folder](const char* leaf) { return folder + "\\" + leaf; };
  constexpr uint32_t Mode = 0600;
  FileHandle file;
  TemporaryFile temporary;
  for (const char* leaf : {"one", "two", "four"})
    if (host.createTemporary(at(leaf).c_str(), Mode, temporary) != 0) std::_Exit(1);
  if (host.createTemporary(at("three").c_str(), Mode, temporary) != 0) std::_Exit(1);
  if (host.rename(at("two").c_str(), at("kept").c_str()) != 0) std::_Exit(2);
  // The name of what is open may stay until it is closed.
  if (host.close(temporary.handle) != 0 || host.remove(at("three").c_str()) != 0) std::_Exit(3);
  if (host.openForWriting(at("three").c_str(), file) != 0) std::_Exit(4);
  if (host.endWriting(file, at("three").c_str(), true) != 0) std::_Exit(4);
  if (host.openForWriting(at("half").c_str(), file) != 0) std::_Exit(5);
  pressCtrlC();
}

// Wine says 0.
bool wasEndedFromOutside(int status) {
  return status == static_cast<int>(STATUS_CONTROL_C_EXIT) || status == 0;
}

} // namespace

TEST_F(WindowsHostTest, LeavesNothingUnfinishedAtTheEndOfTheProcess) {
  EXPECT_EXIT(makeTemporariesAndEnd(m_Host, getFolder()), wasEndedFromOutside, "");
  EXPECT_THAT(leaves(), testing::ElementsAre("kept", "three"));
}

} // namespace support
