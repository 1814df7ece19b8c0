// SPDX-License-Identifier: Apache-2.0
//
// The code page that texts leave in. It belongs to the process, as the streams do. UTF-8 costs
// nothing: it is what texts are, and passes as it is, well-formed or not.

#pragma once

#include <cstdint>
#include <string_view>

namespace messages {

// False, and nothing has changed, if the host lacks the page. The one of "gb2312" is always taken:
// without the host's help texts then stay UTF-8.
[[nodiscard]] bool setOutputPage(uint32_t number);
void resetOutputPage();
[[nodiscard]] uint32_t getOutputPage();

// The text as it leaves; good until the next call, and no longer than the text given.
[[nodiscard]] std::string_view inOutputPage(std::string_view text);

} // namespace messages
