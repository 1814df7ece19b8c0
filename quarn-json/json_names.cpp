// SPDX-License-Identifier: Apache-2.0
//
// What begins a character of UTF-8 says how many bytes follow, and within which bounds the first of
// them must be; the others are all alike. The library replaces what is none when it writes.
#include "quarn-json/json_names.h"

#include <nlohmann/json.hpp>

#include <cstdint>

namespace quarn_json {

namespace {

struct Lead {
  uint8_t first;
  uint8_t last;
  uint8_t following; // bytes behind it
  uint8_t secondFirst;
  uint8_t secondLast;
};

constexpr uint8_t FollowingFirst = 0x80;
constexpr uint8_t FollowingLast = 0xBF;

constexpr Lead Leads[] = {
    {0x00, 0x7F, 0, FollowingFirst, FollowingLast}, {0xC2, 0xDF, 1, FollowingFirst, FollowingLast},
    {0xE0, 0xE0, 2, 0xA0, FollowingLast},           {0xE1, 0xEC, 2, FollowingFirst, FollowingLast},
    {0xED, 0xED, 2, FollowingFirst, 0x9F},          {0xEE, 0xEF, 2, FollowingFirst, FollowingLast},
    {0xF0, 0xF0, 3, 0x90, FollowingLast},           {0xF1, 0xF3, 3, FollowingFirst, FollowingLast},
    {0xF4, 0xF4, 3, FollowingFirst, 0x8F},
};

// The bytes of the character in front; 0 if there is none.
size_t characterSize(std::string_view bytes) {
  const auto at = [bytes](size_t i) { return static_cast<uint8_t>(bytes[i]); };
  for (const Lead& lead : Leads) {
    if (at(0) < lead.first || at(0) > lead.last) continue;
    if (bytes.size() <= lead.following) return 0;
    if (lead.following == 0) return 1;
    if (at(1) < lead.secondFirst || at(1) > lead.secondLast) return 0;
    for (size_t i = 2; i <= lead.following; ++i)
      if (at(i) < FollowingFirst || at(i) > FollowingLast) return 0;
    return lead.following + size_t{1};
  }
  return 0;
}

std::string hexOf(std::string_view bytes) {
  constexpr std::string_view Digits = "0123456789abcdef";
  std::string hex;
  hex.reserve(2 * bytes.size());
  for (const char byte : bytes) {
    hex += Digits[static_cast<uint8_t>(byte) >> 4];
    hex += Digits[static_cast<uint8_t>(byte) & 15];
  }
  return hex;
}

} // namespace

bool isUtf8(std::string_view bytes) {
  while (!bytes.empty()) {
    const size_t size = characterSize(bytes);
    if (size == 0) return false;
    bytes.remove_prefix(size);
  }
  return true;
}

void putName(Json& object, const std::string& field, std::string_view bytes) {
  object[field] = bytes;
  if (!isUtf8(bytes)) object[field + "Bytes"] = hexOf(bytes);
}

std::string lineOf(const Json& value) {
  return value.dump(-1, ' ', false, Json::error_handler_t::replace);
}

} // namespace quarn_json
