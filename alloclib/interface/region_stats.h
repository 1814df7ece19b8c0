// SPDX-License-Identifier: Apache-2.0
//
// What one region has used. The records of all regions stand in two lists, of live and of finished
// regions, from which the report is made. A region that counts blocks instead of single
// allocations, which a plain RegionGeneral does to keep its inline path short, is marked as not
// accurate.
//
// Regions that come and go, as those of one object model after the other, would fill the finished
// list with one record each: records of one name are merged there above a bound.

#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdio>

namespace alloclib {

/// The record of one region. The region holds a pointer to it until `finish`; then the lists own
/// it.
class RegionStats {
public:
  /// Makes the record of a new region at the end of the live list. The name is kept, not copied.
  static RegionStats* start(const char* name, size_t initialSize, bool accurate);

  /// Moves the record to the finished list, or merges it into one of the same name there and
  /// frees it. The caller forgets the pointer.
  void finish();

  /// Sizes in bytes, padding included; the padding is what the client did not ask for.
  void allocated(const void* pointer, size_t bytes, size_t padding);
  /// `bytes` is what the client asked for, the padding what lay beside it.
  void discarded(const void* pointer, size_t bytes, size_t padding);
  void extended();
  /// What the region needs for itself: headers, maps, arrays of buckets. Bytes.
  void overheadIncreased(size_t bytes);
  void overheadDecreased(size_t bytes);
  /// What lies between its blocks and serves nobody at the moment. Bytes.
  void fragmentationIncreased(size_t bytes);
  void fragmentationDecreased(size_t bytes);

  /// Bytes in use: allocated, overhead and fragmentation, without padding and what was freed.
  [[nodiscard]] uint64_t getCurrentSize() const {
    return m_BytesAllocated + m_Overhead + m_Fragmentation - m_Padding - m_BytesFreed;
  }
  [[nodiscard]] uint64_t getMaximumSize() const { return m_MaximumSize; }
  [[nodiscard]] uint64_t getAllocations() const { return m_Allocations; }
  [[nodiscard]] uint64_t getFrees() const { return m_Frees; }
  [[nodiscard]] bool isAccurate() const { return m_Accurate; }

  /// Above what number of finished records of one name they are merged: the limit minus 10 if it
  /// is above 10, else 1. The limit is 0 at the start.
  static void setFinishedLimit(uint32_t limit);

  /// Writes the table: finished regions, if wanted, then the live ones. With `flagLive` each live
  /// region but the root gets a line of complaint.
  static void report(std::FILE* stream, bool includeFinished, bool flagLive);

  /// Frees the finished records. A live region other than the root is an internal error.
  static void freeAll();

private:
  friend class RegionStatsPeer;

  struct List {
    RegionStats* first = nullptr;
    RegionStats* last = nullptr;

    void append(RegionStats* record);
    void unlink(RegionStats* record);
  };

  RegionStats() = default;

  static void reportList(std::FILE* stream, const List& list, bool flagLive);
  void release();
  void noteSize();
  void merge(const RegionStats& other);
  /// The finished record that takes this one's counts; null if it gets a place of its own.
  [[nodiscard]] RegionStats* findMergeTarget() const;
  void writeLine(std::FILE* stream) const;
  [[nodiscard]] const char* getAccuracyPrefix() const { return m_Accurate ? "" : "IN"; }

  static List s_Live;
  static List s_Finished;
  static uint32_t s_NextSequenceNumber;
  static uint32_t s_FinishedLimit;

  uint32_t m_SequenceNumber = 0;
  uint32_t m_TraceLevel = 0;
  uint64_t m_InitialSize = 0;
  bool m_Accurate = false;
  const char* m_Name = nullptr;
  RegionStats* m_Next = nullptr;
  RegionStats* m_Previous = nullptr;
  uint64_t m_Uses = 1;
  uint64_t m_Allocations = 0;
  uint64_t m_Frees = 0;
  uint64_t m_BytesAllocated = 0;
  uint64_t m_Padding = 0;
  uint64_t m_BytesFreed = 0;
  uint64_t m_Overhead = 0;
  uint64_t m_Fragmentation = 0;
  uint64_t m_MaximumSize = 0;
};

} // namespace alloclib
