// SPDX-License-Identifier: Apache-2.0
//
// Build attributes in words, for dumps. What has no name of its own is called unknown and shown as
// a signed number.
#pragma once

#include <cstdint>
#include <string>

namespace elfext {

/// As "Tag_CPU_arch", or "unknown tag (=35)". The tags of each vendor count separately.
[[nodiscard]] std::string getQobixTagName(uint32_t tag);
[[nodiscard]] std::string getZevTagName(uint32_t tag);

/// As "Size of wchar_t is 2 (=2)", or "unknown parameter (=35)", also for tags that aren't known or
/// have a text for their value.
[[nodiscard]] std::string getQobixTagValueName(uint32_t tag, uint32_t value);
[[nodiscard]] std::string getZevTagValueName(uint32_t tag, uint32_t value);

} // namespace elfext
