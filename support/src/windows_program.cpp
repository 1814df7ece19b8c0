// SPDX-License-Identifier: Apache-2.0
//
// The words come from the C library, which splits the one text that Windows gives a program, as all
// programs built with it do. It is told not to expand wildcards: which words mean files, and which
// mean members, is for the tool to say.

#include "support/interface/program.h"

#include "support/interface/converting_host.h"
#include "support/interface/path_converter.h"
#include "support/src/windows_converter_process.h"
#include "support/src/windows_names.h"

#include <cstdlib>
#include <memory>
#include <string>
#include <vector>
#include <windows.h>

extern "C" {
// What the library's own start-up looks at.
extern int _dowildcard;
int _dowildcard = 0;
// Of the C library; no header declares it for programs.
int __wgetmainargs(int* count, wchar_t*** words, wchar_t*** environment, int expand, int* mode);
}

namespace support {

CommandLine getCommandLine(int argc, const char* const* argv) {
  int count = 0;
  int mode = 0;
  wchar_t** wide = nullptr;
  wchar_t** environment = nullptr;
  constexpr int Unexpanded = 0;
  if (__wgetmainargs(&count, &wide, &environment, Unexpanded, &mode) != 0) return {argc, argv};
  static std::vector<std::string> words;
  static std::vector<const char*> pointers;
  words.assign(static_cast<size_t>(count), {});
  for (int i = 0; i < count; ++i) {
    words[static_cast<size_t>(i)] = narrow(wide[i]);
    pointers.push_back(words[static_cast<size_t>(i)].c_str());
  }
  pointers.push_back(nullptr);
  return {count, pointers.data()};
}

// Nothing of it is ever destroyed: the process may end from anywhere, and takes a converter with
// it.
Host& getProgramHost() {
  const wchar_t* program = _wgetenv(L"CYGPATH");
  if (program == nullptr || *program == L'\0') return getNativeHost();
  static ConverterProcess& process = *makeConverterProcess(program).release();
  static PathConverter& converter = *new PathConverter(process);
  static ConvertingHost& host = *new ConvertingHost(
      getNativeHost(), [](std::string_view name) { return converter.convert(name); });
  return host;
}

} // namespace support
