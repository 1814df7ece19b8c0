// SPDX-License-Identifier: Apache-2.0
//
// The texts by which a build of the tool says which one it is: the banner in front of the help, the
// number of --version_number, and the same number in reports of internal faults. The data are
// settled when the build is configured; nothing is asked at run time.

#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace support {

/// What a build says of itself. The texts are views of constants.
struct BuildData {
  std::string_view productName;
  std::string_view componentName;
  std::string_view version;               ///< "major.minor.patch"; empty counts as "0.0.0"
  std::string_view delivery;              ///< a number
  std::string_view developmentLabel = {}; ///< empty: none
  bool isEngineeringRelease = false;
  uint32_t buildStamp = 0;
  std::string_view furtherLine = {}; ///< empty: none
  std::string_view supplier = {};    ///< empty: none
};

/// The data of this build.
[[nodiscard]] const BuildData& getBuildData();

/// The lines that --vsn and the help begin with, without a final newline.
[[nodiscard]] std::string bannerText(const BuildData& data);

/// One number for the whole version: "1000001" is 1.0.0, delivery 1. Minor version, patch and
/// delivery have two digits each.
[[nodiscard]] std::string versionNumberText(const BuildData& data);

} // namespace support
