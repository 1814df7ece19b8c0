// SPDX-License-Identifier: Apache-2.0
//
// The dialogue with a path converter, and how long it goes on. The danger is an answer that is
// taken for another name's: the tool would then replace a wrong file. So no converter is asked
// again after anything but a whole line in time; a fresh one has no answers left over.

#include "support/interface/path_converter.h"

#include "support/interface/letters.h"

#include <cstddef>
#include <utility>

namespace support {

namespace {

// An answer with its line end: the room that the host's plain calls have for a name.
constexpr size_t LongestAnswer = 260;

// A name on which a fresh converter breaks, too, is the name's fault; this many of them one after
// the other are the converter's. So one that always breaks is started six times in a run.
constexpr int MostBreaksInARow = 3;

bool isSeparator(char character) {
  return character == '/' || character == '\\';
}

bool isHostsOwnName(std::string_view name) {
  if (name.starts_with('"')) name.remove_prefix(1);
  if (name.starts_with("\\\\")) return true;
  return name.size() >= 3 && isLetter(name[0]) && name[1] == ':' && isSeparator(name[2]);
}

// A name is a line. Converters end at an empty one.
bool canBeAskedFor(std::string_view name) {
  return !name.empty() && name.find('\n') == std::string_view::npos && !isHostsOwnName(name);
}

void replaceAll(std::string& text, std::string_view what, char replacement) {
  for (size_t place = text.find(what); place != std::string::npos; place = text.find(what, place))
    text.replace(place, what.size(), 1, replacement);
}

// Converters write wildcards as characters of the private use area, since the host's files can't
// have them in their names. In a pattern they are wanted as they were.
void restoreWildcards(std::string& answer) {
  replaceAll(answer, "\xEF\x80\xAA", '*');
  replaceAll(answer, "\xEF\x80\xBF", '?');
}

// The answer as a name; `name` if it is none.
std::string nameFrom(std::string answer, std::string_view name) {
  answer.erase(answer.find_last_not_of("\r\n") + 1);
  if (answer.empty() || answer.find('\0') != std::string::npos) return std::string(name);
  if (name.find_first_of("*?") != std::string_view::npos) restoreWildcards(answer);
  return answer;
}

} // namespace

std::string PathConverter::convert(std::string_view name) {
  if (!canBeAskedFor(name)) return std::string(name);
  const auto known = m_Converted.find(name);
  if (known != m_Converted.end()) return known->second;
  return m_Converted.emplace(name, ask(name)).first->second;
}

std::string PathConverter::ask(std::string_view name) {
  if (m_IsOff) return std::string(name);
  const ConverterDeadline deadline = std::chrono::steady_clock::now() + m_Patience;
  std::string answer;
  ConverterReply reply = converse(name, answer, deadline);
  if (reply == ConverterReply::Broken) reply = converse(name, answer, deadline);
  countBreaks(reply);
  if (reply != ConverterReply::Done) return std::string(name);
  return nameFrom(std::move(answer), name);
}

ConverterReply PathConverter::converse(std::string_view name, std::string& answer,
                                       ConverterDeadline deadline) {
  if (!m_IsRunning && !m_Process.start()) {
    m_IsOff = true;
    return ConverterReply::Unusable;
  }
  m_IsRunning = true;
  ConverterReply reply = m_Process.send(std::string(name) + '\n', deadline);
  if (reply == ConverterReply::Done) reply = m_Process.readLine(answer, LongestAnswer, deadline);
  if (reply == ConverterReply::Done) return reply;

  m_Process.end();
  m_IsRunning = false;
  // The next name would wait as long.
  if (reply == ConverterReply::Late) m_IsOff = true;
  return reply;
}

void PathConverter::countBreaks(ConverterReply reply) {
  m_BreaksInARow = reply == ConverterReply::Broken ? m_BreaksInARow + 1 : 0;
  if (m_BreaksInARow == MostBreaksInARow) m_IsOff = true;
}

} // namespace support
