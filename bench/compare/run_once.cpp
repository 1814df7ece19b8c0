// SPDX-License-Identifier: Apache-2.0
//
//   run_once OUTPUT PROGRAM [WORD...]
//
// Runs the program with its standard output going to the file OUTPUT and nothing to read, and
// prints in one line what that took: microseconds from start to end, microseconds of processor
// time, KiB of memory at the most, exit status.
//
// It is a program of its own because a process counts the memory of the one that started it among
// its own until it has loaded its program: this one must be small.
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <ctime>
#include <fcntl.h>
#include <spawn.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

long long microseconds(const timeval& time) {
  return time.tv_sec * 1000000LL + time.tv_usec;
}

// No clock that somebody sets while a run is measured.
long long now() {
  timespec time;
  clock_gettime(CLOCK_MONOTONIC, &time);
  return time.tv_sec * 1000000LL + time.tv_nsec / 1000;
}

pid_t start(const char* output, char** words) {
  posix_spawn_file_actions_t actions;
  posix_spawn_file_actions_init(&actions);
  // A program that waits for input would wait for ever.
  posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
  posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, output, O_WRONLY | O_CREAT | O_TRUNC,
                                   0666);
  pid_t child = 0;
  const int error = posix_spawnp(&child, words[0], &actions, nullptr, words, environ);
  posix_spawn_file_actions_destroy(&actions);
  if (error == 0) return child;
  std::fprintf(stderr, "run_once: %s: %s\n", words[0], std::strerror(error));
  return -1;
}

} // namespace

int main(int argc, char** argv) {
  if (argc < 3) {
    std::fprintf(stderr, "usage: run_once OUTPUT PROGRAM [WORD...]\n");
    return 2;
  }
  const long long begin = now();
  const pid_t child = start(argv[1], argv + 2);
  if (child < 0) return 1;
  int status = 0;
  rusage usage;
  // wait4 and not getrusage: what is counted is this child, and no other.
  while (wait4(child, &status, 0, &usage) < 0 && errno == EINTR) {
  }
  const long long wall = now() - begin;
  std::printf("%lld %lld %ld %d\n", wall,
              microseconds(usage.ru_utime) + microseconds(usage.ru_stime), usage.ru_maxrss,
              // As a shell tells of a signal.
              WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status));
  return 0;
}
