// SPDX-License-Identifier: Apache-2.0
//
// Symbolic links, as Windows keeps them: bytes that a file system hands to whoever asks for what
// stands in the place of a file. Much else is kept in the same way (compressed files, files that
// are elsewhere until somebody reads them), and is no link.

#pragma once

#include <cstddef>
#include <span>
#include <string>

namespace support {

/// The text of the link that the bytes describe; empty if they describe none. One that starts from
/// the root of all names has the form without a limit.
[[nodiscard]] std::wstring linkTextFrom(std::span<const std::byte> bytes);

/// The text of the link of that name; empty if it is none.
[[nodiscard]] std::wstring readLink(const std::wstring& name);

} // namespace support
