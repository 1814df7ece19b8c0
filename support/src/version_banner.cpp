// SPDX-License-Identifier: Apache-2.0
//
// Builds the banner and the version number text. An engineering release shows the full component
// name, in which the delivery number follows the version that the name ends with. Parts that are
// missing, or no numbers, count as 0: a build with odd data still says something.

#include "support/interface/version_banner.h"

#include <algorithm>
#include <charconv>
#include <cstdio>

namespace support {

namespace {

constexpr std::string_view Digits = "0123456789";
constexpr size_t ShortestFullVersion = 5; // characters of "1.0.0"

// The version that the text ends with: its longest tail of digits and dots.
std::string_view trailingVersion(std::string_view text) {
  return text.substr(text.find_last_not_of("0123456789.") + 1);
}

std::string fullComponentText(const BuildData& data) {
  const size_t digitsEnd = data.componentName.find_last_of(Digits) + 1;
  std::string text(data.componentName.substr(0, digitsEnd));
  if (trailingVersion(text).size() < ShortestFullVersion) text += ".0";
  text.append(".").append(data.delivery);
  if (!data.developmentLabel.empty()) text.append(" ").append(data.developmentLabel);
  return text.append(data.componentName.substr(digitsEnd));
}

// "Tool: quarn [01000001]": the tool's own name, whatever the program file is called.
std::string toolLine(uint32_t buildStamp) {
  char line[32];
  std::snprintf(line, sizeof line, "Tool: %s [%08x]", "quarn", static_cast<unsigned>(buildStamp));
  return line;
}

uint32_t numberFrom(std::string_view text) {
  uint32_t number = 0;
  const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
  return result.ec == std::errc() ? number : 0;
}

uint32_t takeVersionPart(std::string_view& version) {
  const size_t length = std::min(version.find('.'), version.size());
  const uint32_t part = numberFrom(version.substr(0, length));
  version.remove_prefix(std::min(length + 1, version.size()));
  return part;
}

uint32_t deliveryNumber(std::string_view delivery) {
  const bool isNumber = delivery.find_first_not_of(Digits) == std::string_view::npos;
  return isNumber ? numberFrom(delivery) : 0;
}

} // namespace

std::string bannerText(const BuildData& data) {
  std::string text;
  text.append("Product: ").append(data.productName).append("\nComponent: ");
  if (data.isEngineeringRelease) text.append(fullComponentText(data));
  if (!data.isEngineeringRelease) text.append(data.componentName);
  text.append("\n").append(toolLine(data.buildStamp));
  if (data.isEngineeringRelease) text.append("\nEngineering release. Not for production use.");
  if (!data.furtherLine.empty()) text.append("\n").append(data.furtherLine);
  if (!data.supplier.empty()) text.append("\nSoftware supplied by: ").append(data.supplier);
  if (text.ends_with(' ')) text.pop_back();
  return text;
}

std::string versionNumberText(const BuildData& data) {
  constexpr uint32_t LargestPatch = 99;
  std::string_view version = data.version;
  const uint32_t majorPart = takeVersionPart(version);
  const uint32_t minorPart = takeVersionPart(version);
  const uint32_t patchPart = takeVersionPart(version);
  char text[64];
  std::snprintf(text, sizeof text, "%01u%02u%02u%02u", majorPart, minorPart,
                patchPart > LargestPatch ? 0 : patchPart, deliveryNumber(data.delivery));
  return text;
}

} // namespace support
