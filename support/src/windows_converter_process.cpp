// SPDX-License-Identifier: Apache-2.0
//
// A child process between two pipes, in a job that the host closes, and with it the child, when the
// tool ends in whatever way.
//
// Anonymous pipes know no time limit, so these are pipes with a name, which nobody else can take
// part in: each has one instance, and both ends are taken here. Our ends are overlapped, so that a
// converter that neither reads nor answers costs no more than the deadline; its own ends are plain.
//
// What the converter complains of is dropped: the tool's own diagnostics are all that there is on
// the standard error stream, for people and for programs that read it.

#include "support/src/windows_converter_process.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <cwchar>
#include <span>
#include <string_view>
#include <utility>
#include <vector>
#include <windows.h>

namespace support {

namespace {

struct HandleCloser {
  void operator()(HANDLE handle) const { CloseHandle(handle); }
};
using OwnedHandle = std::unique_ptr<void, HandleCloser>;

// Some calls answer with another value than null for no handle.
OwnedHandle ownedHandle(HANDLE handle) {
  return OwnedHandle(handle == INVALID_HANDLE_VALUE ? nullptr : handle);
}

struct Pipe {
  OwnedHandle ours;
  OwnedHandle converters; // may be inherited
};

constexpr DWORD PipeBufferSize = 4096; // bytes

OwnedHandle openInheritable(const wchar_t* name, DWORD access, DWORD sharing) {
  SECURITY_ATTRIBUTES inheritable = {sizeof(SECURITY_ATTRIBUTES), nullptr, TRUE};
  return ownedHandle(CreateFileW(name, access, sharing, &inheritable, OPEN_EXISTING, 0, nullptr));
}

// `ourDirection` is PIPE_ACCESS_INBOUND or PIPE_ACCESS_OUTBOUND. The converter's end has the rights
// that programs expect of a standard stream.
bool makePipe(DWORD ourDirection, Pipe& pipe) {
  static unsigned count = 0;
  std::array<wchar_t, 64> name;
  std::swprintf(name.data(), name.size(), L"\\\\.\\pipe\\quarn.converter.%lu.%u",
                GetCurrentProcessId(), ++count);
  pipe.ours = ownedHandle(CreateNamedPipeW(
      name.data(), ourDirection | FILE_FLAG_OVERLAPPED | FILE_FLAG_FIRST_PIPE_INSTANCE,
      PIPE_TYPE_BYTE | PIPE_WAIT | PIPE_REJECT_REMOTE_CLIENTS, 1, PipeBufferSize, PipeBufferSize, 0,
      nullptr));
  if (!pipe.ours) return false;
  const DWORD access = ourDirection == PIPE_ACCESS_INBOUND ? GENERIC_WRITE | FILE_READ_ATTRIBUTES
                                                           : GENERIC_READ | FILE_WRITE_ATTRIBUTES;
  pipe.converters = openInheritable(name.data(), access, 0);
  return pipe.converters != nullptr;
}

OwnedHandle makeJob() {
  OwnedHandle job = ownedHandle(CreateJobObjectW(nullptr, nullptr));
  JOBOBJECT_EXTENDED_LIMIT_INFORMATION limits = {};
  limits.BasicLimitInformation.LimitFlags = JOB_OBJECT_LIMIT_KILL_ON_JOB_CLOSE;
  if (!job || !SetInformationJobObject(job.get(), JobObjectExtendedLimitInformation, &limits,
                                       sizeof(limits)))
    return nullptr;
  return job;
}

// The list of the only handles that a child inherits: others of the tool, the archive's above all,
// would stay open in it.
class InheritedHandles {
public:
  explicit InheritedHandles(std::vector<HANDLE> handles) : m_Handles(std::move(handles)) {
    SIZE_T size = 0;
    InitializeProcThreadAttributeList(nullptr, 1, 0, &size);
    m_Storage.resize(size);
    m_IsMade = InitializeProcThreadAttributeList(getList(), 1, 0, &size) != 0;
  }
  ~InheritedHandles() {
    if (m_IsMade) DeleteProcThreadAttributeList(getList());
  }
  InheritedHandles(const InheritedHandles&) = delete;
  InheritedHandles& operator=(const InheritedHandles&) = delete;

  // Null if the host refuses.
  LPPROC_THREAD_ATTRIBUTE_LIST makeList() {
    const bool isFilled =
        m_IsMade &&
        UpdateProcThreadAttribute(getList(), 0, PROC_THREAD_ATTRIBUTE_HANDLE_LIST, m_Handles.data(),
                                  m_Handles.size() * sizeof(HANDLE), nullptr, nullptr) != 0;
    return isFilled ? getList() : nullptr;
  }

private:
  LPPROC_THREAD_ATTRIBUTE_LIST getList() {
    return reinterpret_cast<LPPROC_THREAD_ATTRIBUTE_LIST>(m_Storage.data());
  }

