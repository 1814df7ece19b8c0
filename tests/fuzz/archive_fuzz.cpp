// SPDX-License-Identifier: Apache-2.0
//
// Any file read as an archive, under a handler that goes on wherever it may and under none. What
// can be read can be written with all its members; what was written reads the same, and written
// once more it is the same file.
#include "alloclib/interface/region.h"
#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/archive_file_writer.h"
#include "tests/fuzz/memory_bound.h"
#include "tests/support/memory_host.h"

#include <cstdlib>
#include <span>
#include <string>
#include <vector>

namespace {

using arlib::Archive;
using Machines = elfext::ObjectOutline::Machines;

// Goes on wherever there is something to go on with.
class LenientHandler final : public arlib::ErrorHandler {
public:
  bool report(const Archive&, arlib::Severity severity, std::string_view) override {
    return severity != arlib::Severity::Fatal;
  }
};

void expect(bool condition) {
  if (!condition) std::abort();
}

// In bytes, so that a name can't look like the contents in front of it.
std::string describe(Archive& archive) {
  std::string text;
  for (arlib::ArchiveMember* member : archive.getMembers()) {
    if (member->isAuxiliary()) continue;
    expect(member->loadContents());
    const std::span<const uint8_t> contents = member->getContents();
    text += std::to_string(member->getName().size()) + " " + std::to_string(contents.size()) + "\n";
    text += member->getName();
    text.append(contents.begin(), contents.end());
  }
  return text;
}

struct Reading {
  Archive archive;
  Reading(support::Host& host, arlib::ErrorHandler* handler, Machines machines) : archive(host) {
    const bool takesAll = machines == Machines::Any;
    archive.setErrorHandler(handler);
    archive.setMachines(machines);
    archive.setKeepFolders(takesAll);
    archive.setSymbolsWanted(!takesAll);
  }
};

void readAndWrite(testsupport::MemoryHost& host, arlib::ErrorHandler* handler, Machines machines) {
  Reading first(host, handler, machines);
  if (!arlib::readFile("in.a", first.archive)) return;
  const std::string before = describe(first.archive);
  first.archive.setSymbolTableMode(arlib::SymbolTableMode::Always);
  if (!arlib::writeFile("out.a", first.archive)) return;
  Reading second(host, nullptr, machines);
  expect(arlib::readFile("out.a", second.archive));
  expect(describe(second.archive) == before);
  expect(arlib::writeFile("again.a", second.archive));
  expect(host.read("again.a") == host.read("out.a"));
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  static const bool IsInitialised = (static_cast<void>(alloclib::initialise()), true);
  if (!IsInitialised) return 0;
  const fuzzing::MemoryBound bound(size);
  LenientHandler lenient;
  for (arlib::ErrorHandler* handler :
       {static_cast<arlib::ErrorHandler*>(&lenient), static_cast<arlib::ErrorHandler*>(nullptr)}) {
    for (const Machines machines : {Machines::Own, Machines::Any}) {
      testsupport::MemoryHost host;
      host.addFile("in.a", std::vector<uint8_t>(data, data + size));
      readAndWrite(host, handler, machines);
    }
  }
  return 0;
}
