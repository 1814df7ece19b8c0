// SPDX-License-Identifier: Apache-2.0
//
// The same work done by quarn, ar and llvm-ar on libraries of any files, each as a process of its
// own, in one run: what counts is the ratio between the rows of a case. Run it on a quiet machine.
// For libraries of objects there is compare/.
//
//   archiver_bench QUARN [Google Benchmark's own flags]
#include "bench/sample_library.h"

#include <benchmark/benchmark.h>

#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <functional>
#include <memory>
#include <spawn.h>
#include <string>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

namespace {

using Words = std::vector<std::string>;

// How each archiver is told to do the same.
struct Archiver {
  std::string name;
  std::string program;
  Words list;    // followed by the archive
  Words create;  // followed by the archive and the files
  Words replace; // the same
  Words index;   // followed by the archive: write it again with a new symbol table
  Words remove;  // followed by the archive and a member
};

void run(const Words& words) {
  // posix_spawnp wants pointers to what it promises not to change.
  std::vector<char*> arguments;
  for (const std::string& word : words)
    arguments.push_back(const_cast<char*>(word.c_str()));
  arguments.push_back(nullptr);
  posix_spawn_file_actions_t actions;
  posix_spawn_file_actions_init(&actions);
  // A terminal or a pipe would be measured with the listing.
  posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, "/dev/null", O_WRONLY, 0);
  pid_t child = 0;
  const int error =
      posix_spawnp(&child, arguments[0], &actions, nullptr, arguments.data(), environ);
  posix_spawn_file_actions_destroy(&actions);
  int status = 1;
  if (error == 0) waitpid(child, &status, 0);
  // A run that failed took less than it should: no figure is better than that one.
  if (error != 0 || status != 0) {
    std::fprintf(stderr, "failed: %s (status %d)\n", words[0].c_str(), status);
    std::exit(1);
  }
}

Words joined(const Archiver& archiver, const Words& options, const std::string& archive,
             const Words& files = {}) {
  Words words = {archiver.program};
  words.insert(words.end(), options.begin(), options.end());
  words.push_back(archive);
  words.insert(words.end(), files.begin(), files.end());
  return words;
}

// Times `work`; `prepare` runs before each time and doesn't count.
void addCase(const std::string& name, const Archiver& archiver, std::function<void()> prepare,
             Words work) {
  benchmark::RegisterBenchmark((name + "/" + archiver.name).c_str(),
                               [prepare, work](benchmark::State& state) {
                                 for (auto _ : state) {
                                   state.PauseTiming();
                                   prepare();
                                   state.ResumeTiming();
                                   run(work);
                                 }
                               })
      ->Unit(benchmark::kMillisecond)
      ->UseRealTime();
}

void addCases(const Archiver& archiver, const bench::SampleFolder& folder, const std::string& what,
              const Words& files) {
  const std::string master = folder.path(what + "." + archiver.name + ".a");
  const std::string copy = folder.path(what + "." + archiver.name + ".copy.a");
  const auto nothing = [] {};
  const auto removeCopy = [copy] { std::filesystem::remove(copy); };
  // Each time works on a fresh copy: an edited library would be another one the next time.
  const auto makeCopy = [master, copy] {
    std::filesystem::copy_file(master, copy, std::filesystem::copy_options::overwrite_existing);
  };
  // Made by the archiver that is measured: each lists and edits what it writes itself.
  run(joined(archiver, archiver.create, master, files));
  // The last member is the one that is found last and moves nothing behind it.
  const std::string last = std::filesystem::path(files.back()).filename().string();
  addCase("list/" + what, archiver, nothing, joined(archiver, archiver.list, master));
  addCase("create/" + what, archiver, removeCopy, joined(archiver, archiver.create, copy, files));
  addCase("replace_one/" + what, archiver, makeCopy,
          joined(archiver, archiver.replace, copy, {files.back()}));
  addCase("remove_one/" + what, archiver, makeCopy,
          joined(archiver, archiver.remove, copy, {last}));
  addCase("write_again/" + what, archiver, makeCopy, joined(archiver, archiver.index, copy));
}

using Archivers = std::vector<Archiver>;

void addLibrariesOfAnyFile(const Archivers& archivers, const bench::SampleFolder& folder) {
  const struct {
    const char* name;
    uint32_t count;
    uint64_t size;
  } libraries[] = {
      // The start of a process, what is done for each member, and the copying of bytes: each of the
      // three sizes has most of its time in one of them. 150 times the last is a gibibyte.
      {"10_members", 10, 2000},
      {"10000_members", 10000, 700},
      {"1_gigabyte_150_members", 150, 7158278},
  };
  for (const auto& library : libraries) {
    const Words files =
        folder.makeFiles(library.name + std::string("_"), library.count, library.size);
    for (const Archiver& archiver : archivers)
      addCases(archiver, folder, library.name, files);
  }
}

} // namespace

int main(int argc, char** argv) {
  if (argc < 2) {
    std::fprintf(stderr, "usage: %s QUARN [flags]\n", argv[0]);
    return 2;
  }
  const Archivers archivers = {
      // In the order of Archiver's fields. Files are no objects, which the tool warns of and the
      // others don't look at.
      {"quarn",
       argv[1],
       {"-t"},
       {"--create", "--diag_suppress=warning"},
       {"-r", "--diag_suppress=warning"},
       {"-s"},
       {"-d"}},
      {"ar", "ar", {"t"}, {"rcD"}, {"rD"}, {"sD"}, {"dD"}},
      {"llvm-ar", "llvm-ar", {"t"}, {"rcD"}, {"rD"}, {"sD"}, {"dD"}},
  };
  benchmark::Initialize(&argc, argv);
  const bench::SampleFolder folder;
  addLibrariesOfAnyFile(archivers, folder);
  benchmark::RunSpecifiedBenchmarks();
  return 0;
}
