// SPDX-License-Identifier: Apache-2.0
//
// Objects that compilers made. The numbers are what `readelf -hsrg` says of the same files: a
// second opinion on what the builder and the reader might have misunderstood alike.

#include "elfext/interface/relocation.h"
#include "support/interface/host.h"
#include "tests/support/reader_fixture.h"

#include <cctype>

namespace elfext {

namespace {

struct RealObject {
  const char* name;
  uint32_t sections;
  uint32_t symbols; // the null symbol counts
  uint32_t definedGlobals;
  uint32_t undefined;
  uint64_t valueSum; // of all symbols
  uint64_t sizeSum;
  uint32_t relocations;
  uint64_t relocationOffsetSum;
  uint32_t groups;
};

// clang-format off
constexpr RealObject RealObjects[] = {
    {"examples/allocator_build_a.o",               12,  21,  7,  0,    4888,  66460,   16,    5296,  0},
    {"examples/allocator_build_b.o",               12,  21,  7,  0,    3021,  66110,   16,    3212,  0},
    {"examples/allocator_build_c.o",               12,  14,  7,  0,    2320,  66476,   33,    9560,  0},
    {"examples/allocator_build_d.o",               12,  14,  7,  0,    1149,  65964,   23,    2134,  0},
    {"examples/allocator_debug.o",                 26,  29,  7,  0,    4888,  66460,   85,    9584,  0},
    {"examples/allocator_plain.o",                 12,  21,  7,  0,    4888,  66460,   16,    5296,  0},
    {"examples/allocator_sections.o",              31,  28,  7,  0,     712,  66460,   16,    3272,  0},
    {"examples/automaton_build_a.o",               12,  41,  3,  1,   77872,   4600,  338,  629664,  0},
    {"examples/automaton_build_b.o",               12,  39,  3,  1,   46513,   3380,  125,  235364,  0},
    {"examples/automaton_build_c.o",               12,  36,  3,  1,   57392,   4748,  437,  915804,  0},
    {"examples/automaton_build_d.o",               12,  14,  3,  1,    2843,   2636,  155,  248586,  0},
    {"examples/automaton_debug.o",                 26,  49,  3,  1,   79272,   4872,  394,  641020,  0},
    {"examples/automaton_plain.o",                 12,  41,  3,  1,   77872,   4600,  338,  629664,  0},
    {"examples/automaton_sections.o",              14,  41,  3,  1,   77868,   4600,  338,  629664,  0},
    {"examples/bignum_build_a.o",                  11,  13,  7,  2,    3420,   1624,   10,    4340,  0},
    {"examples/bignum_build_b.o",                  11,  14,  7,  3,    2497,   1090,   13,    5186,  0},
    {"examples/bignum_build_c.o",                  11,  13,  7,  2,    3412,   1616,   10,    4332,  0},
    {"examples/bignum_build_d.o",                  11,  13,  7,  2,    1747,    712,   10,    1994,  0},
    {"examples/bignum_debug.o",                    26,  22,  7,  2,    2404,   1124,   74,    7095,  0},
    {"examples/bignum_plain.o",                    11,  13,  7,  2,    3420,   1624,   10,    4340,  0},
    {"examples/bignum_sections.o",                 31,  25,  7,  2,       0,   1624,   10,     168,  0},
    {"examples/calendar_build_a.o",                12,  20,  4,  2,    5888,   1472,    9,    3868,  0},
    {"examples/calendar_build_b.o",                12,  24,  4,  6,    4472,   1064,   31,   16924,  0},
    {"examples/calendar_build_c.o",                12,  12,  4,  2,    1476,   1392,   12,    5072,  0},
    {"examples/calendar_build_d.o",                12,  12,  4,  2,    1170,   1116,   12,    4054,  0},
    {"examples/calendar_debug.o",                  26,  28,  4,  2,    5808,   1452,   75,    7860,  0},
    {"examples/calendar_plain.o",                  12,  20,  4,  2,    5888,   1472,    9,    3868,  0},
    {"examples/calendar_sections.o",               25,  24,  4,  2,    1300,   1472,    9,    1348,  0},
    {"examples/matrix_build_a.o",                  11,  16,  5,  7,    7080,   2992,  171,  216904,  0},
    {"examples/matrix_build_b.o",                  11,  18,  5,  7,    8599,   1996,  171,  140756,  0},
    {"examples/matrix_build_c.o",                  10,  14,  5,  0,    4932,    912,    5,      80,  0},
    {"examples/matrix_build_d.o",                  11,  16,  5,  7,    1615,    992,   45,   16828,  0},
    {"examples/matrix_debug.o",                    26,  25,  5,  7,    2136,   1348,  104,   26383,  0},
    {"examples/matrix_plain.o",                    11,  16,  5,  7,    7080,   2992,  171,  216904,  0},
    {"examples/matrix_sections.o",                 27,  24,  5,  7,       0,   2992,  171,  132112,  0},
    {"examples/wide_build_a.o",                    11,  23, 10,  9,    4872,    912,   22,    6776,  0},
    {"examples/wide_build_b.o",                    11,  30, 10, 12,    5934,    638,   30,    7918,  0},
    {"examples/wide_build_c.o",                    11,  20, 10,  6,    4704,    860,   19,    4332,  0},
    {"examples/wide_build_d.o",                    11,  23, 10,  9,    3262,    632,   22,    4620,  0},
    {"examples/wide_debug.o",                      25,  31, 10,  9,    4872,    912,   96,   13776,  0},
    {"examples/wide_plain.o",                      11,  23, 10,  9,    4872,    912,   22,    6776,  0},
    {"examples/wide_sections.o",                   46,  41, 10,  9,       0,    912,   22,     496,  0},
    {"tests/objects/183-big/allocator_plain.o",     9,  16,  7,  0,    2532,  66616,   40,   12272,  0},
    {"tests/objects/183-big/automaton_plain.o",    10,  11,  3,  1,       4,   3960,  236,  529284,  0},
    {"tests/objects/183-big/bignum_plain.o",        7,  11,  7,  0,    3560,   1828,    0,       0,  0},
    {"tests/objects/183-big/calendar_plain.o",      9,  12,  4,  0,    1700,   1540,    6,    4868,  0},
    {"tests/objects/183-big/matrix_plain.o",        9,  11,  5,  0,    1796,   1400,    8,     196,  0},
    {"tests/objects/183-big/wide_plain.o",          7,  14, 10,  0,    2896,    560,    0,       0,  0},
    {"tests/objects/183-little/allocator_plain.o",  9,  16,  7,  0,    2484,  66592,   40,   12224,  0},
    {"tests/objects/183-little/automaton_plain.o", 10,  11,  3,  1,       4,   3960,  236,  529284,  0},
    {"tests/objects/183-little/bignum_plain.o",     7,  11,  7,  0,    3472,   1776,    0,       0,  0},
    {"tests/objects/183-little/calendar_plain.o",   9,  12,  4,  0,    1700,   1540,    6,    4868,  0},
    {"tests/objects/183-little/matrix_plain.o",     9,  11,  5,  0,    1592,   1288,    8,     112,  0},
    {"tests/objects/183-little/wide_plain.o",       7,  14, 10,  0,    2864,    552,    0,       0,  0},
    {"tests/objects/40-big/allocator_plain.o",     12,  21,  7,  0,    4888,  66460,   16,    5296,  0},
    {"tests/objects/40-big/automaton_plain.o",     12,  41,  3,  1,   77872,   4600,  338,  629664,  0},
    {"tests/objects/40-big/bignum_plain.o",        11,  13,  7,  2,    3440,   1624,   10,    4352,  0},
    {"tests/objects/40-big/calendar_plain.o",      12,  20,  4,  2,    5888,   1472,    9,    3868,  0},
    {"tests/objects/40-big/matrix_plain.o",        11,  16,  5,  7,    7080,   2992,  171,  216904,  0},
    {"tests/objects/40-big/wide_plain.o",          11,  23, 10,  9,    4896,    916,   22,    6804,  0},
};
// clang-format on

std::string testName(const testing::TestParamInfo<RealObject>& info) {
  std::string name = info.param.name;
  for (char& character : name) {
    if (std::isalnum(static_cast<unsigned char>(character)) == 0) character = '_';
  }
  return name;
}

class RealObjectTest : public testing::TestWithParam<RealObject> {
protected:
  void SetUp() override {
    m_Module.setErrorHandler(&m_Reports);
    const std::string path = std::string(QUARN_SOURCE_DIR) + "/" + GetParam().name;
    ASSERT_TRUE(readElfFile(support::getNativeHost(), path.c_str(), m_Module, nullptr))
        << testing::PrintToString(m_Reports.m_Texts);
  }

