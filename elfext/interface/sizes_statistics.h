// SPDX-License-Identifier: Apache-2.0
//
// What the bytes of an object are for. Sections tell where a file has some, program headers where
// it has none.
//
// Both roads count by the same rules, which are in src/tables/sizes_source.cpp. Totals are sums of
// what the headers say: a file that lies gets figures that lie, and nothing else.
#pragma once

#include <cstdint>
#include <cstdio>

namespace elfext {

class ObjectModule;

/// Bytes. Code, literal pools and data in executable sections are told apart by mapping symbols; of
/// read-write data there are two totals, as the file has it and as it is after loading; ZI data has
/// no bytes in the file.
struct SizesStatistics {
  uint64_t m_Code = 0;
  uint64_t m_LiteralPools = 0;
  uint64_t m_RwDataUncompressed = 0;
  uint64_t m_RwDataCompressed = 0;
  uint64_t m_RoData = 0;
  uint64_t m_ZiData = 0;
  uint64_t m_DebugInfo = 0;
  uint64_t m_InternalPadding = 0;
};

/// Changes nothing of the module but its views of symbols, which are made on demand. A module that
/// was read can always be counted; of one that has lost contents since, the bytes that can't be
/// looked at are missing.
[[nodiscard]] SizesStatistics computeSizesStatistics(ObjectModule* objectModule);

/// The eight totals, each cut to 32 bits, between two rules.
void printSizesStatistics(const SizesStatistics& statistics, std::FILE* f);

} // namespace elfext
