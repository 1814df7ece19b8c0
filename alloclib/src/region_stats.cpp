// SPDX-License-Identifier: Apache-2.0
//
// The records, their two lists and the report. Records come from the host's heap and not from a
// region, since the root region needs one before it can give memory.
//
// The report is a table, read by eye. Each field starts at a column of its own: final size 25,
// maximum 34, allocations 43, frees 52, bytes 61, fragmentation 64, uses 71, accuracy 77. A number
// that is too long for its column is cut by the next.

#include "alloclib/interface/region_stats.h"

#include "alloclib/interface/handlers.h"
#include "alloclib/interface/process.h"

#include <algorithm>
#include <cinttypes>
#include <cstdlib>
#include <cstring>
#include <new>

namespace alloclib {
namespace {

constexpr uint32_t RootSequenceNumber = 1;

// One line of the report: fields at fixed columns, in a buffer of blanks. A field that is too
// long is cut where the next one starts.
class ReportLine {
public:
  ReportLine() { std::memset(m_Buffer, ' ', sizeof m_Buffer); }

  void put(size_t column, const char* text) {
    std::memset(m_Buffer + column, ' ', LineEnd - column);
    std::memcpy(m_Buffer + column, text, std::min(std::strlen(text), LineEnd - column));
  }

  void putNumber(size_t column, uint64_t number) {
    char text[32];
    std::snprintf(text, sizeof text, "%" PRIu64 ",", number);
    put(column, text);
  }

  void write(std::FILE* stream) {
    m_Buffer[LineEnd] = '\n';
    std::fwrite(m_Buffer, 1, LineEnd + 1, stream);
  }

private:
  static constexpr size_t LineEnd = 78;

