// SPDX-License-Identifier: Apache-2.0
//
// A file name taken apart, so that its leaf can be replaced. Nothing is lost: an unchanged path
// gives back the text it was made from, but for the separators of a Windows name. Names of members
// reach lastPathComponent from archives that anybody may have made: it cuts at either separator, so
// that a member "../../x" can be written to no place but "x".

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace support {

/// By which host's rules a name is read.
enum PathStyle : uint32_t {
  PathStyle_Detect = 0,
  PathStyle_Windows = 2,
  PathStyle_Posix = 3,
  PathStyle_Undetermined = 5, ///< treated as a Windows name
};

/// No name that a host takes as a member or leaf is longer; longer ones are cut.
inline constexpr size_t LongestPathComponent = 1029; ///< bytes

/// The four parts of a name, as texts of their own: what the name was made from need not live on.
class path {
public:
  /// With PathStyle_Detect the style is worked out from the name. In a POSIX name only "/"
  /// separates, there is no drive, and the directory is kept byte for byte; in a Windows name "/"
  /// and "\" both separate, and both become "\".
  explicit path(std::string_view name, PathStyle style = PathStyle_Detect);

  [[nodiscard]] PathStyle getStyle() const { return m_Style; }
  /// "c:" or "\\server\share"
  [[nodiscard]] const std::string& getDrive() const { return m_Drive; }
  /// With its last separator.
  [[nodiscard]] const std::string& getDirectory() const { return m_Directory; }
  [[nodiscard]] const std::string& getBase() const { return m_Base; }
  /// With its "."; may be empty.
  [[nodiscard]] const std::string& getExtension() const { return m_Extension; }
  [[nodiscard]] std::string getLeaf() const { return m_Base + m_Extension; }

  /// Base and extension from this text, which is cut to LongestPathComponent; the rest stays.
  void replaceLeaf(std::string_view leaf);
  /// All parts put together again.
  [[nodiscard]] std::string toString() const;

private:
  std::string m_Drive;
  std::string m_Directory;
  std::string m_Base;
  std::string m_Extension;
  PathStyle m_Style;
};

/// PathStyle_Windows, PathStyle_Posix or PathStyle_Undetermined.
[[nodiscard]] PathStyle detectPathStyle(std::string_view name);

/// "c:"; a letter, and nothing behind the colon.
[[nodiscard]] bool isDriveName(std::string_view name);

/// Whether a host of this style takes the leaf for a file of that name in the folder at hand, and
/// for nothing else: on Windows some names are devices in every folder, ":" leads to a stream
/// inside a file, wildcards and controls are in no name, and dots and blanks at the end are
/// dropped. On POSIX every leaf is one.
[[nodiscard]] bool isPlainLeaf(std::string_view leaf, PathStyle style);

/// The name without the drive in front, on a host that has drives: "c:x.o" leads to "x.o".
[[nodiscard]] std::string_view withoutDrive(std::string_view name, PathStyle style);

/// What a host of this style takes for the last part of a file's name; a view into it.
[[nodiscard]] std::string_view leafOf(std::string_view name, PathStyle style);

/// What stands behind the last "/" or "\" of the name; a view into it, perhaps empty.
[[nodiscard]] std::string_view lastPathComponent(std::string_view name);

} // namespace support
