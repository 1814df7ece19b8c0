// SPDX-License-Identifier: Apache-2.0
//
// The layout is that of REPARSE_DATA_BUFFER, little endian: kind (4 bytes), size (2), 2 unused,
// then for a symbolic link offset and size of the name that the system follows (2 and 2), those of
// the name that users see (2 and 2), flags (4), and the two names, to which the offsets count.

#include "support/src/windows_links.h"

#include <array>
#include <cstdint>
#include <cstring>
#include <optional>
#include <windows.h>
#include <winioctl.h>

namespace support {

namespace {

constexpr uint32_t SymbolicLink = 0xA000000C;
constexpr size_t FollowedName = 8; // where its offset stands
constexpr size_t SeenName = 12;
constexpr size_t Names = 20;
constexpr size_t LargestData = 16 * 1024;
// The root of all names as the system knows it, and as its users write it.
constexpr std::wstring_view SystemRoot = L"\\??\\";
constexpr std::wstring_view UserRoot = L"\\\\?\\";

// The caller has looked that there are as many bytes.
template <class Number>
Number numberAt(std::span<const std::byte> bytes, size_t place) {
  Number number = 0;
  std::memcpy(&number, bytes.data() + place, sizeof number);
  return number;
}

std::wstring nameAt(std::span<const std::byte> bytes, size_t place) {
  const size_t offset = numberAt<uint16_t>(bytes, place);
  const size_t size = numberAt<uint16_t>(bytes, place + 2);
  const std::span<const std::byte> names = bytes.subspan(Names);
  if (offset > names.size() || size > names.size() - offset) return {};
  std::wstring name(size / sizeof(wchar_t), L'\0');
  std::memcpy(name.data(), names.data() + offset, name.size() * sizeof(wchar_t));
  return name;
}

} // namespace

std::wstring linkTextFrom(std::span<const std::byte> bytes) {
  if (bytes.size() < Names || numberAt<uint32_t>(bytes, 0) != SymbolicLink) return {};
  std::wstring seen = nameAt(bytes, SeenName);
  if (!seen.empty()) return seen;
  std::wstring followed = nameAt(bytes, FollowedName);
  if (followed.starts_with(SystemRoot)) followed.replace(0, SystemRoot.size(), UserRoot);
  return followed;
}

std::wstring readLink(const std::wstring& name) {
  const HANDLE file = CreateFileW(
      name.c_str(), FILE_READ_ATTRIBUTES, FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE,
      nullptr, OPEN_EXISTING, FILE_FLAG_OPEN_REPARSE_POINT | FILE_FLAG_BACKUP_SEMANTICS, nullptr);
  if (file == INVALID_HANDLE_VALUE) return {};
  std::array<std::byte, LargestData> bytes;
  DWORD size = 0;
  const bool isRead = DeviceIoControl(file, FSCTL_GET_REPARSE_POINT, nullptr, 0, bytes.data(),
                                      bytes.size(), &size, nullptr) != 0;
  CloseHandle(file);
  return isRead ? linkTextFrom(std::span(bytes).first(size)) : std::wstring();
}

} // namespace support
