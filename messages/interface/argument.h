// SPDX-License-Identifier: Apache-2.0
//
// One argument of a message. It knows its own type, so that a conversion that does not fit is found
// instead of read wrongly, and so that the length letters of a format say nothing new. It is made
// by the reporting templates of messages.h at the call and gone after it.
//
// Texts in arguments are where the outside comes in: names of members and symbols, words of the
// command line, reasons of the host. They are bytes here, and never looked at as a format.

#pragma once

#include <concepts>
#include <cstdint>
#include <string>
#include <string_view>
#include <type_traits>

namespace messages {

template <class Type>
concept IntegerArgument = std::integral<Type> && !std::same_as<Type, bool> &&
                          !std::same_as<Type, char> && sizeof(Type) <= 8;

/// A value of one conversion. It lives for one report, and holds a view of its text, not a copy.
class Argument {
public:
  enum class Kind : uint8_t { String, Character, Integer };

  /// A text is only viewed: it must outlive the call that the argument is made for. All of these
  /// are implicit, since the reporting templates exist to take plain values.
  Argument(std::string_view text) : m_Text(text), m_Kind(Kind::String) {}
  Argument(const std::string& text) : Argument(std::string_view(text)) {}
  Argument(const char* text) : Argument(std::string_view(text ? text : "(null)")) {}
  Argument(char character)
      : m_Value(static_cast<unsigned char>(character)), m_Kind(Kind::Character) {}
  template <IntegerArgument Type>
  Argument(Type value)
      : m_Value(static_cast<uint64_t>(value)), m_Kind(Kind::Integer), m_IsWide(sizeof(Type) > 4) {}

  [[nodiscard]] Kind getKind() const { return m_Kind; }
  [[nodiscard]] std::string_view getText() const { return m_Text; }
  [[nodiscard]] char getCharacter() const { return static_cast<char>(m_Value); }

  /// As in C, the conversion decides whether the bits are read as signed: an unsigned 32-bit
  /// argument of 0xFFFFFFFF shows as -1 under %d.
  [[nodiscard]] int64_t getSigned() const {
    return m_IsWide ? static_cast<int64_t>(m_Value) : static_cast<int32_t>(m_Value);
  }
  [[nodiscard]] uint64_t getUnsigned() const {
    return m_IsWide ? m_Value : static_cast<uint32_t>(m_Value);
  }

private:
  std::string_view m_Text;
  uint64_t m_Value = 0;
  Kind m_Kind;
  bool m_IsWide = false;
};

} // namespace messages
