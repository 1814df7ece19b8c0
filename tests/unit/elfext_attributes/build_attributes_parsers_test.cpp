// SPDX-License-Identifier: Apache-2.0
//
// The bytes of attribute sections, from the whole section down to one attribute, and what decoding
// makes of them. Bytes lie in a block of their own, so that a sanitizer sees a step beyond them;
// every prefix is tried, and lengths, kinds, numbers and lists that are wrong or have no end must
// be told, with what stands in front of them kept.

#include "elfext/interface/build_attributes_parsers.h"

#include "tests/support/attribute_bytes.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <string>
#include <vector>

namespace elfext {
namespace {

using namespace testsupport;
using testing::ElementsAre;

// Bytes in a block of their own, so that a sanitizer sees a step beyond them.
std::vector<uint8_t> ownBytes(std::string_view text) {
  return {text.begin(), text.end()};
}

// ---- Sections

// What is handed over, as text: kind, vendor, indices, attributes.
class RecordingSectionParser final : public BuildAttributesSectionParser {
public:
  bool parseFileSubSubsection(std::string_view vendor, AttributeBytes attributes) override {
    return record("file", vendor, {}, attributes);
  }
  bool parseSectionSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                 AttributeBytes attributes) override {
    return record("section", vendor, indices, attributes);
  }
  bool parseSymbolSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                AttributeBytes attributes) override {
    return record("symbol", vendor, indices, attributes);
  }

  std::vector<std::string> m_Seen;
  std::string m_Refused; // what is answered with false

private:
  bool record(const char* kind, std::string_view vendor, std::span<const uint32_t> indices,
              AttributeBytes attributes) {
    std::string text = kind + (" " + std::string(vendor));
    for (const uint32_t index : indices)
      text += ' ' + std::to_string(index);
    m_Seen.push_back(text + ": " + textOf(attributes));
    return text != m_Refused;
  }
};

struct Walk {
  bool isWell;
  std::vector<std::string> seen;
};

Walk walk(std::string_view section, bool isLittle = true, const char* refused = "") {
  RecordingSectionParser parser;
  parser.m_Refused = refused;
  const std::vector<uint8_t> bytes = ownBytes(section);
  const bool isWell = parser.parse(bytes, isLittle);
  return {isWell, parser.m_Seen};
}

void expectWell(std::string_view section, const std::vector<std::string>& seen) {
  const Walk result = walk(section);
  EXPECT_TRUE(result.isWell);
  EXPECT_EQ(result.seen, seen);
}

void expectBad(std::string_view section, const std::vector<std::string>& seen) {
  const Walk result = walk(section);
  EXPECT_FALSE(result.isWell);
  EXPECT_EQ(result.seen, seen);
}

// A subsection of vendor "v" with these bytes behind the name, and one that follows it.
std::string sectionWith(std::string_view bytes) {
  return "A" + subsection(ntbs("v") + std::string(bytes)) +
         subsection(ntbs("next") + subSubsection(filePart("z"), true));
}

const char* const Next = "file next: z";

TEST(AttributeSectionTest, StartsWithItsVersion) {
  expectWell("A", {});
  expectBad("", {});
  expectBad("B", {});
  expectBad(std::string(1, '\0'), {});
  std::string other = attributeSection({vendorPart("v", {filePart("x")})});
  other[0] = 'a';
  expectBad(other, {});
}

TEST(AttributeSectionTest, HandsOverWhatItHasInItsOrderAndByteOrder) {
  for (const bool isLittle : {true, false}) {
    const std::string bytes = attributeSection(
        {vendorPart("qobix", {symbolPart({3}, "s"), filePart("f"), sectionPart({1, 300, 7}, "")}),
         vendorPart("ZEV", {}), vendorPart("", {sectionPart({}, "none"), filePart("")}),
         vendorPart("qobix", {filePart("again")})},
        isLittle);
    const Walk result = walk(bytes, isLittle);
    EXPECT_TRUE(result.isWell);
    EXPECT_THAT(result.seen, ElementsAre("symbol qobix 3: s", "file qobix: f",
                                         "section qobix 1 300 7: ", "section : none",
                                         "file : ", "file qobix: again"));
    EXPECT_FALSE(walk(bytes, !isLittle).isWell);
  }
}

