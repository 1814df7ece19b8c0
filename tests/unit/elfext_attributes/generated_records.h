// SPDX-License-Identifier: Apache-2.0
//
// Records for what must hold for all of them: random, but the same ones in each run, with few bits
// as well as many, so that both nearly empty and nearly full records come.

#pragma once

#include "elfext/interface/full_attr.h"

#include <cstdint>
#include <random>

namespace elfext {

class GeneratedRecords {
public:
  // Now few bits, now many.
  uint64_t bits() {
    const uint64_t word = m_Random();
    switch (m_Random() % 4) {
    case 0:
      return word & m_Random() & m_Random() & m_Random();
    case 1:
      return word & m_Random();
    case 2:
      return word;
    default:
      return word | m_Random();
    }
  }

  FeatureSet features() { return {bits(), bits() & features::Defined.high}; }

  AccessWords access() {
    const auto word = [this] { return static_cast<uint16_t>(bits()); };
    const uint16_t code = word();
    const uint16_t readOnlyData = word();
    const uint16_t data = word();
    return {code, readOnlyData, data, word()};
  }

  FullAttr record() {
    FullAttr record;
    record.m_Features = features();
    record.m_Access = access();
    record.m_Flags = bits() & KnownFlags;
    record.m_Stack8 = bits() % 4;
    record.m_AbiLevel = bits() % 2 * AbiLevel_2;
    return record;
  }

  uint32_t below(uint32_t limit) { return static_cast<uint32_t>(m_Random() % limit); }

private:
  // All that have a token.
  static constexpr uint64_t KnownFlags = 0x1FCFF9B7F;

  std::mt19937_64 m_Random{1};
};

// How many records a test looks at.
constexpr int ManyRecords = 20000;

} // namespace elfext
