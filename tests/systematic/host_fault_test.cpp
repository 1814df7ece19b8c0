// SPDX-License-Identifier: Apache-2.0
//
// Runs of all kinds on a host in memory, each of whose calls fails in turn with each of the errors
// that hosts give, or reads fewer bytes than there are. A run that ends well has left and said what
// an undisturbed one does, to the byte; any other one has told which file and what the host said,
// and left everything as it was, but for the files that it has extracted whole. No handle stays
// open.
//
// A row is enough for a further run. What the real programs do on a real disk is in
// tool_fault_test.cpp, and behind every system call in tests/disturbed.

#include "tests/support/faulty_host.h"
#include "tests/unit/quarn/driver_fixture.h"

#include "quarn-ar/ar_main.h"

#include <array>
#include <cerrno>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <sstream>

namespace quarn {

namespace {

using testsupport::ArchiveBuilder;
using testsupport::FaultyHost;
using testsupport::MemoryHost;
using testsupport::ObjectBuilder;

struct NamedRun {
  const char* name;
  const char* line; // the program and its words
};

// clang-format off
constexpr NamedRun Edits[] = {
    {"Create",            "quarn --create new.a a.o c.o text"},
    {"CreateOver",        "quarn --create lib.a a.o c.o"},
    {"CreateFromArchive", "quarn --create lib.a other.a a.o"},
    {"InsertIntoNew",     "quarn -r -c new.a a.o"},
    {"Replace",           "quarn -r lib.a a.o c.o"},
    {"ReplaceInLarge",    "quarn -r large.a member_7.o"},
    {"ReplaceNewer",      "quarn -r -u lib.a a.o c.o"},
    {"ReplaceByPattern",  "quarn -r lib.a *.o"},
    {"Add",               "quarn -rv lib.a c.o"},
    {"AddBefore",         "quarn -r -b a.o lib.a c.o"},
    {"AddLongName",       "quarn -r lib.a a_file_with_a_long_name.o"},
    {"AddLarge",          "quarn -r lib.a large.o"},
    {"AddQuickly",        "quarn -q lib.a a.o"},
    {"AddText",           "quarn -r lib.a text"},
    {"AddNormalised",     "quarn -r --normalise=5 lib.a a.o c.o"},
    {"AddArchive",        "quarn -r lib.a other.a"},
    {"AddVariants",       "quarn -r lib.a first_build.o second_build.o"},
    {"Via",               "quarn -r --via words"},
    {"Attributes",        "quarn -r --libattrmap=map lib.a first_build.o second_build.o"},
    {"Delete",            "quarn -d lib.a a.o"},
    {"DeleteInLarge",     "quarn -d large.a member_7.o big.o"},
    {"Move",              "quarn -m -a big.o lib.a a.o"},
    {"Tables",            "quarn -s bare.a"},
    {"TablesAnew",        "quarn -s lib.a"},
    {"NoTables",          "quarn -n -s lib.a"},
    {"ListAndStrip",      "quarn -t -n lib.a"},
    {"LinkedArchive",     "quarn -r link.a c.o"},
    {"ArReplace",         "quarn-ar rcs lib.a a.o c.o"},
    {"ArCreate",          "quarn-ar rcs new.a a.o c.o"},
    {"ArNewer",           "quarn-ar ru lib.a a.o c.o"},
    {"ArBefore",          "quarn-ar rb a.o lib.a @more"},
    {"ArDelete",          "quarn-ar d lib.a a.o"},
    {"ArMove",            "quarn-ar m lib.a a.o"},
    {"ArTables",          "quarn-ar s bare.a"},
    {"ArLinked",          "quarn-ar r link.a c.o"},
    {"Ranlib",            "quarn-ranlib bare.a"},
};

constexpr NamedRun Readings[] = {
    {"Extract",           "quarn -x lib.a"},
    {"ExtractOne",        "quarn -xv lib.a a.o"},
    {"ExtractLarge",      "quarn -x large.a"},
    {"ExtractKeeping",    "quarn -x -C lib.a big.o"},
    {"Print",             "quarn -p lib.a"},
    {"PrintLinked",       "quarn -p link.a big.o"},
    {"List",              "quarn -t lib.a"},
    {"ListLarge",         "quarn -t large.a"},
    {"ListLong",          "quarn -tv lib.a"},
    {"Symbols",           "quarn --zs lib.a"},
    {"SymbolsWithout",    "quarn --zs bare.a"},
    {"Sizes",             "quarn --sizes lib.a"},
    {"Entries",           "quarn --entries lib.a"},
    {"Summary",           "quarn --zt lib.a"},
    {"ListByVia",         "quarn -t --via words"},
    {"ArList",            "quarn-ar tv lib.a"},
    {"ArPrint",           "quarn-ar p lib.a"},
    {"ArExtract",         "quarn-ar xo lib.a"},
};
// clang-format on

const std::string LongName = "member_with_a_long_name.o";

struct FileState {
  std::string bytes;
  std::string link;
  uint32_t mode = 0;
  bool operator==(const FileState&) const = default;
};
using Files = std::map<std::string, FileState>;

std::string example(const std::string& leaf) {
  std::ifstream stream(std::filesystem::path(QUARN_EXAMPLES) / leaf, std::ios::binary);
  return {std::istreambuf_iterator<char>(stream), {}};
}

// More than 64 KiB are not read whole when a file is looked at.
std::string objectOf(const std::string& symbol, size_t size) {
  ObjectBuilder builder = testsupport::objectThatDefines(symbol);
  builder.section(".data", 1).flags(3).bytes(std::string(size, 'd'));
  return builder.bytes();
}

std::string smallLibrary(bool hasTables) {
  ArchiveBuilder library = testsupport::archive();
  if (hasTables) library.symbolTable({{"f", LongName}, {"g", "big.o"}});
  library.longNames({LongName});
  library.member("a.o", "odd").member(LongName, objectOf("f", 3000));
  return library.member("big.o", objectOf("g", 70000)).bytes();
}

std::string largeLibrary() {
  constexpr int MembersOfLarge = 40;
  ArchiveBuilder library = testsupport::archive();
  for (int i = 0; i < MembersOfLarge; ++i) {
    const std::string number = std::to_string(i);
    library.member("member_" + number + ".o", objectOf("f" + number, 10));
  }
  return library.member("big.o", objectOf("g", 90000)).bytes();
}

std::map<std::string, std::string> makeStore() {
  const std::string other = testsupport::archive()
                                .symbolTable({{"in", "in.o"}})
                                .member("in.o", objectOf("in", 1000))
                                .member("out.o", objectOf("out", 90000))
                                .bytes();
  return {{"a.o", testsupport::objectThatDefines("new").bytes()},
          {"a_file_with_a_long_name.o", objectOf("long", 10)},
          {"bare.a", smallLibrary(false)},
          {"c.o", objectOf("c", 500)},
          {"first_build.o", example("matrix_build_a.o")},
          {"large.a", largeLibrary()},
          {"large.o", objectOf("large", 80000)},
          {"lib.a", smallLibrary(true)},
          {"map", "lib* $IEEE1$P\n"},
          {"member_7.o", objectOf("other", 20)},
          {"more", "a.o c.o\n"},
          {"other.a", other},
          {"second_build.o", example("matrix_build_b.o")},
          {"text", "No object, but a member all the same.\n"},
          {"words", "lib.a a.o\n"}};
}

// A temporary is told of by the name of what it is to become.
std::string userNameOf(const std::string& name) {
  return name.ends_with(".0") ? name.substr(0, name.size() - 2) : name;
}

struct Outcome {
  RunOutcome run;
  Files files;
  size_t openHandles = 0;
};

class FaultOfTheHost : public DriverTest, public testing::WithParamInterface<NamedRun> {
protected:
  void fill() {
    static const std::map<std::string, std::string> Store = makeStore();
    m_Host = MemoryHost();
    for (const auto& [name, bytes] : Store)
      m_Host.addFile(name, bytes).mode = name == "lib.a" ? 0100640 : 0100644;
    m_Host.at("c.o").modificationTime = OldDate + 1;
    m_Host.addLink("link.a", "lib.a");
    if (m_HidesTemporaries) m_Host.hideTemporaries();
  }