TEST(AttributeSectionTest, HandsOverViewsOfItsBytes) {
  struct Parser final : BuildAttributesSectionParser {
    bool parseFileSubSubsection(std::string_view name, AttributeBytes run) override {
      vendor = name.data();
      attributes = run.data();
      return true;
    }
    const char* vendor = nullptr;
    const uint8_t* attributes = nullptr;
  } parser;
  const std::string section = attributeSection({vendorPart("v", {filePart("x")})});
  EXPECT_TRUE(parser.parse(bytesOf(section), true));
  EXPECT_EQ(parser.vendor, section.data() + 5);
  EXPECT_EQ(static_cast<const void*>(parser.attributes), section.data() + 12);
}

TEST(AttributeSectionTest, IgnoresWhatNobodyAsksFor) {
  BuildAttributesSectionParser parser;
  EXPECT_TRUE(parser.parse(bytesOf(attributeSection({vendorPart(
                               "v", {filePart("x"), sectionPart({1}, ""), symbolPart({1}, "")})})),
                           true));
}

TEST(AttributeSectionTest, EndsAtASubsectionOfNoLength) {
  const std::string good = attributeSection({vendorPart("v", {filePart("x")})});
  for (const uint32_t length : {0U, 1U, 4U}) {
    expectBad(good + word(length, true), {"file v: x"});
    expectBad(good + word(length, true) + good.substr(1), {"file v: x"});
  }
  expectBad(good + "\5", {"file v: x"});
  expectBad(good + std::string("\5\0\0", 3), {"file v: x"});
  // The smallest one has a vendor without a name.
  expectWell(good + word(5, true) + '\0', {"file v: x"});
  expectBad(good + word(5, true) + 'v', {"file v: x"});
}

TEST(AttributeSectionTest, EndsAtASubsectionThatIsTooLong) {
  const std::string good = attributeSection({vendorPart("v", {filePart("x")})});
  const auto claimed = [&good](uint32_t length) {
    return "A" + word(length, true) + good.substr(5);
  };
  const auto size = static_cast<uint32_t>(good.size());
  expectWell(claimed(size - 1), {"file v: x"});
  for (const uint32_t length : {size, size + 1, 0x7FFFFFFFU, 0x80000000U, 0xFFFFFFFEU, 0xFFFFFFFFU})
    expectBad(claimed(length), {});
}

TEST(AttributeSectionTest, PassesOverAVendorWithoutAnEnd) {
  expectBad("A" + subsection("vendor") +
                subsection(ntbs("next") + subSubsection(filePart("z"), true)),
            {Next});
}

TEST(AttributeSectionTest, PassesOverTheRestBehindABadKind) {
  const std::string good = subSubsection(filePart("x"), true);
  for (const uint32_t kind : {0U, 4U, 127U, 128U, 0xFFFFFFFFU})
    expectBad(sectionWith(good + subSubsection({kind, "y"}, true) + good), {"file v: x", Next});
  // One that runs to the end of the subsection.
  expectBad(sectionWith(good + "\x81\x80"), {"file v: x", Next});
  expectBad(sectionWith(good + "\x81"), {"file v: x", Next});
}

TEST(AttributeSectionTest, PassesOverTheRestBehindABadSize) {
  const std::string good = subSubsection(filePart("x"), true);
  expectBad(sectionWith(good + "\1"), {"file v: x", Next});
  expectBad(sectionWith(good + std::string("\1\5\0\0", 4)), {"file v: x", Next});
  for (const uint32_t size : {0U, 4U, 11U, 0x80000000U, 0xFFFFFFFFU})
    expectBad(sectionWith(good + "\1" + word(size, true) + "12345"), {"file v: x", Next});
  expectWell(sectionWith(good + "\1" + word(5, true)), {"file v: x", "file v: ", Next});
  // A longer form of the kind counts in the size.
  expectWell(sectionWith("\x81" + std::string(1, '\0') + word(7, true) + "a"), {"file v: a", Next});
  expectBad(sectionWith("\x81" + std::string(1, '\0') + word(5, true)), {Next});
}

TEST(AttributeSectionTest, GoesOnBehindAListWithoutAnEnd) {
  const std::string good = subSubsection(filePart("x"), true);
  for (const uint32_t kind : {2U, 3U}) {
    expectBad(sectionWith(subSubsection({kind, ""}, true) + good), {"file v: x", Next});
    expectBad(sectionWith(subSubsection({kind, "\1\2\3"}, true) + good), {"file v: x", Next});
  }
}

