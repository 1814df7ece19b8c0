// SPDX-License-Identifier: Apache-2.0
// The scanner of formats. Formats are the tool's own, so a fault in one is a fault of the program;
// it is found here, and told by the caller.
#include "messages/interface/format.h"

#include "messages/src/conversion.h"

#include <algorithm>
#include <limits>
#include <optional>

namespace messages {

namespace {

constexpr uint32_t LargestNumberInFormat = std::numeric_limits<int32_t>::max();

bool isDigit(char character) {
  return character >= '0' && character <= '9';
}

class FormatScanner {
public:
  FormatScanner(std::string& text, std::string_view format, std::span<const Argument> arguments)
      : m_Text(text), m_Rest(format), m_Arguments(arguments) {}

  FormatStatus run();

private:
  // How the format names its arguments; the two ways don't mix.
  enum Order : uint8_t { Order_Unknown, Order_Sequential, Order_Positional };

  bool fail(FormatStatus status) {
    m_Status = status;
    return false;
  }
  bool skip(char character);
  void copyLiteral();
  uint32_t readNumber();
  std::optional<uint32_t> readPosition();
  void readFlags(Conversion& conversion);
  bool readStar(int32_t& value);
  bool readWidth(Conversion& conversion);
  bool readPrecision(Conversion& conversion);
  bool setOrder(Order order);
  const Argument* takeArgument(std::optional<uint32_t> position);
  bool convert();
  bool appendArgument(const Conversion& conversion, const Argument& argument);