  [[nodiscard]] Files takeFiles() const {
    Files files;
    for (const std::string& name : m_Host.getNames()) {
      const MemoryHost::File& file = m_Host.at(name);
      files[name] = {file.bytes, file.link, file.mode};
    }
    return files;
  }

  Outcome runLine() {
    std::istringstream stream(GetParam().line);
    Words words{std::istream_iterator<std::string>(stream), {}};
    const std::string program = words.front();
    words.erase(words.begin());
    const Work work = program == "quarn" ? quarnMain : quarn_ar::arMain;
    const RunOutcome run = runWork(work, program.c_str(), words, m_Faulty);
    return {run, takeFiles(), m_Host.openHandles()};
  }
  Outcome runFailing(uint64_t call, int error) {
    fill();
    m_Faulty.failCall(call, error);
    return runLine();
  }
  Outcome runShort(uint64_t call) {
    fill();
    m_Faulty.shortenCall(call);
    return runLine();
  }

  void takeExpectation() {
    fill();
    m_Before = takeFiles();
    m_Plain = runFailing(0, 0);
    ASSERT_EQ(m_Plain.run.status, 0) << m_Plain.run.errors;
    m_Needed = m_Faulty.getCallCount();
    ASSERT_GT(m_Needed, 3U);
  }

  // In its quotes: what most reports name, whichever file could not be read or written.
  static std::string archiveName() {
    const std::string line = GetParam().line;
    const size_t end = line.find(".a");
    if (end == std::string::npos) return "'lib.a'"; // of the file of words
    const size_t start = line.rfind(' ', end) + 1;
    return "'" + line.substr(start, end + 2 - start) + "'";
  }