TEST(AttributeSectionTest, HandsOverTheIndicesInFrontOfABadOne) {
  const auto list = [](std::string_view indices) {
    return sectionWith(
        subSubsection({Tag_Section, std::string(indices) + '\0' + "attributes"}, true));
  };
  // The zero ends a number that hasn't ended.
  expectBad(list("\1\2\x80"), {"section v 1 2: attributes", Next});
  expectBad(list("\x80"), {"section v: attributes", Next});
  // A number that is 0 for want of room.
  expectBad(list("\1\x80\x80\x80\x80\x10\2"), {"section v 1: attributes", Next});
  expectWell(list(""), {"section v: attributes", Next});
  expectWell(list("\xFF\xFF\xFF\xFF\x0F"), {"section v 4294967295: attributes", Next});
}

// The shift wraps, so that the sixth byte starts again near the low end.
TEST(AttributeSectionTest, LosesBitsOfNumbersThatAreTooLong) {
  const auto list = [](std::string_view indices) {
    return attributeSection({vendorPart("v", {{Tag_Symbol, std::string(indices) + '\0'}})});
  };
  expectWell(list("\x81\x80\x80\x80\x70"), {"symbol v 1: "});
  expectWell(list("\x80\x80\x80\x80\x80\x01"), {"symbol v 8: "});
  expectWell(list("\x81\x80\x80\x80\x80\x80\x01"), {"symbol v 1025: "});
}

TEST(AttributeSectionTest, IsNotWellIfAnOperationSaysSo) {
  const std::string section = attributeSection({vendorPart(
      "v", {filePart("a"), sectionPart({1}, "b"), symbolPart({2}, "c"), filePart("d")})});
  for (const char* refused : {"file v", "section v 1", "symbol v 2"}) {
    const Walk result = walk(section, true, refused);
    EXPECT_FALSE(result.isWell);
    EXPECT_THAT(result.seen,
                ElementsAre("file v: a", "section v 1: b", "symbol v 2: c", "file v: d"));
  }
}

// Each prefix that isn't the end of a subsection is told, and nothing beyond it is looked at.
TEST(AttributeSectionTest, TellsEachPrefix) {
  for (const bool isLittle : {true, false}) {
    const std::vector<VendorPart> vendors = {
        vendorPart("qobix", {filePart(tag(6, 10) + tag(5, "cpu")),
                             sectionPart({1, 200}, tag(30, 2)), symbolPart({5}, tag(32, 1, "x"))}),
        vendorPart("ZEV", {filePart(tag(18, 1))}), vendorPart("other", {filePart("bytes")})};
    const std::string whole = attributeSection(vendors, isLittle);
    std::vector<size_t> ends;
    for (size_t count = 0; count <= vendors.size(); ++count)
      ends.push_back(
          attributeSection({vendors.begin(), vendors.begin() + static_cast<ptrdiff_t>(count)},
                           isLittle)
              .size());
    for (size_t size = 0; size <= whole.size(); ++size) {
      const bool isWell = std::ranges::find(ends, size) != ends.end();
      EXPECT_EQ(walk(std::string_view(whole).substr(0, size), isLittle).isWell, isWell) << size;
    }
  }
}

// The same with lengths that fit: what is inside of them is cut.
TEST(AttributeSectionTest, TellsEachPrefixOfASubsection) {
  const std::string content = ntbs("qobix") + subSubsection(filePart(tag(6, 10)), true) +
                              subSubsection(sectionPart({1, 200}, tag(30, 2)), true);
  const size_t afterVendor = 6;
  const size_t afterFile = afterVendor + 7;
  for (size_t size = 1; size <= content.size(); ++size) {
    const bool isWell = size == afterVendor || size == afterFile || size == content.size();
    EXPECT_EQ(walk("A" + subsection(content.substr(0, size))).isWell, isWell) << size;
  }
}

// ---- Vendor "qobix"

class RecordingQobixParser final : public QobixBuildAttributesSubSubsectionParser {
public:
  bool numericTag(uint32_t number, uint32_t value) override {
    return record("", number, &value, {});
  }
  bool stringTag(uint32_t number, std::string_view text) override {
    return record("", number, nullptr, text);
  }
  bool numericAndStringTag(uint32_t number, uint32_t value, std::string_view text) override {
    return record("", number, &value, text);
  }
  bool nestedNumericTag(uint32_t number, uint32_t value) override {
    return record("nested ", number, &value, {});
  }
  bool nestedStringTag(uint32_t number, std::string_view text) override {
    return record("nested ", number, nullptr, text);
  }
  bool nestedNumericAndStringTag(uint32_t number, uint32_t value, std::string_view text) override {
    return record("nested ", number, &value, text);
  }