  std::string& m_Text;
  std::string_view m_Rest; // of the format
  std::span<const Argument> m_Arguments;
  uint32_t m_TakenCount = 0; // in sequential order
  Order m_Order = Order_Unknown;
  FormatStatus m_Status = FormatStatus_Done;
};

FormatStatus FormatScanner::run() {
  copyLiteral();
  while (!m_Rest.empty()) {
    m_Rest.remove_prefix(1); // the "%"
    if (skip('%')) {
      m_Text += '%';
    } else if (!convert()) {
      return m_Status;
    }
    copyLiteral();
  }
  return FormatStatus_Done;
}

bool FormatScanner::skip(char character) {
  if (!m_Rest.starts_with(character)) return false;
  m_Rest.remove_prefix(1);
  return true;
}

void FormatScanner::copyLiteral() {
  const size_t length = std::min(m_Rest.find('%'), m_Rest.size());
  m_Text.append(m_Rest.substr(0, length));
  m_Rest.remove_prefix(length);
}

// Stops growing beyond the largest number.
uint32_t FormatScanner::readNumber() {
  uint64_t number = 0;
  for (; !m_Rest.empty() && isDigit(m_Rest.front()); m_Rest.remove_prefix(1)) {
    number = std::min<uint64_t>(number * 10 + static_cast<uint64_t>(m_Rest.front() - '0'),
                                uint64_t{LargestNumberInFormat} + 1);
  }
  return static_cast<uint32_t>(number);
}

// Reads "2$", if a position stands here.
std::optional<uint32_t> FormatScanner::readPosition() {
  const std::string_view start = m_Rest;
  const uint32_t position = readNumber();
  if (m_Rest.size() < start.size() && skip('$')) return position;
  m_Rest = start;
  return std::nullopt;
}

void FormatScanner::readFlags(Conversion& conversion) {
  for (;; m_Rest.remove_prefix(1)) {
    switch (m_Rest.empty() ? '\0' : m_Rest.front()) {
    case '-':
      conversion.isLeftAligned = true;
      break;
    case '+':
      conversion.showsPlus = true;
      break;
    case ' ':
      conversion.showsBlank = true;
      break;
    case '#':
      conversion.isAlternate = true;
      break;
    case '0':
      conversion.isZeroPadded = true;
      break;
    default:
      return;
    }
  }
}

// Reads the number that an argument holds in the place of a "*".
bool FormatScanner::readStar(int32_t& value) {
  const Argument* argument = takeArgument(readPosition());
  if (!argument) return false;
  const bool isNumber = argument->kind() == Argument::Kind_Integer;
  if (!isNumber || argument->signedValue() != static_cast<int32_t>(argument->signedValue())) {
    return fail(FormatStatus_BadFormat);
  }
  value = static_cast<int32_t>(argument->signedValue());
  return true;
}

bool FormatScanner::readWidth(Conversion& conversion) {
  if (!skip('*')) {
    conversion.width = readNumber();
    return conversion.width <= LargestNumberInFormat || fail(FormatStatus_BadFormat);
  }
  int32_t width = 0;
  if (!readStar(width)) return false;
  if (width < 0) conversion.isLeftAligned = true;
  conversion.width = static_cast<size_t>(width < 0 ? -int64_t{width} : width);
  return true;
}

bool FormatScanner::readPrecision(Conversion& conversion) {
  if (!skip('.')) return true;
  conversion.hasPrecision = true;
  if (!skip('*')) {
    conversion.precision = readNumber();
    return conversion.precision <= LargestNumberInFormat || fail(FormatStatus_BadFormat);
  }
  int32_t precision = 0;
  if (!readStar(precision)) return false;
  conversion.hasPrecision = precision >= 0;
  conversion.precision = static_cast<size_t>(std::max(precision, 0));
  return true;
}

bool FormatScanner::setOrder(Order order) {
  if (m_Order != Order_Unknown && m_Order != order) return fail(FormatStatus_BadFormat);
  m_Order = order;
  return true;
}

// Positions count from 1; without one it is the next argument in turn. Null if there is no such
// argument.
const Argument* FormatScanner::takeArgument(std::optional<uint32_t> position) {
  if (!setOrder(position ? Order_Positional : Order_Sequential)) return nullptr;
  if (position == 0u) {
    fail(FormatStatus_BadFormat);
    return nullptr;
  }
  const uint32_t index = position ? *position - 1 : m_TakenCount++;
  if (index >= MostFormatArguments) {
    fail(FormatStatus_TooManyArguments);
    return nullptr;
  }
  if (index >= m_Arguments.size()) {
    fail(FormatStatus_BadFormat);
    return nullptr;
  }
  return &m_Arguments[index];
}

// One conversion, from behind its "%".
bool FormatScanner::convert() {
  Conversion conversion;
  const std::optional<uint32_t> position = readPosition();
  readFlags(conversion);
  if (!readWidth(conversion) || !readPrecision(conversion)) return false;
  m_Rest.remove_prefix(std::min(m_Rest.find_first_not_of("hljztL"), m_Rest.size()));
  if (m_Rest.empty()) return fail(FormatStatus_BadFormat);
  conversion.letter = m_Rest.front();
  m_Rest.remove_prefix(1);
  const Argument* argument = takeArgument(position);
  if (!argument) return false;
  return appendArgument(conversion, *argument) || fail(FormatStatus_BadFormat);
}

// False if the conversion is none of ours, or not one for this kind of argument.
bool FormatScanner::appendArgument(const Conversion& conversion, const Argument& argument) {
  switch (argument.kind()) {
  case Argument::Kind_String:
    if (conversion.letter != 's') return false;
    appendString(m_Text, conversion, argument.text());
    return true;
  case Argument::Kind_Character:
    if (conversion.letter != 'c') return false;
    appendCharacter(m_Text, conversion, argument.character());
    return true;
  case Argument::Kind_Integer:
    break;
  }
  if (conversion.letter == 'd' || conversion.letter == 'i') {
    appendSigned(m_Text, conversion, argument.signedValue());
    return true;
  }
  constexpr std::string_view UnsignedLetters = "uxXo";
  if (UnsignedLetters.find(conversion.letter) == std::string_view::npos) return false;
  appendUnsigned(m_Text, conversion, argument.unsignedValue());
  return true;
}

} // namespace

FormatStatus appendFormatted(std::string& text, std::string_view format,
                             std::span<const Argument> arguments) {
  return FormatScanner(text, format, arguments).run();
}

} // namespace messages
