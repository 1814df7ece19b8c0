// SPDX-License-Identifier: Apache-2.0
//
// The examples of docs/formats.md, so that they are held against the code. A test takes an example
// apart with the product's own readers, writes down what they found in the way of the document, and
// expects to have written the same text: so each digit of the example and each word beside it is
// one that the code agrees with. After a change that is meant, the new text is in the failure.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace documents {

// A file of the tree, by its path from the root.
std::string contentsOf(const std::string& path);

// The block that is fenced under this name; there must be one.
std::string example(std::string_view name);

std::vector<std::string> linesOf(std::string_view text);

// Fills the text up with blanks.
std::string padded(std::string_view text, size_t width);

std::string inQuotes(std::string_view text);

// As "0x1F" is written.
std::string hexadecimal(uint64_t value);

// The bytes of a dump: in each line what stands between the offset and the words.
std::string bytesOfDump(std::string_view dump);

// Writes a dump: the offset, up to 16 bytes, and in a field's first line what it means.
class DumpWriter {
public:
  explicit DumpWriter(std::string_view bytes) : m_Bytes(bytes) {}

  // What the next bytes are.
  void tell(size_t size, std::string_view meaning);

  // The bytes that nobody has told of yet.
  [[nodiscard]] std::string_view rest() const { return m_Bytes.substr(m_Position); }
  [[nodiscard]] const std::string& text() const { return m_Text; }

private:
  std::string_view m_Bytes;
  size_t m_Position = 0;
  std::string m_Text;
};

} // namespace documents