  std::vector<std::string> m_Seen;
  bool m_Answer = true;

private:
  bool record(std::string where, uint32_t number, const uint32_t* value,
              std::optional<std::string_view> text) {
    where += std::to_string(number);
    if (value != nullptr) where += '=' + std::to_string(*value);
    if (text && text->data() != nullptr) where += " '" + std::string(*text) + "'";
    m_Seen.push_back(where);
    return m_Answer;
  }
};

void expectRun(std::string_view run, bool isWell, const std::vector<std::string>& seen) {
  RecordingQobixParser parser;
  const std::vector<uint8_t> bytes = ownBytes(run);
  EXPECT_EQ(parser.parse(bytes), isWell);
  EXPECT_EQ(parser.m_Seen, seen);
}

TEST(QobixAttributesTest, HaveFormsThatFollowFromTheTag) {
  expectRun("", true, {});
  expectRun(tag(4, "raw") + tag(5, "") + tag(6, 300) + tag(31, 0) + tag(32, 1, "v") + tag(33, "x") +
                tag(34, 7) + tag(70, 8) + tag(71, "y"),
            true,
            {"4 'raw'", "5 ''", "6=300", "31=0", "32=1 'v'", "33 'x'", "34=7", "70=8", "71 'y'"});
  for (uint32_t number = 6; number <= 31; ++number)
    expectRun(tag(number, number), true, {std::to_string(number) + "=" + std::to_string(number)});
  // By being even or odd, up to the largest.
  expectRun(tag(0x80000000, 1) + tag(0xFFFFFFFF, "x"), true, {"2147483648=1", "4294967295 'x'"});
}

TEST(QobixAttributesTest, HaveNoTagsOfScopes) {
  for (const uint32_t number : {0U, 1U, 2U, 3U})
    expectRun(tag(6, 1) + tag(number, 1) + tag(6, 2), false, {"6=1"});
}

TEST(QobixAttributesTest, EndWhereTheRunEnds) {
  expectRun(tag(6, 1) + "\x86", false, {"6=1"});
  expectRun(tag(6, 1) + "\6", false, {"6=1"});
  expectRun(tag(6, 1) + "\6\x80", false, {"6=1"});
  expectRun(tag(6, 1) + "\5", false, {"6=1"});
  expectRun(tag(6, 1) + "\5cpu", false, {"6=1"});
  expectRun(tag(6, 1) + " ", false, {"6=1"});
  expectRun(tag(6, 1) + " \1", false, {"6=1"});
  expectRun(tag(6, 1) + " \1v", false, {"6=1"});
}

TEST(QobixAttributesTest, GoOnBehindAnAnswerOfFalse) {
  RecordingQobixParser parser;
  parser.m_Answer = false;
  EXPECT_FALSE(parser.parse(bytesOf(tag(6, 1) + tag(5, "x") + tag(32, 1, "y") + tag(65, "\6\1"))));
  EXPECT_THAT(parser.m_Seen, ElementsAre("6=1", "5 'x'", "32=1 'y'", "nested 6=1"));
  QobixBuildAttributesSubSubsectionParser ignoring;
  EXPECT_TRUE(ignoring.parse(bytesOf(tag(6, 1) + tag(5, "x") + tag(32, 1, "y") + tag(65, "\6\1"))));
}

