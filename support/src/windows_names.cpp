// SPDX-License-Identifier: Apache-2.0
//
// Names and numbers at the border to Windows. Its failures have numbers of their own; each that a
// call here can give has the number that the C library gives it, or a closer one.

#include "support/src/windows_names.h"

#include <algorithm>
#include <cerrno>
#include <iterator>
#include <windows.h>

namespace support {

namespace {

// A folder's name must leave room for a file's in the old limit of 260.
constexpr size_t LongestPlainName = 247; // UTF-16 units
constexpr size_t LongestPart = 255;      // of a name, on every file system of the host

constexpr DWORD DiskQuotaExceeded = 1295; // not every collection of headers names it

struct ErrorNumber {
  DWORD windows;
  HostError host;
};

constexpr ErrorNumber ErrorNumbers[] = {
    {ERROR_FILE_NOT_FOUND, ENOENT},
    {ERROR_PATH_NOT_FOUND, ENOENT},
    {ERROR_TOO_MANY_OPEN_FILES, EMFILE},
    {ERROR_ACCESS_DENIED, EACCES},
    {ERROR_INVALID_HANDLE, EBADF},
    {ERROR_NOT_ENOUGH_MEMORY, ENOMEM},
    {ERROR_OUTOFMEMORY, ENOMEM},
    {ERROR_INVALID_DRIVE, ENOENT},
    {ERROR_NOT_SAME_DEVICE, EXDEV},
    {ERROR_WRITE_PROTECT, EROFS},
    {ERROR_SHARING_VIOLATION, EBUSY},
    {ERROR_LOCK_VIOLATION, EBUSY},
    {ERROR_HANDLE_DISK_FULL, ENOSPC},
    {ERROR_NOT_SUPPORTED, ENOSYS},
    {ERROR_BAD_NETPATH, ENOENT},
    {ERROR_DEV_NOT_EXIST, ENOENT},
    {ERROR_NETWORK_ACCESS_DENIED, EACCES},
    {ERROR_BAD_NET_NAME, ENOENT},
    {ERROR_FILE_EXISTS, EEXIST},
    {ERROR_CANNOT_MAKE, EACCES},
    {ERROR_INVALID_PARAMETER, EINVAL},
    {ERROR_BROKEN_PIPE, EPIPE},
    {ERROR_BUFFER_OVERFLOW, ENAMETOOLONG},
    {ERROR_DISK_FULL, ENOSPC},
    {ERROR_CALL_NOT_IMPLEMENTED, ENOSYS},
    {ERROR_INVALID_NAME, ENOENT},
    {ERROR_BAD_PATHNAME, ENOENT},
    {ERROR_ALREADY_EXISTS, EEXIST},
    {ERROR_FILENAME_EXCED_RANGE, ENAMETOOLONG},
    {ERROR_FILE_TOO_LARGE, EFBIG},
    {ERROR_PIPE_BUSY, EBUSY},
    {ERROR_NO_DATA, EPIPE},
    {ERROR_PIPE_NOT_CONNECTED, EPIPE},
    {ERROR_DIRECTORY, ENOTDIR},
    {ERROR_DELETE_PENDING, EBUSY},
    {ERROR_NO_UNICODE_TRANSLATION, EILSEQ},
    {ERROR_USER_MAPPED_FILE, EBUSY},
    {DiskQuotaExceeded, ENOSPC},
    {ERROR_PRIVILEGE_NOT_HELD, EPERM},
    {ERROR_NO_SYSTEM_RESOURCES, ENOMEM},
    {ERROR_COMMITMENT_LIMIT, ENOMEM},
    {ERROR_CANT_ACCESS_FILE, ENXIO},
    {ERROR_CANT_RESOLVE_FILENAME, ELOOP},
};

bool hasPrefix(const std::wstring& name, const wchar_t* prefix) {
  return name.starts_with(prefix);
}

// The forms that lead past drives and shares, the one without a limit among them.
bool isForDevices(const std::wstring& name) {
  return hasPrefix(name, L"\\\\?\\") || hasPrefix(name, L"\\\\.\\");
}

// Windows says of such a name what it says of any that can't be.
bool hasLongPart(std::wstring_view name) {
  for (;;) {
    const size_t separator = name.find_first_of(L"\\/");
    if (std::min(separator, name.size()) > LongestPart) return true;
    if (separator == std::wstring_view::npos) return false;
    name.remove_prefix(separator + 1);
  }
}

// Lengths of texts come from names and lines, far below what an int holds.
int lengthOf(std::string_view text) {
  return static_cast<int>(text.size());
}

} // namespace

HostError hostErrorFrom(unsigned long windowsError) {
  const auto* row =
      std::find_if(std::begin(ErrorNumbers), std::end(ErrorNumbers),
                   [windowsError](const ErrorNumber& r) { return r.windows == windowsError; });
  return row != std::end(ErrorNumbers) ? row->host : EIO;
}

HostError lastHostError() {
  return hostErrorFrom(GetLastError());
}

bool widen(std::string_view text, std::wstring& wide) {
  const int length =
      MultiByteToWideChar(CP_UTF8, MB_ERR_INVALID_CHARS, text.data(), lengthOf(text), nullptr, 0);
  wide.assign(static_cast<size_t>(std::max(length, 0)), L'\0');
  MultiByteToWideChar(CP_UTF8, MB_ERR_INVALID_CHARS, text.data(), lengthOf(text), wide.data(),
                      length);
  return text.empty() || length > 0;
}

std::string narrow(std::wstring_view wide) {
  const auto count = static_cast<int>(wide.size());
  const int length =
      WideCharToMultiByte(CP_UTF8, 0, wide.data(), count, nullptr, 0, nullptr, nullptr);
  std::string text(static_cast<size_t>(std::max(length, 0)), '\0');
  WideCharToMultiByte(CP_UTF8, 0, wide.data(), count, text.data(), length, nullptr, nullptr);
  return text;
}

std::wstring wholePath(const std::wstring& name) {
  const DWORD length = GetFullPathNameW(name.c_str(), 0, nullptr, nullptr); // with the NUL
  std::wstring path(length, L'\0');
  const DWORD written = GetFullPathNameW(name.c_str(), length, path.data(), nullptr);
  path.resize(written < length ? written : 0);
  return path;
}

HostError nativeName(std::string_view name, std::wstring& native, size_t room) {
  if (!widen(name, native)) return EILSEQ;
  if (hasLongPart(native)) return ENAMETOOLONG;
  if (native.empty() || isForDevices(native)) return 0;
  const std::wstring path = wholePath(native);
  if (path.size() + room <= LongestPlainName) return 0;
  // With "/" such a form was not told above.
  if (isForDevices(path))
    native = path;
  else
    native = hasPrefix(path, L"\\\\") ? L"\\\\?\\UNC" + path.substr(1) : L"\\\\?\\" + path;
  return 0;
}

} // namespace support
