// SPDX-License-Identifier: Apache-2.0
//
// Any file read as an archive, under a handler that goes on wherever it may and under none. What
// can be read can be written, and what was written reads the same.
#include "alloclib/interface/region.h"
#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/archive_file_writer.h"
#include "tests/support/memory_host.h"

#include <cstdlib>
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

std::string describe(const Archive& archive) {
  std::string text;
  for (const arlib::ArchiveMember* member : archive.getMembers()) {
    if (member->isAuxiliary()) continue;
    text += std::string(member->getName()) + " " + std::to_string(member->getSize()) + "\n";
  }
  return text;
}

void readAndWrite(support::Host& host, arlib::ErrorHandler* handler, Machines machines) {
  const bool takesAll = machines == Machines::Any;
  Archive archive(host);
  archive.setErrorHandler(handler);
  archive.setMachines(machines);
  archive.setKeepFolders(takesAll);
  archive.setSymbolsWanted(!takesAll);
  if (!arlib::readFile("in.a", archive)) return;
  const std::string before = describe(archive);
  archive.setSymbolTableMode(arlib::SymbolTableMode::Always);
  if (!arlib::writeFile("out.a", archive)) return;
  Archive again(host);
  again.setKeepFolders(takesAll);
  if (!arlib::readFile("out.a", again) || describe(again) != before) std::abort();
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  static const bool IsInitialised = (static_cast<void>(alloclib::initialise()), true);
  if (!IsInitialised) return 0;
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
