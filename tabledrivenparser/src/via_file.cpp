// SPDX-License-Identifier: Apache-2.0
//
// The scanner of via files, in two layers. refill reads a piece, refuses one with a NUL byte and
// drops comments, which may begin in one piece and end in another; nextToken takes words from what
// is left, character by character, with the state of quotes, parentheses and a pending backslash.
//
// A via file may be anything: a binary that was named by mistake, a file without an end, one line
// of many megabytes. A NUL ends the run before a word of its piece is taken, a word that outgrows
// the buffer ends it too, and only one piece is in memory at a time. After such a report m_LastChar
// is 0 and nothing is handed out any more.

#include "tabledrivenparser/interface/via_file.h"

#include "support/interface/letters.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/via_file_reader.h"

#include <algorithm>

namespace tabledrivenparser {

struct ViaFile::ScanState {
  bool inDoubleQuotes = false;
  bool inSingleQuotes = false;
  bool inParentheses = false;
  bool isEscapePending = false;

  [[nodiscard]] bool isQuoted() const { return inDoubleQuotes || inSingleQuotes; }
  [[nodiscard]] bool isEnclosed() const { return isQuoted() || inParentheses; }
};

namespace {

bool isLineEnd(char character) {
  return character == '\n' || character == '\r';
}

} // namespace

ViaFile::ViaFile(Parser& parser, ViaFileReader& reader, const char* name)
    : m_Parser(parser), m_Reader(&reader), m_File(reader.open(name)), m_Name(name) {
  if (isOpen()) {
    refill();
  } else {
    fail(OptionMessage::CannotOpenViaFile);
  }
}

ViaFile::ViaFile(Parser& parser, const char* name, std::string_view text)
    : m_Parser(parser), m_Name(name), m_Text(text) {}

ViaFile::~ViaFile() {
  if (isOpen()) m_Reader->close(m_File);
}

void ViaFile::close() {
  if (!isOpen()) return;
  if (!m_Reader->close(m_File)) {
    m_Parser.report(ReportLevel::Warning, OptionMessage::CannotCloseViaFile, {m_Name});
  }
  m_File = nullptr;
}

const char* ViaFile::nextToken() {
  while (support::isWhiteSpace(peek()))
    ++m_Position;
  if (peek() == '\0') m_LastChar = '\0';
  if (m_LastChar == '\0') return nullptr;

  startWord();
  ScanState state;
  for (;;) {
    const char character = peek();
    if (m_LastChar == '\0') return nullptr;
    const bool isBlank = support::isWhiteSpace(character) && !state.isEnclosed();
    if (isBlank || isLineEnd(character) || character == '\0') return finishWord(character, state);
    ++m_Position;
    if (!countCharacter()) return fail(OptionMessage::ViaFileCommandTooLong);
    scanCharacter(character, state);
  }
}

// The next character, 0 at the end of the text and once the file has failed.
char ViaFile::peek() {
  if (m_LastChar == '\0') return '\0';
  if (m_Position == m_Text.size() && !refill()) return '\0';
  return m_Text[m_Position];
}

void ViaFile::startWord() {
  // The other of the two: the caller still holds the word before.
  m_Current = 1 - m_Current;
  m_Words[m_Current].clear();
  m_PreviousLength = m_Length;
  m_Length = 1;
}

// False if the word and its neighbour have grown too long.
// Counted as it stands in the file, with its quotes, against both words together.
bool ViaFile::countCharacter() {
  ++m_Length;
  return m_Reader == nullptr || m_Length + m_PreviousLength <= BufferSize;
}

void ViaFile::scanCharacter(char character, ScanState& state) {
  if (state.isEscapePending) {
    state.isEscapePending = false;
    scanEscaped(character, state);
  } else if (character == '\\') {
    state.isEscapePending = true;
  } else if (character == '"' && !state.inSingleQuotes && !state.inParentheses) {
    state.inDoubleQuotes = !state.inDoubleQuotes;
  } else if (character == '\'' && !state.inDoubleQuotes && !state.inParentheses) {
    state.inSingleQuotes = !state.inSingleQuotes;
  } else {
    m_Words[m_Current] += character;
  }
  // Unlike a quote, a parenthesis does its work behind a backslash too.
  if (state.isQuoted()) return;
  if (character == '(') state.inParentheses = true;
  if (character == ')') state.inParentheses = false;
}

void ViaFile::scanEscaped(char character, const ScanState& state) {
  const bool isProtected = character == '"' || (character == '\\' && state.isQuoted()) ||
                           (character == '\'' && state.inSingleQuotes);
  if (!isProtected) m_Words[m_Current] += '\\';
  m_Words[m_Current] += character;
}

const char* ViaFile::finishWord(char end, const ScanState& state) {
  if (state.isEnclosed()) return fail(OptionMessage::MalformedViaFile);
  // A backslash at the end protects nothing and is a character.
  if (state.isEscapePending) m_Words[m_Current] += '\\';
  m_LastChar = end;
  return m_Words[m_Current].c_str();
}

bool ViaFile::refill() {
  if (!isOpen() || m_LastChar == '\0') return false;
  m_Position = 0;
  m_Text = {};
  // Comments leave room, and a reader may give less than it was asked for.
  while (m_Text.size() < BufferSize) {
    char* free = m_Buffer.data() + m_Text.size();
    const ptrdiff_t count = m_Reader->read(m_File, free, BufferSize - m_Text.size());
    if (count == ViaFileReader::ReadError) fail(OptionMessage::ViaFileReadError);
    if (count <= 0) break;
    const auto size = static_cast<size_t>(count);
    // Looked for in comments too: what holds a NUL is no text.
    if (std::find(free, free + size, '\0') != free + size) {
      fail(OptionMessage::NulInViaFile);
      break;
    }
    keepAllButComments(size);
  }
  return m_LastChar != '\0' && !m_Text.empty();
}

// Makes what has been read behind m_Text a part of it.
void ViaFile::keepAllButComments(size_t count) {
  char* end = m_Buffer.data() + m_Text.size();
  for (const char *read = end, *readEnd = end + count; read != readEnd; ++read) {
    if (m_InComment) {
      m_InComment = !isLineEnd(*read);
    } else if (*read == '#' || *read == ';') {
      m_InComment = true;
    } else {
      *end++ = *read;
    }
  }
  m_Text = {m_Buffer.data(), end};
}

const char* ViaFile::fail(OptionMessage message) {
  m_LastChar = '\0';
  m_Parser.report(ReportLevel::Fatal, message, {m_Name});
  return nullptr;
}

} // namespace tabledrivenparser
