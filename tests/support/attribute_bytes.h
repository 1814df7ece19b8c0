// SPDX-License-Identifier: Apache-2.0
//
// The bytes of attribute sections, piece by piece:
//
//   const AttributePart file = filePart(tag(6, 10));
//   const AttributePart sections = sectionPart({1, 4}, tag(30, 2));
//   attributeSection({vendorPart("qobix", {file, sections})})
//
// The format: "A", then subsections of a length, a vendor's name and parts; a part is a kind (file,
// sections, symbols), a size, indices ended by 0 where the kind has them, and attributes as tag and
// value. Lengths count themselves. Whoever wants a wrong one writes the bytes around it himself.

#pragma once

#include "elfext/interface/build_attributes_tags.h"
#include "tests/support/bytes.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace testsupport {

inline std::string uleb(uint32_t value) {
  std::string bytes;
  for (; value >= 0x80; value >>= 7)
    bytes += static_cast<char>(0x80 | value);
  return bytes + static_cast<char>(value);
}

inline std::string ntbs(std::string_view text) {
  return std::string(text) + '\0';
}

// ---- Attributes

inline std::string tag(uint32_t number, uint32_t value) {
  return uleb(number) + uleb(value);
}

inline std::string tag(uint32_t number, std::string_view text) {
  return uleb(number) + ntbs(text);
}

inline std::string tag(uint32_t number, uint32_t value, std::string_view text) {
  return uleb(number) + uleb(value) + ntbs(text);
}

// ---- Parts of a section

struct AttributePart {
  uint32_t kind;
  std::string payload;
};

inline AttributePart filePart(std::string attributes) {
  return {elfext::Tag_File, std::move(attributes)};
}

inline AttributePart indexedPart(uint32_t kind, const std::vector<uint32_t>& indices,
                                 std::string_view attributes) {
  std::string payload;
  for (const uint32_t index : indices)
    payload += uleb(index);
  payload += '\0';
  payload += attributes;
  return {kind, payload};
}

inline AttributePart sectionPart(const std::vector<uint32_t>& indices,
                                 std::string_view attributes) {
  return indexedPart(elfext::Tag_Section, indices, attributes);
}

inline AttributePart symbolPart(const std::vector<uint32_t>& indices, std::string_view attributes) {
  return indexedPart(elfext::Tag_Symbol, indices, attributes);
}

inline std::string subSubsection(const AttributePart& part, bool isLittle) {
  const std::string kind = uleb(part.kind);
  return kind + word(kind.size() + 4 + part.payload.size(), isLittle) + part.payload;
}

struct VendorPart {
  std::string vendor;
  std::vector<AttributePart> parts;
};

inline VendorPart vendorPart(std::string vendor, std::vector<AttributePart> parts) {
  return {std::move(vendor), std::move(parts)};
}

// A subsection of these bytes.
inline std::string subsection(std::string_view bytes, bool isLittle = true) {
  return word(4 + bytes.size(), isLittle) + std::string(bytes);
}

inline std::string attributeSection(const std::vector<VendorPart>& vendors, bool isLittle = true) {
  std::string bytes = "A";
  for (const VendorPart& vendor : vendors) {
    std::string content = ntbs(vendor.vendor);
    for (const AttributePart& part : vendor.parts)
      content += subSubsection(part, isLittle);
    bytes += subsection(content, isLittle);
  }
  return bytes;
}

} // namespace testsupport