  char m_Buffer[1024];
};

uint32_t getFinishedBound(uint32_t limit) {
  return limit > 10 ? limit - 10 : 1;
}

} // namespace

// Records outlive their regions: what one costs is part of what many short regions cost.
static_assert(sizeof(RegionStats) == 120);

RegionStats::List RegionStats::s_Live;
RegionStats::List RegionStats::s_Finished;
uint32_t RegionStats::s_NextSequenceNumber = RootSequenceNumber;
uint32_t RegionStats::s_FinishedLimit = 0;

void RegionStats::List::append(RegionStats* record) {
  record->m_Previous = last;
  record->m_Next = nullptr;
  (last != nullptr ? last->m_Next : first) = record;
  last = record;
}

void RegionStats::List::unlink(RegionStats* record) {
  RegionStats*& fromPrevious = record->m_Previous != nullptr ? record->m_Previous->m_Next : first;
  RegionStats*& fromNext = record->m_Next != nullptr ? record->m_Next->m_Previous : last;
  // A record that was finished twice, or written over, would otherwise take its neighbours with it.
  if (fromPrevious != record || fromNext != record)
    internalError("RegionStats list is inconsistent");
  fromPrevious = record->m_Next;
  fromNext = record->m_Previous;
}

RegionStats* RegionStats::start(const char* name, size_t initialSize, bool accurate) {
  void* memory = std::malloc(sizeof(RegionStats));
  if (memory == nullptr) outOfMemory(sizeof(RegionStats));
  auto* record = ::new (memory) RegionStats;
  record->m_SequenceNumber = s_NextSequenceNumber++;
  record->m_TraceLevel = getTraceLevel();
  record->m_InitialSize = initialSize;
  record->m_Accurate = accurate;
  record->m_Name = name;
  s_Live.append(record);
  if (record->m_TraceLevel >= 1)
    std::fprintf(stderr, "(%s:%d) New region (%" PRIu64 ") initial_size. Tracing is %sACCURATE\n",
                 name, static_cast<int>(record->m_SequenceNumber), record->m_InitialSize,
                 record->getAccuracyPrefix());
  return record;
}

void RegionStats::finish() {
  if (m_TraceLevel >= 1)
    std::fprintf(stderr,
                 "(%s:%d) Destroyed region with final size (%" PRIu64 ") after (%" PRIu64
                 ") allocs. Maximum size was (%" PRIu64 "). Tracing was %sACCURATE\n",
                 m_Name, static_cast<int>(m_SequenceNumber), getCurrentSize(), m_Allocations,
                 m_MaximumSize, getAccuracyPrefix());
  s_Live.unlink(this);
  RegionStats* target = findMergeTarget();
  if (target == nullptr) return s_Finished.append(this);
  target->merge(*this);
  release();
}

RegionStats* RegionStats::findMergeTarget() const {
  RegionStats* target = nullptr;
  uint32_t sameName = 0;
  bool mustMerge = m_Uses > 1;
  for (RegionStats* record = s_Finished.first; record != nullptr; record = record->m_Next) {
    if (std::strcmp(record->m_Name, m_Name) != 0) continue;
    ++sameName;
    mustMerge = mustMerge || record->m_Uses > 1;
    // A record that others were merged into takes the next as well, so that there is one for a
    // name.
    if (target == nullptr || record->m_Uses > 1) target = record;
  }
  return mustMerge || sameName >= getFinishedBound(s_FinishedLimit) ? target : nullptr;
}

void RegionStats::merge(const RegionStats& other) {
  m_InitialSize += other.m_InitialSize;
  m_Accurate = m_Accurate && other.m_Accurate;
  m_Uses += other.m_Uses;
  m_Allocations += other.m_Allocations;
  m_Frees += other.m_Frees;
  m_BytesAllocated += other.m_BytesAllocated;
  m_Padding += other.m_Padding;
  m_BytesFreed += other.m_BytesFreed;
  m_Overhead += other.m_Overhead;
  m_Fragmentation += other.m_Fragmentation;
  m_MaximumSize = std::max(m_MaximumSize, other.m_MaximumSize);
}

void RegionStats::release() {
  std::free(this);
}

void RegionStats::noteSize() {
  m_MaximumSize = std::max(m_MaximumSize, getCurrentSize());
}

void RegionStats::allocated(const void* pointer, size_t bytes, size_t padding) {
  ++m_Allocations;
  m_BytesAllocated += bytes;
  m_Padding += padding;
  noteSize();
  if (m_TraceLevel >= 2)
    std::fprintf(stderr, "(%s:%d) Allocation at (%p) (%zu) bytes (%zu) padding (%s) type\n", m_Name,
                 static_cast<int>(m_SequenceNumber), pointer, bytes - padding, padding, "unknown");
}

void RegionStats::discarded(const void* pointer, size_t bytes, size_t padding) {
  ++m_Frees;
  m_BytesFreed += bytes;
  noteSize();
  if (m_TraceLevel >= 2)
    std::fprintf(stderr, "(%s:%d) Discarded block at (%p) (%zu) bytes (%zu) padding\n", m_Name,
                 static_cast<int>(m_SequenceNumber), pointer, bytes, padding);
}

void RegionStats::extended() {
  if (m_TraceLevel >= 1)
    std::fprintf(stderr, "(%s:%d) region extended\n", m_Name, static_cast<int>(m_SequenceNumber));
}

void RegionStats::overheadIncreased(size_t bytes) {
  m_Overhead += bytes;
  noteSize();
  if (m_TraceLevel >= 3)
    std::fprintf(stderr, "(%s:%d) overhead increased (%zu) bytes \n", m_Name,
                 static_cast<int>(m_SequenceNumber), bytes);
}

void RegionStats::overheadDecreased(size_t bytes) {
  m_Overhead -= bytes;
  noteSize();
  if (m_TraceLevel >= 3)
    std::fprintf(stderr, "(%s:%d) overhead decreased (%zu) bytes \n", m_Name,
                 static_cast<int>(m_SequenceNumber), bytes);
}

void RegionStats::fragmentationIncreased(size_t bytes) {
  m_Fragmentation += bytes;
  noteSize();
  if (m_TraceLevel >= 3)
    std::fprintf(stderr, "(%s:%d) fragmentation increased (%zu) bytes\n", m_Name,
                 static_cast<int>(m_SequenceNumber), bytes);
}

void RegionStats::fragmentationDecreased(size_t bytes) {
  m_Fragmentation -= bytes;
  noteSize();
  if (m_TraceLevel >= 3)
    std::fprintf(stderr, "(%s:%d) fragmentation decreased (%zu) bytes \n", m_Name,
                 static_cast<int>(m_SequenceNumber), bytes);
}

void RegionStats::setFinishedLimit(uint32_t limit) {
  s_FinishedLimit = limit;
}

void RegionStats::report(std::FILE* stream, bool includeFinished, bool flagLive) {
  std::fputs("\nNum,RegionName,          FinalSz, MaxSz,   NAllocs, NFrees,  Al,Frag,  Uses, Ac\n",
             stream);
  if (includeFinished) reportList(stream, s_Finished, false);
  reportList(stream, s_Live, flagLive);
}

void RegionStats::reportList(std::FILE* stream, const List& list, bool flagLive) {
  for (const RegionStats* record = list.first; record != nullptr; record = record->m_Next) {
    if (flagLive && record->m_SequenceNumber > RootSequenceNumber)
      std::fputs("ERROR: Following region was not destroyed before program termination!\n", stream);
    record->writeLine(stream);
  }
}

void RegionStats::writeLine(std::FILE* stream) const {
  char title[1024];
  std::snprintf(title, sizeof title, "%2d, %s,", static_cast<int>(m_SequenceNumber), m_Name);
  ReportLine line;
  line.put(0, title);
  line.putNumber(25, getCurrentSize());
  line.putNumber(34, m_MaximumSize);
  line.putNumber(43, m_Allocations);
  line.putNumber(52, m_Frees);
  line.putNumber(61, m_BytesAllocated);
  line.putNumber(64, m_Fragmentation);
  line.putNumber(71, m_Uses);
  line.put(77, m_Accurate ? "Y" : "n");
  line.write(stream);
}

void RegionStats::freeAll() {
  for (const RegionStats* record = s_Live.first; record != nullptr; record = record->m_Next)
    if (record->m_SequenceNumber > RootSequenceNumber)
      internalError("FreeAllStats called with live region");
  while (s_Finished.first != nullptr) {
    RegionStats* record = s_Finished.first;
    s_Finished.unlink(record);
    record->release();
  }
  // A new session numbers its root 1 again; the checks above tell the root by that.
  if (s_Live.first == nullptr) s_NextSequenceNumber = RootSequenceNumber;
}

} // namespace alloclib