TEST(QobixAttributesTest, NestOneAttribute) {
  const auto nested = [](std::string_view attribute, std::string_view behind = "") {
    return "\x41" + std::string(attribute) + std::string(behind);
  };
  const std::string zero(1, '\0');
  // A number of 0 is the end of the text by itself.
  expectRun(nested(tag(6, 0)), true, {"nested 6=0"});
  expectRun(nested(tag(6, 1), zero), true, {"nested 6=1"});
  expectRun(nested(tag(6, 300), zero), true, {"nested 6=300"});
  expectRun(nested(tag(5, "cpu")), true, {"nested 5 'cpu'"});
  expectRun(nested(tag(5, "")), true, {"nested 5 ''"});
  expectRun(nested(tag(32, 1, "v")), true, {"nested 32=1 'v'"});
  expectRun(nested(tag(67, "2.09")), true, {"nested 67 '2.09'"});
  expectRun(nested(tag(6, 0)) + tag(6, 5), true, {"nested 6=0", "6=5"});
  // The end of the text is taken for that of the number, and no text is left.
  expectRun(nested(tag(32, 1, "")), false, {});
  // What is left over is too much.
  expectRun(nested("\6\1\1", zero), false, {});
  expectRun(nested(tag(6, 1) + tag(8, 1), zero), false, {});
  expectRun(nested("", zero), false, {});
  expectRun(nested("\3\1", zero), false, {});
  expectRun(nested("\6", zero) + tag(8, 1), true, {"nested 6=0", "8=1"});
  // The number takes the terminator for its end.
  expectRun(nested("\6\x81", zero), true, {"nested 6=1"});
  // A bad one doesn't end the run.
  expectRun(nested("\6\1\1", zero) + tag(6, 5), false, {"6=5"});
  // Without a terminator there is no text to look into.
  expectRun(tag(6, 5) + "\x41\6\1", false, {"6=5"});
}

TEST(QobixAttributesTest, TellEachPrefix) {
  const std::string pieces[] = {tag(6, 300), tag(5, "cpu"), tag(32, 1, "v"), tag(65, "\6\1"),
                                tag(300, 5)};
  std::string whole;
  std::vector<size_t> ends = {0};
  for (const std::string& piece : pieces) {
    whole += piece;
    ends.push_back(whole.size());
  }
  for (size_t size = 0; size <= whole.size(); ++size) {
    RecordingQobixParser parser;
    const std::vector<uint8_t> bytes = ownBytes(std::string_view(whole).substr(0, size));
    EXPECT_EQ(parser.parse(bytes), std::ranges::find(ends, size) != ends.end()) << size;
  }
}

// Who derives hears of what he asks for and steps over the rest.
TEST(QobixAttributesTest, AreWalkedToTheEndThoughNobodyHears) {
  const std::vector<uint8_t> bytes = ownBytes(tag(6, 300) + tag(5, "cpu") + tag(32, 1, "v") +
                                              "\x41" + tag(5, "x") + "\x41" + tag(32, 1, "v"));
  EXPECT_TRUE(QobixBuildAttributesSubSubsectionParser().parse(bytes));
}

// ---- Vendor "ZEV"

class RecordingZevParser final : public ZevBuildAttributesSubSubsectionParser {
public:
  bool numericTag(uint32_t number, uint32_t value) override {
    m_Seen.push_back(std::to_string(number) + '=' + std::to_string(value));
    return m_Answer;
  }

  std::vector<std::string> m_Seen;
  bool m_Answer = true;
};

void expectZevRun(std::string_view run, bool isWell, const std::vector<std::string>& seen) {
  RecordingZevParser parser;
  const std::vector<uint8_t> bytes = ownBytes(run);
  EXPECT_EQ(parser.parse(bytes), isWell);
  EXPECT_EQ(parser.m_Seen, seen);
}

TEST(ZevAttributesTest, AreNumbersIfEven) {
  expectZevRun("", true, {});
  expectZevRun(tag(4, 1) + tag(5, "thrown away") + tag(32, 300) + tag(33, "") + tag(0xFFFFFFFE, 2),
               true, {"4=1", "32=300", "4294967294=2"});
  for (const uint32_t number : {0U, 1U, 2U, 3U})
    expectZevRun(tag(4, 1) + tag(number, 1) + tag(4, 2), false, {"4=1"});
  for (const char* cut : {"\x84", "\4", "\4\x80", "\5", "\5x"})
    expectZevRun(tag(4, 1) + cut, false, {"4=1"});
  RecordingZevParser parser;
  parser.m_Answer = false;
  EXPECT_FALSE(parser.parse(bytesOf(tag(4, 1) + tag(6, 1))));
  EXPECT_THAT(parser.m_Seen, ElementsAre("4=1", "6=1"));
}

TEST(ZevAttributesTest, AreWalkedToTheEndThoughNobodyHears) {
  EXPECT_TRUE(ZevBuildAttributesSubSubsectionParser().parse(ownBytes(tag(4, 1) + tag(5, "x"))));
  EXPECT_FALSE(ZevBuildAttributesSubSubsectionParser().parse(ownBytes(tag(4, 1) + "\4")));
}

// ---- Decoding

BuildAttributes decoded(std::string_view run) {
  BuildAttributes attributes;
  QobixBuildAttributesDecodingParser(attributes).parse(bytesOf(run));
  return attributes;
}

