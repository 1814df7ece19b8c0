// SPDX-License-Identifier: Apache-2.0
//
// The one walk by which attributes of objects are read: section, subsections by vendor,
// sub-subsections by scope, runs. Every length is held against the bytes that are left, in size_t,
// before a view is made of them, and counts itself, so each step goes forward. What is wrong within
// a part costs that part; a length that can't be right costs all behind it, as nobody knows where
// the next part starts.
//
// Lists of indices are handed over as one array that serves again for each list. Nothing is
// reserved for what a section claims, as it claims nothing but lengths of bytes that are there.
#include "elfext/interface/build_attributes_parsers.h"

#include "elfext/src/attributes/standard_tags.h"
#include "elfext/src/bytes/elf_records.h"
#include "elfext/src/bytes/leb128.h"

#include <algorithm>
#include <vector>

namespace elfext {

namespace {

constexpr size_t LengthSize = 4;
constexpr uint8_t FormatVersion = 'A';

// The text at `position`, and a step behind its terminator; false if there is none.
bool readText(AttributeBytes bytes, size_t& position, std::string_view& text) {
  const AttributeBytes rest = bytes.subspan(position);
  const auto end = std::find(rest.begin(), rest.end(), uint8_t{0});
  // A text without its zero would be read on into what follows.
  if (end == rest.end()) return false;
  text = {reinterpret_cast<const char*>(rest.data()), static_cast<size_t>(end - rest.begin())};
  position += text.size() + 1;
  return true;
}

// The sub-subsections of one subsection. What is wrong with one of them is noted.
class SubsectionWalk {
public:
  SubsectionWalk(BuildAttributesSectionParser& parser, std::vector<uint32_t>& indices,
                 bool isLittleEndian)
      : m_Parser(parser), m_Indices(indices), m_IsLittleEndian(isLittleEndian) {}

  // The bytes behind the length. False if something was noted.
  bool walk(AttributeBytes bytes) {
    size_t position = 0;
    if (!readText(bytes, position, m_Vendor)) return false;
    while (position < bytes.size()) {
      size_t size = 0;
      if (!walkSubSubsection(bytes.subspan(position), size)) return false;
      position += size;
    }
    return m_IsWell;
  }

private:
  // False if the rest of the subsection has to be passed over.
  bool walkSubSubsection(AttributeBytes bytes, size_t& size) {
    size_t position = 0;
    uint32_t kind = 0;
    if (!readUleb(bytes, position, kind) || !isAttributeScope(kind)) return false;
    if (bytes.size() - position < LengthSize) return false;
    size = getWord<uint32_t>(bytes.data() + position, m_IsLittleEndian);
    position += LengthSize;
    // The size counts the kind and itself: a smaller one would lead back into them.
    if (size < position || size > bytes.size()) return false;
    if (!handOver(kind, bytes.subspan(position, size - position))) m_IsWell = false;
    return true;
  }

  bool handOver(uint32_t kind, AttributeBytes payload) {
    if (kind == Tag_File) return m_Parser.parseFileSubSubsection(m_Vendor, payload);
    // An index with a zero byte in it has more bytes than it needs, and ends the list early:
    // readIndices tells that.
    const auto end = std::find(payload.begin(), payload.end(), uint8_t{0});
    if (end == payload.end()) return false;
    const auto listSize = static_cast<size_t>(end - payload.begin());
    const bool isListWell = readIndices(payload.first(listSize));
    const AttributeBytes attributes = payload.subspan(listSize + 1);
    const bool isTaken = kind == Tag_Section
                             ? m_Parser.parseSectionSubSubsection(m_Vendor, m_Indices, attributes)
                             : m_Parser.parseSymbolSubSubsection(m_Vendor, m_Indices, attributes);
    return isTaken && isListWell;
  }

  // Those before a bad one are kept.
  bool readIndices(AttributeBytes list) {
    m_Indices.clear();
    for (size_t position = 0; position < list.size();) {
      uint32_t index = 0;
      if (!readUleb(list, position, index) || index == 0) return false;
      m_Indices.push_back(index);
    }
    return true;
  }