  std::vector<HANDLE> m_Handles;
  std::vector<std::byte> m_Storage;
  bool m_IsMade = false;
};

struct StandardStreams {
  HANDLE input;
  HANDLE output;
  HANDLE error;
};

struct Child {
  OwnedHandle process;
  OwnedHandle thread;
};

// A child whose first thread waits to be resumed. It has no window, and no part in our console: a
// key that interrupts the tool there must leave it a converter for its cleaning up.
Child startSuspended(const std::wstring& program, const StandardStreams& streams) {
  InheritedHandles inherited({streams.input, streams.output, streams.error});
  STARTUPINFOEXW startup = {};
  startup.StartupInfo.cb = sizeof(startup);
  startup.StartupInfo.dwFlags = STARTF_USESTDHANDLES;
  startup.StartupInfo.hStdInput = streams.input;
  startup.StartupInfo.hStdOutput = streams.output;
  startup.StartupInfo.hStdError = streams.error;
  startup.lpAttributeList = inherited.makeList();
  if (startup.lpAttributeList == nullptr) return {};

  std::array<wchar_t, 16> commandLine = {L"cygpath -w -f -"}; // the host writes to it
  PROCESS_INFORMATION information = {};
  constexpr DWORD Flags = CREATE_SUSPENDED | CREATE_NO_WINDOW | EXTENDED_STARTUPINFO_PRESENT;
  if (!CreateProcessW(program.c_str(), commandLine.data(), nullptr, nullptr, TRUE, Flags, nullptr,
                      nullptr, &startup.StartupInfo, &information))
    return {};
  return {ownedHandle(information.hProcess), ownedHandle(information.hThread)};
}

// What a call answers that fills a buffer and returns the length, or the size that it would need.
template <class Call>
std::wstring textFrom(Call call) {
  std::wstring text;
  for (DWORD length = call(text.data(), 0); length > text.size();) {
    text.resize(length);
    length = call(text.data(), length);
    if (length < text.size()) text.resize(length);
  }
  return text;
}

std::wstring environmentVariable(const wchar_t* name) {
  return textFrom(
      [name](wchar_t* buffer, DWORD size) { return GetEnvironmentVariableW(name, buffer, size); });
}

// Empty if there is none. The folder doesn't matter to a name that says where it lies.
std::wstring findProgramIn(const std::wstring& folder, const std::wstring& name) {
  return textFrom([&folder, &name](wchar_t* buffer, DWORD size) {
    return SearchPathW(folder.c_str(), name.c_str(), L".exe", size, buffer, nullptr);
  });
}

// A name alone must not lead to a program that lies in the current folder, which may hold somebody
// else's sources: the host's own search would look there, and take an empty place in PATH for it.
std::wstring findProgramByPath(const std::wstring& name) {
  std::wstring folders = environmentVariable(L"PATH");
  std::wstring found;
  while (found.empty() && !folders.empty()) {
    const std::wstring folder = folders.substr(0, folders.find(L';'));
    folders.erase(0, folder.size() + 1);
    if (!folder.empty()) found = findProgramIn(folder, name);
  }
  return found;
}

std::wstring findProgram(const std::wstring& name) {
  if (name.find_first_of(L"\\/:") == std::wstring::npos) return findProgramByPath(name);
  const std::wstring whole = textFrom([&name](wchar_t* buffer, DWORD size) {
    return GetFullPathNameW(name.c_str(), size, buffer, nullptr);
  });
  return findProgramIn({}, whole);
}

DWORD millisecondsUntil(ConverterDeadline deadline) {
  using std::chrono::milliseconds;
  const auto rest =
      std::chrono::ceil<milliseconds>(deadline - std::chrono::steady_clock::now()).count();
  return static_cast<DWORD>(std::clamp<int64_t>(rest, 0, INFINITE - 1));
}

// The host has an error for each moment at which the other end of a pipe is found to be gone.
ConverterReply replyFrom(DWORD error) {
  const bool isBroken =
      error == ERROR_NO_DATA || error == ERROR_BROKEN_PIPE || error == ERROR_PIPE_NOT_CONNECTED;
  return isBroken ? ConverterReply::Broken : ConverterReply::Unusable;
}

// One reading or writing of our end of a pipe, within a time.
class Transfer {
public:
  explicit Transfer(HANDLE pipe) : m_Pipe(pipe) { m_State.hEvent = m_Event.get(); }

