// SPDX-License-Identifier: Apache-2.0
//
// A call that shall fail is made harmless where it enters the kernel, by the number of no call, and
// gets its result where it leaves it. A close is made all the same: the descriptor is gone also
// where it ends with an error. An allocation by brk fails by the old end of memory as its result.
#include "tests/disturbed/tracer.h"

#include <array>
#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <elf.h>
#include <fcntl.h>
#include <sys/mman.h>
#include <sys/personality.h>
#include <sys/ptrace.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <sys/uio.h>
#include <sys/user.h>
#include <sys/wait.h>
#include <unistd.h>

namespace disturbed {

namespace {

constexpr unsigned LongestRun = 20; // seconds
constexpr int CallStop = SIGTRAP | 0x80;

// The program while it stands still at an end of a call.
class Stopped {
public:
  explicit Stopped(pid_t process) : m_Process(process) {
    iovec place = {&m_Registers, sizeof m_Registers};
    ptrace(PTRACE_GETREGSET, m_Process, NT_PRSTATUS, &place);
  }
  [[nodiscard]] SystemCall getCall() const {
    SystemCall call;
    call.number = static_cast<long>(m_Registers.orig_rax);
    call.arguments[0] = static_cast<long>(m_Registers.rdi);
    call.arguments[1] = static_cast<long>(m_Registers.rsi);
    call.arguments[2] = static_cast<long>(m_Registers.rdx);
    return call;
  }
  [[nodiscard]] long getResult() const { return static_cast<long>(m_Registers.rax); }
  void setNumber(long number) { set(m_Registers.orig_rax, number); }
  void setResult(long result) { set(m_Registers.rax, result); }
  void setFirstArgument(long value) { set(m_Registers.rdi, value); }
  void setThirdArgument(long value) { set(m_Registers.rdx, value); }

private:
  void set(unsigned long long& field, long value) { // NOLINT(google-runtime-int): as the kernel's
    field = static_cast<unsigned long long>(value);
    iovec place = {&m_Registers, sizeof m_Registers};
    ptrace(PTRACE_SETREGSET, m_Process, NT_PRSTATUS, &place);
  }
  pid_t m_Process;
  user_regs_struct m_Registers = {};
};

// One run, from stop to stop.
class Trace {
public:
  Trace(pid_t process, const Fault& fault, const std::function<void()>& change, int errorStream)
      : m_Process(process), m_Fault(fault), m_Change(change), m_ErrorStream(errorStream) {}
  void follow(TracedRun& run);

private:
  // False if there will be no further one.
  bool awaitStop(int& state) const;
  void handleStop(int stopSignal);
  void enterCall();
  void leaveCall();
  void disturb(Stopped& stopped);
  void fail(Stopped& stopped, const SystemCall& call);
  [[nodiscard]] bool isToErrorStream(const SystemCall& call) const;
  [[nodiscard]] bool isAt(uint64_t call) const { return call == m_Fault.call; }
  [[nodiscard]] bool isFailing(const SystemCall& call) const;
  void send(int signal) const { kill(m_Process, signal); }

