// SPDX-License-Identifier: Apache-2.0
//
// The tool while somebody else is at work on the archive: in front of each of its host calls in
// turn he writes to it, cuts it short, or makes it.
//
// Whatever the moment, the run tells of one state of the archive, or ends with an error; a writing
// run never replaces what it has not read. The moment is the k-th host call, for every k, by the
// faulty host's disturbance.

#include "tests/support/archive_builder.h"
#include "tests/support/faulty_host.h"
#include "tests/support/object_builder.h"
#include "tests/support/tool_folder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <fcntl.h>
#include <fstream>
#include <functional>
#include <unistd.h>

namespace testsupport {

namespace {

using Words = std::vector<std::string>;

// In the tool's process, whose folder is that of the test. The file stays the same one.
void overwrite(const std::string& bytes) {
  std::ofstream("lib.a", std::ios::binary) << bytes;
}

std::string objectOfSize(size_t size) {
  ObjectBuilder builder = object();
  builder.section(".text", 1).flags(6).bytes(std::string(size, 'x'));
  return builder.bytes();
}

std::string libraryOf(const std::vector<size_t>& sizes) {
  ArchiveBuilder library = archive();
  for (const size_t size : sizes)
    library.member("member_" + std::to_string(size) + ".o", objectOfSize(size));
  return library.bytes();
}

std::string oldLibrary() {
  return libraryOf({16, 70000, 32});
}

// What a run that nobody disturbs says of a library.
std::string outputOn(ToolFolder& folder, const Words& words, const std::string& library) {
  folder.write("lib.a", library);
  return folder.run(words).output;
}

// Tells of an archive that is replaced by who has not its turn.
class WatchingHost final : public FaultyHost {
public:
  WatchingHost() : FaultyHost(support::getNativeHost()) {}

  support::HostError rename(const char* from, const char* to) override {
    if (!isLocked(to)) std::fputs("Replaced without a turn\n", stderr);
    return FaultyHost::rename(from, to);
  }

private:
  static bool isLocked(const char* name) {
    const int file = open(name, O_RDWR | O_CLOEXEC);
    struct flock whole = {};
    whole.l_type = F_WRLCK;
    const bool isTold = fcntl(file, F_OFD_GETLK, &whole) == 0;
    ::close(file);
    return isTold && whole.l_type != F_UNLCK;
  }
};

bool contains(const Words& all, const std::string& word) {
  return std::find(all.begin(), all.end(), word) != all.end();
}

// Runs it with the disturbance in front of each host call, until no call is left; `judge` looks at
// each end. An empty library is none at all.
void disturbEachCall(ToolFolder& folder, const Words& words, const std::string& before,
                     const std::function<void()>& disturbance,
                     const std::function<void(const ToolRun&)>& judge) {
  const std::string mark = "disturbed";
  for (uint64_t call = 1;; ++call) {
    SCOPED_TRACE("call " + std::to_string(call));
    folder.remove(mark);
    if (before.empty())
      folder.remove("lib.a");
    else
      folder.write("lib.a", before);
    WatchingHost host;
    host.disturbCall(call, [&] {
      disturbance();
      std::ofstream marking(mark);
    });
    judge(folder.runOn(host, words));
    if (!contains(folder.leaves(), mark)) return;
  }
}

using DisturbedReading = testing::TestWithParam<Words>;

} // namespace

TEST_P(DisturbedReading, TellsOfOneStateOrOfAnError) {
  ToolFolder folder;
  const std::string longer = libraryOf({64, 48, 90000, 200, 16});
  for (const std::string& now : {longer, oldLibrary().substr(0, 300), std::string("short")}) {
    const std::string oldOutput = outputOn(folder, GetParam(), oldLibrary());
    const std::string newOutput = outputOn(folder, GetParam(), now);
    disturbEachCall(
        folder, GetParam(), oldLibrary(), [&] { overwrite(now); },
        [&](const ToolRun& run) {
          if (run.status == 0)
            EXPECT_THAT(run.output, testing::AnyOf(oldOutput, newOutput)) << run.errors;
          else
            EXPECT_THAT(run.errors, testing::HasSubstr("Error: L"));
          EXPECT_THAT(run.errors, testing::Not(testing::HasSubstr("Success")));
        });
  }
}

INSTANTIATE_TEST_SUITE_P(Tool, DisturbedReading,
                         testing::Values(Words{"-t", "lib.a"}, Words{"-tv", "lib.a"},
                                         Words{"-p", "lib.a"}, Words{"--sizes", "lib.a"},
                                         Words{"--entries", "lib.a"}, Words{"--zt", "lib.a"},
                                         Words{"--zs", "lib.a"}));

// Somebody else makes the archive that this run was about to make.
TEST(DisturbedWriting, AddsToAnArchiveThatAppears) {
  ToolFolder folder;
  folder.write("b.o", objectOfSize(16));
  const auto appear = [] {
    if (access("lib.a", F_OK) != 0) overwrite(archive().member("a.o", "x").bytes());
  };
  int additions = 0;
  const auto judge = [&](const ToolRun& run) {
    std::string error;
    Words names;
    for (const ParsedMember& member : parseArchive(folder.read("lib.a"), error))
      names.push_back(member.name);
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.errors, "");
    EXPECT_EQ(error, "");
    EXPECT_TRUE(contains(names, "b.o"));
    additions += contains(names, "a.o");
  };
  for (const Words& words :
       {Words{"-r", "-c", "lib.a", "b.o"}, Words{"--create", "lib.a", "b.o"}}) {
    disturbEachCall(folder, words, "", appear, judge);
  }
  EXPECT_GT(additions, 5);
}

} // namespace testsupport
