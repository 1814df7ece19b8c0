// SPDX-License-Identifier: Apache-2.0
//
// Finding examples in the document and writing them anew. An example is a fenced block under a name
// of its own, and there must be exactly one: a block that was renamed or doubled fails the test, so
// that none silently goes unread. A dump has the offset in four columns, up to 16 bytes in
// hexadecimal, and beside a field's first line what it means.

#include "tests/docs/document.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <fstream>
#include <iomanip>
#include <iterator>
#include <sstream>

namespace documents {

namespace {

constexpr size_t BytesALine = 16;

std::string hexOf(std::string_view bytes) {
  std::ostringstream text;
  for (const char byte : bytes)
    text << (text.tellp() == 0 ? "" : " ") << std::hex << std::setw(2) << std::setfill('0')
         << static_cast<unsigned>(static_cast<uint8_t>(byte));
  return text.str();
}

} // namespace

std::string contentsOf(const std::string& path) {
  std::ifstream file(QUARN_SOURCE_DIR "/" + path, std::ios::binary);
  return {std::istreambuf_iterator<char>(file), {}};
}

std::string example(std::string_view name) {
  const std::string document = contentsOf("docs/formats.md");
  const std::string fence = "\n```" + std::string(name) + "\n";
  const size_t start = document.find(fence);
  const size_t end = document.find("\n```\n", start + fence.size() - 1);
  if (start == std::string::npos || end == std::string::npos) {
    ADD_FAILURE() << "no example " << name;
    return "";
  }
  EXPECT_EQ(document.find(fence, end), std::string::npos) << "two examples " << name;
  return document.substr(start + fence.size(), end + 1 - start - fence.size());
}

std::vector<std::string> linesOf(std::string_view text) {
  std::istringstream stream{std::string(text)};
  std::vector<std::string> lines;
  for (std::string line; std::getline(stream, line);)
    lines.push_back(line);
  return lines;
}

std::string padded(std::string_view text, size_t width) {
  return std::string(text) + std::string(width - std::min(width, text.size()), ' ');
}

std::string inQuotes(std::string_view text) {
  return "\"" + std::string(text) + "\"";
}

std::string hexadecimal(uint64_t value) {
  std::ostringstream text;
  text << "0x" << std::hex << std::uppercase << value;
  return text.str();
}

std::string bytesOfDump(std::string_view dump) {
  std::string bytes;
  for (const std::string& line : linesOf(dump)) {
    const size_t offsetEnd = line.find("  ", line.find_first_not_of(' '));
    const std::string behind = offsetEnd == std::string::npos ? "" : line.substr(offsetEnd + 2);
    std::istringstream words(behind.substr(0, behind.find("  ")));
    for (std::string word; words >> word;)
      bytes += static_cast<char>(std::stoi(word, nullptr, 16));
  }
  return bytes;
}

void DumpWriter::tell(size_t size, std::string_view meaning) {
  std::string_view left = rest().substr(0, size);
  while (!left.empty()) {
    const std::string offset = std::to_string(m_Position);
    std::string line = std::string(4 - std::min<size_t>(4, offset.size()), ' ') + offset + "  ";
    line += padded(hexOf(left.substr(0, BytesALine)), 3 * BytesALine + 1);
    line += meaning;
    m_Text += line.substr(0, line.find_last_not_of(' ') + 1) + "\n";
    m_Position += std::min(left.size(), BytesALine);
    left.remove_prefix(std::min(left.size(), BytesALine));
    meaning = "";
  }
}

} // namespace documents