  RecordingReports m_Reports{false};
  ObjectModule m_Module;
};

uint64_t valueOf(const Symbol& symbol) {
  return symbol.getCategory() == Symbol::Category_Hosted ? symbol.getHostedSymbolOffset()
                                                         : symbol.getAbiValue();
}

} // namespace

TEST_P(RealObjectTest, HasTheSymbolsThatReadelfLists) {
  const RealObject& expected = GetParam();
  EXPECT_EQ(m_Module.getSectionCount(), expected.sections);
  EXPECT_EQ(m_Module.getSymbolCount(), expected.symbols);
  EXPECT_EQ(m_Module.getGroupCount(), expected.groups);
  EXPECT_EQ(m_Module.getUndefinedSymbolCount(), expected.undefined);
  uint32_t definedGlobals = 0;
  uint64_t valueSum = 0;
  uint64_t sizeSum = 0;
  for (const Symbol* symbol : m_Module.getSymbols()) {
    valueSum += valueOf(*symbol);
    sizeSum += symbol->getSize();
    if (symbol->getCategory() != Symbol::Category_Undefined && symbol->getBinding() != STB_LOCAL)
      ++definedGlobals;
  }
  EXPECT_EQ(definedGlobals, expected.definedGlobals);
  EXPECT_EQ(valueSum, expected.valueSum);
  EXPECT_EQ(sizeSum, expected.sizeSum);
}

TEST_P(RealObjectTest, HasTheRelocationsThatReadelfLists) {
  uint32_t count = 0;
  uint64_t offsetSum = 0;
  for (Section* section : m_Module.getSections()) {
    count += section->getRelocationCount();
    for (uint32_t i = 0; i < section->getRelocationCount(); ++i)
      offsetSum += section->getRelocation(i)->getOffset();
  }
  EXPECT_EQ(count, GetParam().relocations);
  EXPECT_EQ(offsetSum, GetParam().relocationOffsetSum);
}

TEST_P(RealObjectTest, IsValid) {
  EXPECT_TRUE(m_Module.validate()) << testing::PrintToString(m_Reports.m_Texts);
}

INSTANTIATE_TEST_SUITE_P(Objects, RealObjectTest, testing::ValuesIn(RealObjects), testName);

} // namespace elfext
