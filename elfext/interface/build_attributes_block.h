// SPDX-License-Identifier: Apache-2.0
//
// The attributes of one vendor as they stand in the file, without the list of what they hold for.
// Blocks never change, and within a module there is one for equal vendor and bytes: its address is
// its identity.
//
// The bytes are tags and values in the order of the file, also those that nobody here knows.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

namespace elfext {

class BuildAttributesBlock {
public:
  /// Both outlive the block.
  BuildAttributesBlock(std::string_view vendor, std::span<const uint8_t> data)
      : m_Vendor(vendor), m_Data(data) {}

  [[nodiscard]] std::string_view getVendor() const { return m_Vendor; }
  [[nodiscard]] std::span<const uint8_t> getData() const { return m_Data; }

private:
  std::string_view m_Vendor;
  std::span<const uint8_t> m_Data;
};

} // namespace elfext
