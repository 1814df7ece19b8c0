// SPDX-License-Identifier: Apache-2.0
//
// Numbers that follow from their seed and from nothing else: the same on every machine and with
// every library, as those of <random>'s distributions are not.
//
// A counter that goes up by the golden section of 2^64 and is mixed into a number: three lines, no
// state but 64 bits, and streams that can be begun anywhere.

#pragma once

#include <cstdint>
#include <string>

namespace bench {

class Numbers {
public:
  // Another stream for each number.
  Numbers(uint64_t seed, uint64_t stream) : m_State(mixed(seed) ^ stream) {}

  uint64_t next() { return mixed(m_State += Step); }

  // From 0 to bound - 1.
  uint32_t below(uint32_t bound) {
    // The upper half of a product, which costs no division; bounds are far below 2^32, so that the
    // numbers are as good as equally likely.
    return static_cast<uint32_t>((next() >> 32) * uint64_t{bound} >> 32);
  }

  std::string bytes(size_t count) {
    std::string text;
    text.reserve(count + 8);
    while (text.size() < count) {
      uint64_t word = next();
      // Low byte first, whatever the machine's own order is.
      for (int i = 0; i < 8; ++i, word >>= 8)
        text += static_cast<char>(word & 0xFF);
    }
    text.resize(count);
    return text;
  }

private:
  static constexpr uint64_t Step = 0x9E3779B97F4A7C15;

  static constexpr uint64_t mixed(uint64_t value) {
    value = (value ^ (value >> 30)) * 0xBF58476D1CE4E5B9;
    value = (value ^ (value >> 27)) * 0x94D049BB133111EB;
    return value ^ (value >> 31);
  }

  uint64_t m_State;
};

} // namespace bench
