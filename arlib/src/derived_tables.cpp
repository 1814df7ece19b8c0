// SPDX-License-Identifier: Apache-2.0
//
// The layout of an archive and its long-name table, which holds each name longer than 15 bytes
// followed by "/" and a newline, in list order. Sums are in 64 bits; what the format can't hold is
// refused before anything is allocated for it.
#include "arlib/src/derived_tables.h"

#include "arlib/interface/archive_format.h"

#include <cerrno>
#include <cstring>
#include <string_view>

namespace arlib {

std::optional<uint64_t> DerivedTable::getSizeAfter(const ArchiveMember* table) const {
  if (fate == Fate::Made) return bytes.size();
  if (fate == Fate::Dropped || table == nullptr) return std::nullopt;
  return table->getSize();
}

MemberLayout layOut(std::span<ArchiveMember* const> members,
                    std::optional<uint64_t> symbolTableSize,
                    std::optional<uint64_t> longNameTableSize) {
  uint64_t cursor = ArchiveMagic.size();
  const auto place = [&cursor](uint64_t size) {
    const auto offset = static_cast<uint32_t>(cursor);
    cursor = nextHeaderOffset(cursor, size);
    return offset;
  };
  MemberLayout layout;
  layout.members.reserve(members.size());
  if (symbolTableSize) layout.symbolTable = place(*symbolTableSize);
  if (longNameTableSize) layout.longNameTable = place(*longNameTableSize);
  for (const ArchiveMember* member : members)
    layout.members.push_back(member->isAuxiliary() ? 0 : place(member->getSize()));
  return layout;
}

bool makeLongNameTable(const Archive& archive, alloclib::RegionGeneral& region,
                       DerivedTables& tables) {
  uint64_t required = 0;
  for (const ArchiveMember* member : archive.getMembers()) {
    if (isLongName(member->getName())) {
      required += member->getName().size() + LongNameTerminator.size();
    }
  }
  if (required == 0) {
    tables.longNames.fate = DerivedTable::Fate::Dropped;
    return true;
  }
  if (required > MaximumFileSize) {
    return archive.fail(&ErrorHandler::reportWriteError, archive.getFileName(), EFBIG);
  }
  const auto requiredFileNameTableSize = static_cast<uint32_t>(required);
  auto* bytes = static_cast<uint8_t*>(region.allocate(requiredFileNameTableSize));
  tables.longNames = {DerivedTable::Fate::Made, {bytes, requiredFileNameTableSize}};
  uint32_t fileNameTableOffset = 0;
  for (const ArchiveMember* member : archive.getMembers()) {
    if (!isLongName(member->getName())) continue;
    tables.nameOffsets.push_back(fileNameTableOffset);
    for (const std::string_view part : {member->getName(), LongNameTerminator}) {
      std::memcpy(bytes + fileNameTableOffset, part.data(), part.size());
      fileNameTableOffset += static_cast<uint32_t>(part.size());
    }
  }
  QUARN_ASSERT(1, fileNameTableOffset == requiredFileNameTableSize);
  return true;
}

} // namespace arlib
