// SPDX-License-Identifier: Apache-2.0
//
// What the region tests share: the region system's life around each test, a parent that writes down
// what is asked of it, and a look inside the regions. Sizes of blocks and the state behind the
// inline path are promises too, which no client can see from outside.

#pragma once

#include "alloclib/interface/region.h"
#include "alloclib/interface/region_large_block.h"
#include "alloclib/interface/region_malloc_free.h"
#include "alloclib/interface/region_stats.h"
#include "tests/support/test_host.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <fstream>
#include <new>
#include <sstream>
#include <string>
#include <vector>

namespace alloclib {

class RegionGeneralPeer {
public:
  static RegionGeneral* create(Region* parent, uint32_t flagsState = 1, size_t firstBlock = 4096) {
    return RegionGeneral::createPlain(parent, firstBlock, firstBlock, "test region", flagsState);
  }
  static uint32_t getState(const RegionGeneral* region) { return region->m_FlagsState; }
  static void setState(RegionGeneral* region, uint32_t state) { region->m_FlagsState = state; }
  static size_t getBucketBytes(const RegionGeneral* region) { return region->m_BucketBytes; }
  static char* getCursor(const RegionGeneral* region) { return region->m_Cursor; }
  static void setCursor(RegionGeneral* region, char* cursor) { region->m_Cursor = cursor; }
  static char* getFastLimit(const RegionGeneral* region) { return region->m_FastLimit; }
  static char* getWorkingEnd(const RegionGeneral* region) { return region->m_WorkingEnd; }
  static size_t getLargestChunk(const RegionGeneral* region) { return region->m_LargestChunk; }
  static bool hasLargeBlocks(const RegionGeneral* region) {
    return region->m_LargeBlocks != nullptr;
  }
  static RegionStats& getStats(RegionGeneral* region) { return *region->m_Stats; }
  static void setBlockWorkingState(RegionGeneral* region) { region->SetBlockWorkingState(); }
  static void setFastLimit(RegionGeneral* region) { region->setFastLimit(); }
};

class RegionLargeBlockPeer {
public:
  static RegionLargeBlock* create(Region* parent) {
    return RegionLargeBlock::createOn(parent, "test pages", false, false);
  }
  static uint32_t getHint(const RegionLargeBlock* region) { return region->m_Hint; }
  static RegionLargeBlock* getOverflow(const RegionLargeBlock* region) {
    return region->m_Overflow;
  }
  static void setBits(RegionLargeBlock* region, uint32_t firstBit, uint32_t count, bool free) {
    region->SetBits(firstBit, count, free);
  }
  static char* getChunk(const RegionLargeBlock* region, uint32_t chunk) {
    return region->m_Chunks[chunk];
  }
};

class RegionStatsPeer {
public:
  static void breakList(RegionStats* record) { record->m_Previous = record; }
};

// Blocks of its own making, with a log of sizes. What is larger than the machine likes to give
// is address space without memory.
class RecordingRegion final : public Region {
public:
  void* AllocFull(size_t size, size_t, const char*) override {
    allocations.push_back(size);
    if (size >= HugeSize) return testsupport::takeAddresses(size);
    return ::operator new(size, Alignment);
  }
  void DiscardFull(void* pointer, size_t size, size_t) override {
    discards.push_back(size);
    if (size >= HugeSize)
      testsupport::giveAddressesBack(pointer, size);
    else
      release(pointer);
  }
  void Destroy(bool) override {}
  // What nobody has given back; not of the largest.
  static void release(void* pointer) { ::operator delete(pointer, Alignment); }

  std::vector<size_t> allocations;
  std::vector<size_t> discards;

private:
  static constexpr size_t HugeSize = size_t{1} << 30;
  static constexpr std::align_val_t Alignment{4096}; // more than anybody asks for
};

class RegionTest : public testing::Test {
protected:
  void SetUp() override { initialise(); }
  void TearDown() override {
    setDebugMode(Debug_Off);
    setTraceLevel(0);
    RegionStats::setFinishedLimit(0);
    shutDown();
  }
};

inline std::string getReport(bool includeFinished, bool flagLive) {
  const std::string name = testing::TempDir() + "region_report";
  std::FILE* stream = std::fopen(name.c_str(), "wb");
  RegionStats::report(stream, includeFinished, flagLive);
  std::fclose(stream);
  std::stringstream report;
  report << std::ifstream(name, std::ios::binary).rdbuf();
  return report.str();
}

} // namespace alloclib
