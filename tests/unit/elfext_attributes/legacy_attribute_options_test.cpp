// SPDX-License-Identifier: Apache-2.0
//
// Options of older compilers, which stand in objects as texts: flags and accesses, switched on and
// off, alone and in clauses of one text. What is no option ends the reading, and nothing is said of
// it.

#include "elfext/interface/attribute_string.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

namespace elfext {
namespace {

constexpr uint64_t AllBits = ~uint64_t{0};

uint64_t applied(uint64_t flags, std::string_view options) {
  applyFlagString(flags, options);
  return flags;
}

struct OptionRow {
  const char* name;
  uint64_t set;
  uint64_t clear;
};

// clang-format off
const OptionRow Options[] = {
    {"interwork",    0x1,         0x2},
    {"inter",        0x1,         0x2},
    {"ropi",         0x40000,     0},
    {"pic",          0x40000,     0},
    {"rwpiclient",   0,           0xC},
    {"rwpi",         0x4,         0x8},
    {"pid",          0x4,         0x8},
    {"usev6",        0x8,         0},
    {"hardfp",       0x100,       0x200},
    {"softfp",       0x200,       0x100},
    {"swstna",       0,           0},
    {"swstackcheck", 0,           0},
    {"krell2lib",    0x10000000,  0},
    {"swst",         0,           0},
    {"usev7",        0,           0},
    {"ospace",       0x10000,     0x30000},
    {"otime",        0x30000,     0x10000},
    {"ieee_full",    0x700000,    0},
    {"ieee_part",    0x300000,    0},
    {"ieee_java",    0x100000,    0},
    {"8byte",        0x800000,    0x80000},
    {"fpic",         0x28040000,  0},
    {"indirect",     0x20000000,  0},
    {"standardlib",  0x40000000,  0},
    {"microlib",     0x80000000,  0},
    {"threadedcxx",  0x100000000, 0},
};
// clang-format on

TEST(FlagOptionsTest, SetAndClearBits) {
  for (const OptionRow& row : Options) {
    for (const uint64_t flags : {uint64_t{0}, AllBits, uint64_t{0x818069}}) {
      const uint64_t wanted = (flags & ~row.clear) | row.set;
      const std::string name = row.name;
      EXPECT_EQ(applied(flags, "-" + name), wanted) << name;
      EXPECT_EQ(applied(flags, "/" + name), wanted) << name;
    }
  }
}

TEST(FlagOptionsTest, DoTheOppositeBehindNo) {
  for (const OptionRow& row : Options) {
    const std::string name = row.name;
    // Nothing of the alignment to 4 follows from its not being one to 8.
    const uint64_t gained = name == "8byte" ? 0 : row.clear;
    EXPECT_EQ(applied(0, "-no" + name), gained) << name;
    EXPECT_EQ(applied(0, "/NO" + name), gained) << name;
    const uint64_t lost = name == "8byte" ? row.set | 0x80000 : row.set;
    // A word that has both sides of an option keeps the one that is gained.
    EXPECT_EQ(applied(AllBits, "-no" + name), (AllBits & ~lost) | gained) << name;
  }
}

TEST(FlagOptionsTest, DontGainTheBaseRegisterWhereItIsInUse) {
  EXPECT_EQ(applied(0x4, "/norwpi"), 0x8u);
  EXPECT_EQ(applied(0x4, "/norwpiclient"), 0x4u);
  EXPECT_EQ(applied(0x0, "/norwpiclient"), 0xCu);
  EXPECT_EQ(applied(0x8, "/rwpi"), 0x4u);
}

TEST(FlagOptionsTest, ReplaceOneGoalByTheOther) {
  EXPECT_EQ(applied(0x30000, "-ospace"), 0x10000u);
  EXPECT_EQ(applied(0x10000, "-otime"), 0x30000u);
  EXPECT_EQ(applied(0, "-otime-ospace"), 0x10000u);
}

TEST(FlagOptionsTest, AreClausesOfOneText) {
  EXPECT_EQ(applied(0x28040004, "/norwpi/nofpic"), 0x8u);
  EXPECT_EQ(applied(0, "/norwpi/fpic/noropi/noindirect"), 0x8000008u);
  EXPECT_EQ(applied(0x28040008, "/nofpic/rwpi"), 0x4u);
  EXPECT_EQ(applied(0x700000, "-noieee_full-noieee_part-ieee_java"), 0x100000u);
  EXPECT_EQ(applied(0, "-noieee_full-noieee_java-ieee_part"), 0x300000u);
  EXPECT_EQ(applied(0x100000, "-noieee_part-noieee_java-ieee_full"), 0x700000u);
  EXPECT_EQ(applied(0x80000, "/8byte/no8byte"), 0u);
  EXPECT_EQ(applied(0, "-Interwork/ROPI"), 0x40001u);
}

TEST(FlagOptionsTest, EndAtWhatIsNone) {
  EXPECT_EQ(applied(0, ""), 0u);
  EXPECT_EQ(applied(0, "ropi"), 0u);
  EXPECT_EQ(applied(0, "-nothing-ropi"), 0u);
  EXPECT_EQ(applied(0, "-ropi-nothing-usev6"), 0x40000u);
  EXPECT_EQ(applied(0, "-ropi usev6"), 0x40000u);
  EXPECT_EQ(applied(0, "-ropi--usev6"), 0x40000u);
  EXPECT_EQ(applied(0, "-"), 0u);
  EXPECT_EQ(applied(0, "-no"), 0u);
  // "inter" is there, and what is behind it opens no clause.
  EXPECT_EQ(applied(0, "-interworld-ropi"), 0x1u);
}

// ---- Accesses

AccessWords accessed(AccessWords access, std::string_view options) {
  applyAccessString(access, options);
  return access;
}

AccessWords touched(bool code, bool readOnlyData, bool data, uint16_t bits) {
  const auto in = [bits](bool isTouched) { return isTouched ? bits : uint16_t{0}; };
  return {in(code), in(readOnlyData), in(data), 0};
}

TEST(AccessOptionsTest, HaveAScope) {
  struct ScopeRow {
    const char* scope;
    bool code;
    bool readOnlyData;
    bool data;
  };
  const ScopeRow rows[] = {
      {"", true, true, true},
      {"code", true, false, false},
      {"text", true, false, false},
      {"rodata", false, true, true},
      {"ro", true, true, true},
      {"rw", false, false, true},
      {"data", false, false, true},
      {"all", true, true, true},
      {"CODE", true, false, false},
      {"code+data", true, false, true},
      {"text+rodata", true, true, true},
      {"rw+text", true, false, true},
  };
  for (const ScopeRow& row : rows) {
    const AccessWords wanted = touched(row.code, row.readOnlyData, row.data, 0x4000);
    for (const char* end : {"+UL41", ":+UL41", ":UL41"}) {
      if (*row.scope == '\0' && *end == ':') continue;
      EXPECT_EQ(accessed({}, row.scope + std::string(end)), wanted) << row.scope << end;
    }
    const std::string without = row.scope + std::string("-UL41");
    const AccessWords all = AccessWords::all(0xFFFF);
    EXPECT_EQ(accessed(all, without), all.without(wanted)) << without;
  }
}

TEST(AccessOptionsTest, SetAndClearLoadsAndStores) {
  const AccessWords unaligned = AccessWords::all(0xC000);
  EXPECT_EQ(accessed({}, "+UL41+US41+UL21+US21"), unaligned);
  EXPECT_EQ(accessed(AccessWords::all(0xC290), "-UL41-US41-UL21-US21"), AccessWords::all(0x290));
  // Stores are of every scope.
  EXPECT_EQ(accessed({}, "code:+US41"), (AccessWords{0, 0, 0, 0x4000}));
  EXPECT_EQ(accessed({}, "L88S88-L88"), (AccessWords{0, 0, 0, 1}));
  EXPECT_EQ(accessed(AccessWords::all(0xFFFF), ""), AccessWords::all(0xFFFF));
}

TEST(AccessOptionsTest, IgnoreTheirWeights) {
  EXPECT_EQ(accessed({}, "code:+L22/12+L21/0-L22/+L11"), (AccessWords{0x300, 0, 0, 0}));
}

TEST(AccessOptionsTest, EndAtWhatIsNone) {
  EXPECT_EQ(accessed({}, "code:+L22+nothing+L21"), (AccessWords{0x80, 0, 0, 0}));
  EXPECT_EQ(accessed({}, "code:+L22 +L21"), (AccessWords{0x80, 0, 0, 0}));
  EXPECT_EQ(accessed({}, "nothing:+L22"), AccessWords());
  EXPECT_EQ(accessed({}, "code:+l22"), AccessWords());
  EXPECT_EQ(accessed({}, "code+"), AccessWords());
  EXPECT_EQ(accessed({}, "+L22/"), touched(true, true, true, 0x80));
}

TEST(AccessOptionsTest, HaveDefaultsForATarget) {
  for (uint32_t number = 6; number <= 17; ++number)
    EXPECT_EQ(defaultAccessWords(number, "Krell"), AccessWords::all(0xC290)) << number;
  for (const uint32_t number : {1U, 5U, 18U, 0xFFFFFFFFU})
    EXPECT_EQ(defaultAccessWords(number, "v6"), AccessWords::all(0x290)) << number;
  EXPECT_EQ(defaultAccessWords(0, "v6"), AccessWords::all(0xC290));
  EXPECT_EQ(defaultAccessWords(0, ""), AccessWords::all(0x210));
  EXPECT_EQ(defaultAccessWords(0, "v5"), AccessWords::all(0x210));
  EXPECT_EQ(defaultAccessWords(0, "Krell"), (AccessWords{0x290, 0x210, 0x210, 0x210}));
}

} // namespace
} // namespace elfext
