// SPDX-License-Identifier: Apache-2.0
//
// Names as Windows takes them. In the product a name is UTF-8; here it becomes UTF-16 and goes to
// the calls that take that, so that neither the code page of the machine nor that of the process
// has a say in which file is meant.

#pragma once

#include "support/interface/host.h"

#include <string>
#include <string_view>

namespace support {

/// The number that a failure of Windows has in the C library, so that its text is that of any host.
[[nodiscard]] HostError hostErrorFrom(unsigned long windowsError);
/// The same for the call that has just failed.
[[nodiscard]] HostError lastHostError();

/// False if the text is not UTF-8.
[[nodiscard]] bool widen(std::string_view text, std::wstring& wide);
/// What UTF-16 can't say becomes U+FFFD.
[[nodiscard]] std::string narrow(std::wstring_view wide);

/// A name for the calls of Windows; EILSEQ if it is not UTF-8. One that is too long for them, as it
/// stands or from the current folder on, is given with its whole path in the form that has no
/// limit; `room` is for what is going to be put behind it, in UTF-16 units.
[[nodiscard]] HostError nativeName(std::string_view name, std::wstring& native, size_t room = 0);

/// The whole path of a name, without links followed; empty if there is none.
[[nodiscard]] std::wstring wholePath(const std::wstring& name);

} // namespace support
