// SPDX-License-Identifier: Apache-2.0
//
// The host of the tests where it is Windows. Its C library ends an aborted process with status 3.

#include "tests/support/test_host.h"

#include <cstdlib>
#include <ctime>
#include <string>
#include <windows.h>

namespace testsupport {

namespace {

std::wstring wide(const char* text) {
  std::wstring units(static_cast<size_t>(MultiByteToWideChar(CP_UTF8, 0, text, -1, nullptr, 0)),
                     L'\0');
  MultiByteToWideChar(CP_UTF8, 0, text, -1, units.data(), static_cast<int>(units.size()));
  units.pop_back();
  return units;
}

// The machine's own place for temporaries, as it was before the first change.
const wchar_t* getTemporaryPlace() {
  static const std::wstring place = _wgetenv(L"TMP") == nullptr ? L"" : _wgetenv(L"TMP");
  return place.c_str();
}

} // namespace

// The library's copy follows, and children get it.
void setEnvironment(const char* name, const char* value) {
  _wputenv((wide(name) + L"=" + wide(value == nullptr ? "" : value)).c_str());
}

void setTemporaryPlace(const char* folder) {
  const std::wstring before = getTemporaryPlace();
  _wputenv((L"TMP=" + (folder == nullptr ? before : wide(folder))).c_str());
}

void setTimeZone(const char* name) {
  setEnvironment("TZ", name);
  _tzset();
}

bool hasAborted(int status) {
  return status == 3;
}

void* takeAddresses(size_t size) {
  return VirtualAlloc(nullptr, size, MEM_RESERVE | MEM_COMMIT, PAGE_READWRITE);
}

void giveAddressesBack(void* addresses, size_t) {
  VirtualFree(addresses, 0, MEM_RELEASE);
}

} // namespace testsupport
