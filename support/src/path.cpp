// SPDX-License-Identifier: Apache-2.0
//
// Parsing of path names. Each string takes its front off what is left of the name, so that
// rebuilding is plain joining. Order: drive or share, folder up to the last separator, base,
// extension from the last dot of the leaf. Any of them may be empty.

#include "support/interface/path.h"

#include "support/interface/letters.h"

#include <algorithm>
#include <iterator>

namespace support {

namespace {

constexpr std::string_view AnySeparator = "/\\";

bool isSeparator(char character) {
  return AnySeparator.find(character) != std::string_view::npos;
}

// The length of "\\server\share" in a name that begins with two separators.
size_t shareLength(std::string_view name) {
  const size_t serverEnd = std::min(name.find('\\', 2), name.size());
  return std::min(name.find('\\', serverEnd + 1), name.size());
}

size_t driveLength(std::string_view name) {
  if (name.size() >= 2 && name[1] == ':') return 2;
  return name.starts_with("\\\\") ? shareLength(name) : 0;
}

// Devices of the host in every folder, whatever extension is behind. The last three of each row
// are the superscript digits, which count as digits there.
constexpr std::string_view Devices[] = {"con", "prn", "aux", "nul", "conin$", "conout$", "clock$"};
constexpr std::string_view NumberedDevices[] = {"com", "lpt"};
constexpr std::string_view DeviceNumbers[] = {"0", "1", "2", "3",        "4",        "5",       "6",
                                              "7", "8", "9", "\xC2\xB9", "\xC2\xB2", "\xC2\xB3"};

bool isNumberedDevice(std::string_view name) {
  const auto isNumbered = [name](std::string_view device) {
    return equalIgnoringCase(name.substr(0, device.size()), device) &&
           std::find(std::begin(DeviceNumbers), std::end(DeviceNumbers),
                     name.substr(std::min(name.size(), device.size()))) != std::end(DeviceNumbers);
  };
  return std::any_of(std::begin(NumberedDevices), std::end(NumberedDevices), isNumbered);
}

bool isDeviceName(std::string_view leaf) {
  std::string_view name = leaf.substr(0, leaf.find('.'));
  name = name.substr(0, name.find_last_not_of(' ') + 1);
  const auto isName = [name](std::string_view device) { return equalIgnoringCase(name, device); };
  return std::any_of(std::begin(Devices), std::end(Devices), isName) || isNumberedDevice(name);
}

// In no name of a file there: wildcards, what command lines mean something by, the mark of a
// stream.
bool isForbidden(char character) {
  const auto byte = static_cast<unsigned char>(character);
  return byte < 0x20 || std::string_view("<>:\"|?*").find(character) != std::string_view::npos;
}

std::string takeFront(std::string_view& rest, size_t length) {
  std::string front(rest.substr(0, length));
  rest.remove_prefix(length);
  return front;
}

} // namespace

bool isDriveName(std::string_view name) {
  return name.size() == 2 && isLetter(name[0]) && name[1] == ':';
}

bool isPlainLeaf(std::string_view leaf, PathStyle style) {
  if (style == PathStyle_Posix) return true;
  // A folder in every folder: nobody can open it for a file.
  if (leaf == "." || leaf == "..") return true;
  if (std::any_of(leaf.begin(), leaf.end(), isForbidden)) return false;
  if (leaf.ends_with('.') || leaf.ends_with(' ')) return false;
  return !isDeviceName(leaf);
}

PathStyle detectPathStyle(std::string_view name) {
  if (name.size() >= 2 && name[1] == ':') return PathStyle_Windows;
  if (name.starts_with('\\') || name.starts_with("//")) return PathStyle_Windows;
  if (name.starts_with('/')) return PathStyle_Posix;
  return name.find('\\') == std::string_view::npos ? PathStyle_Undetermined : PathStyle_Windows;
}

std::string_view withoutDrive(std::string_view name, PathStyle style) {
  const bool hasDrive = style == PathStyle_Windows && isDriveName(name.substr(0, 2));
  return hasDrive ? name.substr(2) : name;
}

std::string_view leafOf(std::string_view name, PathStyle style) {
  if (style == PathStyle_Posix) return name.substr(name.rfind('/') + 1);
  return lastPathComponent(withoutDrive(name, style));
}

std::string_view lastPathComponent(std::string_view name) {
  return name.substr(name.find_last_of(AnySeparator) + 1);
}

path::path(std::string_view name, PathStyle style)
    : m_Style(style == PathStyle_Detect ? detectPathStyle(name) : style) {
  std::string normalised(name);
  const bool isPosix = m_Style == PathStyle_Posix;
  if (!isPosix) std::replace_if(normalised.begin(), normalised.end(), isSeparator, '\\');

  std::string_view rest = normalised;
  m_Drive = takeFront(rest, isPosix ? 0 : driveLength(rest));
  m_Directory = takeFront(rest, rest.rfind(isPosix ? '/' : '\\') + 1);
  replaceLeaf(rest);
}

void path::replaceLeaf(std::string_view leaf) {
  leaf = leaf.substr(0, LongestPathComponent);
  m_Base = takeFront(leaf, std::min(leaf.rfind('.'), leaf.size()));
  m_Extension = leaf;
}

std::string path::toString() const {
  return m_Drive + m_Directory + m_Base + m_Extension;
}

} // namespace support
