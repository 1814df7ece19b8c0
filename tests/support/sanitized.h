// SPDX-License-Identifier: Apache-2.0
//
// Whether the test runs under the address sanitizer, which has a way of its own with time, memory
// and descriptors.

#pragma once

namespace testsupport {

#if defined(__SANITIZE_ADDRESS__)
constexpr bool IsSanitized = true;
#elif defined(__has_feature)
constexpr bool IsSanitized = __has_feature(address_sanitizer);
#else
constexpr bool IsSanitized = false;
#endif

} // namespace testsupport