  // Reports that have no room for the host's words.
  [[nodiscard]] bool isWithoutReason(const std::string& errors) const {
    const std::string& operation = m_Faulty.getFailedOperation();
    if (operation == "readNext") return errors.find("L3905U") != std::string::npos;
    if (operation == "openSequential") return errors.find("L3904U") != std::string::npos;
    // What nobody can be told of isn't there; of an archive that isn't, one is made.
    const bool isLookedFor = operation == "status" || operation == "findNames";
    const bool hasPosition = errors.find("L6841E") == std::string::npos;
    return isLookedFor && (errors.find("L6833E") != std::string::npos || !hasPosition);
  }

  // Of calls whose failure nobody is told of by the host's words.
  [[nodiscard]] bool isBestEffort() const {
    const std::string& operation = m_Faulty.getFailedOperation();
    return operation == "isWritable" || operation == "copyProtection" ||
           operation == "setPermissions" || operation == "setTimes";
  }

  void expectWhole(const Outcome& outcome) const {
    EXPECT_EQ(outcome.run.output, m_Plain.run.output);
    // All of a file of words has been read when it is closed.
    const bool isCloseToldOf = m_Faulty.getFailedOperation() == "close" &&
                               outcome.run.errors.starts_with("Warning: L3913W: ") &&
                               outcome.run.errors.ends_with(m_Plain.run.errors);
    if (!isCloseToldOf) {
      EXPECT_EQ(outcome.run.errors, m_Plain.run.errors);
    }
    for (const auto& [name, state] : m_Plain.files) {
      ASSERT_TRUE(outcome.files.contains(name)) << name;
      EXPECT_TRUE(outcome.files.at(name).bytes == state.bytes) << name;
      EXPECT_EQ(outcome.files.at(name).link, state.link) << name;
      if (!isBestEffort()) {
        EXPECT_EQ(outcome.files.at(name).mode, state.mode) << name;
      }
    }
    EXPECT_EQ(outcome.files.size(), m_Plain.files.size());
  }

  void expectOldFiles(const Outcome& outcome, bool isExtracting) const {
    Files files = outcome.files;
    if (isExtracting) {
      for (const auto& [name, state] : m_Plain.files) {
        const bool isExtracted = !m_Before.contains(name) || !(m_Before.at(name) == state);
        if (!isExtracted) continue;
        if (files.contains(name)) {
          EXPECT_TRUE(files.at(name).bytes == state.bytes || files.at(name) == m_Before.at(name))
              << name;
        }
        files.erase(name);
      }
    }
    for (const auto& [name, state] : files) {
      ASSERT_TRUE(m_Before.contains(name)) << name;
      EXPECT_TRUE(m_Before.at(name) == state) << name;
    }
    for (const auto& [name, state] : m_Before) {
      const bool isOld = m_Plain.files.contains(name) && m_Plain.files.at(name) == state;
      EXPECT_TRUE(files.contains(name) || (isExtracting && !isOld)) << name;
    }
  }

