// SPDX-License-Identifier: Apache-2.0
//
// The pool of a module in which equal attribute sets, blocks and texts are one shared object, so
// that thousands of sections with the same attributes cost one set.

#include "elfext/interface/build_attributes_cache.h"

#include "tests/unit/elfext_attributes/attribute_sets.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace elfext {
namespace {

TEST(BuildAttributesCache, KeepsOneOfEqualSets) {
  BuildAttributesCache cache;
  BuildAttributes attributes = with(Tag_CPU_arch, 14);
  const BuildAttributes* first = cache.getBuildAttributes(attributes);
  EXPECT_NE(first, &attributes);
  EXPECT_EQ(*first, attributes);
  attributes.setNumericTag(Tag_Z64_ISA_use, 1);
  EXPECT_EQ(cache.getBuildAttributes(attributes), first);
  EXPECT_FALSE(first->hasTag(Tag_Z64_ISA_use));
  attributes.setNumericTag(Tag_CPU_arch, 15);
  EXPECT_NE(cache.getBuildAttributes(attributes), first);
  BuildAttributes emptied = withCompatible({{1, "x"}});
  emptied.removeTag(Tag_compatibility);
  EXPECT_NE(cache.getBuildAttributes(emptied), cache.getBuildAttributes({}));
}

TEST(BuildAttributesCache, LetsTheFirstRecordStand) {
  BuildAttributesCache cache;
  const BuildAttributes* first = cache.getBuildAttributes(withRecord(Unheard));
  EXPECT_EQ(first->getFullAttr(), Unheard);
  EXPECT_EQ(cache.getBuildAttributes({}), first);
  EXPECT_EQ(first->getFullAttr(), Unheard);
}

TEST(BuildAttributesCache, KeepsOneBlockForEachVendorAndBytes) {
  BuildAttributesCache cache;
  const std::vector<uint8_t> bytes = {6, 0, 7};
  std::vector<uint8_t> same = bytes;
  std::string vendor = "qobix";
  const BuildAttributesBlock* block = cache.getBlock(vendor, same);
  vendor[0] = 'x';
  same[0] = 99;
  EXPECT_EQ(block->getVendor(), std::string_view("qobix"));
  EXPECT_EQ(std::vector(block->getData().begin(), block->getData().end()), bytes);
  EXPECT_EQ(cache.getBlock("qobix", bytes), block);
  EXPECT_NE(cache.getBlock("Qobix", bytes), block);
  EXPECT_NE(cache.getBlock("qobix", std::span(bytes).first(2)), block);
  EXPECT_NE(cache.getBlock("qobix", same), block);
  EXPECT_NE(cache.getBlock("qobix", {}), block);
}

TEST(BuildAttributesCache, KeepsASetForEachText) {
  BuildAttributesCache cache;
  const BuildAttributes& attributes = cache.getBuildAttributesOf("$ZEV_ISAv4");
  EXPECT_EQ(attributes, BuildAttributes("$ZEV_ISAv4"));
  EXPECT_EQ(&cache.getBuildAttributesOf("$ZEV_ISAv4"), &attributes);
  EXPECT_NE(&cache.getBuildAttributesOf("$ZEV_ISAv5"), &attributes);
}

} // namespace
} // namespace elfext
