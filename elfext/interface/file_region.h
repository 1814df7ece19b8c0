// SPDX-License-Identifier: Apache-2.0
//
// The role of something with a place in the file: the header, the two header tables, segments,
// sections, and the pieces of segments that no section covers.
//
// Regions are placed by offsets in the file, or relative to each other by the placement forest,
// from which a layout finds offsets that keep all distances. Offsets and sizes are the file's, up
// to 64 bits: questions about two regions compare distances and never ends.
#pragma once

#include "alloclib/interface/region_general.h"
#include "elfext/interface/placement_node.h"

#include <cstdint>

namespace elfext {

class DataStore;
class DataStructure;

class FileRegion {
public:
  FileRegion(const FileRegion&) = delete;
  FileRegion& operator=(const FileRegion&) = delete;

  /// Whether a file offset is set; the offset is 0 when not. Either pointer may be null.
  bool getFileExtent(uint64_t* offset, uint64_t* size) const;
  /// 0 when none is set.
  [[nodiscard]] uint64_t getFileOffset() const { return m_FileOffset; }
  /// Bytes in the file.
  [[nodiscard]] virtual uint64_t getFileSize() const = 0;

  /// The congruence that the file offset must satisfy: offset modulo alignment is the remainder.
  /// The alignment is never 0.
  virtual void getAlignment(uint64_t* remainder, uint64_t* alignment) const = 0;
  virtual void setFileOffset(uint64_t offset);
  void clearFileOffset();
  virtual void setAlignment(uint64_t) {}

  /// The region's bytes where it has some of its own; null in all others, and when bytes that were
  /// left in the file can't be loaded.
  virtual DataStore* getDataStore() { return nullptr; }

  /// The record for an output file's layout, made in the region.
  virtual DataStructure* createDataStructure(alloclib::RegionGeneral& region,
                                             uint64_t currentOffset) = 0;

  /// The placement forest, see PlacementNode: `second` starts `delta` bytes after `first`.
  static bool link(FileRegion& first, FileRegion& second, uint64_t delta) {
    return PlacementNode::link(first.m_Placement, second.m_Placement, delta);
  }
  /// The bytes that both have, where their distance is known; false if there are none. Any of the
  /// pointers may be null.
  static bool overlap(FileRegion& first, FileRegion& second, uint64_t* offsetInFirst,
                      uint64_t* offsetInSecond, uint64_t* length);
  /// Whether this region lies wholly in the other at a known distance.
  [[nodiscard]] bool isWithin(FileRegion& outer);
  [[nodiscard]] PlacementNode& getPlacement() { return m_Placement; }

protected:
  FileRegion() = default;
  /// Regions belong to their module.
  ~FileRegion() = default;

private:
  PlacementNode m_Placement;
  uint64_t m_FileOffset = 0;
  bool m_HasFileOffset = false;
};

} // namespace elfext
