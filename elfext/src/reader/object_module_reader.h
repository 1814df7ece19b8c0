// SPDX-License-Identifier: Apache-2.0
//
// The second half of a read: from checked tables the model, each kind of object in a file of its
// own. Nothing is checked here and nothing reported; only build attributes, which hang on what was
// made, are checked while they are given.
//
// It is the road that readElfFile takes; the tool itself finds names in the tables and makes no
// model. The context is the tables with what grows beside them, so each step here reads the tables'
// fields as its own.
#pragma once

#include "elfext/interface/object_module.h"
#include "elfext/src/tables/object_tables.h"

#include <cstdint>
#include <memory>
#include <span>
#include <vector>

namespace elfext {

class DeferredContentsSelector;
class ReferenceCountedFile;

// The file that deferred contents stay in; only a file that was opened as a whole can be one.
struct DeferralFile {
  support::Host& host;
  support::FileHandle file;
  DeferredContentsSelector& selector;
  // Made when the first section is deferred; from then on it closes the file. The read itself
  // holds one reference.
  ReferenceCountedFile* shared = nullptr;
};

// The tables of an object, and what is made of them.
struct ReadContext : ObjectTables {
  ReadContext(const ReadReporter& readReporter, ImageBytes& bytes, ObjectModule& objectModule,
              const uint8_t* lent, DeferralFile* deferralFile)
      : ObjectTables(readReporter, bytes), module(objectModule), lentBytes(lent),
        deferral(deferralFile) {}

  ObjectModule& module;
  // The whole image, where its memory is lent for as long as the module; else null.
  const uint8_t* lentBytes;
  // Null when no contents may be deferred.
  DeferralFile* deferral;
  // By section: the symbols of a symbol table, element 0 being null, in the object region.
  std::vector<std::span<Symbol*>> symbols = {};
  // A tag without a place of its own in the model; it becomes a read condition.
  bool hasSymbolTableSizeTag = false;

  // The text of a string table, which lives as long as the module.
  [[nodiscard]] const char* stringsOf(uint32_t section);
};

// Takes both halves. The image, which the context refers to, goes to the module on the way.
[[nodiscard]] bool readObjectModule(ReadContext& context, std::unique_ptr<ImageSource> image);

void createSections(ReadContext& context);
void nameSections(ReadContext& context);
void linkSections(ReadContext& context);
void createSymbols(ReadContext& context);
void giveRelocations(ReadContext& context);
void createGroups(ReadContext& context);
void placeRegions(ReadContext& context);
void takeDynamicTables(ReadContext& context);
void takeVersions(ReadContext& context, const VersionTables& versions);
void takeDebugOverlays(ReadContext& context);
void takeSegmentMaps(ReadContext& context);
[[nodiscard]] bool giveBuildAttributes(ReadContext& context);
[[nodiscard]] uint32_t computeReadConditions(const ReadContext& context);

} // namespace elfext
