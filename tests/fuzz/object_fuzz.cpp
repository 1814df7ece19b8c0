// SPDX-License-Identifier: Apache-2.0
//
// Any bytes read as an object, from memory and as a member of a file, under a handler that refuses
// and one that goes on. What was read is counted, validated and looked at, and must be the same in
// the object's tables, as far as the tests hold them against each other. Once more it is read as an
// object of any machine.
#include "alloclib/interface/session.h"
#include "elfext/interface/deferred_contents_selector.h"
#include "elfext/interface/error_string_capture.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/object_outline.h"
#include "elfext/interface/read_elf_file.h"
#include "elfext/interface/section.h"
#include "elfext/interface/sizes_statistics.h"
#include "support/interface/source_file.h"
#include "tests/fuzz/memory_bound.h"
#include "tests/support/memory_host.h"
#include "tests/systematic/two_roads.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <string>
#include <string_view>

namespace {

using namespace elfext;

// Goes on wherever there is something to go on with.
class AcceptingHandler final : public ErrorHandler {
public:
  bool report(const ObjectModule&, uint32_t, const std::string&) override { return true; }
  bool outOfMemory(const ObjectModule&) override { return false; }
  bool ioErrorReading(const ObjectModule&, int) override { return false; }
  bool ioErrorWriting(const ObjectModule&, int) override { return false; }
  bool unrecognisedFileType(const ObjectModule&, uint32_t) override { return false; }
  bool invalidDataEncoding(const ObjectModule&, uint32_t) override { return false; }
  bool unsupportedVersion(const ObjectModule&, uint32_t) override { return false; }
  bool wrongMagic(const ObjectModule&) override { return false; }
  bool wrongClass(const ObjectModule&) override { return false; }
};

void lookAt(ObjectModule& module) {
  [[maybe_unused]] const SizesStatistics sizes = computeSizesStatistics(&module);
  for (Section* section : module.getSections())
    section->materializeRelocations();
  SymbolList symbols;
  for (const Symbol* symbol : module.getSymbols()) {
    if (symbol->isBuildAttributesSymbol() && symbol->getName() == nullptr) std::abort();
  }
  [[maybe_unused]] const bool isValid = module.validate();
  module.clear();
  if (!module.isEmpty()) std::abort();
}

void readFromMemory(std::span<const uint8_t> bytes, ErrorHandler& handler) {
  testsupport::MemoryHost host;
  ObjectModule module;
  module.setErrorHandler(&handler);
  if (readElfFile(host, "object", bytes, module, nullptr)) lookAt(module);
}

void readAsMember(std::span<const uint8_t> bytes, ErrorHandler& handler) {
  constexpr size_t Before = 100;
  testsupport::MemoryHost host;
  const std::string_view text(reinterpret_cast<const char*>(bytes.data()), bytes.size());
  host.addFile("archive", std::string(Before, 'x') + std::string(text) + "behind");
  BySizeDeferredContentsSelector selector;
  ObjectModule module;
  module.setErrorHandler(&handler);
  if (readElfFile(host, "archive", Before, bytes.size(), module, &selector)) lookAt(module);
}

// Objects of other machines, and what compilers keep for the optimiser of a link, are read for
// their names alone.
void readForNames(std::span<const uint8_t> bytes) {
  testsupport::MemoryHost host;
  host.addFile("object", bytes);
  support::SourceFiles files(host);
  std::shared_ptr<support::SourceFile> file;
  if (files.open("object", file) != 0) std::abort();
  ElfextErrorStringCapture handler;
  ObjectOutline outline;
  outline.setMachines(ObjectOutline::Machines::Any);
  if (!outline.read(file, 0, bytes.size(), &handler, std::nullopt)) return;
  size_t nameSize = 0;
  for (const ObjectOutline::OutlinedSymbol& symbol : outline.getSymbols())
    nameSize = std::max(nameSize, symbol.name == nullptr ? 0 : std::strlen(symbol.name));
  if (nameSize > bytes.size()) std::abort();
}

void readAlone(std::span<const uint8_t> bytes) {
  const alloclib::Session session;
  ElfextErrorStringCapture refusing;
  AcceptingHandler accepting;
  for (ErrorHandler* handler :
       {static_cast<ErrorHandler*>(&refusing), static_cast<ErrorHandler*>(&accepting)}) {
    readFromMemory(bytes, *handler);
    readAsMember(bytes, *handler);
  }
  readForNames(bytes);
}

} // namespace

// Nobody catches what a failed expectation throws.
extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  static const bool IsInitialised = (GTEST_FLAG_SET(throw_on_failure, true), true);
  if (!IsInitialised || size == 0) return 0;
  const fuzzing::MemoryBound bound(size);
  readAlone({data, size});
  testsupport::expectSameOnBothRoads({reinterpret_cast<const char*>(data), size});
  return 0;
}
