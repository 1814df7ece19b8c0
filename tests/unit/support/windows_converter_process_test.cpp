// SPDX-License-Identifier: Apache-2.0
//
// A converter of our own as a process of this host, which does well or badly as the environment
// tells it. Where it hangs the tests wait for a fraction of a second; where the process must be
// gone they wait until the host says so.

#include "support/src/windows_converter_process.h"

#include "support/interface/path_converter.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <chrono>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <windows.h>

namespace support {

namespace {

namespace fs = std::filesystem;

using std::chrono::milliseconds;
using std::chrono::seconds;
using std::chrono::steady_clock;

constexpr DWORD LongEnough = 20'000; // milliseconds

fs::path ownProgram() {
  std::array<wchar_t, 4096> name;
  GetModuleFileNameW(nullptr, name.data(), static_cast<DWORD>(name.size()));
  return name.data();
}

// It lies beside this program.
const fs::path FakeConverter = ownProgram().parent_path() / FAKE_CONVERTER_PROGRAM;

// The folder that the process works in, for as long as this lives.
class WorkingFolder {
public:
  explicit WorkingFolder(const fs::path& folder) { fs::current_path(folder); }
  ~WorkingFolder() { fs::current_path(m_Before); }
  WorkingFolder(const WorkingFolder&) = delete;
  WorkingFolder& operator=(const WorkingFolder&) = delete;

private:
  fs::path m_Before = fs::current_path();
};

// Whether the process has ended, or does so in a while.
bool ends(DWORD processId) {
  HANDLE process = OpenProcess(SYNCHRONIZE, FALSE, processId);
  if (process == nullptr) return true;
  const bool hasEnded = WaitForSingleObject(process, LongEnough) == WAIT_OBJECT_0;
  CloseHandle(process);
  return hasEnded;
}

class WindowsConverterProcessTest : public testing::Test {
protected:
  void SetUp() override {
    setVariable(L"FAKE_CONVERTER", nullptr);
    fs::remove_all(m_Folder);
    fs::create_directory(m_Folder);
  }
  void TearDown() override {
    setVariable(L"PATH", m_PathBefore.c_str());
    m_Process.reset();
    fs::remove_all(m_Folder);
  }

  static void setVariable(const wchar_t* name, const wchar_t* value) {
    SetEnvironmentVariableW(name, value);
  }

  // What becomes of the name, with the program that answers in this way.
  std::string convert(const std::string& name) { return m_Converter->convert(name); }
  void use(const wchar_t* way, milliseconds patience = seconds(20),
           const fs::path& program = FakeConverter) {
    setVariable(L"FAKE_CONVERTER", way);
    m_Process = makeConverterProcess(program.wstring());
    m_Converter.emplace(*m_Process, patience);
  }
  DWORD processId() { return static_cast<DWORD>(std::stoul(convert("/id"))); }