  void expectReport(const Outcome& outcome, int error) const {
    EXPECT_THAT(outcome.run.errors, testing::HasSubstr("rror: "));
    EXPECT_THAT(outcome.run.errors, testing::Not(testing::HasSubstr("Success")));
    if (error == 0 || isBestEffort()) return;
    const std::string name = "'" + userNameOf(m_Faulty.getFailedName()) + "'";
    if (isWithoutReason(outcome.run.errors)) return;
    EXPECT_THAT(outcome.run.errors,
                testing::AnyOf(testing::HasSubstr(name), testing::HasSubstr(archiveName())));
    EXPECT_THAT(outcome.run.errors, testing::HasSubstr(support::hostErrorText(error)));
  }

  void judge(const Outcome& outcome, int error, bool isExtracting) const {
    SCOPED_TRACE(m_Faulty.getFailedOperation() + " " + m_Faulty.getFailedName() + ": " +
                 outcome.run.errors);
    // A fatal error ends the process, and with it all that it has open.
    if (!outcome.run.errors.starts_with("Fatal error: ")) {
      EXPECT_EQ(outcome.openHandles, 0U);
    }
    if (outcome.run.status == 0) return expectWhole(outcome);
    EXPECT_EQ(outcome.run.status, 1);
    expectReport(outcome, error);
    expectOldFiles(outcome, isExtracting);
  }

  void failEachCall(bool isExtracting) {
    takeExpectation();
    for (const int error : {ENOSPC, EIO, EACCES, EMFILE, EINTR, ESTALE}) {
      for (uint64_t call = 1; call <= m_Needed; ++call) {
        SCOPED_TRACE("error " + std::to_string(error) + " at call " + std::to_string(call));
        judge(runFailing(call, error), error, isExtracting);
      }
    }
  }

  // Nobody has promised who reads a sequence more than one byte.
  void shortenEachCall(bool isExtracting) {
    takeExpectation();
    for (uint64_t call = 1; call <= m_Needed; ++call) {
      SCOPED_TRACE("short at call " + std::to_string(call));
      const Outcome outcome = runShort(call);
      // What ends too early to be an archive is a plain file.
      if (outcome.run.errors.find("non-ELF object 'other.a'") != std::string::npos) continue;
      if (m_Faulty.getFailedOperation() != "readAt") {
        EXPECT_EQ(outcome.run.status, 0) << m_Faulty.getFailedOperation();
      }
      judge(outcome, 0, isExtracting);
    }
  }

  FaultyHost m_Faulty{m_Host};
  Files m_Before;
  Outcome m_Plain;
  uint64_t m_Needed = 0;
  bool m_HidesTemporaries = false;
};

using FaultOfTheHostInAnEdit = FaultOfTheHost;
using FaultOfTheHostInAReading = FaultOfTheHost;

std::string nameOf(const testing::TestParamInfo<NamedRun>& info) {
  return info.param.name;
}

} // namespace

TEST_P(FaultOfTheHostInAnEdit, KeepsAllFilesOrMakesTheNewArchive) {
  failEachCall(false);
}

TEST_P(FaultOfTheHostInAnEdit, KeepsAllFilesWhereTemporariesHaveNoName) {
  m_HidesTemporaries = true;
  failEachCall(false);
}

TEST_P(FaultOfTheHostInAnEdit, TakesNoHalfReadFileForAWholeOne) {
  shortenEachCall(false);
}

INSTANTIATE_TEST_SUITE_P(Runs, FaultOfTheHostInAnEdit, testing::ValuesIn(Edits), nameOf);

TEST_P(FaultOfTheHostInAReading, TellsAllAndLeavesWholeFiles) {
  failEachCall(true);
}

TEST_P(FaultOfTheHostInAReading, TakesNoHalfReadFileForAWholeOne) {
  shortenEachCall(true);
}

INSTANTIATE_TEST_SUITE_P(Runs, FaultOfTheHostInAReading, testing::ValuesIn(Readings), nameOf);

} // namespace quarn
