// SPDX-License-Identifier: Apache-2.0
//
// The document as it grows. A library is a few fields and some lists, and each row of a list is a
// line of its own: such a text can be searched and compared by lines, and it is all that is kept of
// libraries that are done, which may have a million symbols.
#pragma once

#include "quarn-json/json_names.h"

#include <string>
#include <string_view>

namespace quarn_json {

// Of the meaning of fields. It grows when a reader of the former one would misunderstand.
constexpr int FormatVersion = 1;

class Document {
public:
  Document();

  // Between these stand the fields and lists of one library, and the rows of one list.
  void startLibrary() { start("    {"); }
  void endLibrary() { end("    }"); }
  void putField(std::string_view name, const Json& value);
  void startList(std::string_view name);
  void endList() { end("      ]"); }
  void putRow(const Json& row) { item("        " + lineOf(row)); }

  // The whole text. Nothing may follow.
  [[nodiscard]] const std::string& finish();

private:
  void start(std::string_view line);
  void end(std::string_view line);
  void item(std::string_view line);

  std::string m_Text;
  bool m_IsFirst = true; // of the items of what was started last
};

} // namespace quarn_json
