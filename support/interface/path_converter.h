// SPDX-License-Identifier: Apache-2.0
//
// POSIX-style names for a host with drive letters: a program beside the tool, the path converter,
// is asked what the host calls a file. It is a help and no more, so nothing about it is ever
// reported: a name that it can't tell stays as it is, and the host says what becomes of that.
//
// Within a run a name has one meaning. Whatever came of asking for it is kept, also that nothing
// came of it: a file that was created under a name is renamed or removed under the same one, even
// if the converter has gone in between.

#pragma once

#include "support/interface/converter_process.h"

#include <chrono>
#include <functional>
#include <map>
#include <string>
#include <string_view>

namespace support {

class PathConverter {
public:
  /// The process outlives this object, and starts no converter before a name needs one. `patience`
  /// is how long a name may take in all.
  explicit PathConverter(ConverterProcess& process,
                         std::chrono::milliseconds patience = std::chrono::seconds(30))
      : m_Process(process), m_Patience(patience) {}

  /// What the host calls the file of that name, in UTF-8 as the name is; the name where the
  /// converter can't tell. Names that begin with a drive and a separator or with two "\", also
  /// behind a quotation mark, are the host's own and never asked for.
  [[nodiscard]] std::string convert(std::string_view name);

private:
  ConverterReply converse(std::string_view name, std::string& answer, ConverterDeadline deadline);
  std::string ask(std::string_view name);
  void countBreaks(ConverterReply reply);

  ConverterProcess& m_Process;
  std::chrono::milliseconds m_Patience;
  bool m_IsRunning = false;
  bool m_IsOff = false;   // from here on no name is asked for
  int m_BreaksInARow = 0; // names that broke two converters each
  std::map<std::string, std::string, std::less<>> m_Converted;
};

} // namespace support
