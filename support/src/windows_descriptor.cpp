// SPDX-License-Identifier: Apache-2.0
//
// Descriptors are the C library's here; what is written goes past it, as it would put a carriage
// return in front of each line feed. A console takes UTF-16, whatever code page it is set to. Who
// writes to a pipe that nobody reads any more ends, as by the signal that POSIX systems have for
// it.

#include "support/interface/descriptor.h"

#include "support/interface/code_page.h"
#include "support/src/windows_code_page.h"
#include "support/src/windows_host.h"
#include "support/src/windows_names.h"

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <fcntl.h>
#include <io.h>
#include <string>
#include <windows.h>

// What other code writes to the standard streams is no different.
extern "C" {
extern int _CRT_fmode;
int _CRT_fmode = _O_BINARY;
}

namespace support {

namespace {

constexpr int LowestDuplicate = ErrorDescriptor + 1;
constexpr size_t LargestPiece = 0x8000; // that every console takes at once

constinit uint32_t consolePage = Utf8CodePage;

HANDLE handleOf(int descriptor) {
  return reinterpret_cast<HANDLE>(_get_osfhandle(descriptor));
}

// In a program that is started without output the C library has the number of a descriptor all the
// same, with a handle behind it that stands for something else.
bool isOpen(int descriptor) {
  SetLastError(NO_ERROR);
  return GetFileType(handleOf(descriptor)) != FILE_TYPE_UNKNOWN || GetLastError() == NO_ERROR;
}

bool isConsole(HANDLE handle) {
  DWORD mode = 0;
  return GetConsoleMode(handle, &mode) != 0;
}

HostError writeToConsole(HANDLE console, std::string_view bytes) {
  const std::wstring text = wideFromPage(consolePage, bytes);
  for (size_t at = 0; at < text.size();) {
    DWORD written = 0;
    const auto size = static_cast<DWORD>(std::min(text.size() - at, LargestPiece));
    if (WriteConsoleW(console, text.data() + at, size, &written, nullptr) == 0)
      return lastHostError();
    at += written;
  }
  return 0;
}

// The C library gives out its lowest free number, and lets children have it.
int duplicateAbove(int descriptor) {
  const int duplicate = _dup(descriptor);
  if (duplicate < 0) return duplicate;
  SetHandleInformation(handleOf(duplicate), HANDLE_FLAG_INHERIT, 0);
  if (duplicate >= LowestDuplicate) return duplicate;
  const int higher = duplicateAbove(descriptor);
  _close(duplicate);
  return higher;
}

} // namespace

int duplicateDescriptor(int descriptor) {
  if (!isOpen(descriptor)) return -1;
  const int duplicate = duplicateAbove(descriptor);
  return duplicate >= 0 ? duplicate : descriptor;
}

HostError writeToDescriptor(int descriptor, std::string_view bytes) {
  const HANDLE handle = handleOf(descriptor);
  if (isConsole(handle)) return writeToConsole(handle, bytes);
  size_t largest = INT32_MAX;
  while (!bytes.empty()) {
    DWORD written = 0;
    const auto size = static_cast<DWORD>(std::min(bytes.size(), largest));
    if (WriteFile(handle, bytes.data(), size, &written, nullptr) == 0) {
      const HostError error = lastHostError();
      if (error == EPIPE) endWithoutReader();
      return error;
    }
    bytes.remove_prefix(written);
    largest = std::max<size_t>(written > 0 ? size_t{written} * 2 : size / 2, 1);
    if (written > 0) continue;
    // A pipe that doesn't block, and has no room for so much.
    if (GetFileType(handle) != FILE_TYPE_PIPE) return EIO;
    Sleep(1);
  }
  return 0;
}

void setConsolePage(uint32_t number) {
  consolePage = number;
}

HostError closeDescriptor(int descriptor) {
  return _close(descriptor) == 0 ? 0 : errno;
}

} // namespace support
