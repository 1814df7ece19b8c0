// SPDX-License-Identifier: Apache-2.0
//
// Somebody else is at work on the same files: what comes out is of one state of them, or an error.
// The host in memory replaces, removes, writes to, cuts and extends files between the steps of a
// run.

#include "alloclib/interface/process.h"
#include "arlib/interface/contents_reader.h"
#include "tests/unit/arlib/archive_fixture.h"

#include <cerrno>
#include <functional>

namespace arlib {

namespace {

using Contents = std::vector<std::string>;

const std::string LongName = "member_with_a_long_name.o";

ArchiveBuilder oldLibrary() {
  return archive()
      .longNames({LongName})
      .member("a.o", "old a")
      .member(LongName, std::string(3000, 'o'))
      .member("c.o", object().bytes());
}

// The same names at other offsets.
ArchiveBuilder newLibrary() {
  return archive()
      .longNames({LongName})
      .member("a.o", std::string(700, 'n'))
      .member(LongName, "new")
      .member("c.o", "new c");
}

const Contents OldContents = {"old a", std::string(3000, 'o'), object().bytes()};
const Contents NewContents = {std::string(700, 'n'), "new", "new c"};

// All members' bytes in pieces, as printing and extracting do it; nothing after a failure.
Contents readAll(support::Host& host, RecordingHandler& handler) {
  Archive library(host);
  library.setErrorHandler(&handler);
  if (!readFile("lib.a", library)) return {};
  ContentsReader reader(library);
  Contents all;
  for (const ArchiveMember* member : library.getMembers()) {
    if (member->isAuxiliary()) continue;
    std::string text;
    std::span<const uint8_t> piece;
    if (!reader.start(*member)) return {};
    do {
      if (!reader.read(piece)) return {};
      text += textOf(piece);
    } while (!piece.empty());
    all.push_back(text);
  }
  return reader.finish() ? all : Contents();
}

// Reads "lib.a" with the disturbance in front of each host call in turn. What is read must be one
// of the two, or a failure that was reported; says how often each came.
struct Outcomes {
  int old = 0;
  int fresh = 0;
  int failures = 0;
};

Outcomes disturb(const std::function<void(MemoryHost&)>& disturbance) {
  Outcomes outcomes;
  for (uint64_t call = 1;; ++call) {
    SCOPED_TRACE("call " + std::to_string(call));
    MemoryHost disk;
    disk.addFile("lib.a", oldLibrary().bytes());
    FaultyHost host(disk);
    RecordingHandler handler;
    host.disturbCall(call, [&] { disturbance(disk); });
    const Contents contents = readAll(host, handler);
    if (contents.empty()) {
      ++outcomes.failures;
      EXPECT_THAT(handler.reports, testing::Not(IsEmpty()));
    } else {
      EXPECT_TRUE(contents == OldContents || contents == NewContents);
      ++(contents == OldContents ? outcomes.old : outcomes.fresh);
    }
    EXPECT_EQ(disk.openHandles(), 0u);
    if (host.getFailedOperation().empty()) return outcomes;
  }
}

void writeInPlace(MemoryHost& disk, const std::string& bytes) {
  disk.at("lib.a").bytes = bytes;
  disk.at("lib.a").modificationNanoseconds += 1;
}

} // namespace

TEST(OneOpening, SurvivesThatItsNameLeadsToAnotherArchive) {
  const Outcomes outcomes =
      disturb([](MemoryHost& disk) { disk.addFile("lib.a", newLibrary().bytes()); });
  EXPECT_EQ(outcomes.failures, 0);
  EXPECT_GT(outcomes.old, 3);
  EXPECT_GT(outcomes.fresh, 0);
}

TEST(OneOpening, SurvivesThatItsNameIsGone) {
  const Outcomes outcomes = disturb([](MemoryHost& disk) { EXPECT_EQ(disk.remove("lib.a"), 0); });
  EXPECT_LE(outcomes.failures, 2);
  EXPECT_GT(outcomes.old, 3);
}

TEST(OneOpening, RefusesWhatIsWrittenToInPlace) {
  const Outcomes outcomes =
      disturb([](MemoryHost& disk) { writeInPlace(disk, newLibrary().bytes()); });
  EXPECT_GT(outcomes.failures, 2);
  EXPECT_GT(outcomes.old, 0);
  EXPECT_GT(outcomes.fresh, 0);
}

TEST(OneOpening, RefusesWhatIsCutShort) {
  for (const size_t size : {0u, 5u, 70u, 300u, 3100u}) {
    const std::string bytes = oldLibrary().bytes().substr(0, size);
    const Outcomes outcomes = disturb([&](MemoryHost& disk) { writeInPlace(disk, bytes); });
    EXPECT_GT(outcomes.failures, 2);
    EXPECT_EQ(outcomes.fresh, 0);
  }
}

TEST(OneOpening, RefusesWhatGrows) {
  const Outcomes outcomes = disturb([](MemoryHost& disk) {
    writeInPlace(disk, oldLibrary().member("d.o", "one more").bytes());
    disk.at("lib.a").bytes.resize(oldLibrary().bytes().size() + 60);
  });
  EXPECT_GT(outcomes.failures, 2);
}

// ---- Input files of a writer

namespace {

// Puts "a.o" into a library that holds something else, with the disturbance in front of each host
// call. The library must be the old one, or have one of the two contents.
int countRefusals(const std::function<void(MemoryHost&)>& disturbance, uint64_t mostKept) {
  const std::string before = archive().member("x.o", "x").bytes();
  const std::string oldFile(5000, 'o');
  int refusals = 0;
  for (uint64_t call = 1;; ++call) {
    SCOPED_TRACE("call " + std::to_string(call));
    MemoryHost disk;
    disk.addFile("lib.a", before);
    disk.addFile("a.o", oldFile);
    FaultyHost host(disk);
    RecordingHandler handler;
    Archive library(host);
    library.setErrorHandler(&handler);
    library.getSourceFiles().setMostKept(mostKept);
    EXPECT_TRUE(readFile("lib.a", library));
    host.disturbCall(call, [&] { disturbance(disk); });
    const bool isWritten =
        library.addMemberFromFile("a.o") != nullptr && writeFile("lib.a", library);
    if (isWritten) {
      const std::string now = disk.read("lib.a");
      EXPECT_TRUE(now == archive().member("x.o", "x").member("a.o", oldFile).bytes() ||
                  now == archive().member("x.o", "x").member("a.o", "short and new").bytes());
    } else {
      ++refusals;
      EXPECT_EQ(disk.read("lib.a"), before);
      EXPECT_THAT(handler.reports, testing::Not(IsEmpty()));
    }
    if (host.getFailedOperation().empty()) return refusals;
  }
}

} // namespace

TEST(OneOpening, TakesAnInputFileThatIsReplacedAsItWas) {
  for (const uint64_t mostKept : {0u, 100'000u}) {
    EXPECT_EQ(
        countRefusals([](MemoryHost& disk) { disk.addFile("a.o", "short and new"); }, mostKept), 0);
  }
}

TEST(OneOpening, RefusesAnInputFileThatIsWrittenToInPlace) {
  const auto overwrite = [](MemoryHost& disk) {
    disk.at("a.o").bytes = "short and new";
    disk.at("a.o").modificationNanoseconds += 1;
  };
  EXPECT_GT(countRefusals(overwrite, 0), 2);
  // What is in memory by then is whole.
  EXPECT_LE(countRefusals(overwrite, 100'000), 2);
}

// ---- What a read leaves behind

// A handler that would always go on can't make a read go on where there is no way.
TEST(OneOpening, EndsAReadWhateverTheHandlerAnswers) {
  class Agreeing final : public ErrorHandler {
  public:
    bool report(const Archive&, Severity, std::string_view text) override {
      last = text;
      return true;
    }
    std::string last;
  };
  const std::vector<std::pair<std::string, std::string>> files = {
      {"", "I/O error reading file"},
      {"!<thin>\n", "File does not begin with the archive magic number (not an archive file?)"},
      {"!<arch>\nx", "End of file in the middle of archive member header starting at offset 8"},
      {archive().member("a", "x").badSize("x").bytes(),
       "Archive member header starting at offset 8 contains invalid size string 'x         '"},
      {archive().member("a", "x").noPadding().bytes(), "I/O error reading file"},
      {archive().member("a", "x").badSize("99").bytes(), "I/O error reading file"},
      {archive().symbolTableBytes("abc").bytes(),
       "Archive symbol table is 3 bytes long, but should contain at least a 4-byte symbol count"},
      {archive().symbolTableBytes(bigEndian(1)).bytes(),
       "Archive symbol table is 4 bytes long, but claims to contain 1 symbols so it should be at "
       "least 8 bytes long"},
      {archive().symbolTableBytes(bigEndian(1) + bigEndian(8) + "abc").bytes(),
       "Archive symbol table ends in the middle of the name of symbol #0 (out of 1)"},
  };
  for (const auto& [bytes, report] : files) {
    MemoryHost host;
    host.addFile("lib.a", bytes);
    Agreeing handler;
    Archive library(host);
    library.setErrorHandler(&handler);
    EXPECT_FALSE(readFile("lib.a", library));
    EXPECT_EQ(handler.last, report);
    EXPECT_FALSE(readFile("gone.a", library));
    EXPECT_EQ(handler.last, "I/O error reading file: No such file or directory");
  }
}

// The tables' bytes go with the views of them.
TEST(OneOpening, ReadsAgainAndAgainInTheSameMemory) {
  MemoryHost host;
  std::vector<std::string> names;
  for (int i = 0; i < 20'000; ++i)
    names.push_back("a_long_name_that_needs_the_table_" + std::to_string(i) + ".o");
  host.addFile("lib.a", archive().longNames(names).member("a.o", "x").bytes());
  Archive library(host);
  ASSERT_TRUE(readFile("lib.a", library));
  const uint64_t before = alloclib::getSystemSize();
  for (int i = 0; i < 20; ++i)
    ASSERT_TRUE(readFile("lib.a", library));
  EXPECT_LT(alloclib::getSystemSize(), before + 2'000'000);
}

// Also those of a table that the archive did without in between.
TEST(OneOpening, ReadsAgainInTheSameMemoryBehindAnEditThatDropsATable) {
  MemoryHost host;
  host.addFile("lib.a", archive()
                            .symbolTable({{std::string(500'000, 's'), "a.o"}})
                            .longNamesText(std::string(500'000, 'n') + "/\n")
                            .member("a.o", "x")
                            .bytes());
  Archive library(host);
  const auto readAndEdit = [&] {
    ASSERT_TRUE(readFile("lib.a", library));
    library.setSymbolTableMode(SymbolTableMode::Never);
    library.removeMember(library.getMembers().back());
    ASSERT_TRUE(library.updateAuxiliaryMembers());
    ASSERT_TRUE(library.getMembers().empty());
  };
  readAndEdit();
  const uint64_t before = alloclib::getSystemSize();
  for (int i = 0; i < 20; ++i)
    readAndEdit();
  EXPECT_LT(alloclib::getSystemSize(), before + 3'000'000);
}

} // namespace arlib
