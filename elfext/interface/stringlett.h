// SPDX-License-Identifier: Apache-2.0
//
// A text as a key: a pointer with the text's hash, which is computed once.
//
// It is the key of tables by text: the bytes are compared only where the hashes are equal. Whoever
// owns the text keeps it as long as the key.

#pragma once

#include <cstdint>

namespace elfext {

class Stringlett {
public:
  /// The text, which may be null, is not copied.
  explicit Stringlett(const char* text);

  [[nodiscard]] const char* getText() const { return m_Text; }
  /// 0 for a null text.
  [[nodiscard]] uint32_t getHash() const { return m_Hash; }

  /// Whether both texts are null, or the same bytes.
  [[nodiscard]] bool operator==(const Stringlett& other) const;

private:
  const char* m_Text;
  uint32_t m_Hash;
};

} // namespace elfext
