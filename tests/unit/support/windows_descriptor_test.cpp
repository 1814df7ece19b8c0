// SPDX-License-Identifier: Apache-2.0
//
// Output on Windows: pipes that are full, or that nobody reads any more, and a start without any
// output.

#include "support/interface/descriptor.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <io.h>
#include <string>
#include <thread>
#include <windows.h>

namespace support {

namespace {

// A pipe whose end for writing is a descriptor.
class DescriptorTest : public testing::Test {
protected:
  DescriptorTest() {
    HANDLE writer = nullptr;
    EXPECT_NE(CreatePipe(&m_Reader, &writer, nullptr, 4096), 0);
    m_Writer = _open_osfhandle(reinterpret_cast<intptr_t>(writer), 0);
    EXPECT_GE(m_Writer, 0);
  }
  ~DescriptorTest() override {
    if (m_Reader != nullptr) CloseHandle(m_Reader);
    if (m_Writer >= 0) static_cast<void>(closeDescriptor(m_Writer));
  }

  static HANDLE handleOf(int descriptor) {
    return reinterpret_cast<HANDLE>(_get_osfhandle(descriptor));
  }

  std::string readAll() {
    std::string text;
    std::array<char, 1000> bytes;
    DWORD count = 0;
    while (ReadFile(m_Reader, bytes.data(), bytes.size(), &count, nullptr) != 0 && count > 0)
      text.append(bytes.data(), count);
    return text;
  }

  HANDLE m_Reader = nullptr;
  int m_Writer = -1;
};

} // namespace

TEST_F(DescriptorTest, GetsWhatIsWrittenAsItIs) {
  EXPECT_EQ(writeToDescriptor(m_Writer, "a\nb\r\n\x1a"), 0);
  EXPECT_EQ(closeDescriptor(std::exchange(m_Writer, -1)), 0);
  EXPECT_EQ(readAll(), "a\nb\r\n\x1a");
}

// Some shells make pipes that take nothing rather than let a program wait.
TEST_F(DescriptorTest, WaitsForAFullPipeThatDoesNotBlock) {
  DWORD mode = PIPE_READMODE_BYTE | PIPE_NOWAIT;
  ASSERT_NE(SetNamedPipeHandleState(handleOf(m_Writer), &mode, nullptr, nullptr), 0);
  const std::string text(100'000, 'x');
  HostError error = -1;
  std::thread writer([&] {
    error = writeToDescriptor(m_Writer, text);
    EXPECT_EQ(closeDescriptor(std::exchange(m_Writer, -1)), 0);
  });
  Sleep(50);
  EXPECT_EQ(readAll().size(), text.size());
  writer.join();
  EXPECT_EQ(error, 0);
}

TEST_F(DescriptorTest, TellsThatNobodyReads) {
  CloseHandle(std::exchange(m_Reader, nullptr));
  EXPECT_EQ(writeToDescriptor(m_Writer, "text"), EPIPE);
}

TEST_F(DescriptorTest, IsDuplicatedForNoChild) {
  const int duplicate = duplicateDescriptor(m_Writer);
  ASSERT_GT(duplicate, ErrorDescriptor);
  DWORD flags = HANDLE_FLAG_INHERIT;
  EXPECT_NE(GetHandleInformation(handleOf(duplicate), &flags), 0);
  EXPECT_EQ(flags & HANDLE_FLAG_INHERIT, 0u);
  EXPECT_EQ(closeDescriptor(duplicate), 0);
}

namespace {

constexpr DWORD HasNone = 17;
constexpr DWORD HasOne = 18;
constexpr const wchar_t* StartedAnew = L"QUARN_DESCRIPTOR_TEST";

// The status of this program, started again for the one case, with this handle for its stdout.
DWORD startAnew(HANDLE output) {
  std::wstring program(MAX_PATH, L'\0');
  program.resize(GetModuleFileNameW(nullptr, program.data(), MAX_PATH));
  std::wstring line =
      L"\"" + program + L"\" --gtest_filter=DescriptorAtTheStart.IsMissingWhereThereIsNoOutput";
  STARTUPINFOW start = {};
  start.cb = sizeof start;
  start.dwFlags = STARTF_USESTDHANDLES;
  start.hStdOutput = output;
  PROCESS_INFORMATION process;
  DWORD status = 0;
  if (CreateProcessW(program.c_str(), line.data(), nullptr, nullptr, TRUE, DETACHED_PROCESS,
                     nullptr, nullptr, &start, &process) == 0)
    return status;
  WaitForSingleObject(process.hProcess, INFINITE);
  GetExitCodeProcess(process.hProcess, &status);
  CloseHandle(process.hThread);
  CloseHandle(process.hProcess);
  return status;
}

} // namespace

TEST(DescriptorAtTheStart, IsMissingWhereThereIsNoOutput) {
  if (_wgetenv(StartedAnew) != nullptr)
    std::_Exit(duplicateDescriptor(OutputDescriptor) < 0 ? HasNone : HasOne);
  SetEnvironmentVariableW(StartedAnew, L"yes");
  EXPECT_EQ(startAnew(nullptr), HasNone);
  EXPECT_EQ(startAnew(INVALID_HANDLE_VALUE), HasNone);
  SECURITY_ATTRIBUTES inherited = {sizeof inherited, nullptr, TRUE};
  const HANDLE nul =
      CreateFileW(L"NUL", GENERIC_WRITE, FILE_SHARE_WRITE, &inherited, OPEN_EXISTING, 0, nullptr);
  EXPECT_EQ(startAnew(nul), HasOne);
  CloseHandle(nul);
  SetEnvironmentVariableW(StartedAnew, nullptr);
}

} // namespace support
