// SPDX-License-Identifier: Apache-2.0
//
// From a key to the 32-bit number that chooses its bucket. Pointer hashes differ from run to run,
// which is one reason why nothing that a table exports may reach a file unsorted.

#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <type_traits>

namespace elfext {

template <class Key>
using HashFunction = uint32_t (*)(const Key* key);

/// The hash of a text: times 31 plus the byte, for each byte, from 0. The empty text has 0.
[[nodiscard]] constexpr uint32_t hashText(std::string_view text) {
  uint32_t hash = 0;
  for (char character : text)
    hash = hash * 31 + static_cast<unsigned char>(character);
  return hash;
}

[[nodiscard]] inline uint32_t hashAddress(const void* pointer) {
  // The low bits of an aligned address say nothing.
  return static_cast<uint32_t>(reinterpret_cast<uintptr_t>(pointer)) >> 4;
}

[[nodiscard]] constexpr uint32_t hashInteger(uint32_t value) {
  return value;
}

[[nodiscard]] constexpr uint32_t hashInteger(uint64_t value) {
  return static_cast<uint32_t>(value >> 32) ^ static_cast<uint32_t>(value);
}

/// The usual hash for a type of key; a type of a client's own has getHash().
template <class Key>
[[nodiscard]] uint32_t hashKey(const Key* key) {
  if constexpr (std::is_pointer_v<Key>)
    return hashAddress(*key);
  else if constexpr (std::is_integral_v<Key> || std::is_enum_v<Key>)
    return hashInteger(static_cast<std::conditional_t<sizeof(Key) == 8, uint64_t, uint32_t>>(*key));
  else if constexpr (std::is_same_v<Key, std::string_view>)
    return hashText(*key);
  else
    return key->getHash();
}

} // namespace elfext
