// SPDX-License-Identifier: Apache-2.0
//
// Sets of attributes as tests need them: of one tag, of a list, of a record. The tables of tags are
// the tests' own, and say of each number whether the record follows from it.

#pragma once

#include "elfext/interface/build_attributes.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace elfext {

// A number, and whether the record follows from it.
template <class Tag>
struct TagRow {
  Tag tag;
  bool feedsRecord;
};

// clang-format off
constexpr TagRow<uint32_t> QobixNumbers[] = {
    {6, true},   {7, true},   {8, true},   {9, true},   {40, true},  {10, true},  {11, true},
    {12, true},  {13, true},  {14, true},  {15, true},  {16, true},  {17, true},  {18, false},
    {19, true},  {20, true},  {21, true},  {22, true},  {23, true},  {24, true},  {25, true},
    {26, false}, {27, false}, {28, true},  {29, false}, {30, false}, {31, false}, {34, true},
    {36, true},  {38, false}, {46, true},  {64, false}, {66, true},  {68, true},  {42, false},
    {70, false}, {44, false},
};
constexpr TagRow<ZevTag> ZevNumbers[] = {
    {ZevTag::Tag_ZV_interworking, true}, {ZevTag::Tag_ZV_cpp_exceptions, true},
    {ZevTag::Tag_ZV_mdivide, true},      {ZevTag::Tag_ZV_standardlib, true},
    {ZevTag::Tag_ZV_microlib, true},     {ZevTag::Tag_ZV_require8, true},
    {ZevTag::Tag_ZV_eba, true},          {ZevTag::Tag_ZV_version, false},
    {ZevTag::Tag_ZV_pld, true},          {ZevTag::Tag_ZV_full_isa, true},
};
// clang-format on

constexpr uint32_t Texts[] = {Tag_CPU_raw_name, Tag_CPU_name, Tag_conformance};
constexpr uint32_t LargestTag = 70;

// A record that no tags lead to: where it is gone, the record was made anew.
constexpr FullAttr Unheard = {.m_AbiLevel = 7};

// Does something with each number of both vendors.
template <class Function>
void forEachNumber(Function function) {
  for (const auto& row : QobixNumbers)
    function(row.tag, row.feedsRecord);
  for (const auto& row : ZevNumbers)
    function(row.tag, row.feedsRecord);
}

template <class Tag>
BuildAttributes with(Tag tag, uint32_t value) {
  BuildAttributes attributes;
  attributes.setNumericTag(tag, value);
  return attributes;
}

inline BuildAttributes withText(uint32_t tag, std::string_view text) {
  BuildAttributes attributes;
  attributes.setStringTag(tag, text);
  return attributes;
}

inline BuildAttributes withRecord(const FullAttr& record) {
  BuildAttributes attributes;
  attributes.setFullAttr(record);
  return attributes;
}

// With the tags that follow from the record.
inline BuildAttributes derivedFrom(const FullAttr& record) {
  BuildAttributes attributes = withRecord(record);
  attributes.deriveStandardTags();
  return attributes;
}
inline BuildAttributes derivedFrom(FeatureSet features) {
  return derivedFrom(FullAttr{.m_Features = features});
}

inline BuildAttributes withCompatible(const std::vector<CompatibilityTag>& entries) {
  BuildAttributes attributes;
  for (const CompatibilityTag& entry : entries)
    attributes.addCompatibilityTag(entry.flag, entry.vendor);
  return attributes;
}

inline BuildAttributes withAlsoCompatible(const std::vector<AlsoCompatibilityTag>& entries) {
  BuildAttributes attributes;
  for (const AlsoCompatibilityTag& entry : entries)
    attributes.addAlsoCompatibilityTag(entry);
  return attributes;
}

inline std::vector<CompatibilityTag> compatibleOf(const BuildAttributes& attributes) {
  std::vector<CompatibilityTag> entries(attributes.getCompatibilityTagCount());
  for (uint32_t i = 0; i < entries.size(); ++i)
    attributes.getCompatibilityTag(i, entries[i]);
  return entries;
}

inline std::vector<AlsoCompatibilityTag> alsoCompatibleOf(const BuildAttributes& attributes) {
  std::vector<AlsoCompatibilityTag> entries(attributes.getAlsoCompatibilityTagCount());
  for (uint32_t i = 0; i < entries.size(); ++i)
    attributes.getAlsoCompatibilityTag(i, entries[i]);
  return entries;
}

// What can't be put together.
inline BuildAttributes invalid() {
  return BuildAttributes::getCheckedCombination(
      withRecord({.m_Features = features::PURE_DOUBLES}),
      withRecord({.m_Features = features::MIXED_DOUBLES}));
}

// As both vendors' blocks have them, one behind the other.
inline std::string bytesOf(const BuildAttributes& attributes) {
  std::string bytes;
  attributes.encodeQobix(bytes);
  attributes.encodeZev(bytes);
  return bytes;
}

} // namespace elfext
