// SPDX-License-Identifier: Apache-2.0
//
// Walks over the bytes of an attribute section. What is found is handed to operations that a class
// of the caller's overrides. Texts and bytes that are handed over are views of the section.
//
// A section is the byte 'A' and then subsections, one a vendor: a 4-byte length that counts itself,
// the vendor's name with its terminator, and sub-subsections. One of these is a kind (file, section
// or symbol), a 4-byte size of the whole, for sections and symbols a list of indices with a zero
// behind it, and attributes. Lengths have the object's byte order; kinds, indices, tags and numbers
// are LEB128 numbers (leb128.h).
#pragma once

#include "elfext/interface/build_attributes.h"

#include <cstdint>
#include <set>
#include <span>
#include <string_view>

namespace elfext {

using AttributeBytes = std::span<const uint8_t>;

class BuildAttributesSectionParser {
public:
  virtual ~BuildAttributesSectionParser() = default;

  /// Walks a whole section, and goes on behind what is corrupted as far as the lengths allow. True
  /// if it was well formed and no operation answered false.
  bool parse(AttributeBytes section, bool isLittleEndian);

  /// Called for each sub-subsection, in file order. The indices hold only during the call.
  virtual bool parseFileSubSubsection(std::string_view, AttributeBytes) { return true; }
  virtual bool parseSectionSubSubsection(std::string_view, std::span<const uint32_t>,
                                         AttributeBytes) {
    return true;
  }
  virtual bool parseSymbolSubSubsection(std::string_view, std::span<const uint32_t>,
                                        AttributeBytes) {
    return true;
  }
};

/// A run of attributes of vendor "qobix".
class QobixBuildAttributesSubSubsectionParser {
public:
  virtual ~QobixBuildAttributesSubSubsectionParser() = default;

  /// False if the run was malformed, at which the walk ends, or an operation answered false.
  virtual bool parse(AttributeBytes run);

  virtual bool numericTag(uint32_t, uint32_t) { return true; }
  virtual bool stringTag(uint32_t, std::string_view) { return true; }
  virtual bool numericAndStringTag(uint32_t, uint32_t, std::string_view) { return true; }
  /// The attribute that Tag_also_compatible_with holds.
  virtual bool nestedNumericTag(uint32_t, uint32_t) { return true; }
  virtual bool nestedStringTag(uint32_t, std::string_view) { return true; }
  virtual bool nestedNumericAndStringTag(uint32_t, uint32_t, std::string_view) { return true; }

private:
  bool parseNested(std::string_view text);
};

/// A run of attributes of vendor "ZEV". Texts are stepped over.
class ZevBuildAttributesSubSubsectionParser {
public:
  virtual ~ZevBuildAttributesSubSubsectionParser() = default;

  bool parse(AttributeBytes run);

  virtual bool numericTag(uint32_t, uint32_t) { return true; }
};

/// Both fill a set of attributes, with what is known; the rest is only in the bytes.
class QobixBuildAttributesDecodingParser : public QobixBuildAttributesSubSubsectionParser {
public:
  explicit QobixBuildAttributesDecodingParser(BuildAttributes& attributes);

  bool numericTag(uint32_t tag, uint32_t value) override;
  bool stringTag(uint32_t tag, std::string_view text) override;
  bool numericAndStringTag(uint32_t tag, uint32_t value, std::string_view text) override;
  bool nestedNumericTag(uint32_t tag, uint32_t value) override;
  bool nestedStringTag(uint32_t tag, std::string_view text) override;
  bool nestedNumericAndStringTag(uint32_t tag, uint32_t value, std::string_view text) override;

private:
  bool addAlsoCompatible(AlsoCompatibilityTag entry);

  BuildAttributes& m_Attributes;
  /// The entries of the set: a run may have thousands, and be made so that they all hash alike.
  std::set<CompatibilityTag> m_Compatible;
  std::set<AlsoCompatibilityTag> m_AlsoCompatible;
};

class ZevBuildAttributesDecodingParser : public ZevBuildAttributesSubSubsectionParser {
public:
  explicit ZevBuildAttributesDecodingParser(BuildAttributes& attributes)
      : m_Attributes(attributes) {}

  bool numericTag(uint32_t tag, uint32_t value) override;

private:
  BuildAttributes& m_Attributes;
};

} // namespace elfext
