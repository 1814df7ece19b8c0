// SPDX-License-Identifier: Apache-2.0
//
// The quoting rules are those of the two families of build systems: what a POSIX compiler driver
// reads, and what a Windows program makes of its command line. A file is read to its end, whatever
// size it tells; how many there may be is bounded, as two files that name a third twice each could
// go on doubling.
#include "quarn-ar/response_file.h"

#include "quarn-ar/refusal.h"
#include "quarn/reporting.h"

#include <algorithm>

namespace quarn_ar {

namespace {

constexpr size_t MostFiles = 2000;
constexpr size_t PieceSize = 0x10000; // bytes
constexpr std::string_view Blanks = " \t\n\v\f\r";

bool isBlank(char character) {
  return Blanks.find(character) != std::string_view::npos;
}

// Takes words off the front of a text.
class WordSplitter {
public:
  explicit WordSplitter(std::string_view text) : m_Text(text) {}

  [[nodiscard]] bool skipBlanks() {
    while (!m_Text.empty() && isBlank(m_Text.front()))
      m_Text.remove_prefix(1);
    return !m_Text.empty();
  }
  // False if a quote has no end.
  [[nodiscard]] bool takePosix(std::string& word);
  [[nodiscard]] bool takeWindows(std::string& word);

private:
  char take() {
    const char character = m_Text.front();
    m_Text.remove_prefix(1);
    return character;
  }
  void takeBackslashes(std::string& word);

  std::string_view m_Text;
};

bool WordSplitter::takePosix(std::string& word) {
  char quote = '\0';
  while (!m_Text.empty()) {
    if (quote == '\0' && isBlank(m_Text.front())) break;
    const char character = take();
    if (character == '\\') {
      if (!m_Text.empty()) word += take();
    } else if (character == quote) {
      quote = '\0';
    } else if (quote == '\0' && (character == '"' || character == '\'')) {
      quote = character;
    } else {
      word += character;
    }
  }
  return quote == '\0';
}

// In front of a quote two of them are one, and one that is left makes the quote a character.
void WordSplitter::takeBackslashes(std::string& word) {
  const size_t count = std::min(m_Text.find_first_not_of('\\'), m_Text.size());
  m_Text.remove_prefix(count);
  if (m_Text.empty() || m_Text.front() != '"') {
    word.append(count, '\\');
    return;
  }
  word.append(count / 2, '\\');
  if (count % 2 != 0) word += take();
}

bool WordSplitter::takeWindows(std::string& word) {
  bool isQuoted = false;
  while (!m_Text.empty()) {
    if (!isQuoted && isBlank(m_Text.front())) break;
    if (m_Text.front() == '\\') {
      takeBackslashes(word);
      continue;
    }
    const char character = take();
    if (character != '"') {
      word += character;
    } else if (isQuoted && !m_Text.empty() && m_Text.front() == '"') {
      word += take();
    } else {
      isQuoted = !isQuoted;
    }
  }
  return !isQuoted;
}

class Expansion {
public:
  Expansion(support::Host& host, Quoting quoting) : m_Host(host), m_Quoting(quoting) {}

  [[nodiscard]] bool expand(const std::vector<std::string>& words);
  [[nodiscard]] std::vector<std::string> takeWords() { return std::move(m_Words); }

private:
  bool expandFile(const std::string& name);
  bool readFile(const std::string& name, support::FileHandle file, size_t minimum,
                std::string& text);
  bool expandOpenFile(const std::string& name, support::FileHandle file);

  support::Host& m_Host;
  Quoting m_Quoting;
  std::vector<std::string> m_Words;
  std::vector<support::FileStatus> m_Open; // the file at hand, and those that lead to it
  size_t m_FileCount = 0;
};

bool Expansion::expand(const std::vector<std::string>& words) {
  for (const std::string& word : words) {
    if (word.size() < 2 || word.front() != '@')
      m_Words.push_back(word);
    else if (!expandFile(word.substr(1)))
      return false;
  }
  return true;
}

bool Expansion::expandFile(const std::string& name) {
  if (++m_FileCount > MostFiles) return refuse("more than %u response files", MostFiles);
  support::FileHandle file;
  const support::HostError error = m_Host.openForReading(name.c_str(), file);
  if (error != 0) {
    return refuse("the response file '%s' can't be opened: %s", name, quarn::hostErrorText(error));
  }
  const bool isDone = expandOpenFile(name, file);
  // It was only read.
  static_cast<void>(m_Host.close(file));
  return isDone;
}

bool Expansion::expandOpenFile(const std::string& name, support::FileHandle file) {
  support::FileStatus status;
  if (const support::HostError error = m_Host.statusOf(file, status); error != 0) {
    return refuse("the response file '%s' can't be read: %s", name, quarn::hostErrorText(error));
  }
  if (status.kind != support::FileKind::RegularFile)
    return refuse("the response file '%s' is no regular file", name);
  const auto isSame = [&](const support::FileStatus& other) { return other.isSameFile(status); };
  if (std::any_of(m_Open.begin(), m_Open.end(), isSame))
    return refuse("the response file '%s' leads back to itself", name);
  std::string text;
  if (!readFile(name, file, static_cast<size_t>(status.size), text)) return false;
  const std::optional<std::vector<std::string>> words = splitWords(text, m_Quoting);
  if (!words) return refuse("the response file '%s' has a quote without an end", name);
  m_Open.push_back(status);
  const bool isDone = expand(*words);
  m_Open.pop_back();
  return isDone;
}

bool Expansion::readFile(const std::string& name, support::FileHandle file, size_t minimum,
                         std::string& text) {
  size_t done = PieceSize;
  while (done == PieceSize) {
    const size_t offset = text.size();
    text.resize(offset + PieceSize);
    auto* bytes = reinterpret_cast<uint8_t*>(text.data() + offset);
    const support::HostError error = m_Host.readAt(file, {bytes, PieceSize}, offset, done);
    if (error != 0)
      return refuse("the response file '%s' can't be read: %s", name, quarn::hostErrorText(error));
    text.resize(offset + done);
  }
  // Somebody has cut it meanwhile.
  if (text.size() < minimum)
    return refuse("the response file '%s' can't be read: %s", name, quarn::hostErrorText(0));
  if (text.find('\0') != std::string::npos)
    return refuse("the response file '%s' holds a NUL character", name);
  return true;
}

} // namespace

std::optional<Quoting> quotingNamed(std::string_view name) {
  if (name == "posix") return Quoting::Posix;
  if (name == "windows") return Quoting::Windows;
  refuse("there is no quoting '%s'", name);
  return std::nullopt;
}

std::optional<std::vector<std::string>> splitWords(std::string_view text, Quoting quoting) {
  std::vector<std::string> words;
  WordSplitter splitter(text);
  while (splitter.skipBlanks()) {
    std::string& word = words.emplace_back();
    const bool isWhole =
        quoting == Quoting::Posix ? splitter.takePosix(word) : splitter.takeWindows(word);
    if (!isWhole) return std::nullopt;
  }
  return words;
}

bool expandResponseFiles(support::Host& host, Quoting quoting, std::vector<std::string>& words) {
  Expansion expansion(host, quoting);
  if (!expansion.expand(words)) return false;
  words = expansion.takeWords();
  return true;
}

} // namespace quarn_ar
