// SPDX-License-Identifier: Apache-2.0
//
// The look-up of words in attribute texts.
#pragma once

#include "elfext/interface/feature_set.h"

#include <cstdint>
#include <string_view>

namespace elfext {

// What a word says. Most of it is empty.
struct AttributeWord {
  FeatureSet features = {};
  uint64_t flags = 0;
  uint64_t stack8 = 0;
  uint64_t abiLevel = 0;
  bool takesFlagsBack = false; // those that a text claims unless it has this word
};

// The whole word, in either case; null for one that says nothing.
const AttributeWord* findAttributeWord(std::string_view word);

// The number of the access name that the text begins with, in this case; as many as there are names
// if it begins with none.
uint32_t findAccessName(std::string_view text);

} // namespace elfext
