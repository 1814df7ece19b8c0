// SPDX-License-Identifier: Apache-2.0
//
// The document as it grows. A library is a few fields and some lists, and each row of a list is a
// line of its own: such a text can be searched and compared by lines, and it is all that is kept of
// libraries that are done, which may have a million symbols. What is too much for the memory goes
// to a temporary file: in an archive of a megabyte thousands of members may share one long name,
// which then stands in the document thousands of times.
#pragma once

#include "quarn-json/json_names.h"
#include "support/interface/host.h"

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>

namespace quarn_json {

// Of the meaning of fields. It grows when a reader of the former one would misunderstand.
constexpr int FormatVersion = 1;

class Document {
public:
  static constexpr size_t MostInMemory = 0x400000; // bytes

  explicit Document(support::Host& host);
  ~Document();
  Document(const Document&) = delete;
  Document& operator=(const Document&) = delete;

  // Between these stand the fields and lists of one library, and the rows of one list.
  void startLibrary() { start("    {"); }
  void endLibrary() { end("    }"); }
  void putField(std::string_view name, const Json& value);
  void startList(std::string_view name);
  void endList() { end("      ]"); }
  void putRow(const Json& row) { item("        " + lineOf(row)); }

  // Hands out the whole text, piece by piece. Nothing may follow. The host's error number if some
  // of it could not be kept, or can't be had any more; in the first case nothing is handed out.
  [[nodiscard]] support::HostError finish(const std::function<void(std::string_view)>& take);

  // Of the temporary file.
  [[nodiscard]] const std::string& getFileName() const { return m_FileName; }

private:
  void start(std::string_view line);
  void end(std::string_view line);
  void item(std::string_view line);
  void add(std::string_view line);
  void moveToFile();
  [[nodiscard]] support::HostError handOutFile(const std::function<void(std::string_view)>& take);

  support::Host& m_Host;
  std::string m_Text;    // behind what is in the file
  bool m_IsFirst = true; // of the items of what was started last
  support::FileHandle m_File;
  std::string m_FileName;
  uint64_t m_FileSize = 0; // bytes
  support::HostError m_Error = 0;
};

} // namespace quarn_json