  const fs::path m_Folder = ownProgram().parent_path() / "windows_converter_process_test";
  std::wstring m_PathBefore = _wgetenv(L"PATH");
  std::unique_ptr<ConverterProcess> m_Process;
  std::optional<PathConverter> m_Converter;
};

} // namespace

TEST_F(WindowsConverterProcessTest, AnswersNames) {
  use(L"");
  EXPECT_EQ(convert("/lib/a.o"), "W:\\lib\\a.o");
  EXPECT_EQ(convert("a b.o"), "W:a b.o");
  EXPECT_EQ(convert("/\xC3\xA9\xE6\x97\xA5"), "W:\\\xC3\xA9\xE6\x97\xA5");
  EXPECT_EQ(convert("/*.?"), "W:\\*.?");
}

TEST_F(WindowsConverterProcessTest, AnswersManyNames) {
  use(L"");
  for (int i = 0; i < 1000; ++i) {
    const std::string number = std::to_string(i);
    ASSERT_EQ(convert("/" + number), "W:\\" + number);
  }
}

TEST_F(WindowsConverterProcessTest, IsToldWhatToDoOnItsCommandLine) {
  use(L"command line");
  EXPECT_EQ(convert("/a"), "cygpath -w -f -");
}

TEST_F(WindowsConverterProcessTest, IsOneForAllNames) {
  use(L"process");
  EXPECT_EQ(convert("/a"), convert("/b"));
}

TEST_F(WindowsConverterProcessTest, MayAnswerLate) {
  use(L"late");
  EXPECT_EQ(convert("/a"), "W:\\a");
}

TEST_F(WindowsConverterProcessTest, MayAnswerInPieces) {
  use(L"in pieces");
  EXPECT_EQ(convert("/a"), "W:\\a");
  EXPECT_EQ(convert("/b"), "W:\\b");
}

TEST_F(WindowsConverterProcessTest, IsNotWaitedForWithoutALineEnd) {
  use(L"without line end", milliseconds(400));
  EXPECT_EQ(convert("/a"), "/a");
  EXPECT_EQ(convert("/b"), "/b");
}

TEST_F(WindowsConverterProcessTest, IsNotBelievedInHalf) {
  use(L"half");
  EXPECT_EQ(convert("/a"), "/a");
}

TEST_F(WindowsConverterProcessTest, IsNotBelievedBeyondItsRoom) {
  use(L"300 bytes");
  EXPECT_EQ(convert("/a"), "/a");
  EXPECT_EQ(convert("/b"), "/b");
}

TEST_F(WindowsConverterProcessTest, IsNotReadWithoutEnd) {
  use(L"without end");
  EXPECT_EQ(convert("/a"), "/a");
}

TEST_F(WindowsConverterProcessTest, IsNotBelievedTwice) {
  use(L"twice");
  EXPECT_EQ(convert("/a"), "/a");
  EXPECT_EQ(convert("/b"), "/b");
}

TEST_F(WindowsConverterProcessTest, IsStartedAnewWhereItEnds) {
  use(L"two names");
  for (const std::string name : {"a", "b", "c", "d", "e", "f", "g"})
    EXPECT_EQ(convert("/" + name), "W:\\" + name);
}

TEST_F(WindowsConverterProcessTest, MayEndAtEveryName) {
  use(L"no name");
  for (const std::string name : {"/a", "/b", "/c", "/d", "/e"})
    EXPECT_EQ(convert(name), name);
}

TEST_F(WindowsConverterProcessTest, MayHang) {
  use(L"hang", milliseconds(400));
  const auto before = steady_clock::now();
  EXPECT_EQ(convert("/a"), "/a");
  EXPECT_GE(steady_clock::now() - before, milliseconds(400));
  EXPECT_EQ(convert("/b"), "/b");
  EXPECT_LT(steady_clock::now() - before, seconds(15));
}

// A pipe that nobody reads from takes no more than a few thousand bytes.
TEST_F(WindowsConverterProcessTest, MayHangBeforeItReadsALongName) {
  use(L"deaf", milliseconds(400));
  const std::string name(1'000'000, 'a');
  const auto before = steady_clock::now();
  EXPECT_EQ(convert(name), name);
  EXPECT_LT(steady_clock::now() - before, seconds(15));
}

TEST_F(WindowsConverterProcessTest, TakesALongName) {
  use(L"process");
  EXPECT_NE(convert(std::string(1'000'000, 'a')).size(), 1'000'000U);
}

TEST_F(WindowsConverterProcessTest, NeedNotExist) {
  use(L"", seconds(20), "C:\\no\\such\\converter.exe");
  EXPECT_EQ(convert("/a"), "/a");
  use(L"", seconds(20), "no_such_converter");
  EXPECT_EQ(convert("/a"), "/a");
}

TEST_F(WindowsConverterProcessTest, NeedBeNoProgram) {
  std::ofstream(m_Folder / "text.exe") << "no program";
  use(L"", seconds(20), m_Folder / "text.exe");
  EXPECT_EQ(convert("/a"), "/a");
  use(L"", seconds(20), m_Folder);
  EXPECT_EQ(convert("/a"), "/a");
}

TEST_F(WindowsConverterProcessTest, IsFoundWithoutItsExtension) {
  use(L"", seconds(20), fs::path(FakeConverter).replace_extension());
  EXPECT_EQ(convert("/a"), "W:\\a");
}

TEST_F(WindowsConverterProcessTest, IsFoundFromTheCurrentFolderWhereItsNameSaysSo) {
  fs::copy_file(FakeConverter, m_Folder / "converter.exe");
  const WorkingFolder folder(m_Folder);
  use(L"", seconds(20), ".\\converter.exe");
  EXPECT_EQ(convert("/a"), "W:\\a");
}

TEST_F(WindowsConverterProcessTest, IsFoundInTheFoldersOfPath) {
  fs::copy_file(FakeConverter, m_Folder / "converter.exe");
  setVariable(L"PATH", (L"C:\\nowhere;" + m_Folder.wstring()).c_str());
  for (const char* name : {"converter", "converter.exe"}) {
    use(L"", seconds(20), name);
    EXPECT_EQ(convert("/a"), "W:\\a") << name;
  }
}

// What lies in a folder of sources is not what the user has named.
TEST_F(WindowsConverterProcessTest, IsNotFoundInTheCurrentFolderByItsNameAlone) {
  fs::copy_file(FakeConverter, m_Folder / "converter.exe");
  fs::copy_file(FakeConverter, m_Folder / "converter");
  const WorkingFolder folder(m_Folder);
  for (const wchar_t* path :
       {L"C:\\nowhere", L";C:\\nowhere;;", L";", static_cast<const wchar_t*>(nullptr)}) {
    setVariable(L"PATH", path);
    for (const char* name : {"converter", "converter.exe"}) {
      use(L"", seconds(20), name);
      EXPECT_EQ(convert("/a"), "/a") << name;
    }
  }
}

TEST_F(WindowsConverterProcessTest, ComplainsToNobody) {
  const fs::path kept = m_Folder / "errors";
  SECURITY_ATTRIBUTES inheritable = {sizeof(SECURITY_ATTRIBUTES), nullptr, TRUE};
  HANDLE file = CreateFileW(kept.c_str(), GENERIC_WRITE, FILE_SHARE_READ, &inheritable,
                            CREATE_ALWAYS, 0, nullptr);
  HANDLE before = GetStdHandle(STD_ERROR_HANDLE);
  SetStdHandle(STD_ERROR_HANDLE, file);
  use(L"complaint");
  EXPECT_EQ(convert("/a"), "W:\\a");
  SetStdHandle(STD_ERROR_HANDLE, before);
  CloseHandle(file);
  EXPECT_EQ(fs::file_size(kept), 0U);
}

TEST_F(WindowsConverterProcessTest, InheritsNoOtherHandle) {
  SECURITY_ATTRIBUTES inheritable = {sizeof(SECURITY_ATTRIBUTES), nullptr, TRUE};
  // A number that no handle of a small process has by itself.
  std::array<HANDLE, 200> events = {};
  for (HANDLE& event : events)
    event = CreateEventW(&inheritable, TRUE, FALSE, nullptr);
  use(L"handle");
  EXPECT_EQ(convert(std::to_string(reinterpret_cast<uintptr_t>(events.back()))), "closed");
  for (HANDLE event : events)
    CloseHandle(event);
}

TEST_F(WindowsConverterProcessTest, EndsWithItsObject) {
  use(L"process and hang");
  const DWORD id = processId();
  m_Process.reset();
  EXPECT_TRUE(ends(id));
}

TEST_F(WindowsConverterProcessTest, EndsWhereItHangs) {
  use(L"process and hang", seconds(3));
  const DWORD id = processId();
  EXPECT_EQ(convert("/a"), "/a");
  EXPECT_TRUE(ends(id));
}

namespace {

constexpr const wchar_t* IdFileVariable = L"CONVERTER_ID_FILE";

// This program once more, with the environment telling it to be the tool: it starts a converter,
// tells of its process in a file, and waits.
class KilledTool {
public:
  explicit KilledTool(const fs::path& idFile) : m_IdFile(idFile) {
    SetEnvironmentVariableW(IdFileVariable, idFile.c_str());
    std::wstring commandLine = L"test --gtest_filter=*.EndsWithAKilledTool";
    STARTUPINFOW startup = {};
    startup.cb = sizeof(startup);
    EXPECT_TRUE(CreateProcessW(ownProgram().c_str(), commandLine.data(), nullptr, nullptr, FALSE, 0,
                               nullptr, nullptr, &startup, &m_Information));
    SetEnvironmentVariableW(IdFileVariable, nullptr);
  }
  ~KilledTool() {
    CloseHandle(m_Information.hThread);
    CloseHandle(m_Information.hProcess);
  }
  KilledTool(const KilledTool&) = delete;
  KilledTool& operator=(const KilledTool&) = delete;

