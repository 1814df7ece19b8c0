// SPDX-License-Identifier: Apache-2.0
//
// The text of an attribute record, both ways: each token, the order in which they are printed, the
// form of a text with empty and unknown tokens in it, and accesses in each scope. Reading never
// fails, as these texts stand in symbol names that anybody may write; on generated records, what is
// printed and read again soon stays the same.

#include "elfext/interface/attribute_string.h"

#include "alloclib/interface/region.h"
#include "elfext/interface/object_module.h"
#include "tests/unit/elfext_attributes/generated_records.h"
#include "tests/unit/elfext_attributes/other_case.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace elfext {
namespace {

constexpr AccessWords ReadAccess = {0x10, 0x210, 0x210, 0x210};

FullAttr withFeatures(FeatureSet features) {
  FullAttr record = {.m_Access = ReadAccess};
  record.m_Features = features;
  return record;
}

FullAttr withFlags(uint64_t flags) {
  FullAttr record = {.m_Access = ReadAccess};
  record.m_Flags = flags;
  return record;
}

FullAttr withAccess(const AccessWords& access) {
  FullAttr record = {.m_Access = access};
  return record;
}

std::string reprinted(std::string_view text) {
  return printAttributeString(parseAttributeString(text));
}

struct FeatureRow {
  const char* token;
  FeatureSet set;
};

// clang-format off
const FeatureRow PrintedFeatures[] = {
    {"KRL_ISAv5",     {0x7C0}},
    {"KRL_ISAv4",     {0x3C0}},
    {"KRL_ISAv3M",    {0x11C0}},
    {"KRL_ISAv3",     {0x1C0}},
    {"KRL_ISAv2",     {0xC0}},
    {"KRL_ISAv1",     {0x40}},
    {"ZEV_ISAv8",     {0x3F}},
    {"Z64_ISAv8",     {0x10000000000}},
    {"ZEV_ISAv7",     {0x1F}},
    {"ZEV_ISAv6",     {0xF}},
    {"ZEV_ISAv5",     {0x7}},
    {"ZEV_ISAv4",     {0x3}},
    {"ZEV_ISAv3",     {0x1}},
    {"X",             {0x10000}},
    {"E",             {0x40000}},
    {"P",             {0x20000}},
    {"J",             {0x80000}},
    {"Z",             {0x1000000}},
    {"N",             {0x2000000}},
    {"DE",            {0xC000000000}},
    {"D",             {0x4000000000}},
    {"K",             {0x100000}},
    {"B",             {0x800}},
    {"S",             {0x200000}},
    {"7EM",           {0x400000}},
    {"8M",            {0x2000}},
    {"FP_ZEVv8_FP16", {0x07FF000000000000, 0x2}},
    {"FP_ZEVv8",      {0x07FF000000000000}},
    {"FP_ZEVv8_D16",  {0x07EF000000000000}},
    {"HFUv5_D16",     {0x07ED000000000000}},
    {"HFUv4",         {0x07FC000000000000}},
    {"HFUv3",         {0x03F8000000000000}},
    {"HFUv3_D16",     {0x03E8000000000000}},
    {"HFUv2",         {0x01E8000000000000}},
    {"HFUv1",         {0x00E8000000000000}},
    {"HFUi5",         {0x0381000000000000}},
    {"HFUi3",         {0x0380000000000000}},
    {"HFUi2",         {0x0180000000000000}},
    {"HFUi1",         {0x0080000000000000}},
    {"EXTD32",        {0x0018000000000000}},
    {"EXTD16",        {0x0008000000000000}},
    {"HFUS",          {0x0020000000000000}},
    {"HFUD",          {0x0040000000000000}},
    {"VFMA",          {0x0004000000000000}},
    {"PE",            {0x2000000000000000}},
    {"ME",            {0x4000000000000000}},
    {"FZ_POSZERO",    {0x8000000000000000}},
    {"PLD8",          {0x5007F0000000}},
    {"PLD6",          {0x1007F0000000}},
    {"PLD5",          {0x7F0000000}},
    {"PLD4",          {0x3F0000000}},
    {"PLD3",          {0x1F0000000}},
    {"PLD2",          {0xF0000000}},
    {"PLD1",          {0x70000000}},
    {"PLD9",          {0x30000000}},
    {"PLD7",          {0x10000000}},
    {"WMMX2",         {0xC000}},
    {"WMMX",          {0x4000}},
    {"MD",            {0x4000000}},
    {"MPE",           {0x8000000}},
    {"KCPv3",         {0x0800000000000000}},
};

const FeatureRow ReadFeatures[] = {
    {"KRELL_ISAv5",   {0x7C0}},
    {"KRELL_ISAv4",   {0x3C0}},
    {"KRELL_ISAv3",   {0x1C0}},
    {"KRELL_ISAv2",   {0xC0}},
    {"KRELL_ISAv1",   {0x40}},
    {"FPiv8",         {0x0383000000000000}},
    {"FPiv8_2",       {0x0383000000000000, 0x2}},
};

struct FlagRow {
  const char* token;
  uint64_t bits;
};

const FlagRow Flags[] = {
    {"IW",          0x1},
    {"~IW",         0x2},
    {"RWPI",        0x4},
    {"USESV6",      0x8},
    {"STKCKD",      0x10},
    {"~STKCKD",     0x20},
    {"USESV7",      0x40},
    {"HARDFP",      0x100},
    {"SOFTFP",      0x200},
    {"WCHAR32",     0x1000},
    {"ENUMINT",     0x800},
    {"~SHL",        0x8000},
    {"OTIME",       0x30000},
    {"OSPACE",      0x10000},
    {"ROPI",        0x40000},
    {"IEEEX",       0x700000},
    {"IEEEF",       0x300000},
    {"IEEEJ",       0x100000},
    {"EBA4",        0x80000},
    {"EBA8",        0x800000},
    {"UX",          0x4000000},
    {"FPIC",        0x8000000},
    {"INDIRECT",    0x20000000},
    {"STANDARDLIB", 0x40000000},
    {"MICROLIB",    0x80000000},
    {"KRELL2LIB",   0x10000000},
    {"THREADEDCXX", 0x100000000},
};

const char* const Accesses[] = {
    "L88", "L84", "L82", "L81", "L44", "L42", "L41", "L22",
    "L21", "L11", "UL84", "UL82", "UL81", "UL42", "UL41", "UL21",
};
// clang-format on

// ---- Tokens

TEST(AttributeStringTest, ReadsEachFeature) {
  for (const auto& rows :
       {std::span<const FeatureRow>(PrintedFeatures), std::span<const FeatureRow>(ReadFeatures)}) {
    for (const FeatureRow& row : rows) {
      const FeatureSet closed = closeFeatures(row.set);
      const std::string token = row.token;
      EXPECT_EQ(parseAttributeString("$" + token).m_Features, closed) << token;
      EXPECT_EQ(parseAttributeString("$" + inOtherCase(token)).m_Features, closed) << token;
      EXPECT_EQ(parseAttributeString("$" + token + "q").m_Features, FeatureSet()) << token;
      EXPECT_EQ(parseAttributeString("$q$" + token + "$r").m_Features, closed) << token;
    }
  }
}

TEST(AttributeStringTest, PrintsEachFeature) {
  for (const FeatureRow& row : PrintedFeatures)
    EXPECT_EQ(printAttributeString(withFeatures(row.set)), "$" + std::string(row.token) + "$IEEE1");
}

TEST(AttributeStringTest, PrintsButDoesntReadWhatHasTheVersionAsItsToken) {
  const std::string text = "$v8.1$IEEE1";
  EXPECT_EQ(printAttributeString(withFeatures(features::V81_ISA)), text);
  EXPECT_EQ(printAttributeString(withFeatures(features::V81_SIMD)), text);
  EXPECT_EQ(printAttributeString(withFeatures(features::V81_ISA | features::V81_SIMD)),
            "$v8.1$v8.1$IEEE1");
  EXPECT_EQ(parseAttributeString(text).m_Features, FeatureSet());
}

TEST(AttributeStringTest, HidesALevelBehindOneThatStandsBeforeIt) {
  EXPECT_EQ(printAttributeString(withFeatures(features::FP_ISA_ZEVv8)), "$HFUi5$IEEE1");
  EXPECT_EQ(printAttributeString(withFeatures(features::FP_ISA_ZEVv8 | features::HFU_HALF)),
            "$HFUi5$IEEE1");
  EXPECT_EQ(printAttributeString(withFeatures(features::KRELL_ISAv4 | features::M_PROFILE)),
            "$KRL_ISAv4$IEEE1");
  EXPECT_EQ(printAttributeString(withFeatures({0x07FC000000000000 | 0x8000000000})),
            "$HFUv4$IEEE1");
}

TEST(AttributeStringTest, PrintsNothingOfWhatHasNoToken) {
  using namespace features;
  for (const FeatureSet set : {FP16, A_PROFILE, R_PROFILE, M_PROFILE, VIRTUALIZATION_EXTENSION,
                               ZEV_DIVIDE, SOFTFP, HFU_HALF})
    EXPECT_EQ(printAttributeString(withFeatures(set)), "$IEEE1") << std::hex << set.low;
  EXPECT_EQ(printAttributeString(withFlags(0x80 | 0x20000 | 0x200000000)), "$IEEE1");
}

TEST(AttributeStringTest, ReadsAndPrintsEachFlag) {
  for (const FlagRow& row : Flags) {
    const std::string text = "$IEEE1$" + std::string(row.token);
    EXPECT_EQ(parseAttributeString(text).m_Flags, row.bits) << text;
    EXPECT_EQ(parseAttributeString(inOtherCase(text)).m_Flags, row.bits) << text;
    EXPECT_EQ(parseAttributeString(text + "x").m_Flags, 0u) << text;
    EXPECT_EQ(printAttributeString(withFlags(row.bits)), text);
  }
}

TEST(AttributeStringTest, ReadsAndPrintsTheStackAndTheAbiLevel) {
  const FullAttr record = parseAttributeString("$IEEE1$eabiV2$PRES8$req8$EABIv3");
  EXPECT_EQ(record.m_Stack8, 3u);
  EXPECT_EQ(record.m_AbiLevel, 2u);
  EXPECT_EQ(printAttributeString(record), "$IEEE1$REQ8$PRES8$EABIv2");
  EXPECT_EQ(reprinted("$IEEE1$PRES8"), "$IEEE1$PRES8");
}

TEST(AttributeStringTest, PrintsAllThereIsInItsOrder) {
  FullAttr record;
  record.m_Features = {~uint64_t{0}, ~uint64_t{0}};
  record.m_Access = AccessWords::all(0xFFFF);
  record.m_Flags = ~uint64_t{0};
  record.m_Stack8 = ~uint64_t{0};
  record.m_AbiLevel = ~uint64_t{0};
  EXPECT_EQ(printAttributeString(record),
            "$KRL_ISAv5$ZEV_ISAv8$Z64_ISAv8$X$E$P$J$Z$N$DE$K$B$S$7EM$8M$FP_ZEVv8_FP16$PE$ME"
            "$FZ_POSZERO$PLD8$WMMX2$MD$MPE$v8.1$v8.1$KCPv3"
            "$A:L88L84L82L81L42L41L22L21UL84UL82UL81UL42UL41UL21$X:L11"
            "$S88S84S82S81S42S41S22S21US84US82US81US42US41US21"
            "$IEEE1$IW$~IW$RWPI$USESV6$STKCKD$~STKCKD$USESV7$HARDFP$SOFTFP$WCHAR32$ENUMINT$~SHL"
            "$OTIME$ROPI$IEEEX$EBA4$EBA8$UX$FPIC$INDIRECT$STANDARDLIB$MICROLIB$KRELL2LIB"
            "$THREADEDCXX$REQ8$PRES8$EABIv2");
}

TEST(AttributeStringTest, PrintsTheDefaultRecord) {
  FullAttr record = DefaultFullAttr;
  record.m_Features = features::ZEV_ISAv4;
  const std::string text = "$ZEV_ISAv4$A:L22$X:L11$S22$IEEE1$IW$USESV6$~STKCKD$USESV7$~SHL$OSPACE"
                           "$EBA8$EABIv2";
  EXPECT_EQ(printAttributeString(record), text);
  EXPECT_EQ(parseAttributeString(text), record);
}

// ---- The form of a text

TEST(AttributeStringTest, ReadsTheEmptyTextAsIeee) {
  FullAttr empty = {.m_Access = ReadAccess};
  empty.m_Flags = 0x300000;
  for (const char* text : {"", "ZEV_ISAv4", "x$ZEV_ISAv4$IEEE1", " $IEEE1", "$", "$$$", "$nothing"})
    EXPECT_EQ(parseAttributeString(text), empty) << text;
  EXPECT_EQ(reprinted(""), "$IEEE1$IEEEF");
}

TEST(AttributeStringTest, StepsOverEmptyTokens) {
  EXPECT_EQ(parseAttributeString("$$ZEV_ISAv4$$$IEEE1$$"),
            parseAttributeString("$ZEV_ISAv4$IEEE1"));
}

TEST(AttributeStringTest, TakesIeeeBackWhereverItIsSaid) {
  EXPECT_EQ(parseAttributeString("$IEEEX$IEEE1").m_Flags, 0x700000u);
  EXPECT_EQ(parseAttributeString("$IEEE1$IEEEX").m_Flags, 0x700000u);
  EXPECT_EQ(parseAttributeString("$IEEEX").m_Flags, 0x700000u);
  EXPECT_EQ(parseAttributeString("$ieee1$IEEEJ").m_Flags, 0x100000u);
  EXPECT_EQ(parseAttributeString("$IEEEJ").m_Flags, 0x300000u);
  EXPECT_EQ(printAttributeString({}), "$IEEE1");
}

TEST(AttributeStringTest, ClosesTheUnionOfFeatures) {
  EXPECT_EQ(parseAttributeString("$krl_isav3").m_Features, features::KRELL_ISAv3);
  EXPECT_EQ(reprinted("$KRL_ISAv3"), "$KRL_ISAv3$IEEE1$IEEEF");
  EXPECT_EQ(reprinted("$ZEV_ISAv5$KRL_ISAv1$IEEE1"), "$KRL_ISAv2$ZEV_ISAv5$IEEE1");
  EXPECT_EQ(reprinted("$KRL_ISAv3$D$IEEE1"), "$KRL_ISAv3M$D$IEEE1");
  EXPECT_EQ(reprinted("$HFUv2$P$IEEE1"), "$P$HFUv2$PE$IEEE1");
  // No token for two levels in one.
  EXPECT_EQ(parseAttributeString("$KRELL_ISAv4~$ZEV_ISAv1").m_Features, FeatureSet());
}

// ---- Accesses

struct ScopeRow {
  const char* scope;
  bool code;
  bool readOnlyData;
  bool data;
};

TEST(AttributeStringTest, ReadsEachAccessInEachScope) {
  const ScopeRow scopes[] = {{"A:", true, true, true},    {"C:", true, true, true},
                             {"R:", false, true, true},   {"W:", false, false, true},
                             {"X:", true, false, false},  {"", false, false, false},
                             {"Q:", false, false, false}, {"a:", false, false, false}};
  for (const ScopeRow& scope : scopes) {
    for (uint32_t i = 0; i < std::size(Accesses); ++i) {
      const auto bit = static_cast<uint16_t>(1u << i);
      const auto in = [bit](bool isTouched) { return isTouched ? bit : uint16_t{0}; };
      const std::string load = std::string("$") + scope.scope + Accesses[i];
      const AccessWords loads = {in(scope.code), in(scope.readOnlyData), in(scope.data), 0};
      EXPECT_EQ(parseAttributeString(load).m_Access, ReadAccess | loads) << load;
      std::string store = load;
      store[store.rfind('L')] = 'S';
      const AccessWords stores = {0, 0, 0, bit};
      EXPECT_EQ(parseAttributeString(store).m_Access, ReadAccess | stores) << store;
    }
  }
}

TEST(AttributeStringTest, ReadsAccessesInTheOrderOfTheTable) {
  const auto code = [](const char* text) {
    return parseAttributeString(text).m_Access.code & ~0x10;
  };
  EXPECT_EQ(code("$A:L88L22UL41S22"), 0x4081);
  EXPECT_EQ(parseAttributeString("$A:L88L22UL41S22").m_Access.stores, 0x290);
  EXPECT_EQ(code("$A:L22L88"), 0x80);
  EXPECT_EQ(code("$A:L22L22"), 0x80);
  EXPECT_EQ(code("$A:L22nonsenseL21"), 0x80);
  EXPECT_EQ(code("$A:nonsenseL22"), 0);
  EXPECT_EQ(code("$A:l22"), 0);
  EXPECT_EQ(code("$A:$L22"), 0);
  EXPECT_EQ(code("$AA:L22"), 0);
  EXPECT_EQ(code("$A"), 0);
  EXPECT_EQ(code("$A:"), 0);
  EXPECT_EQ(code("$:L22"), 0);
  const AccessWords odd = parseAttributeString("$X:L41L44").m_Access;
  EXPECT_EQ(odd.code, 0x50);
}

TEST(AttributeStringTest, PrintsAccessesByWhereTheyAre) {
  const auto print = [](const AccessWords& access) {
    return printAttributeString(withAccess(access));
  };
  EXPECT_EQ(print({0x80, 0x80, 0x80, 0}), "$A:L22$IEEE1");
  EXPECT_EQ(print({0x80, 0x80, 0, 0}), "$R:L22$IEEE1");
  EXPECT_EQ(print({0x80, 0, 0x80, 0}), "$X:L22$W:L22$IEEE1");
  EXPECT_EQ(print({0, 0x80, 0x80, 0}), "$C:L22$W:L22$IEEE1");
  EXPECT_EQ(print({0x80, 0, 0, 0}), "$X:L22$IEEE1");
  EXPECT_EQ(print({0, 0x80, 0, 0}), "$C:L22$IEEE1");
  EXPECT_EQ(print({0, 0, 0x80, 0}), "$W:L22$IEEE1");
  EXPECT_EQ(print({0, 0, 0, 0x80}), "$S22$IEEE1");
  EXPECT_EQ(print({0x87, 0x83, 0x81, 0x4080}), "$A:L88L22$R:L84$X:L82$S22US41$IEEE1");
  // What every target can do.
  EXPECT_EQ(print({0x10, 0x210, 0x210, 0x210}), "$IEEE1");
  EXPECT_EQ(print({0x210, 0, 0, 0x10}), "$X:L11$IEEE1");
}

TEST(AttributeStringTest, WidensSomeAccessesThatItReadsBack) {
  EXPECT_EQ(reprinted("$R:L22$IEEE1"), "$C:L22$W:L22$IEEE1");
  EXPECT_EQ(reprinted("$C:L22$W:L22$IEEE1"), "$A:L22$IEEE1");
  for (const char* text : {"$A:L22$IEEE1", "$X:L22$IEEE1", "$W:L22$IEEE1", "$X:L22$W:L22$IEEE1"})
    EXPECT_EQ(reprinted(text), text);
}

// ---- Operations

TEST(AttributeStringTest, AddsATextToARecord) {
  FullAttr record = parseAttributeString("$ZEV_ISAv5$IEEE1$IW$REQ8");
  record.m_TargetClass = {1, 2};
  addAttributeString(record, "$KRL_ISAv1$A:L22S22$ROPI$PRES8$EABIv2");
  FullAttr wanted = parseAttributeString("$ZEV_ISAv5$KRL_ISAv2$A:L22S22$IW$ROPI$REQ8$PRES8$EABIv2");
  wanted.m_TargetClass = {1, 2};
  EXPECT_EQ(record, wanted);
  // Even the empty text claims the flags that it doesn't take back, and closes the features.
  FullAttr bare = {};
  bare.m_Features = features::KCP_ISA;
  addAttributeString(bare, "");
  EXPECT_EQ(bare.m_Flags, 0x300000u);
  EXPECT_EQ(bare.m_Access, ReadAccess);
  EXPECT_EQ(bare.m_Features, features::KCP_ISA | features::MIXED_DOUBLES);
}

TEST(AttributeStringTest, PrintsWhatFitsIntoABuffer) {
  const FullAttr record = parseAttributeString("$ZEV_ISAv4$IEEE1");
  const std::string text = "$ZEV_ISAv4$IEEE1";
  EXPECT_EQ(printAttributeString(record, nullptr, 0), text.size());
  EXPECT_EQ(printAttributeString(record, nullptr, 100), text.size());
  for (size_t size = 0; size < text.size() + 3; ++size) {
    std::string buffer(30, 'x');
    EXPECT_EQ(printAttributeString(record, buffer.data(), size), text.size());
    const std::string fitting = size == 0 ? "" : text.substr(0, size - 1) + '\0';
    EXPECT_EQ(buffer, fitting + std::string(30 - fitting.size(), 'x')) << size;
  }
}

TEST(AttributeStringTest, NamesDecorationSymbols) {
  ObjectModule module;
  EXPECT_STREQ(buildDecorationName(module.getContainerRegion(), parseAttributeString("$P$IEEE1")),
               "BuildAttributes$$P$IEEE1");
}

// ---- All records

// A record may hold what its text can't say, and a text may say more when it is read. It soon comes
// to one that stays.
TEST(AttributeStringTest, IsStableAfterItWasReadTwice) {
  GeneratedRecords generated;
  for (int i = 0; i < ManyRecords; ++i) {
    std::string text = printAttributeString(generated.record());
    for (int round = 0; round < 2; ++round)
      text = reprinted(text);
    ASSERT_EQ(reprinted(text), text);
  }
}

// At once where all features come with their tokens, and accesses are those of all words or of
// code.
TEST(AttributeStringTest, IsStableForWhatTextsCanSay) {
  GeneratedRecords generated;
  for (int i = 0; i < ManyRecords; ++i) {
    FullAttr record;
    for (uint32_t n = generated.below(8); n > 0; --n)
      record.m_Features |= PrintedFeatures[generated.below(std::size(PrintedFeatures))].set;
    record.m_Features = closeFeatures(record.m_Features);
    const AccessWords access = generated.access();
    const auto onlyCode = static_cast<uint16_t>(access.code & ~access.readOnlyData);
    record.m_Access = ReadAccess | AccessWords::all(access.data) | AccessWords{onlyCode, 0, 0, 0};
    record.m_Access.stores = access.stores | 0x210;
    record.m_Flags = generated.record().m_Flags;
    record.m_Flags &= ~uint64_t{0x20000}; // without the other bit of its group
    record.m_Flags &= ~uint64_t{0x600000};
    record.m_Stack8 = generated.below(4);
    const std::string text = printAttributeString(record);
    ASSERT_EQ(reprinted(text), text);
  }
}

} // namespace
} // namespace elfext
