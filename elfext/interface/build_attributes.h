// SPDX-License-Identifier: Apache-2.0
//
// All that is known of how some code was built: tags, as they stand in an object's attribute
// section, and the same knowledge as a record (full_attr.h), on which comparisons work. Each is
// derived from the other: the record from the tags when it is asked for, the tags from the record
// where an object states its attributes as text.
//
// A set that is not valid holds nothing; it is the result of putting together what can't be.
#pragma once

#include "elfext/interface/build_attributes_tags.h"
#include "elfext/interface/full_attr.h"
#include "elfext/interface/owned_value.h"

#include <array>
#include <compare>
#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace elfext {

/// An instance of Tag_compatibility.
struct CompatibilityTag {
  uint32_t flag = 0;
  std::string vendor;

  friend auto operator<=>(const CompatibilityTag&, const CompatibilityTag&) = default;
};

/// An instance of Tag_also_compatible_with: another attribute, under which the code could be used
/// too.
struct AlsoCompatibilityTag {
  AlsoCompatibilityTag() = default;
  /// Of the tag, the low seven bits are kept.
  AlsoCompatibilityTag(uint32_t wholeTag, std::optional<uint32_t> itsNumber,
                       std::optional<std::string> itsText)
      : tag(wholeTag & 0x7F), number(itsNumber), text(std::move(itsText)) {}

  uint32_t tag = 0;
  std::optional<uint32_t> number;
  std::optional<std::string> text;

  friend auto operator<=>(const AlsoCompatibilityTag&, const AlsoCompatibilityTag&) = default;
};

/// What code built for one more architecture number says of itself.
[[nodiscard]] AlsoCompatibilityTag alsoForArchitecture(uint32_t number);

class BuildAttributes {
public:
  /// Valid, with the default record and no tag.
  BuildAttributes() = default;
  /// With the record of a text, and the tags that follow from it.
  explicit BuildAttributes(std::string_view attributeText);

  /// False only of what a set operation made of an invalid set, or of two that can't be combined.
  [[nodiscard]] bool isValid() const { return m_Valid; }

  /// Brought up to date with the tags.
  [[nodiscard]] const FullAttr& getFullAttr() const {
    if (m_FlagsStale) updateFullAttr();
    return m_FullAttr;
  }
  /// Makes the record anew from the tags.
  void updateFullAttr() const;
  /// Without a look at the tags.
  void setFullAttr(const FullAttr& record);

  /// Tags of vendor "qobix". Those that are not in the vocabulary are kept from 33 upwards, even
  /// ones as numbers, odd ones as texts. A tag that is not there is 0 or empty. The tags 32 and 65,
  /// whose instances are lists, can only be asked for and removed here.
  [[nodiscard]] bool hasTag(uint32_t tag) const;
  [[nodiscard]] uint32_t getNumericTag(uint32_t tag) const;
  [[nodiscard]] std::string_view getStringTag(uint32_t tag) const;
  /// Cut to a byte, but for Tag_CPU_arch; texts to 31 bytes.
  void setNumericTag(uint32_t tag, uint32_t value);
  void setStringTag(uint32_t tag, std::string_view text);
  void removeTag(uint32_t tag);

  /// Tags of vendor "ZEV". Some bring others with them, as setters say below.
  [[nodiscard]] bool hasTag(ZevTag tag) const;
  [[nodiscard]] uint32_t getNumericTag(ZevTag tag) const;
  void setNumericTag(ZevTag tag, uint32_t value);
  void removeTag(ZevTag tag);

  /// Whether it was appended: an equal one may be there. A set has either these or a conformance.
  bool addCompatibilityTag(uint32_t flag, std::string_view vendor);
  /// For callers that know that no equal one is there.
  void appendCompatibilityTag(CompatibilityTag entry);
  /// How many there were.
  uint32_t removeCompatibilityTag(std::string_view vendor);
  [[nodiscard]] uint32_t getCompatibilityTagCount() const;
  void getCompatibilityTag(uint32_t index, CompatibilityTag& result) const;

