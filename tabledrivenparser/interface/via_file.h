// SPDX-License-Identifier: Apache-2.0
//
// A via file: a text file of further arguments, as a row of words.
//
// A "#" or ";" anywhere, also in the middle of a word or inside quotes, starts a comment that lasts
// up to and including the next line feed or carriage return: so `a#x`, a line end and `b` are the
// word `ab`. White space separates words, except inside quotes and parentheses, which can't span
// lines. Quotes are removed, parentheses stay. A backslash protects a quote (a single one only
// inside single quotes) and, inside quotes, a backslash; anywhere else it is a character like any
// other, so that `dir\file.o` passes unchanged.
//
// The value store opens one for each via file and feeds its words to the parser, one level deeper
// than the word that named it. What a file may try (no end, NUL bytes, words beyond all size) ends
// in a fatal report; see the source.

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace tabledrivenparser {

class Parser;
class ViaFileReader;
enum class OptionMessage : uint16_t;

/// One file being read. It owns the open file and the last two words, and nothing of the parser.
class ViaFile {
public:
  /// What a word and the word before it may take together, each with one terminator, as they stand
  /// in the file without its comments. Also the number of characters read at a time: a NUL byte is
  /// found when its piece is read, before any word of that piece is handed out.
  static constexpr size_t BufferSize = 1024;

  /// Opens the file and reads the first piece. Complaints go through the parser's report; name and
  /// both objects must outlive this one.
  ViaFile(Parser& parser, ViaFileReader& reader, const char* name);
  ViaFile(const ViaFile&) = delete;
  ViaFile& operator=(const ViaFile&) = delete;
  virtual ~ViaFile();

  [[nodiscard]] bool isOpen() const { return m_File != nullptr; }
  /// The next word, or null at the end of the file and after a fatal report. The text is the file's
  /// own and stays valid until the second call after this one.
  const char* nextToken();
  /// Warns if the host complains. The destructor closes too, without a word.
  void close();

protected:
  /// For a text that is already in memory; it must outlive this object.
  ViaFile(Parser& parser, const char* name, std::string_view text);
  /// Makes m_Text the next characters. False if there are none.
  virtual bool refill();

private:
  struct ScanState;

  char peek();
  void startWord();
  bool countCharacter();
  void scanCharacter(char character, ScanState& state);
  void scanEscaped(char character, const ScanState& state);
  const char* finishWord(char end, const ScanState& state);
  void keepAllButComments(size_t count);
  const char* fail(OptionMessage message);

  Parser& m_Parser;
  ViaFileReader* m_Reader = nullptr; ///< null for a text in memory, which has no limit either
  void* m_File = nullptr;
  const char* m_Name;
  char m_LastChar = '\n'; ///< what ended the last word; 0 marks the file as finished or failed
  bool m_InComment = false;
  size_t m_Position = 0; ///< in m_Text
  std::string_view m_Text;
  std::array<char, BufferSize> m_Buffer;
  /// The last two words in turn, as one of them is still in use while the other is looked ahead to.
  std::array<std::string, 2> m_Words;
  size_t m_Current = 0;
  size_t m_Length = 0;         ///< of the current word with its terminator, before quote removal
  size_t m_PreviousLength = 0; ///< the same of the word before; 0 if there is none
};

} // namespace tabledrivenparser