  ConverterReply read(std::span<char> bytes, ConverterDeadline deadline) {
    return finish(
        ReadFile(m_Pipe, bytes.data(), static_cast<DWORD>(bytes.size()), nullptr, &m_State),
        deadline);
  }
  ConverterReply write(std::string_view bytes, ConverterDeadline deadline) {
    return finish(
        WriteFile(m_Pipe, bytes.data(), static_cast<DWORD>(bytes.size()), nullptr, &m_State),
        deadline);
  }
  [[nodiscard]] size_t getCount() const { return m_Count; }

private:
  ConverterReply finish(BOOL isDone, ConverterDeadline deadline) {
    if (!isDone && GetLastError() != ERROR_IO_PENDING) return replyFrom(GetLastError());
    const bool isLate =
        WaitForSingleObject(m_State.hEvent, millisecondsUntil(deadline)) != WAIT_OBJECT_0;
    if (isLate) CancelIo(m_Pipe);
    // Waits for the cancelling: until then the host may still use the buffer.
    const BOOL isGood = GetOverlappedResult(m_Pipe, &m_State, &m_Count, TRUE);
    if (isLate) return ConverterReply::Late;
    return isGood ? ConverterReply::Done : replyFrom(GetLastError());
  }

  HANDLE m_Pipe;
  OwnedHandle m_Event = ownedHandle(CreateEventW(nullptr, TRUE, FALSE, nullptr));
  OVERLAPPED m_State = {};
  DWORD m_Count = 0;
};

class WindowsConverterProcess final : public ConverterProcess {
public:
  explicit WindowsConverterProcess(std::wstring program) : m_Program(std::move(program)) {}

  bool start() override {
    const std::wstring program = findProgram(m_Program);
    Pipe input;
    Pipe output;
    const OwnedHandle nowhere =
        openInheritable(L"NUL", GENERIC_WRITE, FILE_SHARE_READ | FILE_SHARE_WRITE);
    OwnedHandle job = makeJob();
    if (program.empty() || !nowhere || !job || !makePipe(PIPE_ACCESS_OUTBOUND, input) ||
        !makePipe(PIPE_ACCESS_INBOUND, output))
      return false;

    const Child child =
        startSuspended(program, {input.converters.get(), output.converters.get(), nowhere.get()});
    if (!child.process) return false;
    if (!AssignProcessToJobObject(job.get(), child.process.get())) {
      TerminateProcess(child.process.get(), 1);
      return false;
    }
    ResumeThread(child.thread.get());
    m_ToConverter = std::move(input.ours);
    m_FromConverter = std::move(output.ours);
    m_Job = std::move(job);
    return true;
  }

  ConverterReply send(std::string_view line, ConverterDeadline deadline) override {
    // What comes unasked would be taken for the answer.
    DWORD unasked = 0;
    if (!PeekNamedPipe(m_FromConverter.get(), nullptr, 0, nullptr, &unasked, nullptr))
      return replyFrom(GetLastError());
    if (unasked != 0) return ConverterReply::Broken;

    Transfer transfer(m_ToConverter.get());
    const ConverterReply reply = transfer.write(line, deadline);
    if (reply != ConverterReply::Done) return reply;
    return transfer.getCount() == line.size() ? reply : ConverterReply::Unusable;
  }

  ConverterReply readLine(std::string& line, size_t longest, ConverterDeadline deadline) override {
    line.clear();
    while (line.find('\n') == std::string::npos && line.size() <= longest) {
      std::array<char, 512> bytes;
      Transfer transfer(m_FromConverter.get());
      const ConverterReply reply = transfer.read(bytes, deadline);
      if (reply != ConverterReply::Done) return reply;
      // An empty writing: without end, these would outrun the deadline.
      if (transfer.getCount() == 0) return ConverterReply::Unusable;
      line.append(bytes.data(), transfer.getCount());
    }
    const bool isOneLine = line.find('\n') == line.size() - 1;
    return isOneLine && line.size() <= longest ? ConverterReply::Done : ConverterReply::Unusable;
  }

  // The job takes the converter with it.
  void end() override {
    m_Job.reset();
    m_ToConverter.reset();
    m_FromConverter.reset();
  }

private:
  std::wstring m_Program;
  OwnedHandle m_Job;
  OwnedHandle m_ToConverter;
  OwnedHandle m_FromConverter;
};

} // namespace

std::unique_ptr<ConverterProcess> makeConverterProcess(std::wstring program) {
  return std::make_unique<WindowsConverterProcess>(std::move(program));
}

} // namespace support
