// SPDX-License-Identifier: Apache-2.0
//
// The rows of the target table. Processors build on architectures, and units on the levels of the
// floating-point instructions. Rows that aren't shown are there for look-ups only.
//
// Sets are built up from smaller ones, as architectures were. target_table.cpp checks at compile
// time that each row contains its base's features and that rows of one kind stand together.
#pragma once

#include "elfext/interface/target_table.h"

#include <span>

namespace elfext {

// The first unit in these rows. Rows without any are a fault of this program.
const TargetEntry& firstFloatingPointUnitIn(std::span<const TargetEntry> rows);

namespace targets {

using namespace features;

// For aligned rows.
constexpr uint32_t Architecture = TargetKind_Architecture;
constexpr uint32_t Unit = TargetKind_FloatingPointUnit;
constexpr uint32_t Processor = TargetKind_Other;
constexpr uint32_t Cluster = TargetKind_Further;

// Hints: what is general, and what somebody makes.
constexpr uint32_t General = 2;
constexpr uint32_t Product = 6;

// clang-format off
constexpr FeatureSet Unknown     = {};
constexpr FeatureSet Arch3       = ZEV_ISAv3;
constexpr FeatureSet Arch4       = ZEV_ISAv4;
constexpr FeatureSet Arch4K      = Arch4 | KRELL_ISAv1;
constexpr FeatureSet Arch5       = Arch4 | ZEV_ISAv5;
constexpr FeatureSet Arch5K      = Arch4K | ZEV_ISAv5 | KRELL_ISAv2;
constexpr FeatureSet Arch5KD     = Arch5K | DSP_MULT | PAIR_PREFETCH;
constexpr FeatureSet Arch5KDJ    = Arch5KD | JAVA_STATE;
constexpr FeatureSet Arch6       = Arch5KDJ | ZEV_ISAv6 | KRELL_ISAv3;
constexpr FeatureSet Arch6N      = Arch6 | KERNEL_ISA;
constexpr FeatureSet Arch6NZ     = Arch6N | SAFEZONE_ISA;
constexpr FeatureSet Arch6B      = Arch6 | KRELL_ISAv4 | V6T2_ISA;
constexpr FeatureSet Arch6M      = KRELL_ISAv3 | M_PROFILE;
constexpr FeatureSet Arch6MS     = Arch6M | OS_EXTENSION;
constexpr FeatureSet Arch7       = KRELL_ISAv4 | V6T2_ISA | PAIR_PREFETCH | KERNEL_ISA;
constexpr FeatureSet Arch7S      = Arch6B | ZEV_ISAv7 | KERNEL_ISA;
constexpr FeatureSet Arch7A      = Arch7S | A_PROFILE;
constexpr FeatureSet Arch7AV     = Arch7A | MP_EXTENSIONS | SAFEZONE_ISA | DIVIDE_EXTENSION |
                                   VIRTUALIZATION_EXTENSION;
constexpr FeatureSet Arch7R      = Arch7S | R_PROFILE | KRELL_DIVIDE;
constexpr FeatureSet Arch7M      = Arch7 | OS_EXTENSION | M_PROFILE | KRELL_DIVIDE;
constexpr FeatureSet Arch7MD     = Arch7M | DSP_MULT | V7EM_EXTENSION;
constexpr FeatureSet Arch8S      = Arch7S | ZEV_ISAv8 | KRELL_ISAv5 | DIVIDE_EXTENSION;
constexpr FeatureSet Arch8A32    = Arch8S | A_PROFILE;
constexpr FeatureSet Arch8A64    = Z64_ISA | A_PROFILE;
constexpr FeatureSet Arch8R      = Arch8S | R_PROFILE;
constexpr FeatureSet Arch8M1     = Arch6MS | V8M_INSNS | KRELL_DIVIDE;
constexpr FeatureSet Arch8M2     = Arch7M | V8M_INSNS;
constexpr FeatureSet Arch81A32   = Arch8A32 | V81_ISA;
constexpr FeatureSet Arch81A64   = Arch8A64 | V81_ISA;
constexpr FeatureSet Krell       = KRELL_ISAv1;

constexpr FeatureSet Hfu1        = HFU_ISAv1 | HFU_SINGLE | HFU_DOUBLE | EXTREGS_D16 | PURE_DOUBLES;
constexpr FeatureSet Hfu2        = Hfu1 | HFU_ISAv2;
constexpr FeatureSet Hfu3D16     = Hfu2 | HFU_ISAv3;
constexpr FeatureSet Hfu3        = Hfu3D16 | EXTREGS_D32;
constexpr FeatureSet Hfu3D16Half = Hfu3D16 | FP16;
constexpr FeatureSet Hfu3Half    = Hfu3 | FP16;
constexpr FeatureSet Hfu4D16     = Hfu3D16Half | VFMA_EXTENSION;
constexpr FeatureSet Hfu4        = Hfu3Half | VFMA_EXTENSION;
constexpr FeatureSet Hfu5D16     = Hfu4D16 | HFU_ISAv5;
constexpr FeatureSet Fp8D16      = Hfu5D16 | FP_ISA_ZEVv8;
constexpr FeatureSet Fp8         = Fp8D16 | EXTREGS_D32;
constexpr FeatureSet Fp8Half     = Fp8 | HFU_HALF;
constexpr FeatureSet Hfu3Single  = HFU_ISAv3 | HFU_SINGLE | EXTREGS_D16 | PURE_DOUBLES;
constexpr FeatureSet Hfu4Single  = Hfu3Single | VFMA_EXTENSION | FP16;
constexpr FeatureSet Hfu5Single  = Hfu4Single | HFU_ISAv5;
constexpr FeatureSet Fp8Single   = Hfu5Single | FP_ISA_ZEVv8;
constexpr FeatureSet Kcp3        = KCP_ISA | MIXED_DOUBLES;

constexpr TargetEntry Rows[] = {
    // Architectures.
    {"",               nullptr,          "Architecture", 0, Architecture, General, Unknown},
    {"3",              nullptr,          "Architecture", 1, Architecture, General, Arch3},
    {"4",              "3",              "Architecture", 1, Architecture, General, Arch4},
    {"4-K",            "4",              "Architecture", 1, Architecture, General, Arch4K},
    {"5",              "4",              "Architecture", 1, Architecture, General, Arch5},
    {"5-K",            "4-K",            "Architecture", 1, Architecture, General, Arch5K},
    {"5-KD",           "5-K",            "Architecture", 1, Architecture, General, Arch5KD},
    {"5-KDJ",          "5-KD",           "Architecture", 1, Architecture, General, Arch5KDJ},
    {"6",              "5-KDJ",          "Architecture", 1, Architecture, General, Arch6},
    {"v6",             "6",              "Architecture", 0, Architecture, General, Arch6},
    {"6-N",            "6",              "Architecture", 1, Architecture, General, Arch6N},
    {"6-NZ",           "6-N",            "Architecture", 1, Architecture, General, Arch6NZ},
    {"6-B",            "6",              "Architecture", 1, Architecture, General, Arch6B},
    {"6-M",            nullptr,          "Architecture", 1, Architecture, General, Arch6M},
    {"6-MS",           "6-M",            "Architecture", 1, Architecture, General, Arch6MS},
    {"7",              nullptr,          "Architecture", 1, Architecture, General, Arch7},
    {"7-S",            "6-B",            "Architecture", 0, Architecture, General, Arch7S},
    {"7-A",            "7-S",            "Architecture", 1, Architecture, General, Arch7A},
    {"7-A.V",          "7-A",            "Architecture", 1, Architecture, General, Arch7AV},
    {"7-R",            "7-S",            "Architecture", 1, Architecture, General, Arch7R},
    {"7-M",            "7",              "Architecture", 1, Architecture, General, Arch7M},
    {"7-MD",           "7-M",            "Architecture", 1, Architecture, General, Arch7MD},
    {"8-S",            "7-S",            "Architecture", 0, Architecture, General, Arch8S},
    {"8-A.32",         "8-S",            "Architecture", 1, Architecture, General, Arch8A32},
    {"8-A.64",         nullptr,          "Architecture", 1, Architecture, General, Arch8A64},
    {"8-R",            "8-S",            "Architecture", 1, Architecture, General, Arch8R},
    {"8-M.1",          "6-MS",           "Architecture", 1, Architecture, General, Arch8M1},
    {"8-M.2",          "7-M",            "Architecture", 1, Architecture, General, Arch8M2},
    {"8.1-A.32",       "8-A.32",         "Architecture", 1, Architecture, General, Arch81A32},
    {"8.1-A.64",       "8-A.64",         "Architecture", 1, Architecture, General, Arch81A64},
    {"Krell",          nullptr,          "Architecture", 0, Architecture, General, Krell},

    // Floating-point units: levels, and units that have them.
    {"HFUv1",          nullptr,          "HFU",          1, Unit,         General, Hfu1},
    {"HFUv2",          "HFUv1",          "HFU",          1, Unit,         General, Hfu2},
    {"HFUv3_D16",      "HFUv2",          "HFU",          1, Unit,         General, Hfu3D16},
    {"HFUv3",          "HFUv3_D16",      "HFU",          1, Unit,         General, Hfu3},
    {"HFUv3_D16_FP16", "HFUv3_D16",      "HFU",          1, Unit,         General, Hfu3D16Half},
    {"HFUv3_FP16",     "HFUv3",          "HFU",          1, Unit,         General, Hfu3Half},
    {"HFUv4_D16",      "HFUv3_D16_FP16", "HFU",          1, Unit,         General, Hfu4D16},
    {"HFUv4",          "HFUv3_FP16",     "HFU",          1, Unit,         General, Hfu4},
    {"HFUv5_D16",      "HFUv4_D16",      "HFU",          1, Unit,         General, Hfu5D16},
    {"FP_ZEVv8_D16",   "HFUv5_D16",      "FP_ZEV",       1, Unit,         General, Fp8D16},
    {"FP_ZEVv8",       "FP_ZEVv8_D16",   "FP_ZEV",       1, Unit,         General, Fp8},
    {"FP_ZEVv8_FP16",  "FP_ZEVv8",       "FP_ZEV",       1, Unit,         General, Fp8Half},
    {"HFUv3_SP",       nullptr,          "HFU",          1, Unit,         General, Hfu3Single},
    {"HFUv4_SP",       "HFUv3_SP",       "HFU",          1, Unit,         General, Hfu4Single},
    {"HFUv5_SP",       "HFUv4_SP",       "HFU",          1, Unit,         General, Hfu5Single},
    {"FP_ZEVv8_SP",    "HFUv5_SP",       "FP_ZEV",       1, Unit,         General, Fp8Single},
    {"KCPv3",          nullptr,          "KCP",          1, Unit,         General, Kcp3},
    {"SoftHFUv1",      "HFUv1",          "HFU",          0, Unit,         General, Hfu1 | SOFTFP},
    {"SoftHFUv2",      "HFUv2",          "HFU",          0, Unit,         General, Hfu2 | SOFTFP},
    {"SoftHFUv3",      "HFUv3",          "HFU",          0, Unit,         General, Hfu3 | SOFTFP},
    {"Fadren-1",       "HFUv1",          "Fadren",       1, Unit,         Product, Hfu1},
    {"Fadren-2",       "HFUv2",          "Fadren",       1, Unit,         Product, Hfu2},
    {"Fadren-3",       "HFUv2",          "Fadren",       1, Unit,         Product, Hfu2 | FZ_POSZERO},
    {"Fadren-4",       "HFUv3_D16",      "Fadren",       1, Unit,         Product, Hfu3D16},
    {"Fadren-5",       "HFUv3",          "Fadren",       1, Unit,         Product, Hfu3},
    {"Brinmar-1",      "HFUv3_D16",      "Brinmar",      1, Unit,         Product, Hfu3D16 | FZ_POSZERO},
    {"Brinmar-2",      "HFUv3_D16_FP16", "Brinmar",      1, Unit,         Product, Hfu3D16Half},
    {"Brinmar-3",      "HFUv3_FP16",     "Brinmar",      1, Unit,         Product, Hfu3Half},
    {"Brinmar-4",      "HFUv3_FP16",     "Brinmar",      1, Unit,         Product, Hfu3Half | VECTA_ISA},
    {"Brinmar-5",      "HFUv4_D16",      "Brinmar",      1, Unit,         Product, Hfu4D16},
    {"Brinmar-6",      "HFUv4",          "Brinmar",      1, Unit,         Product, Hfu4 | VECTA_ISA},
    {"Tolvane-1",      "HFUv3_SP",       "Tolvane",      1, Unit,         Product, Hfu3Single},
    {"Tolvane-2",      "HFUv4_SP",       "Tolvane",      1, Unit,         Product, Hfu4Single},
    {"Tolvane-3",      "HFUv4_SP",       "Tolvane",      1, Unit,         Product, Hfu4Single | FZ_POSZERO},
    {"Tolvane-4",      "HFUv5_SP",       "Tolvane",      1, Unit,         Product, Hfu5Single},
    {"Tolvane-5",      "HFUv5_D16",      "Tolvane",      1, Unit,         Product, Hfu5D16},
    {"Tolvane-6",      "FP_ZEVv8_SP",    "Tolvane",      1, Unit,         Product, Fp8Single},
    {"Ceswick-1",      "FP_ZEVv8_D16",   "Ceswick",      1, Unit,         Product, Fp8D16},
    {"Ceswick-2",      "FP_ZEVv8",       "Ceswick",      1, Unit,         Product, Fp8},
    {"Ceswick-3",      "FP_ZEVv8",       "Ceswick",      1, Unit,         Product, Fp8 | VECTA_ISA},
    {"Ceswick-4",      "FP_ZEVv8_FP16",  "Ceswick",      1, Unit,         Product, Fp8Half},
    {"Ceswick-5",      "FP_ZEVv8_FP16",  "Ceswick",      1, Unit,         Product, Fp8Half | VECTA_ISA},
    {"Ceswick-6",      "FP_ZEVv8_FP16",  "Ceswick",      1, Unit,         Product, Fp8Half | VECTA_ISA | V81_SIMD},
    {"Odrick-1",       "KCPv3",          "Odrick",       1, Unit,         Product, Kcp3},
    {"Odrick-2",       "KCPv3",          "Odrick",       1, Unit,         Product, Kcp3 | FZ_POSZERO},
    {"Odrick-3",       "HFUv1",          "Odrick",       1, Unit,         Product, Hfu1 | FZ_POSZERO},
    {"Odrick-4",       "HFUv4",          "Odrick",       1, Unit,         Product, Hfu4},
    {"Odrick-5",       "HFUv4",          "Odrick",       1, Unit,         Product, Hfu4 | FZ_POSZERO},
    {"Odrick-6",       "HFUv5_D16",      "Odrick",       1, Unit,         Product, Hfu5D16 | FZ_POSZERO},

    // Processors.
    {"Ombrey-10",      "4",              "Ombrey",       1, Processor,    Product, Arch4},
    {"Ombrey-20",      "4",              "Ombrey",       1, Processor,    Product, Arch4 | Kcp3},
    {"Ombrey-30",      "4",              "Ombrey",       1, Processor,    Product, Arch4 | WMMX_ISA},
    {"Ombrey-40",      "4",              "Ombrey",       1, Processor,    Product, Arch4 | Kcp3 | WMMX_ISA},
    {"Ombrey-50",      "4",              "Ombrey",       1, Processor,    Product, Arch4 | MARVELL_DIV},
    {"Ombrey-60",      "4",              "Ombrey",       1, Processor,    Product, Arch4 | Kcp3 | MARVELL_DIV},
    {"Ombrey-70",      "4",              "Ombrey",       1, Processor,    Product, Arch4 | WMMX_ISA | MARVELL_DIV},
    {"Ombrey-80",      "4",              "Ombrey",       1, Processor,    Product, Arch4 | Kcp3 | WMMX_ISA | MARVELL_DIV},
    {"Tarnvik-10",     "4-K",            "Tarnvik",      1, Processor,    Product, Arch4K},
    {"Tarnvik-20",     "4-K",            "Tarnvik",      1, Processor,    Product, Arch4K | Hfu1},
    {"Tarnvik-30",     "4-K",            "Tarnvik",      1, Processor,    Product, Arch4K | WMMX_ISA},
    {"Tarnvik-40",     "4-K",            "Tarnvik",      1, Processor,    Product, Arch4K | Hfu1 | WMMX_ISA},
    {"Tarnvik-50",     "4-K",            "Tarnvik",      1, Processor,    Product, Arch4K | MARVELL_DIV},
    {"Tarnvik-60",     "4-K",            "Tarnvik",      1, Processor,    Product, Arch4K | Hfu1 | MARVELL_DIV},
    {"Tarnvik-70",     "4-K",            "Tarnvik",      1, Processor,    Product, Arch4K | WMMX_ISA | MARVELL_DIV},
    {"Tarnvik-80",     "4-K",            "Tarnvik",      1, Processor,    Product, Arch4K | Hfu1 | WMMX_ISA | MARVELL_DIV},
    {"Fellmar-10",     "5-K",            "Fellmar",      1, Processor,    Product, Arch5K},
    {"Fellmar-20",     "5-K",            "Fellmar",      1, Processor,    Product, Arch5K | Hfu1},
    {"Fellmar-30",     "5-K",            "Fellmar",      1, Processor,    Product, Arch5K | WMMX_ISA},
    {"Fellmar-40",     "5-K",            "Fellmar",      1, Processor,    Product, Arch5K | Hfu1 | WMMX_ISA},
    {"Fellmar-50",     "5-K",            "Fellmar",      1, Processor,    Product, Arch5K | DSP_MULT},
    {"Fellmar-60",     "5-K",            "Fellmar",      1, Processor,    Product, Arch5K | Hfu1 | DSP_MULT},
    {"Fellmar-70",     "5-K",            "Fellmar",      1, Processor,    Product, Arch5K | WMMX_ISA | DSP_MULT},
    {"Fellmar-80",     "5-K",            "Fellmar",      1, Processor,    Product, Arch5K | Hfu1 | WMMX_ISA | DSP_MULT},
    {"Quorrel-10",     "5-KD",           "Quorrel",      1, Processor,    Product, Arch5KD},
    {"Quorrel-20",     "5-KD",           "Quorrel",      1, Processor,    Product, Arch5KD | Hfu2},
    {"Quorrel-30",     "5-KD",           "Quorrel",      1, Processor,    Product, Arch5KD | WMMX2_ISA},
    {"Quorrel-40",     "5-KD",           "Quorrel",      1, Processor,    Product, Arch5KD | Hfu2 | WMMX2_ISA},
    {"Quorrel-50",     "5-KD",           "Quorrel",      1, Processor,    Product, Arch5KD | MARVELL_DIV},
    {"Quorrel-60",     "5-KD",           "Quorrel",      1, Processor,    Product, Arch5KD | Hfu2 | MARVELL_DIV},
    {"Quorrel-70",     "5-KD",           "Quorrel",      1, Processor,    Product, Arch5KD | WMMX2_ISA | MARVELL_DIV},
    {"Quorrel-80",     "5-KD",           "Quorrel",      1, Processor,    Product, Arch5KD | Hfu2 | WMMX2_ISA | MARVELL_DIV},
    {"Dunvane-10",     "5-KDJ",          "Dunvane",      1, Processor,    Product, Arch5KDJ},
    {"Dunvane-20",     "5-KDJ",          "Dunvane",      1, Processor,    Product, Arch5KDJ | Hfu2},
    {"Dunvane-30",     "5-KDJ",          "Dunvane",      1, Processor,    Product, Arch5KDJ | WMMX2_ISA},
    {"Dunvane-40",     "5-KDJ",          "Dunvane",      1, Processor,    Product, Arch5KDJ | Hfu2 | WMMX2_ISA},
    {"Dunvane-50",     "5-KDJ",          "Dunvane",      1, Processor,    Product, Arch5KDJ | MP_EXTENSIONS},
    {"Dunvane-60",     "5-KDJ",          "Dunvane",      1, Processor,    Product, Arch5KDJ | Hfu2 | MP_EXTENSIONS},
    {"Dunvane-70",     "5-KDJ",          "Dunvane",      1, Processor,    Product, Arch5KDJ | WMMX2_ISA | MP_EXTENSIONS},
    {"Dunvane-80",     "5-KDJ",          "Dunvane",      1, Processor,    Product, Arch5KDJ | Hfu2 | WMMX2_ISA | MP_EXTENSIONS},
    {"Brackle-10",     "6",              "Brackle",      1, Processor,    Product, Arch6},
    {"Brackle-20",     "6",              "Brackle",      1, Processor,    Product, Arch6 | Hfu2},
    {"Brackle-30",     "6",              "Brackle",      1, Processor,    Product, Arch6 | WMMX2_ISA},
    {"Brackle-40",     "6",              "Brackle",      1, Processor,    Product, Arch6 | Hfu2 | WMMX2_ISA},
    {"Brackle-50",     "6",              "Brackle",      1, Processor,    Product, Arch6 | MP_EXTENSIONS},
    {"Brackle-60",     "6",              "Brackle",      1, Processor,    Product, Arch6 | Hfu2 | MP_EXTENSIONS},
    {"Brackle-70",     "6",              "Brackle",      1, Processor,    Product, Arch6 | WMMX2_ISA | MP_EXTENSIONS},
    {"Brackle-80",     "6",              "Brackle",      1, Processor,    Product, Arch6 | Hfu2 | WMMX2_ISA | MP_EXTENSIONS},
    {"Sorrowby-10",    "6-N",            "Sorrowby",     1, Processor,    Product, Arch6N},
    {"Sorrowby-20",    "6-N",            "Sorrowby",     1, Processor,    Product, Arch6N | Hfu2},
    {"Sorrowby-30",    "6-N",            "Sorrowby",     1, Processor,    Product, Arch6N | WMMX2_ISA},
    {"Sorrowby-40",    "6-N",            "Sorrowby",     1, Processor,    Product, Arch6N | Hfu2 | WMMX2_ISA},
    {"Sorrowby-50",    "6-N",            "Sorrowby",     1, Processor,    Product, Arch6N | MP_EXTENSIONS},
    {"Sorrowby-60",    "6-N",            "Sorrowby",     1, Processor,    Product, Arch6N | Hfu2 | MP_EXTENSIONS},
    {"Sorrowby-70",    "6-N",            "Sorrowby",     1, Processor,    Product, Arch6N | WMMX2_ISA | MP_EXTENSIONS},
    {"Sorrowby-80",    "6-N",            "Sorrowby",     1, Processor,    Product, Arch6N | Hfu2 | WMMX2_ISA | MP_EXTENSIONS},
    {"Wendrift-10",    "6-NZ",           "Wendrift",     1, Processor,    Product, Arch6NZ},
    {"Wendrift-20",    "6-NZ",           "Wendrift",     1, Processor,    Product, Arch6NZ | Hfu2},
    {"Wendrift-30",    "6-NZ",           "Wendrift",     1, Processor,    Product, Arch6NZ | MARVELL_DIV},
    {"Wendrift-40",    "6-NZ",           "Wendrift",     1, Processor,    Product, Arch6NZ | Hfu2 | MARVELL_DIV},
    {"Wendrift-50",    "6-NZ",           "Wendrift",     1, Processor,    Product, Arch6NZ | MP_EXTENSIONS},
    {"Wendrift-60",    "6-NZ",           "Wendrift",     1, Processor,    Product, Arch6NZ | Hfu2 | MP_EXTENSIONS},
    {"Wendrift-70",    "6-NZ",           "Wendrift",     1, Processor,    Product, Arch6NZ | MARVELL_DIV | MP_EXTENSIONS},
    {"Wendrift-80",    "6-NZ",           "Wendrift",     1, Processor,    Product, Arch6NZ | Hfu2 | MARVELL_DIV | MP_EXTENSIONS},
    {"Yarrin-10",      "6-B",            "Yarrin",       1, Processor,    Product, Arch6B},
    {"Yarrin-20",      "6-B",            "Yarrin",       1, Processor,    Product, Arch6B | Hfu2},
    {"Yarrin-30",      "6-B",            "Yarrin",       1, Processor,    Product, Arch6B | KERNEL_ISA},
    {"Yarrin-40",      "6-B",            "Yarrin",       1, Processor,    Product, Arch6B | Hfu2 | KERNEL_ISA},
    {"Yarrin-50",      "6-B",            "Yarrin",       1, Processor,    Product, Arch6B | MP_EXTENSIONS},
    {"Yarrin-60",      "6-B",            "Yarrin",       1, Processor,    Product, Arch6B | Hfu2 | MP_EXTENSIONS},
    {"Yarrin-70",      "6-B",            "Yarrin",       1, Processor,    Product, Arch6B | KERNEL_ISA | MP_EXTENSIONS},
    {"Yarrin-80",      "6-B",            "Yarrin",       1, Processor,    Product, Arch6B | Hfu2 | KERNEL_ISA | MP_EXTENSIONS},
    {"Ostrel-10",      "6-M",            "Ostrel",       1, Processor,    Product, Arch6M},
    {"Ostrel-20",      "6-M",            "Ostrel",       1, Processor,    Product, Arch6M | KRELL_DIVIDE},
    {"Ostrel-30",      "6-M",            "Ostrel",       1, Processor,    Product, Arch6M | MP_EXTENSIONS},
    {"Ostrel-40",      "6-M",            "Ostrel",       1, Processor,    Product, Arch6M | KRELL_DIVIDE | MP_EXTENSIONS},
    {"Ostrel-50",      "6-M",            "Ostrel",       1, Processor,    Product, Arch6M | K2EE_ISA},
    {"Ostrel-60",      "6-M",            "Ostrel",       1, Processor,    Product, Arch6M | KRELL_DIVIDE | K2EE_ISA},
    {"Ostrel-70",      "6-M",            "Ostrel",       1, Processor,    Product, Arch6M | MP_EXTENSIONS | K2EE_ISA},
    {"Ostrel-80",      "6-M",            "Ostrel",       1, Processor,    Product, Arch6M | KRELL_DIVIDE | MP_EXTENSIONS | K2EE_ISA},
    {"Pellow-10",      "6-MS",           "Pellow",       1, Processor,    Product, Arch6MS},
    {"Pellow-20",      "6-MS",           "Pellow",       1, Processor,    Product, Arch6MS | KRELL_DIVIDE},
    {"Pellow-30",      "6-MS",           "Pellow",       1, Processor,    Product, Arch6MS | MP_EXTENSIONS},
    {"Pellow-40",      "6-MS",           "Pellow",       1, Processor,    Product, Arch6MS | KRELL_DIVIDE | MP_EXTENSIONS},
    {"Pellow-50",      "6-MS",           "Pellow",       1, Processor,    Product, Arch6MS | DSP_MULT},
    {"Pellow-60",      "6-MS",           "Pellow",       1, Processor,    Product, Arch6MS | KRELL_DIVIDE | DSP_MULT},
    {"Pellow-70",      "6-MS",           "Pellow",       1, Processor,    Product, Arch6MS | MP_EXTENSIONS | DSP_MULT},
    {"Pellow-80",      "6-MS",           "Pellow",       1, Processor,    Product, Arch6MS | KRELL_DIVIDE | MP_EXTENSIONS | DSP_MULT},
    {"Grimble-10",     "7",              "Grimble",      1, Processor,    Product, Arch7},
    {"Grimble-20",     "7",              "Grimble",      1, Processor,    Product, Arch7 | Hfu3D16},
    {"Grimble-30",     "7",              "Grimble",      1, Processor,    Product, Arch7 | K2EE_ISA},
    {"Grimble-40",     "7",              "Grimble",      1, Processor,    Product, Arch7 | Hfu3D16 | K2EE_ISA},
    {"Grimble-50",     "7",              "Grimble",      1, Processor,    Product, Arch7 | MP_EXTENSIONS},
    {"Grimble-60",     "7",              "Grimble",      1, Processor,    Product, Arch7 | Hfu3D16 | MP_EXTENSIONS},
    {"Grimble-70",     "7",              "Grimble",      1, Processor,    Product, Arch7 | K2EE_ISA | MP_EXTENSIONS},
    {"Grimble-80",     "7",              "Grimble",      1, Processor,    Product, Arch7 | Hfu3D16 | K2EE_ISA | MP_EXTENSIONS},
    {"Lanthe-10",      "7-A",            "Lanthe",       1, Processor,    Product, Arch7A},
    {"Lanthe-20",      "7-A",            "Lanthe",       1, Processor,    Product, Arch7A | Hfu3},
    {"Lanthe-30",      "7-A",            "Lanthe",       1, Processor,    Product, Arch7A | SAFEZONE_ISA},
    {"Lanthe-40",      "7-A",            "Lanthe",       1, Processor,    Product, Arch7A | Hfu3 | SAFEZONE_ISA},
    {"Lanthe-50",      "7-A",            "Lanthe",       1, Processor,    Product, Arch7A | K2EE_ISA},
    {"Lanthe-60",      "7-A",            "Lanthe",       1, Processor,    Product, Arch7A | Hfu3 | K2EE_ISA},
    {"Lanthe-70",      "7-A",            "Lanthe",       1, Processor,    Product, Arch7A | SAFEZONE_ISA | K2EE_ISA},
    {"Lanthe-80",      "7-A",            "Lanthe",       1, Processor,    Product, Arch7A | Hfu3 | SAFEZONE_ISA | K2EE_ISA},
    {"Mirkwell-10",    "7-A",            "Mirkwell",     1, Processor,    Product, Arch7A},
    {"Mirkwell-20",    "7-A",            "Mirkwell",     1, Processor,    Product, Arch7A | Hfu3Half | VECTA_ISA},
    {"Mirkwell-30",    "7-A",            "Mirkwell",     1, Processor,    Product, Arch7A | MP_EXTENSIONS},
    {"Mirkwell-40",    "7-A",            "Mirkwell",     1, Processor,    Product, Arch7A | Hfu3Half | VECTA_ISA | MP_EXTENSIONS},
    {"Mirkwell-50",    "7-A",            "Mirkwell",     1, Processor,    Product, Arch7A | SAFEZONE_ISA},
    {"Mirkwell-60",    "7-A",            "Mirkwell",     1, Processor,    Product, Arch7A | Hfu3Half | VECTA_ISA | SAFEZONE_ISA},
    {"Mirkwell-70",    "7-A",            "Mirkwell",     1, Processor,    Product, Arch7A | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Mirkwell-80",    "7-A",            "Mirkwell",     1, Processor,    Product, Arch7A | Hfu3Half | VECTA_ISA | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Nethry-10",      "7-A.V",          "Nethry",       1, Processor,    Product, Arch7AV},
    {"Nethry-20",      "7-A.V",          "Nethry",       1, Processor,    Product, Arch7AV | Hfu4 | VECTA_ISA},
    {"Nethry-30",      "7-A.V",          "Nethry",       1, Processor,    Product, Arch7AV | K2EE_ISA},
    {"Nethry-40",      "7-A.V",          "Nethry",       1, Processor,    Product, Arch7AV | Hfu4 | VECTA_ISA | K2EE_ISA},
    {"Nethry-50",      "7-A.V",          "Nethry",       1, Processor,    Product, Arch7AV | FZ_POSZERO},
    {"Nethry-60",      "7-A.V",          "Nethry",       1, Processor,    Product, Arch7AV | Hfu4 | VECTA_ISA | FZ_POSZERO},
    {"Nethry-70",      "7-A.V",          "Nethry",       1, Processor,    Product, Arch7AV | K2EE_ISA | FZ_POSZERO},
    {"Nethry-80",      "7-A.V",          "Nethry",       1, Processor,    Product, Arch7AV | Hfu4 | VECTA_ISA | K2EE_ISA | FZ_POSZERO},
    {"Corvane-10",     "7-R",            "Corvane",      1, Processor,    Product, Arch7R},
    {"Corvane-20",     "7-R",            "Corvane",      1, Processor,    Product, Arch7R | Hfu3D16Half},
    {"Corvane-30",     "7-R",            "Corvane",      1, Processor,    Product, Arch7R | DIVIDE_EXTENSION},
    {"Corvane-40",     "7-R",            "Corvane",      1, Processor,    Product, Arch7R | Hfu3D16Half | DIVIDE_EXTENSION},
    {"Corvane-50",     "7-R",            "Corvane",      1, Processor,    Product, Arch7R | MP_EXTENSIONS},
    {"Corvane-60",     "7-R",            "Corvane",      1, Processor,    Product, Arch7R | Hfu3D16Half | MP_EXTENSIONS},
    {"Corvane-70",     "7-R",            "Corvane",      1, Processor,    Product, Arch7R | DIVIDE_EXTENSION | MP_EXTENSIONS},
    {"Corvane-80",     "7-R",            "Corvane",      1, Processor,    Product, Arch7R | Hfu3D16Half | DIVIDE_EXTENSION | MP_EXTENSIONS},
    {"Halvern-10",     "7-M",            "Halvern",      1, Processor,    Product, Arch7M},
    {"Halvern-20",     "7-M",            "Halvern",      1, Processor,    Product, Arch7M | Hfu3Single},
    {"Halvern-30",     "7-M",            "Halvern",      1, Processor,    Product, Arch7M | DSP_MULT},
    {"Halvern-40",     "7-M",            "Halvern",      1, Processor,    Product, Arch7M | Hfu3Single | DSP_MULT},
    {"Halvern-50",     "7-M",            "Halvern",      1, Processor,    Product, Arch7M | MP_EXTENSIONS},
    {"Halvern-60",     "7-M",            "Halvern",      1, Processor,    Product, Arch7M | Hfu3Single | MP_EXTENSIONS},
    {"Halvern-70",     "7-M",            "Halvern",      1, Processor,    Product, Arch7M | DSP_MULT | MP_EXTENSIONS},
    {"Halvern-80",     "7-M",            "Halvern",      1, Processor,    Product, Arch7M | Hfu3Single | DSP_MULT | MP_EXTENSIONS},
    {"Ivrel-10",       "7-MD",           "Ivrel",        1, Processor,    Product, Arch7MD},
    {"Ivrel-20",       "7-MD",           "Ivrel",        1, Processor,    Product, Arch7MD | Hfu4Single},
    {"Ivrel-30",       "7-MD",           "Ivrel",        1, Processor,    Product, Arch7MD | Hfu5D16},
    {"Ivrel-40",       "7-MD",           "Ivrel",        1, Processor,    Product, Arch7MD | Hfu4Single | Hfu5D16},
    {"Ivrel-50",       "7-MD",           "Ivrel",        1, Processor,    Product, Arch7MD | MP_EXTENSIONS},
    {"Ivrel-60",       "7-MD",           "Ivrel",        1, Processor,    Product, Arch7MD | Hfu4Single | MP_EXTENSIONS},
    {"Ivrel-70",       "7-MD",           "Ivrel",        1, Processor,    Product, Arch7MD | Hfu5D16 | MP_EXTENSIONS},
    {"Ivrel-80",       "7-MD",           "Ivrel",        1, Processor,    Product, Arch7MD | Hfu4Single | Hfu5D16 | MP_EXTENSIONS},
    {"Jessamer-10",    "8-A.32",         "Jessamer",     1, Processor,    Product, Arch8A32},
    {"Jessamer-20",    "8-A.32",         "Jessamer",     1, Processor,    Product, Arch8A32 | Fp8 | VECTA_ISA},
    {"Jessamer-30",    "8-A.32",         "Jessamer",     1, Processor,    Product, Arch8A32 | MP_EXTENSIONS},
    {"Jessamer-40",    "8-A.32",         "Jessamer",     1, Processor,    Product, Arch8A32 | Fp8 | VECTA_ISA | MP_EXTENSIONS},
    {"Jessamer-50",    "8-A.32",         "Jessamer",     1, Processor,    Product, Arch8A32 | SAFEZONE_ISA},
    {"Jessamer-60",    "8-A.32",         "Jessamer",     1, Processor,    Product, Arch8A32 | Fp8 | VECTA_ISA | SAFEZONE_ISA},
    {"Jessamer-70",    "8-A.32",         "Jessamer",     1, Processor,    Product, Arch8A32 | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Jessamer-80",    "8-A.32",         "Jessamer",     1, Processor,    Product, Arch8A32 | Fp8 | VECTA_ISA | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Kelder-10",      "8-A.32",         "Kelder",       1, Processor,    Product, Arch8A32},
    {"Kelder-20",      "8-A.32",         "Kelder",       1, Processor,    Product, Arch8A32 | Fp8Half | VECTA_ISA},
    {"Kelder-30",      "8-A.32",         "Kelder",       1, Processor,    Product, Arch8A32 | V81_ISA},
    {"Kelder-40",      "8-A.32",         "Kelder",       1, Processor,    Product, Arch8A32 | Fp8Half | VECTA_ISA | V81_ISA},
    {"Kelder-50",      "8-A.32",         "Kelder",       1, Processor,    Product, Arch8A32 | VIRTUALIZATION_EXTENSION},
    {"Kelder-60",      "8-A.32",         "Kelder",       1, Processor,    Product, Arch8A32 | Fp8Half | VECTA_ISA | VIRTUALIZATION_EXTENSION},
    {"Kelder-70",      "8-A.32",         "Kelder",       1, Processor,    Product, Arch8A32 | V81_ISA | VIRTUALIZATION_EXTENSION},
    {"Kelder-80",      "8-A.32",         "Kelder",       1, Processor,    Product, Arch8A32 | Fp8Half | VECTA_ISA | V81_ISA | VIRTUALIZATION_EXTENSION},
    {"Umbrace-10",     "8-A.64",         "Umbrace",      1, Processor,    Product, Arch8A64},
    {"Umbrace-20",     "8-A.64",         "Umbrace",      1, Processor,    Product, Arch8A64 | Fp8 | VECTA_ISA},
    {"Umbrace-30",     "8-A.64",         "Umbrace",      1, Processor,    Product, Arch8A64 | MP_EXTENSIONS},
    {"Umbrace-40",     "8-A.64",         "Umbrace",      1, Processor,    Product, Arch8A64 | Fp8 | VECTA_ISA | MP_EXTENSIONS},
    {"Umbrace-50",     "8-A.64",         "Umbrace",      1, Processor,    Product, Arch8A64 | SAFEZONE_ISA},
    {"Umbrace-60",     "8-A.64",         "Umbrace",      1, Processor,    Product, Arch8A64 | Fp8 | VECTA_ISA | SAFEZONE_ISA},
    {"Umbrace-70",     "8-A.64",         "Umbrace",      1, Processor,    Product, Arch8A64 | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Umbrace-80",     "8-A.64",         "Umbrace",      1, Processor,    Product, Arch8A64 | Fp8 | VECTA_ISA | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Vessary-10",     "8-R",            "Vessary",      1, Processor,    Product, Arch8R},
    {"Vessary-20",     "8-R",            "Vessary",      1, Processor,    Product, Arch8R | Fp8D16},
    {"Vessary-30",     "8-R",            "Vessary",      1, Processor,    Product, Arch8R | VIRTUALIZATION_EXTENSION},
    {"Vessary-40",     "8-R",            "Vessary",      1, Processor,    Product, Arch8R | Fp8D16 | VIRTUALIZATION_EXTENSION},
    {"Vessary-50",     "8-R",            "Vessary",      1, Processor,    Product, Arch8R | MP_EXTENSIONS},
    {"Vessary-60",     "8-R",            "Vessary",      1, Processor,    Product, Arch8R | Fp8D16 | MP_EXTENSIONS},
    {"Vessary-70",     "8-R",            "Vessary",      1, Processor,    Product, Arch8R | VIRTUALIZATION_EXTENSION | MP_EXTENSIONS},
    {"Vessary-80",     "8-R",            "Vessary",      1, Processor,    Product, Arch8R | Fp8D16 | VIRTUALIZATION_EXTENSION | MP_EXTENSIONS},
    {"Wickmere-10",    "8-M.1",          "Wickmere",     1, Processor,    Product, Arch8M1},
    {"Wickmere-20",    "8-M.1",          "Wickmere",     1, Processor,    Product, Arch8M1 | SAFEZONE_ISA},
    {"Wickmere-30",    "8-M.1",          "Wickmere",     1, Processor,    Product, Arch8M1 | MP_EXTENSIONS},
    {"Wickmere-40",    "8-M.1",          "Wickmere",     1, Processor,    Product, Arch8M1 | SAFEZONE_ISA | MP_EXTENSIONS},
    {"Wickmere-50",    "8-M.1",          "Wickmere",     1, Processor,    Product, Arch8M1 | K2EE_ISA},
    {"Wickmere-60",    "8-M.1",          "Wickmere",     1, Processor,    Product, Arch8M1 | SAFEZONE_ISA | K2EE_ISA},
    {"Wickmere-70",    "8-M.1",          "Wickmere",     1, Processor,    Product, Arch8M1 | MP_EXTENSIONS | K2EE_ISA},
    {"Wickmere-80",    "8-M.1",          "Wickmere",     1, Processor,    Product, Arch8M1 | SAFEZONE_ISA | MP_EXTENSIONS | K2EE_ISA},
    {"Zorrel-10",      "8-M.2",          "Zorrel",       1, Processor,    Product, Arch8M2},
    {"Zorrel-20",      "8-M.2",          "Zorrel",       1, Processor,    Product, Arch8M2 | Fp8Single},
    {"Zorrel-30",      "8-M.2",          "Zorrel",       1, Processor,    Product, Arch8M2 | DSP_MULT | V7EM_EXTENSION},
    {"Zorrel-40",      "8-M.2",          "Zorrel",       1, Processor,    Product, Arch8M2 | Fp8Single | DSP_MULT | V7EM_EXTENSION},
    {"Zorrel-50",      "8-M.2",          "Zorrel",       1, Processor,    Product, Arch8M2 | SAFEZONE_ISA},
    {"Zorrel-60",      "8-M.2",          "Zorrel",       1, Processor,    Product, Arch8M2 | Fp8Single | SAFEZONE_ISA},
    {"Zorrel-70",      "8-M.2",          "Zorrel",       1, Processor,    Product, Arch8M2 | DSP_MULT | V7EM_EXTENSION | SAFEZONE_ISA},
    {"Zorrel-80",      "8-M.2",          "Zorrel",       1, Processor,    Product, Arch8M2 | Fp8Single | DSP_MULT | V7EM_EXTENSION | SAFEZONE_ISA},

    // Several processors in one.
    {"NCores-1",       "6-N",            "NCores",       1, Cluster,      Product, Arch6N | MP_EXTENSIONS | PLD1},
    {"NCores-2",       "6-NZ",           "NCores",       1, Cluster,      Product, Arch6NZ | MP_EXTENSIONS | PLD1},
    {"NCores-3",       "7-A",            "NCores",       1, Cluster,      Product, Arch7A | MP_EXTENSIONS | PLD1},
    {"NCores-4",       "7-A.V",          "NCores",       1, Cluster,      Product, Arch7AV | MP_EXTENSIONS | PLD1},
    {"NCores-5",       "7-R",            "NCores",       1, Cluster,      Product, Arch7R | MP_EXTENSIONS | PLD1},
    {"NCores-6",       "8-A.32",         "NCores",       1, Cluster,      Product, Arch8A32 | MP_EXTENSIONS | PLD1},
    {"NCores-7",       "8-R",            "NCores",       1, Cluster,      Product, Arch8R | MP_EXTENSIONS | PLD1},
    {"NCores-8",       "8-A.64",         "NCores",       1, Cluster,      Product, Arch8A64 | MP_EXTENSIONS | PLD1},
    {"Twinbay-1",      "6-N",            "Twinbay",      1, Cluster,      Product, Arch6N | MP_EXTENSIONS},
    {"Twinbay-2",      "6-B",            "Twinbay",      1, Cluster,      Product, Arch6B | MP_EXTENSIONS},
    {"Twinbay-3",      "7-S",            "Twinbay",      1, Cluster,      Product, Arch7S | MP_EXTENSIONS},
    {"Twinbay-4",      "7-A",            "Twinbay",      1, Cluster,      Product, Arch7A | MP_EXTENSIONS},
    {"Twinbay-5",      "7-R",            "Twinbay",      1, Cluster,      Product, Arch7R | MP_EXTENSIONS},
    {"Twinbay-6",      "8-A.32",         "Twinbay",      1, Cluster,      Product, Arch8A32 | MP_EXTENSIONS},
    {"Twinbay-7",      "8-R",            "Twinbay",      1, Cluster,      Product, Arch8R | MP_EXTENSIONS},
    {"Twinbay-8",      "8-A.64",         "Twinbay",      1, Cluster,      Product, Arch8A64 | MP_EXTENSIONS},
    {"Quadbay-1",      "6-N",            "Quadbay",      1, Cluster,      Product, Arch6N | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Quadbay-2",      "6-B",            "Quadbay",      1, Cluster,      Product, Arch6B | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Quadbay-3",      "7-S",            "Quadbay",      1, Cluster,      Product, Arch7S | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Quadbay-4",      "7-A",            "Quadbay",      1, Cluster,      Product, Arch7A | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Quadbay-5",      "7-R",            "Quadbay",      1, Cluster,      Product, Arch7R | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Quadbay-6",      "8-A.32",         "Quadbay",      1, Cluster,      Product, Arch8A32 | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Quadbay-7",      "8-R",            "Quadbay",      1, Cluster,      Product, Arch8R | MP_EXTENSIONS | SAFEZONE_ISA},
    {"Quadbay-8",      "8-A.64",         "Quadbay",      1, Cluster,      Product, Arch8A64 | MP_EXTENSIONS | SAFEZONE_ISA},
};
// clang-format on

} // namespace targets

} // namespace elfext
