// SPDX-License-Identifier: Apache-2.0
//
// What the tests with hostile objects share: the object is inserted and shown by the real programs,
// which must not take long nor much memory.
//
// Each object is good enough to be read far, and multiplies something: rows that share bytes, lists
// that name each other, counts that promise more. One second, and 64 MiB beyond its size, are far
// above what the tool needs, and far below what anything quadratic would take.

#pragma once

#include "elfext/interface/elf_constants.h"
#include "tests/support/archive_builder.h"
#include "tests/support/object_builder.h"
#include "tests/support/sanitized.h"
#include "tests/support/tool_folder.h"
#include "tests/systematic/two_roads.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <initializer_list>
#include <string>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>

namespace testsupport {

constexpr uint32_t Megabyte = 0x100000;
constexpr uint32_t ManySections = 60000; // nearly as many as there can be
constexpr uint32_t LongNameSize = Megabyte / 2;

// What a run may take, beyond the object's own size.
constexpr double MostSeconds = 1;
constexpr uint64_t MostMemory = 64 * uint64_t{Megabyte};

struct Hostile {
  const char* name;
  std::string (*make)();
  // What is said of the object; empty if it is read.
  const char* report;
};

inline void PrintTo(const Hostile& hostile, std::ostream* stream) {
  *stream << hostile.name;
}

// Rows of words as they are in a file with the low byte first. Rows of a table are many, and far
// faster made here than piece by piece.
inline void put(std::string& text, std::initializer_list<uint32_t> words) {
  for (const uint32_t each : words)
    text += littleEndian(each);
}

constexpr uint32_t Local = 0;
constexpr uint32_t Global = 1;

constexpr uint32_t symbolInfo(uint32_t binding, uint32_t type, uint32_t section) {
  return binding << 4 | type | section << 16;
}

// The null symbol, and symbols of value 0 with names at every `step`-th byte from `firstName` on.
inline std::string symbolRows(uint32_t count, uint32_t info, uint32_t firstName = 0,
                              uint32_t step = 0) {
  std::string rows(16, '\0');
  for (uint32_t i = 0; i < count; ++i)
    put(rows, {firstName + i * step, 0, 0, info});
  return rows;
}

// A string table of one text.
inline std::string longName(char letter = 'n') {
  return '\0' + std::string(LongNameSize, letter) + '\0';
}

// A string table, a symbol table with that many rows, and the sections that come next.
inline ObjectBuilder withSymbols(const std::string& rows, const std::string& strings) {
  ObjectBuilder file = object();
  file.section(".strtab", elfext::SHT_STRTAB).bytes(strings);
  file.section(".symtab", elfext::SHT_SYMTAB).link(1).bytes(rows);
  return file;
}

class HostileObject : public testing::TestWithParam<Hostile> {
protected:
  using Program = ToolRun (ToolFolder::*)(const std::vector<std::string>& words) const;

  HostileObject() { m_Folder.write("lib.a", archive().member("a.o", object().bytes()).bytes()); }

  // In a process of its own, so that this one stays small: what it has counts for what it starts.
  void write(std::string (*make)()) {
    const pid_t process = fork();
    if (process == 0) {
      m_Folder.write("x.o", make());
      _exit(0);
    }
    int state = 0;
    waitpid(process, &state, 0);
    ASSERT_EQ(state, 0);
    m_Size = m_Folder.read("x.o").size();
    ASSERT_GT(m_Size, Megabyte / 2);
    ASSERT_LT(m_Size, 5 * Megabyte);
  }

  // A neighbour on the processor may slow a run down, but hardly three.
  double leastSeconds(Program program, const std::vector<std::string>& words, double seconds) {
    for (int attempt = 1; attempt < 3 && seconds >= MostSeconds; ++attempt)
      seconds = std::min(seconds, (m_Folder.*program)(words).seconds);
    return seconds;
  }

  ToolRun run(const std::vector<std::string>& words, Program program = &ToolFolder::runProgram) {
    SCOPED_TRACE(words.front());
    ToolRun run = (m_Folder.*program)(words);
    if (!IsSanitized) {
      EXPECT_LT(leastSeconds(program, words, run.seconds), MostSeconds);
      EXPECT_LT(run.peakMemory, m_Size + MostMemory);
    }
    return run;
  }

  // The object is a member like any other, with and without a report of it.
  void expectHarmless(const Hostile& hostile) {
    write(hostile.make);
    const ToolRun insertion = run({"-r", "lib.a", "x.o"});
    EXPECT_EQ(insertion.status, 0);
    if (*hostile.report == '\0')
      EXPECT_EQ(insertion.errors, "");
    else
      EXPECT_THAT(insertion.errors, testing::HasSubstr(hostile.report));
    EXPECT_TRUE(m_Folder.read("lib.a").ends_with(m_Folder.read("x.o")));
    for (const char* report : {"--sizes", "--entries", "--zs"}) {
      const ToolRun reporting = run({report, "lib.a"});
      EXPECT_EQ(reporting.status, 0) << report;
      EXPECT_EQ(reporting.errors, "") << report;
    }
    const ToolRun document = run({"lib.a"}, &ToolFolder::runJson);
    EXPECT_EQ(document.status, 0);
    EXPECT_EQ(document.errors, "");
  }

  ToolFolder m_Folder;
  uint64_t m_Size = 0;
};

} // namespace testsupport
