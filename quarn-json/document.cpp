// SPDX-License-Identifier: Apache-2.0
//
// Lines, and the commas between them. What stands in a line is written by the JSON library.
#include "quarn-json/document.h"

#include <nlohmann/json.hpp>

#include <cerrno>
#include <vector>

namespace quarn_json {

namespace {

constexpr size_t PieceSize = 0x40000;

} // namespace

Document::Document(support::Host& host) : m_Host(host) {
  m_Text = "{\n  \"formatVersion\": " + std::to_string(FormatVersion) + ",\n  \"libraries\": [";
}

// There is nobody left to tell when this fails, and the file is only litter.
Document::~Document() {
  if (!m_File.isOpen()) return;
  [[maybe_unused]] const support::HostError closeError = m_Host.close(m_File);
  [[maybe_unused]] const support::HostError removeError = m_Host.remove(m_FileName.c_str());
}

void Document::putField(std::string_view name, const Json& value) {
  item("      " + lineOf(name) + ": " + lineOf(value));
}

void Document::startList(std::string_view name) {
  start("      " + lineOf(name) + ": [");
}

support::HostError Document::finish(const std::function<void(std::string_view)>& take) {
  end("  ]");
  end("}");
  m_Text += '\n';
  if (m_Error == 0 && m_File.isOpen()) m_Error = handOutFile(take);
  if (m_Error == 0) take(m_Text);
  return m_Error;
}

support::HostError Document::handOutFile(const std::function<void(std::string_view)>& take) {
  std::vector<uint8_t> piece(PieceSize);
  for (uint64_t offset = 0; offset < m_FileSize;) {
    size_t done = 0;
    const support::HostError error = m_Host.readAt(m_File, piece, offset, done);
    if (error != 0) return error;
    if (done == 0) return EIO;
    take({reinterpret_cast<const char*>(piece.data()), done});
    offset += done;
  }
  return 0;
}

void Document::start(std::string_view line) {
  item(line);
  m_IsFirst = true;
}

void Document::end(std::string_view line) {
  add(line);
  m_IsFirst = false;
}

void Document::item(std::string_view line) {
  if (!m_IsFirst) m_Text += ',';
  add(line);
  m_IsFirst = false;
}

void Document::add(std::string_view line) {
  m_Text += '\n';
  m_Text += line;
  if (m_Text.size() > MostInMemory) moveToFile();
}

// What can't be kept is told of at the end, in the place of the document.
void Document::moveToFile() {
  if (m_Error == 0 && !m_File.isOpen()) m_Error = m_Host.createUnnamedTemporary(m_FileName, m_File);
  if (m_Error == 0)
    m_Error =
        m_Host.write(m_File, {reinterpret_cast<const uint8_t*>(m_Text.data()), m_Text.size()});
  m_FileSize += m_Text.size();
  m_Text.clear();
}

} // namespace quarn_json