TEST(DecodingTest, StoresTheTagsOfTheVocabulary) {
  for (const uint32_t number :
       {6U,  7U,  8U,  9U,  10U, 11U, 12U, 13U, 14U, 15U, 16U, 17U, 18U, 19U, 20U, 21U, 22U, 23U,
        24U, 25U, 26U, 27U, 28U, 29U, 30U, 31U, 34U, 36U, 38U, 40U, 42U, 44U, 46U, 64U, 66U, 68U}) {
    const BuildAttributes attributes = decoded(tag(number, 3));
    EXPECT_TRUE(attributes.hasTag(number)) << number;
    EXPECT_EQ(attributes.getNumericTag(number), 3u) << number;
    const uint32_t kept = number == Tag_CPU_arch ? 0x103 : 3;
    EXPECT_EQ(decoded(tag(number, 0x103)).getNumericTag(number), kept) << number;
  }
  // One field for both.
  EXPECT_EQ(decoded(tag(70, 5)).getNumericTag(42), 5u);
  EXPECT_EQ(decoded(tag(42, 5) + tag(70, 6)).getNumericTag(42), 6u);
}

TEST(DecodingTest, LeavesOtherTagsInTheBytes) {
  const BuildAttributes attributes = decoded(tag(48, 1) + tag(62, 1) + tag(72, 1) +
                                             tag(0x80000000, 1) + tag(33, "x") + tag(69, "y"));
  EXPECT_EQ(attributes, BuildAttributes());
}

TEST(DecodingTest, KeepsTexts) {
  const BuildAttributes attributes = decoded(tag(4, "raw") + tag(5, "name") + tag(67, "2.09"));
  EXPECT_EQ(attributes.getStringTag(4), "raw");
  EXPECT_EQ(attributes.getStringTag(5), "name");
  EXPECT_EQ(attributes.getStringTag(67), "2.09");
  EXPECT_EQ(decoded(tag(5, std::string(100, 'x'))).getStringTag(5), std::string(31, 'x'));
}

TEST(DecodingTest, FollowsTheGoalsInTheFlags) {
  for (uint32_t value = 0; value < 6; ++value) {
    BuildAttributes attributes = decoded(tag(30, value));
    const uint64_t goal = value == 1 || value == 2 ? 0x30000 : 0x10000;
    EXPECT_EQ(attributes.getFullAttr().m_Flags & 0x30000, goal) << value;
  }
}

TEST(DecodingTest, CollectsCompatibleVendors) {
  const BuildAttributes attributes =
      decoded(tag(67, "2.09") + tag(32, 1, "a") + tag(32, 300, "b") + tag(32, 1, "a"));
  ASSERT_EQ(attributes.getCompatibilityTagCount(), 2u);
  CompatibilityTag entry;
  attributes.getCompatibilityTag(1, entry);
  EXPECT_EQ(entry.flag, 300u);
  EXPECT_EQ(entry.vendor, "b");
  EXPECT_FALSE(attributes.hasTag(67));
  EXPECT_FALSE(decoded(tag(32, 1, "a") + tag(67, "2.09")).hasTag(67));
}

TEST(DecodingTest, CollectsWhatElseIsCompatible) {
  const std::string zero(1, '\0');
  const BuildAttributes attributes =
      decoded("\x41" + tag(6, 11) + zero + "\x41" + tag(5, "cpu") + "\x41" + tag(32, 1, "v") +
              "\x41" + tag(6, 11) + zero + "\x41" + tag(6 + 128, 11) + zero + "\x41" + tag(6, 0));
  ASSERT_EQ(attributes.getAlsoCompatibilityTagCount(), 4u);
  const AlsoCompatibilityTag wanted[] = {{6, 11, {}}, {5, {}, "cpu"}, {32, 1, "v"}, {6, 0, {}}};
  for (uint32_t i = 0; i < 4; ++i) {
    AlsoCompatibilityTag entry;
    attributes.getAlsoCompatibilityTag(i, entry);
    EXPECT_EQ(entry, wanted[i]) << i;
  }
}

