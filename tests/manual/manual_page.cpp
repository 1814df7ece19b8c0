// SPDX-License-Identifier: Apache-2.0
//
// Reads manual pages. Marks are found word by word, as mdoc parses a line: a macro's arguments go
// on to the next word that is a macro itself, and punctuation that stands alone divides them.
#include "manual_page.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cctype>
#include <cstdio>
#include <fstream>
#include <iterator>
#include <memory>
#include <sstream>

namespace manuals {

namespace {

Lines linesOf(const std::string& text) {
  std::istringstream stream(text);
  Lines lines;
  for (std::string line; std::getline(stream, line);)
    lines.push_back(line);
  return lines;
}

// Mandoc prints bold and underlined characters as two, with a backspace between.
std::string withoutOverstrikes(const std::string& text) {
  std::string plain;
  for (const char character : text) {
    if (character == '\b' && !plain.empty())
      plain.pop_back();
    else
      plain += character;
  }
  return plain;
}

// The words of a macro line; the first one without its dot.
std::vector<std::string> wordsOf(std::string_view line) {
  if (!line.starts_with('.')) return {};
  std::istringstream stream{std::string(line.substr(1))};
  return {std::istream_iterator<std::string>(stream), {}};
}

// Two letters, of which the first one is a capital. No option or token that pages name looks so.
bool isMacro(const std::string& word) {
  return word.size() == 2 && std::isupper(static_cast<unsigned char>(word[0])) != 0 &&
         std::islower(static_cast<unsigned char>(word[1])) != 0;
}

bool isPunctuation(const std::string& word) {
  return word == "," || word == "." || word == "|" || word == "=" || word == ";" || word == ":" ||
         word == ")" || word == "(";
}

std::string unescaped(std::string word) {
  const size_t zeroWidth = word.find("\\&");
  if (zeroWidth != std::string::npos) word.erase(zeroWidth, 2);
  return word;
}

} // namespace

std::string contentsOf(const std::string& path) {
  std::ifstream file(QUARN_SOURCE_DIR "/" + path, std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

Lines sourceOf(const std::string& page) {
  Lines lines = linesOf(contentsOf("manual/" + page));
  std::erase_if(lines, [](const std::string& line) { return line.starts_with(".\\\""); });
  EXPECT_FALSE(lines.empty()) << page;
  return lines;
}

Lines renderedOf(const std::string& page) {
  const std::string command =
      QUARN_MANDOC " -T ascii -O width=1000 '" QUARN_SOURCE_DIR "/manual/" + page + "'";
  const std::unique_ptr<FILE, int (*)(FILE*)> pipe(popen(command.c_str(), "r"), pclose);
  std::string text;
  std::array<char, 4096> piece;
  while (const size_t count = std::fread(piece.data(), 1, piece.size(), pipe.get()))
    text.append(piece.data(), count);
  return linesOf(withoutOverstrikes(text));
}

Lines linesUnder(const Lines& source, std::string_view heading) {
  const auto isHeading = [](const std::string& line) {
    return line.starts_with(".Sh ") || line.starts_with(".Ss ");
  };
  const auto start = std::find_if(source.begin(), source.end(), [&](const std::string& line) {
    return isHeading(line) && std::string_view(line).substr(4) == heading;
  });
  EXPECT_NE(start, source.end()) << heading;
  if (start == source.end()) return {};
  return {start + 1, std::find_if(start + 1, source.end(), isHeading)};
}

Lines marksBehind(const Lines& source, std::string_view line) {
  const auto isText = [](const std::string& text) {
    return !text.starts_with('.') && text != "and";
  };
  const auto at = std::find(source.begin(), source.end(), line);
  EXPECT_NE(at, source.end()) << line;
  if (at == source.end()) return {};
  return {at + 1, std::find_if(at + 1, source.end(), isText)};
}

Lines itemsIn(Lines lines) {
  std::erase_if(lines, [](const std::string& line) { return !line.starts_with(".It "); });
  return lines;
}

Names wordsMarked(std::string_view line, std::string_view macro) {
  Names marked;
  bool isMarked = false;
  for (const std::string& word : wordsOf(line)) {
    if (isMacro(word))
      isMarked = word == macro;
    else if (isMarked && !isPunctuation(word))
      marked.insert(unescaped(word));
  }
  return marked;
}

Names optionsIn(std::string_view line) {
  Names names;
  size_t dashes = 0;
  bool isDash = false;
  for (const std::string& word : wordsOf(line)) {
    const bool isSecond = isDash;
    isDash = word == "Fl";
    if (isDash)
      dashes = isSecond ? 2 : 1;
    else if (isMacro(word))
      dashes = 0;
    else if (dashes == 2 && !isPunctuation(word))
      names.insert(word);
    else if (dashes == 1 && !isPunctuation(word))
      std::ranges::transform(word, std::inserter(names, names.end()),
                             [](char letter) { return std::string(1, letter); });
  }
  return names;
}

void add(Names& names, const Names& more) {
  names.insert(more.begin(), more.end());
}

std::regex patternOf(std::string_view text) {
  std::string pattern;
  for (const char character : text.substr(0, text.find('\n'))) {
    if (std::string_view("\\^$.|?*+()[]{}").find(character) != std::string_view::npos)
      pattern += '\\';
    pattern += character;
  }
  // An option is shown with its dashes and its "=", which are arguments of the text.
  pattern = std::regex_replace(pattern, std::regex("(%[sdcu])+"), ".+");
  return std::regex(std::regex_replace(pattern, std::regex(" +"), " "));
}

} // namespace manuals