  // The process of its converter; 0 if it doesn't come up.
  [[nodiscard]] DWORD waitForConverter() const {
    for (DWORD waited = 0; waited < LongEnough; waited += 50) {
      std::ifstream file(m_IdFile);
      DWORD id = 0;
      std::string line;
      if (std::getline(file, line) && !file.eof()) id = static_cast<DWORD>(std::stoul(line));
      if (id != 0) return id;
      Sleep(50);
    }
    return 0;
  }
  void kill() const { TerminateProcess(m_Information.hProcess, 9); }

private:
  fs::path m_IdFile;
  PROCESS_INFORMATION m_Information = {};
};

} // namespace

TEST_F(WindowsConverterProcessTest, EndsWithAKilledTool) {
  if (const wchar_t* toldFile = _wgetenv(IdFileVariable); toldFile != nullptr) {
    use(L"process and hang");
    std::ofstream(fs::path(toldFile)) << convert("/id") << std::endl;
    Sleep(3 * LongEnough);
    return;
  }
  const fs::path idFile = ownProgram().parent_path() / "windows_converter_process_id";
  const KilledTool tool(idFile);
  const DWORD id = tool.waitForConverter();
  ASSERT_NE(id, 0U);
  HANDLE converter = OpenProcess(SYNCHRONIZE, FALSE, id);
  ASSERT_NE(converter, nullptr);
  EXPECT_EQ(WaitForSingleObject(converter, 0), static_cast<DWORD>(WAIT_TIMEOUT));
  tool.kill();
  EXPECT_EQ(WaitForSingleObject(converter, LongEnough), WAIT_OBJECT_0);
  CloseHandle(converter);
  fs::remove(idFile);
}

} // namespace support