// Equal entries that were there before count too.
TEST(DecodingTest, AddsToWhatIsThere) {
  BuildAttributes attributes =
      decoded(tag(32, 1, "a") + "\x41" + tag(6, 0) + tag(6, 1) + tag(7, 65));
  const std::string run = tag(32, 1, "a") + tag(32, 2, "a") + "\x41" + tag(6, 0) + tag(6, 2);
  EXPECT_TRUE(QobixBuildAttributesDecodingParser(attributes).parse(bytesOf(run)));
  EXPECT_EQ(attributes.getCompatibilityTagCount(), 2u);
  EXPECT_EQ(attributes.getAlsoCompatibilityTagCount(), 1u);
  EXPECT_EQ(attributes.getNumericTag(6), 2u);
  EXPECT_EQ(attributes.getNumericTag(7), 65u);
}

TEST(DecodingTest, KeepsWhatStandsBeforeAFault) {
  BuildAttributes attributes;
  EXPECT_FALSE(QobixBuildAttributesDecodingParser(attributes)
                   .parse(bytesOf(tag(6, 10) + tag(3, 1) + tag(7, 65))));
  EXPECT_EQ(attributes.getNumericTag(6), 10u);
  EXPECT_FALSE(attributes.hasTag(7));
}

TEST(DecodingTest, StoresTagsOfVendorZev) {
  for (uint32_t number = 4; number <= 22; number += 2) {
    BuildAttributes attributes;
    EXPECT_TRUE(ZevBuildAttributesDecodingParser(attributes).parse(bytesOf(tag(number, 0x102))));
    EXPECT_EQ(attributes.getNumericTag(static_cast<ZevTag>(number)), 2u) << number;
  }
  BuildAttributes attributes;
  EXPECT_TRUE(ZevBuildAttributesDecodingParser(attributes)
                  .parse(bytesOf(tag(24, 1) + tag(0xFFFFFFFE, 1) + tag(5, "x"))));
  EXPECT_EQ(attributes, BuildAttributes());
  // Through the setter, with what follows from it.
  ZevBuildAttributesDecodingParser(attributes).parse(bytesOf(tag(4, 1) + tag(14, 1)));
  EXPECT_EQ(attributes.getCompatibilityTagCount(), 1u);
  EXPECT_TRUE(attributes.hasTag(Tag_ABI_align_needed));
  EXPECT_EQ(attributes.getNumericTag(Tag_ABI_align_needed), 0u);
}

// ---- From tags to bytes and back

TEST(DecodingTest, ReadsWhatWasEncoded) {
  std::string wanted;
  for (const uint32_t number :
       {6U,  7U,  8U,  9U,  40U, 10U, 11U, 12U, 13U, 14U, 15U, 16U, 17U, 18U, 19U, 20U, 21U, 22U,
        23U, 24U, 25U, 26U, 27U, 28U, 29U, 30U, 31U, 34U, 36U, 38U, 46U, 64U, 66U, 68U, 42U, 44U})
    wanted += tag(number, number % 5);
  const std::string first = tag(4, "raw") + tag(5, "name");
  const std::string lists = tag(32, 1, "b") + tag(32, 300, "a") + "\x41" + tag(6, 0) + "\x41" +
                            tag(6, 3) + std::string(1, '\0') + "\x41" + tag(5, "cpu");
  BuildAttributes attributes = decoded(first + wanted + lists);
  std::string encoded;
  attributes.encodeQobix(encoded);
  EXPECT_EQ(encoded, first + wanted + lists);
  EXPECT_EQ(decoded(encoded), attributes);
  encoded.clear();
  decoded(tag(6, 1) + tag(67, "2.09")).encodeQobix(encoded);
  EXPECT_EQ(encoded, tag(67, "2.09") + tag(6, 1));
  std::string zev;
  for (uint32_t number = 22; number >= 4; number -= 2)
    ZevBuildAttributesDecodingParser(attributes).parse(bytesOf(tag(number, 1)));
  attributes.encodeZev(zev);
  std::string all;
  for (uint32_t number = 4; number <= 22; number += 2)
    all += tag(number, 1);
  EXPECT_EQ(zev, all);
}

TEST(DecodingTest, EncodesUnknownTagsInRisingOrder) {
  BuildAttributes attributes;
  attributes.setNumericTag(300, 1);
  attributes.setStringTag(71, "x");
  attributes.setNumericTag(48, 2);
  attributes.setStringTag(33, "y");
  attributes.setNumericTag(0x80000000, 3);
  std::string encoded;
  attributes.encodeQobix(encoded);
  EXPECT_EQ(encoded, tag(33, "y") + tag(48, 2) + tag(71, "x") + tag(300, 1) + tag(0x80000000, 3));
}

} // namespace
} // namespace elfext
