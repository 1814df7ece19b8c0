// SPDX-License-Identifier: Apache-2.0
//
// What sorting finds is what going through the segments in their order finds, for each section: on
// small tables of all kinds and on large ones, where the plain way would take long.

#include "elfext/src/reader/segment_finder.h"

#include "elfext/interface/elf_constants.h"
#include "elfext/src/bytes/extents.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>

namespace elfext {

namespace {

constexpr uint32_t OtherSystem = 0;

bool isJudgedByRange(const ProgramHeader& segment, uint32_t osAbi) {
  switch (segment.type) {
  case PT_LOAD:
  case PT_NOTE:
  case PT_PHDR:
  case PT_TLS:
  case PT_ZEV_EXIDX:
    return true;
  case PT_DYNAMIC:
  case PT_INTERP:
    return osAbi != ELFOSABI_ZEV;
  default:
    return false;
  }
}

bool isInRange(const SectionHeader& section, const ProgramHeader& segment) {
  return section.offset >= segment.offset && section.offset - segment.offset <= segment.filesz &&
         section.size <= segment.memsz;
}

bool isInMemory(const SectionHeader& section, const ProgramHeader& segment) {
  return section.addr >= segment.vaddr && section.addr - segment.vaddr <= segment.memsz &&
         section.size <= segment.memsz - (section.addr - segment.vaddr);
}

bool isAtEnd(const SectionHeader& section, const ProgramHeader& segment) {
  return section.offset >= segment.offset && section.offset - segment.offset == segment.filesz &&
         segment.memsz >= segment.filesz && section.size <= segment.memsz - segment.filesz;
}

// The plain order, segment by segment.
uint32_t plainSegment(const SectionHeader& section, const std::vector<ProgramHeader>& segments,
                      uint32_t osAbi) {
  const bool hasBytes = section.type != SHT_NOBITS && section.size != 0;
  if (section.type == SHT_NULL || hasBytes) return NoExtent;
  uint32_t candidate = NoExtent;
  for (uint32_t i = 0; i < segments.size(); ++i) {
    if (!isJudgedByRange(segments[i], osAbi)) {
      if (isAtEnd(section, segments[i])) return i;
      continue;
    }
    if (!isInRange(section, segments[i])) continue;
    const bool isBetter = candidate == NoExtent || (isInMemory(section, segments[i]) &&
                                                    !isInMemory(section, segments[candidate]));
    if (isBetter) candidate = i;
  }
  return candidate;
}

// Numbers of a few places, near 0 or near the largest one, so that much is equal, next to another,
// and beyond the end.
class Numbers {
public:
  Numbers(uint32_t seed, uint64_t range, bool areLarge)
      : m_Random(seed), m_Range(range), m_AreLarge(areLarge) {}

  uint64_t upTo(uint64_t largest) { return m_Random() % (largest + 1); }
  uint64_t number() {
    const uint64_t small = upTo(m_Range);
    return m_AreLarge && upTo(2) == 0 ? UINT64_MAX - small : small;
  }
  template <class Value, size_t Count>
  Value oneOf(const Value (&values)[Count]) {
    return values[upTo(Count - 1)];
  }

private:
  std::mt19937_64 m_Random;
  uint64_t m_Range;
  bool m_AreLarge;
};

ProgramHeader randomSegment(Numbers& numbers, bool areMostlyJudgedByRange) {
  static constexpr uint32_t Types[] = {PT_NULL,  PT_LOAD, PT_DYNAMIC, PT_INTERP, PT_NOTE,
                                       PT_SHLIB, PT_PHDR, PT_TLS,     PT_LOAD,   PT_ZEV_EXIDX};
  ProgramHeader segment;
  segment.type = areMostlyJudgedByRange && numbers.upTo(19) != 0 ? PT_LOAD : numbers.oneOf(Types);
  segment.offset = numbers.number();
  segment.filesz = numbers.number();
  segment.vaddr = numbers.number();
  segment.memsz = numbers.upTo(3) == 0 ? segment.filesz + numbers.upTo(9) : numbers.number();
  return segment;
}

SectionHeader randomSection(Numbers& numbers) {
  static constexpr uint32_t Types[] = {SHT_NOBITS, SHT_NOBITS, SHT_NOBITS, SHT_PROGBITS, SHT_NULL};
  SectionHeader section;
  section.type = numbers.oneOf(Types);
  section.offset = numbers.number();
  section.addr = numbers.number();
  section.size = numbers.upTo(2) == 0 ? 0 : numbers.number();
  return section;
}

// Returns how many sections have a segment.
size_t expectPlainSegments(const std::vector<SectionHeader>& sections,
                           const std::vector<ProgramHeader>& segments, uint32_t osAbi) {
  std::vector<uint32_t> expected;
  for (const SectionHeader& section : sections)
    expected.push_back(plainSegment(section, segments, osAbi));
  EXPECT_EQ(findSegments(sections, segments, osAbi), expected);
  const auto none = std::count(expected.begin(), expected.end(), NoExtent);
  return expected.size() - static_cast<size_t>(none);
}

} // namespace

TEST(SegmentFinderTest, FindsNothingWhereThereIsNothing) {
  const std::vector<SectionHeader> sections(2, {.type = SHT_NOBITS});
  const std::vector<ProgramHeader> segments(2, {.type = PT_LOAD});
  EXPECT_EQ(findSegments({}, segments, OtherSystem), std::vector<uint32_t>());
  EXPECT_EQ(findSegments(sections, {}, OtherSystem), std::vector<uint32_t>(2, NoExtent));
  EXPECT_EQ(findSegments(sections, segments, OtherSystem), std::vector<uint32_t>(2, 0));
}

TEST(SegmentFinderTest, FindsTheSegmentsOfThePlainOrder) {
  size_t foundCount = 0;
  size_t sectionCount = 0;
  for (uint32_t round = 0; round < 6000; ++round) {
    Numbers numbers(round, round % 5 == 0 ? 3 : 15, round % 3 == 0);
    std::vector<ProgramHeader> segments(numbers.upTo(24));
    for (ProgramHeader& segment : segments)
      segment = randomSegment(numbers, round % 2 == 0);
    std::vector<SectionHeader> sections(numbers.upTo(24));
    for (SectionHeader& section : sections)
      section = randomSection(numbers);
    SCOPED_TRACE("round " + std::to_string(round));
    foundCount +=
        expectPlainSegments(sections, segments, round % 4 < 2 ? OtherSystem : ELFOSABI_ZEV);
    sectionCount += sections.size();
  }
  // The tables are neither hopeless nor trivial.
  EXPECT_GT(foundCount, sectionCount / 10);
  EXPECT_LT(foundCount, sectionCount * 9 / 10);
}

TEST(SegmentFinderTest, FindsTheSegmentsOfThePlainOrderInLargeTables) {
  for (uint32_t round = 0; round < 4; ++round) {
    Numbers numbers(round, 100000, round % 2 == 1);
    std::vector<ProgramHeader> segments(1500);
    for (ProgramHeader& segment : segments)
      segment = randomSegment(numbers, round < 2);
    std::vector<SectionHeader> sections(1500);
    for (SectionHeader& section : sections)
      section = randomSection(numbers);
    SCOPED_TRACE("round " + std::to_string(round));
    EXPECT_GT(expectPlainSegments(sections, segments, OtherSystem), 100U);
  }
}

} // namespace elfext
