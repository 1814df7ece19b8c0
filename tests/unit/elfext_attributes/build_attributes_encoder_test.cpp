// SPDX-License-Identifier: Apache-2.0
//
// From a set of tags to its bytes: numbers in groups of seven bits, texts with their ends, and the
// order of tags, lists and unknown tags. Bytes are compared as they are, since other tools read
// them.

#include "elfext/interface/build_attributes.h"

#include "tests/unit/elfext_attributes/attribute_sets.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

namespace elfext {
namespace {

using namespace std::string_literals;
using namespace std::string_view_literals;

std::string qobixOf(const BuildAttributes& attributes) {
  std::string bytes;
  attributes.encodeQobix(bytes);
  return bytes;
}

std::string zevOf(const BuildAttributes& attributes) {
  std::string bytes;
  attributes.encodeZev(bytes);
  return bytes;
}

std::string encodedAlso(const AlsoCompatibilityTag& entry) {
  BuildAttributes attributes;
  attributes.addAlsoCompatibilityTag(entry);
  return qobixOf(attributes);
}

TEST(BuildAttributesEncoder, WritesNothingForNothing) {
  EXPECT_EQ(qobixOf({}), "");
  EXPECT_EQ(zevOf({}), "");
}

TEST(BuildAttributesEncoder, WritesNumbersInLittleGroups) {
  EXPECT_EQ(qobixOf(with(Tag_ABI_enum_size, 0)), "\x1A\0"sv);
  EXPECT_EQ(qobixOf(with(Tag_ABI_enum_size, 127)), "\x1A\x7F"sv);
  EXPECT_EQ(qobixOf(with(Tag_ABI_enum_size, 128)), "\x1A\x80\x01"sv);
  EXPECT_EQ(qobixOf(with(Tag_ABI_enum_size, 255)), "\x1A\xFF\x01"sv);
  EXPECT_EQ(qobixOf(with(Tag_CPU_arch, 0x3FFF)), "\x06\xFF\x7F"sv);
  EXPECT_EQ(qobixOf(with(Tag_CPU_arch, 0x4000)), "\x06\x80\x80\x01"sv);
  EXPECT_EQ(qobixOf(with(Tag_CPU_arch, 0xFFFFFFFF)), "\x06\xFF\xFF\xFF\xFF\x0F"sv);
  EXPECT_EQ(qobixOf(with(0x12Cu, 300)), "\xAC\x02\xAC\x02"sv);
}

TEST(BuildAttributesEncoder, WritesTextsWithTheirEnds) {
  BuildAttributes attributes;
  attributes.setStringTag(Tag_CPU_name, "name");
  EXPECT_EQ(qobixOf(attributes), "\x05name\0"sv);
  attributes.setStringTag(Tag_CPU_name, "");
  EXPECT_EQ(qobixOf(attributes), "\x05\0"sv);
}

TEST(BuildAttributesEncoder, AppendsToWhatIsThere) {
  std::string bytes = "before";
  with(Tag_CPU_arch, 1).encodeQobix(bytes);
  with(ZevTag::Tag_ZV_pld, 2).encodeZev(bytes);
  EXPECT_EQ(bytes, "before\x06\x01\x14\x02");
}

TEST(BuildAttributesEncoder, WritesTheTagsOfThePublicAbiInTheirOrder) {
  constexpr uint8_t Numbers[] = {6,  7,  8,  9,  40, 10, 11, 12, 13, 14, 15, 16,
                                 17, 18, 19, 20, 21, 22, 23, 24, 25, 26, 27, 28,
                                 29, 30, 31, 34, 36, 38, 46, 64, 66, 68, 42, 44};
  BuildAttributes attributes;
  std::string expected = "\x43"
                         "2.08"s +
                         '\0' + "\x04raw" + '\0' + "\x05name" + '\0';
  uint32_t value = 20;
  for (const uint8_t tag : Numbers) {
    attributes.setNumericTag(tag, ++value);
    expected += static_cast<char>(tag);
    expected += static_cast<char>(value);
  }
  attributes.setStringTag(Tag_CPU_name, "name");
  attributes.setStringTag(Tag_CPU_raw_name, "raw");
  attributes.setConformance("2.08");
  EXPECT_EQ(qobixOf(attributes), expected);
  EXPECT_EQ(zevOf(attributes), "");
}

TEST(BuildAttributesEncoder, WritesOneTagForMultiprocessing) {
  EXPECT_EQ(qobixOf(with(Tag_MPextension_use_r207, 1)), "\x2A\x01"sv);
}

TEST(BuildAttributesEncoder, WritesTheMakersTagsInTheirOrder) {
  BuildAttributes attributes;
  for (uint32_t tag = 22; tag >= 4; tag -= 2)
    attributes.setNumericTag(ZevTag{tag}, tag + 100);
  EXPECT_EQ(zevOf(attributes),
            "\x04\x68\x06\x6A\x08\x6C\x0A\x6E\x0C\x70\x0E\x72\x10\x74\x12\x76\x14\x78\x16\x7A"sv);
}

TEST(BuildAttributesEncoder, WritesWhatTheMakersTagsBring) {
  EXPECT_EQ(qobixOf(with(ZevTag::Tag_ZV_interworking, 1)), "\x20\x02ZEV\0"sv);
  EXPECT_EQ(qobixOf(with(ZevTag::Tag_ZV_eba, 2)), "\x18\x02"sv);
}

TEST(BuildAttributesEncoder, WritesCompatibilitiesInTheOrderOfTheList) {
  BuildAttributes attributes;
  attributes.addCompatibilityTag(300, "two");
  attributes.addCompatibilityTag(0, "");
  attributes.addCompatibilityTag(1, "one");
  EXPECT_EQ(qobixOf(attributes), "\x20\xAC\x02two\0\x20\0\0\x20\x01one\0"sv);
}

TEST(BuildAttributesEncoder, WritesOneAttributeIntoAnother) {
  EXPECT_EQ(encodedAlso({6, 11, {}}), "A\x06\x0B\0"sv);
  EXPECT_EQ(encodedAlso({6, 300, {}}), "A\x06\xAC\x02\0"sv);
  EXPECT_EQ(encodedAlso({6, 0, {}}), "A\x06\0"sv) << "its own zero is the end";
  EXPECT_EQ(encodedAlso({5, {}, "name"}), "A\x05name\0"sv);
  EXPECT_EQ(encodedAlso({5, {}, ""}), "A\x05\0"sv);
  EXPECT_EQ(encodedAlso({32, 1, "name"}), "A\x20\x01name\0"sv);
  EXPECT_EQ(encodedAlso({32, 0, "name"}), "A\x20\0name\0"sv);
  EXPECT_EQ(encodedAlso({0x86, 11, {}}), "A\x06\x0B\0"sv);
}

TEST(BuildAttributesEncoder, WritesUnknownTagsLastInRisingOrder) {
  BuildAttributes attributes;
  attributes.setNumericTag(0x80000000, 5);
  attributes.setStringTag(0xFFFFFFFF, "last");
  attributes.setStringTag(49, "odd");
  attributes.setNumericTag(50, 3);
  attributes.setNumericTag(48, 300);
  attributes.setStringTag(33, "first");
  attributes.setNumericTag(72, 0);
  EXPECT_EQ(qobixOf(attributes), "\x21"
                                 "first\0\x30\xAC\x02\x31odd\0\x32\x03\x48\0"
                                 "\x80\x80\x80\x80\x08\x05\xFF\xFF\xFF\xFF\x0Flast\0"sv);
}

TEST(BuildAttributesEncoder, WritesListsBehindTheTagsAndBeforeUnknownOnes) {
  BuildAttributes attributes;
  attributes.setNumericTag(48, 1);
  attributes.addAlsoCompatibilityTag({6, 11, {}});
  attributes.addAlsoCompatibilityTag({6, 2, {}});
  attributes.addCompatibilityTag(1, "x");
  attributes.setNumericTag(Tag_DIV_use, 2);
  EXPECT_EQ(qobixOf(attributes), "\x2C\x02\x20\x01x\0A\x06\x0B\0A\x06\x02\0\x30\x01"sv);
}

TEST(BuildAttributesEncoder, WritesNoTagThatWasTakenAway) {
  BuildAttributes attributes = with(Tag_CPU_arch, 1);
  attributes.setNumericTag(48, 1);
  attributes.addCompatibilityTag(1, "x");
  for (const uint32_t tag : {6u, 48u, 32u})
    attributes.removeTag(tag);
  EXPECT_EQ(qobixOf(attributes), "");
}

} // namespace
} // namespace elfext