  void addAlsoCompatibilityTag(AlsoCompatibilityTag entry);
  [[nodiscard]] bool hasAlsoCompatibilityTag(const AlsoCompatibilityTag& entry) const;
  [[nodiscard]] uint32_t getAlsoCompatibilityTagCount() const;
  void getAlsoCompatibilityTag(uint32_t index, AlsoCompatibilityTag& result) const;

  /// Nothing happens where there are compatibility tags.
  void setConformance(std::string_view text);
  void setDefaultConformance();

  /// By the tags: they are the truth. Tag_Z64_ISA_use doesn't count. A list that has become empty
  /// differs from one that never was.
  [[nodiscard]] bool operator==(const BuildAttributes& other) const;
  [[nodiscard]] bool hasEqualRecordToo(const BuildAttributes& other) const;
  /// Equal sets have equal hashes.
  [[nodiscard]] size_t getHash() const;

  /// All of both; where both have a tag, that of `b`.
  [[nodiscard]] static BuildAttributes getUnion(const BuildAttributes& a, const BuildAttributes& b);
  /// What `b` says beyond `a`. A number that only `a` has comes as 0.
  [[nodiscard]] static BuildAttributes getDifference(const BuildAttributes& a,
                                                     const BuildAttributes& b);
  /// What both say.
  [[nodiscard]] static BuildAttributes getIntersection(const BuildAttributes& a,
                                                       const BuildAttributes& b);
  /// The union with the higher of the architectures; not valid where the records can't be merged.
  [[nodiscard]] static BuildAttributes getCheckedCombination(const BuildAttributes& a,
                                                             const BuildAttributes& b);

  /// Sets the tags that follow from the record.
  void deriveStandardTags();
  /// Takes PLD1 out of the features, but for processors of one family that all have it.
  void applyDefaultPld(FeatureSet& features) const;
  /// Completes tags that older compilers left out; for use after a block of vendor "qobix".
  void fixUpAfterDecoding();

  /// Appends the tags as they stand in an attribute section. Equal sets give equal bytes.
  void encodeQobix(std::string& bytes) const;
  void encodeZev(std::string& bytes) const;

private:
  friend class RecordFromTags;
  friend class TagsFromRecord;

  /// Places of the tags that are in the vocabulary: numbers of both vendors, and texts.
  static constexpr uint32_t NumberCount = 46;
  static constexpr uint32_t TextCount = 3;

  [[nodiscard]] static BuildAttributes makeInvalid();
  [[nodiscard]] bool hasNumber(uint32_t place) const { return (m_Present >> place & 1) != 0; }
  [[nodiscard]] uint32_t getNumber(uint32_t place) const;
  /// Without consequences for other tags or the record.
  void putNumber(uint32_t place, uint32_t value);
  void dropNumber(uint32_t place) { m_Present &= ~(uint64_t{1} << place); }
  void markFed(uint32_t place);
  void followZevTag(ZevTag tag);
  void followInterworking();
  void followStackAlignment();
  void encodeOtherTags(std::string& bytes) const;
  void copyMissingNumbers(const BuildAttributes& other);
  void addCompatibilityTags(const std::vector<CompatibilityTag>& entries);
  void addMissingAlsoCompatibilityTags(const std::vector<AlsoCompatibilityTag>& entries);
  void copyMissingOthers(const BuildAttributes& other);
  void copyDifferentOthers(const BuildAttributes& from, const BuildAttributes& against);

  bool m_Valid = true;
  mutable bool m_FlagsStale = false; ///< a tag that feeds the record has changed
  mutable FullAttr m_FullAttr = DefaultFullAttr;

  uint64_t m_Present = 0; ///< a bit for each number
  uint32_t m_CpuArch = 0;
  std::array<uint8_t, NumberCount> m_Numbers = {};
  std::array<std::optional<std::string>, TextCount> m_Texts;

  OwnedValue<std::vector<CompatibilityTag>> m_CompatibilityTags;
  OwnedValue<std::vector<AlsoCompatibilityTag>> m_AlsoCompatibilityTags;
  OwnedValue<std::map<uint32_t, uint32_t>> m_OtherNumericTags;
  OwnedValue<std::map<uint32_t, std::string>> m_OtherStringTags;
};

} // namespace elfext
