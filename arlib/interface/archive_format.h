// SPDX-License-Identifier: Apache-2.0
//
// The archive file format, byte for byte: get and put of each record stand here side by side, and
// nowhere else.
//
//   file     "!<arch>\n", then members, each starting at an even offset
//   member   60-byte header, contents, and a byte 0x0A where the size is odd
//   header   name 16, date 12, uid 6, gid 6, mode 8 (octal), size 10, then "`\n"; text, left-
//            justified, padded with blanks
//   name     "/" alone              the symbol table, as the first member
//            "//" alone             the long-name table, as the first or second member
//            "/" and digits         an offset in the long-name table
//            otherwise              at most 15 characters and a "/"
//   long-name table   each name, then "/\n"; found only through the offsets in the headers
//   symbol table      count, then for each symbol the header offset of its member, then for each
//                     symbol its name and a NUL; numbers are big-endian and 32 bits wide
//
// A symbol's name may carry a suffix: "$$BuildAttributes$" and the text of an attribute set.
#pragma once

#include "elfext/interface/attribute_string.h"

#include <array>
#include <cstdint>
#include <span>
#include <string_view>

namespace arlib {

constexpr std::string_view ArchiveMagic = "!<arch>\n";
constexpr std::string_view MemberMagic = "`\n";
constexpr std::string_view LongNameTerminator = "/\n";
constexpr std::string_view AttributeMarker = elfext::DecorationMarker;
constexpr uint8_t PaddingByte = 0x0A;

constexpr uint32_t MemberHeaderSize = 60;
constexpr size_t MaximumShortName = 15;
constexpr uint64_t MaximumFileSize = 0x7FFFFFFF; ///< archives and members stay below 2 GiB

/// Where a field stands in the member header, in bytes.
struct HeaderField {
  uint32_t position;
  uint32_t width;
};

constexpr HeaderField NameField = {0, 16};
constexpr HeaderField DateField = {16, 12};
constexpr HeaderField UidField = {28, 6};
constexpr HeaderField GidField = {34, 6};
constexpr HeaderField ModeField = {40, 8};
constexpr HeaderField SizeField = {48, 10};
constexpr HeaderField MagicField = {58, 2};

/// The name fields of the two tables, whole.
constexpr std::string_view SymbolTableName = "/               ";
constexpr std::string_view FileNameTableName = "//              ";
/// A symbol table with numbers of 64 bits, which some tools write for some machines.
constexpr std::string_view WideSymbolTableName = "/SYM64/         ";
static_assert(SymbolTableName.size() == NameField.width);
static_assert(WideSymbolTableName.size() == NameField.width);
static_assert(FileNameTableName.size() == NameField.width);

/// A member header of a file as text. The view lives as long as the bytes.
class MemberHeaderView {
public:
  explicit MemberHeaderView(std::span<const uint8_t, MemberHeaderSize> bytes)
      : m_Text(reinterpret_cast<const char*>(bytes.data()), bytes.size()) {}

  [[nodiscard]] std::string_view get(HeaderField field) const {
    return m_Text.substr(field.position, field.width);
  }

private:
  std::string_view m_Text;
};

/// The numbers of a member header.
struct MemberHeaderNumbers {
  uint32_t date = 0; ///< seconds since 1970
  uint32_t uid = 0;
  uint32_t gid = 0;
  uint32_t mode = 0;
  uint32_t size = 0; ///< bytes of the contents, without padding
};

/// Fills a header. The name is cut or padded to its field; a number with too many digits loses its
/// last ones, as the field has no more room.
void putMemberHeader(std::span<uint8_t, MemberHeaderSize> bytes, std::string_view name,
                     const MemberHeaderNumbers& numbers);

/// Reads a number field: blanks, digits, blanks, filling exactly `width` characters. The first
/// character that is a digit but not one of the base ends the number and is stepped over. False if
/// there is no digit, anything else stands in the field, or the number needs more than 32 bits;
/// `result` is then what had been read so far.
bool parseHeaderNumber(std::string_view text, uint32_t base, uint32_t width, uint32_t& result);

[[nodiscard]] constexpr uint64_t roundUpToEven(uint64_t value) {
  return value + (value & 1);
}

/// Whether a name goes in the long-name table. One with folders does, as a "/" ends the name in a
/// header.
constexpr bool isLongName(std::string_view name) {
  return name.size() > MaximumShortName || name.find('/') != std::string_view::npos;
}

/// Where the next header starts, for a header at `offset` whose contents have `size` bytes.
[[nodiscard]] constexpr uint64_t nextHeaderOffset(uint64_t offset, uint64_t size) {
  return roundUpToEven(offset + MemberHeaderSize + size);
}

[[nodiscard]] constexpr uint32_t getBigEndian32(const uint8_t* bytes) {
  return uint32_t{bytes[0]} << 24 | uint32_t{bytes[1]} << 16 | uint32_t{bytes[2]} << 8 |
         uint32_t{bytes[3]};
}

constexpr void putBigEndian32(uint8_t* bytes, uint32_t value) {
  bytes[0] = static_cast<uint8_t>(value >> 24);
  bytes[1] = static_cast<uint8_t>(value >> 16);
  bytes[2] = static_cast<uint8_t>(value >> 8);
  bytes[3] = static_cast<uint8_t>(value);
}

} // namespace arlib
