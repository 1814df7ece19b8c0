// SPDX-License-Identifier: Apache-2.0
//
// The library with each host call failing in turn, and with the disk full after any number of
// bytes: the old archive whole or the new one complete, nothing left behind, and a report.
//
// The call is the k-th, for every k until a run needs no more; the disk takes n bytes, for n up to
// all that are needed. The product's own promise that the old archive survives is nothing but this.
// A member that the host can't give is never taken for one that has nothing to publish.

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/archive_file_writer.h"
#include "arlib/interface/contents_reader.h"
#include "tests/support/archive_builder.h"
#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"
#include "tests/support/object_builder.h"
#include "tests/support/recording_handler.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cerrno>
#include <functional>

namespace arlib {

namespace {

using testsupport::archive;
using testsupport::FaultyHost;
using testsupport::MemoryHost;
using testsupport::object;
using testsupport::RecordingHandler;

const std::string LongName = "member_with_a_long_name.o";

// One editing run. False as soon as a step fails.
using Edit = std::function<bool(Archive&)>;

struct NamedEdit {
  const char* name;
  Edit edit;
};

const std::vector<NamedEdit> Edits = {
    {"insert", [](Archive& a) { return a.addMemberFromFile("new.o") != nullptr; }},
    {"replace", [](Archive& a) { return a.getMembers()[2]->setContentsFromFile("new.o"); }},
    {"replace by a piece",
     [](Archive& a) { return a.getMembers()[2]->setContentsFromFileRegion("new.o", 2, 9); }},
    {"delete",
     [](Archive& a) {
       a.removeMember(a.getMembers()[2]);
       return true;
     }},
    {"move",
     [](Archive& a) {
       a.moveMember(a.getMembers()[2], 4);
       return true;
     }},
    {"rewrite", [](Archive&) { return true; }},
    {"edit in memory",
     [](Archive& a) {
       a.addMember("memory", 0, 0, 0, 0)->setContents("abc", 3);
       return a.getMembers()[2]->clearType();
     }},
};

void fillDisk(MemoryHost& disk) {
  disk.addFile("lib.a", archive()
                            .symbolTable({{"s", "a.o"}})
                            .longNames({LongName})
                            .member("a.o", "odd")
                            .member(LongName, std::string(5000, 'x'))
                            .member("c.o", "")
                            .bytes());
  disk.addFile("new.o", object().bytes());
}

// Reads, edits and writes. What was reported is in the handler.
bool run(support::Host& host, RecordingHandler& handler, const Edit& edit) {
  Archive archive(host);
  archive.setErrorHandler(&handler);
  if (!readFile("lib.a", archive)) return false;
  // The client's own look before an edit.
  if (archive.isReadOnly()) return handler.reportReadOnlyOutput(archive, "lib.a");
  archive.setSymbolTableMode(SymbolTableMode::Always);
  return edit(archive) && writeFile("lib.a", archive);
}

std::string wantedBytes(const Edit& edit) {
  MemoryHost disk;
  fillDisk(disk);
  RecordingHandler handler;
  EXPECT_TRUE(run(disk, handler, edit));
  EXPECT_TRUE(handler.reports.empty());
  return disk.read("lib.a");
}

// Failures that a run survives: what is only best effort, the close of the old archive when the new
// one has taken its place, and the reading ahead of a small input file, which is read again where
// its bytes are wanted.
bool isTolerated(const FaultyHost& host) {
  const std::string& operation = host.getFailedOperation();
  if (operation == "copyProtection" || operation == "status") return true;
  if (host.getFailedName() == "lib.a") return operation == "close";
  return host.getFailedName() == "new.o" && (operation == "readAt" || operation == "statusOf");
}

void failEachCall(const NamedEdit& each, int error) {
  const std::string wanted = wantedBytes(each.edit);
  for (uint64_t call = 1;; ++call) {
    MemoryHost disk;
    fillDisk(disk);
    const std::string old = disk.read("lib.a");
    FaultyHost host(disk);
    RecordingHandler handler;
    host.failCall(call, error);
    const bool isDone = run(host, handler, each.edit);
    const std::string& operation = host.getFailedOperation();
    SCOPED_TRACE(std::string(each.name) + ", call " + std::to_string(call) + " " + operation);
    EXPECT_EQ(disk.read("lib.a"), isDone ? wanted : old);
    EXPECT_THAT(disk.getNames(), testing::ElementsAre("lib.a", "new.o"));
    EXPECT_EQ(disk.openHandles(), 0u);
    EXPECT_EQ(isDone, handler.reports.empty());
    if (isDone && !operation.empty()) {
      EXPECT_TRUE(isTolerated(host) || operation == "isWritable") << host.getFailedName();
    }
    // The reason is in the report, unless the access test failed, which gives none.
    if (!isDone && operation != "isWritable") {
      EXPECT_THAT(handler.reports.front(), testing::HasSubstr(strerror(error)));
    }
    if (operation.empty()) break;
  }
}

} // namespace

TEST(FailingHost, KeepsTheOldArchiveOrMakesTheNewOne) {
  for (const NamedEdit& each : Edits) {
    failEachCall(each, EIO);
    failEachCall(each, ENOSPC);
  }
}

// Somebody else is as fast as we are: a temporary of that name is there already.
TEST(FailingHost, LooksForAnotherNameWhereATemporaryIsInTheWay) {
  MemoryHost disk;
  fillDisk(disk);
  RecordingHandler handler;
  uint64_t call = 0;
  FaultyHost host(disk);
  do {
    fillDisk(disk);
    host.failCall(++call, EEXIST);
    run(host, handler, Edits.front().edit);
    ASSERT_NE(host.getFailedOperation(), "") << "no temporary is made";
  } while (host.getFailedOperation() != "createTemporary");
  EXPECT_EQ(disk.read("lib.a"), wantedBytes(Edits.front().edit));
}

TEST(FullDisk, KeepsTheOldArchive) {
  for (const NamedEdit& each : Edits) {
    const std::string wanted = wantedBytes(each.edit);
    const size_t needed = wanted.size();
    for (size_t room = 0; room < needed; room += room < 500 ? 1 : 97) {
      SCOPED_TRACE(std::string(each.name) + ", room for " + std::to_string(room));
      MemoryHost disk;
      fillDisk(disk);
      const std::string old = disk.read("lib.a");
      disk.setRoom(room);
      RecordingHandler handler;
      EXPECT_FALSE(run(disk, handler, each.edit));
      EXPECT_THAT(
          handler.reports,
          testing::ElementsAre("0 I/O error writing file 'lib.a.0': No space left on device"));
      EXPECT_EQ(disk.read("lib.a"), old);
      EXPECT_THAT(disk.getNames(), testing::ElementsAre("lib.a", "new.o"));
    }
    MemoryHost disk;
    fillDisk(disk);
    disk.setRoom(needed);
    RecordingHandler handler;
    EXPECT_TRUE(run(disk, handler, each.edit));
    EXPECT_EQ(disk.read("lib.a"), wanted);
  }
}

TEST(FailingHost, NeverGivesWrongContents) {
  MemoryHost disk;
  fillDisk(disk);
  FaultyHost host(disk);
  for (uint64_t call = 1;; ++call) {
    RecordingHandler handler;
    host.failCall(call, EIO);
    Archive archive(host);
    archive.setErrorHandler(&handler);
    bool isComplete = readFile("lib.a", archive);
    if (isComplete) {
      ContentsReader reader(archive);
      std::string text;
      std::span<const uint8_t> piece;
      isComplete = reader.start(*archive.getMembers()[3]);
      while (isComplete && (isComplete = reader.read(piece)) && !piece.empty())
        text.append(piece.begin(), piece.end());
      if (isComplete) {
        EXPECT_EQ(text, std::string(5000, 'x'));
        isComplete = reader.finish();
      }
    }
    if (!isComplete) {
      EXPECT_EQ(handler.reports.size(), 1u) << call;
    }
    if (host.getFailedOperation().empty()) break;
  }
  EXPECT_EQ(disk.openHandles(), 0u);
}

} // namespace arlib
