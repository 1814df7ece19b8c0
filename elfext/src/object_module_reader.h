// SPDX-License-Identifier: Apache-2.0
//
// The steps of a read, each in a file of its own. They share one context and are taken in one
// order, which also is the order of their reports: the first problem in that order is the one that
// is told. False from a step ends the read.
//
// A hostile file can make a thousand sections of the same bytes. Whether sections overlap is found
// out beforehand, from the headers alone: the read of such a file is bound to fail at the place of
// that check, so until then nothing is made of its tables. They are only checked for what would be
// reported before.
#pragma once

#include "elfext/src/elf_records.h"
#include "elfext/src/go_on.h"
#include "elfext/src/image_bytes.h"
#include "elfext/src/low_level_result.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <utility>
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

struct ReadContext {
  ObjectModule& module;
  ImageBytes& image;
  // For what goes with the end of the read.
  alloclib::RegionGeneral& region;
  // The whole image, where its memory is lent for as long as the module; else null.
  const uint8_t* lentBytes;
  // Null when no contents may be deferred.
  DeferralFile* deferral;

  RecordFormat format = {};
  FileHeader fileHeader = {};
  std::span<SectionHeader> sectionHeaders = {};
  std::span<ProgramHeader> programHeaders = {};
  // By segment: whether its bytes are known to be in the image.
  std::vector<bool> isSegmentThere = {};
  // By section: relocation, group and index sections that later steps pass over.
  std::vector<bool> isBroken = {};
  // By section: the symbols of a symbol table, element 0 being null, in the object region.
  std::vector<std::span<Symbol*>> symbols = {};
  // The first two sections that overlap in the file; none for all good files.
  std::optional<std::pair<uint32_t, uint32_t>> overlap = {};
  bool hasSymbolTableSizeTag = false;

  [[nodiscard]] uint32_t sectionCount() const {
    return static_cast<uint32_t>(sectionHeaders.size());
  }
  // What messages call the last section.
  [[nodiscard]] uint32_t lastSection() const { return sectionCount() - 1; }
  [[nodiscard]] uint32_t segmentCount() const {
    return static_cast<uint32_t>(programHeaders.size());
  }
  [[nodiscard]] uint32_t typeOf(uint32_t section) const { return sectionHeaders[section].type; }
  // Rows of a table of fixed rows; the null symbol counts.
  [[nodiscard]] uint64_t rowCount(uint32_t section) const;

  // The bytes, or null after a report that they can't be had.
  [[nodiscard]] const uint8_t* view(uint64_t offset, uint64_t size);
  // The contents of a section as the model has them, mended tables included. Null, after a report,
  // if they can't be had; also null for a section without bytes.
  [[nodiscard]] const uint8_t* viewSection(uint32_t section);
  // Reports that the image could not give bytes, and why. Always false.
  [[nodiscard]] bool failRead() const;

  template <class Word>
  [[nodiscard]] Word get(const uint8_t* bytes) const {
    return getWord<Word>(bytes, format.isLittle);
  }
};

// Whether a section of that type and size has bytes in the file.
[[nodiscard]] bool hasFileBytes(const SectionHeader& header);
[[nodiscard]] bool isSymbolTable(uint32_t type);
[[nodiscard]] bool isRelocationTable(uint32_t type);

// The end of an extent, or the largest number where it lies beyond.
[[nodiscard]] constexpr uint64_t endOf(uint64_t offset, uint64_t size) {
  return size > UINT64_MAX - offset ? UINT64_MAX : offset + size;
}

// Takes all steps. The image, which the context refers to, goes to the module on the way.
[[nodiscard]] bool readObjectModule(ReadContext& context, std::unique_ptr<ImageSource> image);

[[nodiscard]] bool readFileHeader(ReadContext& context);
[[nodiscard]] bool readSectionHeaders(ReadContext& context);
[[nodiscard]] bool readProgramHeaders(ReadContext& context);
[[nodiscard]] bool createSections(ReadContext& context);
[[nodiscard]] bool readContents(ReadContext& context);
[[nodiscard]] bool readSectionNames(ReadContext& context);
[[nodiscard]] bool readLinks(ReadContext& context);
[[nodiscard]] bool readSymbols(ReadContext& context);
[[nodiscard]] bool readRelocations(ReadContext& context);
[[nodiscard]] bool readGroups(ReadContext& context);
[[nodiscard]] bool placeRegions(ReadContext& context);
[[nodiscard]] bool readDynamicSections(ReadContext& context);
// What the dynamic section says of the version sections; a count that is not there means that
// there should be no such section. False ends the read; the flag tells whether versions were read.
struct VersionCounts {
  std::optional<uint32_t> definitions = {};
  std::optional<uint32_t> requirements = {};
};
[[nodiscard]] bool readVersions(ReadContext& context, const VersionCounts& counts,
                                bool& areVersionsRead);
[[nodiscard]] bool readDebugOverlays(ReadContext& context);
[[nodiscard]] bool readSegmentMaps(ReadContext& context);
// From attribute sections, then from decoration symbols.
[[nodiscard]] bool readBuildAttributes(ReadContext& context);
[[nodiscard]] uint32_t computeReadConditions(const ReadContext& context);

} // namespace elfext
