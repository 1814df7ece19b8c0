// SPDX-License-Identifier: Apache-2.0
//
// Decides whether bytes are an ELF object, by the rules of a read's first step. The archive asks
// this of members and of files that it is given; what is not ELF is a member like any other and no
// error.
#include "elfext/interface/format_recognizer.h"

#include "checking/interface/checking.h"
#include "elfext/interface/elf_constants.h"

#include <algorithm>
#include <array>

namespace elfext {

namespace {

// Sizes and places of the ELF standard; the headers must be whole.
constexpr size_t IdentSize = 16;
constexpr size_t ClassPosition = 4;
constexpr size_t Header32Size = 52;
constexpr size_t Header64Size = 64;

} // namespace

bool isElfData(std::span<const uint8_t> data) {
  if (data.size() < IdentSize) return false;
  // Class 2 decides alone, as it does when the object is read: with the magic looked at in one
  // place and not in the other, a member could be an object to one half of a run and none to the
  // other.
  if (data[ClassPosition] == 2) return data.size() >= Header64Size;
  return data[ClassPosition] == 1 && data.size() >= Header32Size &&
         std::equal(ElfMagic.begin(), ElfMagic.end(), data.begin());
}

bool isElfFile(support::Host& host, support::FileHandle file, uint64_t offset, uint64_t size) {
  std::array<uint8_t, RecognizedBytes> bytes;
  const std::span<uint8_t> wanted =
      std::span(bytes).first(static_cast<size_t>(std::min<uint64_t>(size, bytes.size())));
  size_t done = 0;
  return host.readAt(file, wanted, offset, done) == 0 && isElfData(wanted.first(done));
}

bool isElfFile(support::Host& host, support::FileHandle file) {
  support::FileStatus status;
  // Larger files have no place in an archive, whose sizes have 32 bits.
  if (host.statusOf(file, status) != 0 || status.size >= 0xFFFFFFFF) return false;
  return isElfFile(host, file, 0, static_cast<uint64_t>(status.size));
}

bool isElfFile(support::Host& host, const char* fileName, uint64_t offset, uint64_t size) {
  QUARN_ASSERT(1, fileName != NULL);
  support::FileHandle file;
  if (host.openForReading(fileName, file) != 0) return false;
  const bool isElf = isElfFile(host, file, offset, size);
  return host.close(file) == 0 && isElf;
}

bool isElfFile(support::Host& host, const char* fileName) {
  QUARN_ASSERT(1, fileName != NULL);
  support::FileHandle file;
  if (host.openForReading(fileName, file) != 0) return false;
  const bool isElf = isElfFile(host, file);
  return host.close(file) == 0 && isElf;
}

} // namespace elfext
