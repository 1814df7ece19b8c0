// SPDX-License-Identifier: Apache-2.0
//
// Tells ELF images from anything else, by the first bytes alone. This is the cheap question;
// whether an image is sound is for the reader to say.
//
// The rule: byte 4 (EI_CLASS) chooses the form. With the value 2 the file has the 64-byte header,
// and nothing else is looked at. Any other value takes the 32-bit path, on which the class must be
// 1, the first four bytes 7F 45 4C 46, and the header 52 bytes long.
#pragma once

#include "support/interface/host.h"

#include <cstdint>
#include <span>

namespace elfext {

/// So many bytes from the start of a file decide.
constexpr uint32_t RecognizedBytes = 64;

/// Tests the bytes of a whole image, or its first RecognizedBytes.
[[nodiscard]] bool isElfData(std::span<const uint8_t> data);

/// Tests a file. One that can't be opened or read, or of 0xFFFFFFFF bytes or more, is no ELF file.
[[nodiscard]] bool isElfFile(support::Host& host, const char* fileName);
[[nodiscard]] bool isElfFile(support::Host& host, support::FileHandle file);

/// Tests `size` bytes at `offset` of a file.
[[nodiscard]] bool isElfFile(support::Host& host, const char* fileName, uint64_t offset,
                             uint64_t size);
[[nodiscard]] bool isElfFile(support::Host& host, support::FileHandle file, uint64_t offset,
                             uint64_t size);

} // namespace elfext