  pid_t m_Process;
  const Fault& m_Fault;
  const std::function<void()>& m_Change;
  int m_ErrorStream;
  bool m_HasBegun = false; // the program itself
  bool m_IsInCall = false;
  bool m_HasFailed = false; // the call that is being made
  int m_Delivered = 0;      // the signal that the program gets as it goes on
  std::vector<SystemCall> m_Calls;
};

void endHungRun(int) {}

bool Trace::awaitStop(int& state) const {
  return waitpid(m_Process, &state, 0) == m_Process && WIFSTOPPED(state);
}

void Trace::follow(TracedRun& run) {
  int state = 0;
  bool isThere = awaitStop(state);
  ptrace(PTRACE_SETOPTIONS, m_Process, 0, PTRACE_O_TRACESYSGOOD | PTRACE_O_EXITKILL);
  alarm(LongestRun);
  while (isThere) {
    ptrace(PTRACE_SYSCALL, m_Process, 0, m_Delivered);
    isThere = awaitStop(state);
    if (isThere) handleStop(WSTOPSIG(state));
  }
  if (!WIFEXITED(state) && !WIFSIGNALED(state)) {
    run.hasHung = true;
    send(SIGKILL);
    while (waitpid(m_Process, &state, 0) == m_Process && WIFSTOPPED(state)) {
    }
  }
  alarm(0);
  run.status = WIFEXITED(state) ? WEXITSTATUS(state) : -1;
  run.signal = WIFSIGNALED(state) ? WTERMSIG(state) : 0;
  run.calls = std::move(m_Calls);
}

void Trace::handleStop(int stopSignal) {
  m_Delivered = stopSignal == CallStop ? 0 : stopSignal;
  if (stopSignal != CallStop) return;
  m_IsInCall = !m_IsInCall;
  if (m_IsInCall)
    enterCall();
  else
    leaveCall();
}

bool Trace::isToErrorStream(const SystemCall& call) const {
  if (call.kind() != CallKind::Write && call.kind() != CallKind::Close) return false;
  struct stat to;
  struct stat errors;
  const std::string link =
      "/proc/" + std::to_string(m_Process) + "/fd/" + std::to_string(call.arguments[0]);
  if (stat(link.c_str(), &to) != 0 || fstat(m_ErrorStream, &errors) != 0) return false;
  return to.st_ino == errors.st_ino && to.st_dev == errors.st_dev;
}

bool Trace::isFailing(const SystemCall& call) const {
  const uint64_t number = m_Calls.size();
  const bool hasCome = m_Fault.kind == FaultKind::AllErrors
                           ? m_Fault.call != 0 && number >= m_Fault.call
                           : isAt(number);
  return hasCome && isMetBy(m_Fault, call);
}

void Trace::enterCall() {
  Stopped stopped(m_Process);
  SystemCall call = stopped.getCall();
  m_HasBegun = m_HasBegun || call.number == SYS_rt_sigaction;
  if (!m_HasBegun) return;
  call.isToErrorStream = isToErrorStream(call);
  m_Calls.push_back(call);
  if (isFailing(call)) {
    fail(stopped, call);
  } else if (isAt(m_Calls.size())) {
    disturb(stopped);
  }
}

void Trace::fail(Stopped& stopped, const SystemCall& call) {
  m_HasFailed = true;
  if (call.number == SYS_brk)
    stopped.setFirstArgument(0);
  else if (call.kind() != CallKind::Close)
    stopped.setNumber(-1);
}

void Trace::disturb(Stopped& stopped) {
  if (m_Fault.kind == FaultKind::Short) stopped.setThirdArgument(m_Fault.value);
  if (m_Fault.kind == FaultKind::KillBefore) send(SIGKILL);
  if (isChange(m_Fault.kind)) m_Change();
}

void Trace::leaveCall() {
  if (!m_HasBegun) return;
  Stopped stopped(m_Process);
  SystemCall& call = m_Calls.back();
  // The program relies on its registers but that of the result.
  if (m_HasFailed && call.number == SYS_brk) stopped.setFirstArgument(call.arguments[0]);
  if (m_HasFailed && call.number != SYS_brk) stopped.setResult(-m_Fault.value);
  if (m_Fault.kind == FaultKind::Short && isAt(m_Calls.size()))
    stopped.setThirdArgument(call.arguments[2]);
  m_HasFailed = false;
  call.result = stopped.getResult();
  if (m_Fault.kind == FaultKind::KillAfter && isAt(m_Calls.size())) send(SIGKILL);
  // It arrives before the program goes on, so in front of the next call.
  if (m_Fault.kind == FaultKind::Signal && isAt(m_Calls.size() + 1)) send(m_Fault.value);
}

void limitTo(__rlimit_resource_t resource, rlim_t value) {
  const rlimit limit = {value, value};
  setrlimit(resource, &limit);
}

} // namespace

Stream::Stream() : m_Descriptor(memfd_create("stream", MFD_CLOEXEC)) {}

Stream::~Stream() {
  close(m_Descriptor);
}

std::string Stream::takeAll() const {
  std::string text(static_cast<size_t>(lseek(m_Descriptor, 0, SEEK_END)), '\0');
  if (pread(m_Descriptor, text.data(), text.size(), 0) < 0) text.clear();
  if (ftruncate(m_Descriptor, 0) != 0) std::abort();
  lseek(m_Descriptor, 0, SEEK_SET);
  return text;
}

bool canTrace() {
  const pid_t process = fork();
  if (process == 0) _exit(ptrace(PTRACE_TRACEME, 0, nullptr, nullptr) == 0 ? 0 : 1);
  int state = 0;
  return waitpid(process, &state, 0) == process && WIFEXITED(state) && WEXITSTATUS(state) == 0;
}

void Tracer::start(const Command& command) const {
  std::vector<const char*> arguments;
  for (const std::string& word : command.words)
    arguments.push_back(word.c_str());
  arguments.push_back(nullptr);
  if (chdir(command.folder.c_str()) != 0) _exit(99);
  const int nothing = open("/dev/null", O_RDONLY | O_CLOEXEC);
  dup2(nothing, STDIN_FILENO);
  dup2(m_Output.getDescriptor(), STDOUT_FILENO);
  dup2(m_Errors.getDescriptor(), STDERR_FILENO);
  clearenv(); // the user's language and time zone are no part of the run
  setenv("TMPDIR", command.folder.c_str(), 1);
  setenv("TZ", "UTC", 1);
  umask(022);
  // A signal that was ignored when the tests were started would stay so.
  for (int number = 1; number < NSIG; ++number)
    std::signal(number, SIG_DFL);
  limitTo(RLIMIT_CORE, 0);
  // Memory lies in the same places each time, and so each run makes the same calls.
  personality(ADDR_NO_RANDOMIZE);
  ptrace(PTRACE_TRACEME, 0, nullptr, nullptr);
  execv(command.file.c_str(), const_cast<char* const*>(arguments.data()));
  _exit(98);
}

TracedRun Tracer::run(const Command& command, const Fault& fault,
                      const std::function<void()>& change) const {
  struct sigaction alarmAction = {};
  alarmAction.sa_handler = endHungRun; // without SA_RESTART: the wait ends with it
  sigaction(SIGALRM, &alarmAction, nullptr);
  TracedRun run;
  const pid_t process = fork();
  if (process == 0) start(command);
  Trace(process, fault, change, m_Errors.getDescriptor()).follow(run);
  run.output = m_Output.takeAll();
  run.errors = m_Errors.takeAll();
  return run;
}

} // namespace disturbed
