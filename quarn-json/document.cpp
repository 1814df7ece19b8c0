// SPDX-License-Identifier: Apache-2.0
//
// Lines, and the commas between them. What stands in a line is written by the JSON library.
#include "quarn-json/document.h"

#include <nlohmann/json.hpp>

namespace quarn_json {

Document::Document() {
  m_Text = "{\n  \"formatVersion\": " + std::to_string(FormatVersion) + ",\n  \"libraries\": [";
}

void Document::putField(std::string_view name, const Json& value) {
  item("      " + lineOf(name) + ": " + lineOf(value));
}

void Document::startList(std::string_view name) {
  start("      " + lineOf(name) + ": [");
}

const std::string& Document::finish() {
  end("  ]");
  end("}");
  m_Text += '\n';
  return m_Text;
}

void Document::start(std::string_view line) {
  item(line);
  m_IsFirst = true;
}

void Document::end(std::string_view line) {
  m_Text += '\n';
  m_Text += line;
  m_IsFirst = false;
}

void Document::item(std::string_view line) {
  if (!m_IsFirst) m_Text += ',';
  m_Text += '\n';
  m_Text += line;
  m_IsFirst = false;
}

} // namespace quarn_json