  BuildAttributesSectionParser& m_Parser;
  std::vector<uint32_t>& m_Indices;
  bool m_IsLittleEndian;
  std::string_view m_Vendor;
  bool m_IsWell = true;
};

} // namespace

bool BuildAttributesSectionParser::parse(AttributeBytes section, bool isLittleEndian) {
  if (section.empty() || section[0] != FormatVersion) return false;
  std::vector<uint32_t> indices;
  // More than most lists have.
  indices.reserve(256);
  bool isWell = true;
  for (size_t position = 1; position < section.size();) {
    const AttributeBytes rest = section.subspan(position);
    if (rest.size() < LengthSize) return false;
    const auto length = getWord<uint32_t>(rest.data(), isLittleEndian);
    if (length <= LengthSize || length > rest.size()) return false;
    SubsectionWalk walk(*this, indices, isLittleEndian);
    if (!walk.walk(rest.subspan(LengthSize, length - LengthSize))) isWell = false;
    position += length;
  }
  return isWell;
}

// ---- Vendor "qobix"

bool QobixBuildAttributesSubSubsectionParser::parse(AttributeBytes run) {
  bool isWell = true;
  for (size_t position = 0; position < run.size();) {
    uint32_t tag = 0;
    if (!readUleb(run, position, tag) || tag < FirstAttributeTag) return false;
    const bool hasBoth = BuildAttributesTagClassifier::isQobixNumericAndStringTag(tag);
    const bool hasNumber = hasBoth || BuildAttributesTagClassifier::isQobixNumericTag(tag);
    uint32_t value = 0;
    std::string_view text;
    if (hasNumber && !readUleb(run, position, value)) return false;
    if ((hasBoth || !hasNumber) && !readText(run, position, text)) return false;
    bool isTaken = false;
    if (tag == Tag_also_compatible_with)
      isTaken = parseNested(text);
    else if (hasBoth)
      isTaken = numericAndStringTag(tag, value, text);
    else
      isTaken = hasNumber ? numericTag(tag, value) : stringTag(tag, text);
    // What is refused ends nothing: the next attribute is found all the same.
    isWell = isWell && isTaken;
  }
  return isWell;
}

// The text holds an attribute, whose own end is that of the text too: a number of 0 and a text
// need no further zero.
bool QobixBuildAttributesSubSubsectionParser::parseNested(std::string_view text) {
  // The text's own zero counts, which readText has found.
  const AttributeBytes bytes(reinterpret_cast<const uint8_t*>(text.data()), text.size() + 1);
  size_t position = 0;
  uint32_t tag = 0;
  if (!readUleb(bytes, position, tag) || tag < FirstAttributeTag) return false;
  const bool hasBoth = BuildAttributesTagClassifier::isQobixNumericAndStringTag(tag);
  const bool hasNumber = hasBoth || BuildAttributesTagClassifier::isQobixNumericTag(tag);
  uint32_t value = 0;
  std::string_view nested;
  if (hasNumber) {
    if (!readUleb(bytes, position, value)) return false;
    if (position + 1 == bytes.size() && bytes[position] == 0) ++position;
  }
  if ((hasBoth || !hasNumber) && !readText(bytes, position, nested)) return false;
  if (position != bytes.size()) return false;
  if (hasBoth) return nestedNumericAndStringTag(tag, value, nested);
  return hasNumber ? nestedNumericTag(tag, value) : nestedStringTag(tag, nested);
}

QobixBuildAttributesDecodingParser::QobixBuildAttributesDecodingParser(BuildAttributes& attributes)
    : m_Attributes(attributes) {
  for (uint32_t i = 0; i < attributes.getCompatibilityTagCount(); ++i) {
    CompatibilityTag entry;
    attributes.getCompatibilityTag(i, entry);
    m_Compatible.insert(std::move(entry));
  }
  for (uint32_t i = 0; i < attributes.getAlsoCompatibilityTagCount(); ++i) {
    AlsoCompatibilityTag entry;
    attributes.getAlsoCompatibilityTag(i, entry);
    m_AlsoCompatible.insert(std::move(entry));
  }
}

bool QobixBuildAttributesDecodingParser::numericTag(uint32_t tag, uint32_t value) {
  // Tags that are not known stay in the block's bytes, and are no fault.
  if (placeOf(tag) == NoPlace) return true;
  m_Attributes.setNumericTag(tag, value);
  return true;
}

bool QobixBuildAttributesDecodingParser::stringTag(uint32_t tag, std::string_view text) {
  if (textPlaceOf(tag) != NoPlace) m_Attributes.setStringTag(tag, text);
  return true;
}

bool QobixBuildAttributesDecodingParser::numericAndStringTag(uint32_t, uint32_t value,
                                                             std::string_view text) {
  CompatibilityTag entry = {value, std::string(text)};
  // The set spares a look through the list for each of thousands of entries.
  if (m_Compatible.insert(entry).second) m_Attributes.appendCompatibilityTag(std::move(entry));
  return true;
}

bool QobixBuildAttributesDecodingParser::addAlsoCompatible(AlsoCompatibilityTag entry) {
  if (m_AlsoCompatible.insert(entry).second) m_Attributes.addAlsoCompatibilityTag(std::move(entry));
  return true;
}

bool QobixBuildAttributesDecodingParser::nestedNumericTag(uint32_t tag, uint32_t value) {
  return addAlsoCompatible({tag, value, {}});
}

bool QobixBuildAttributesDecodingParser::nestedStringTag(uint32_t tag, std::string_view text) {
  return addAlsoCompatible({tag, {}, std::string(text)});
}

bool QobixBuildAttributesDecodingParser::nestedNumericAndStringTag(uint32_t tag, uint32_t value,
                                                                   std::string_view text) {
  return addAlsoCompatible({tag, value, std::string(text)});
}

// ---- Vendor "ZEV"

bool ZevBuildAttributesSubSubsectionParser::parse(AttributeBytes run) {
  bool isWell = true;
  for (size_t position = 0; position < run.size();) {
    uint32_t tag = 0;
    if (!readUleb(run, position, tag) || tag < FirstAttributeTag) return false;
    uint32_t value = 0;
    std::string_view text;
    if (BuildAttributesTagClassifier::isZevStringTag(tag)) {
      if (!readText(run, position, text)) return false;
    } else {
      if (!readUleb(run, position, value)) return false;
      if (!numericTag(tag, value)) isWell = false;
    }
  }
  return isWell;
}

bool ZevBuildAttributesDecodingParser::numericTag(uint32_t tag, uint32_t value) {
  const auto zevTag = static_cast<ZevTag>(tag);
  if (placeOf(zevTag) != NoPlace) m_Attributes.setNumericTag(zevTag, value);
  return true;
}

} // namespace elfext
