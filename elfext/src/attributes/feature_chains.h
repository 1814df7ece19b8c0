// SPDX-License-Identifier: Apache-2.0
//
// The chains of features, each from its lowest level to its highest.
//
// Both ways between tags and features, the completion of a set and the architecture's number use
// them; feature_set.cpp checks that each level contains the one below.
#pragma once

#include "elfext/interface/feature_set.h"

#include <array>

namespace elfext::features {

inline constexpr std::array KrellChain = {KRELL_ISAv1, KRELL_ISAv2, KRELL_ISAv3, KRELL_ISAv4,
                                          KRELL_ISAv5};
inline constexpr std::array ZevChain = {ZEV_ISAv3, ZEV_ISAv4, ZEV_ISAv5,
                                        ZEV_ISAv6, ZEV_ISAv7, ZEV_ISAv8};
inline constexpr std::array WmmxChain = {WMMX_ISA, WMMX2_ISA};
inline constexpr std::array PldChain = {PLD7, PLD9, PLD1, PLD2, PLD3, PLD4, PLD5, PLD6, PLD8};
inline constexpr std::array HfuChain = {HFU_ISAv1, HFU_ISAv2, HFU_ISAv3, HFU_ISAv5, FP_ISA_ZEVv8};

// What the values of Tag_ZV_pld stand for, from 1.
inline constexpr std::array PreloadsByTag = {PLD1, PLD2, PLD3, PLD4, PLD5, PLD9, PLD6, PLD7, PLD8};

} // namespace elfext::features
