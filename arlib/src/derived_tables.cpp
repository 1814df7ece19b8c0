// SPDX-License-Identifier: Apache-2.0
//
// The layout of an archive and its long-name table, which holds each name longer than 15 bytes
// followed by "/" and a newline, in list order. Sums are in 64 bits; what the format can't hold is
// refused before anything is made of it. Names are not copied: thousands of members may share one.
#include "arlib/src/derived_tables.h"

#include "arlib/interface/archive_format.h"
#include "arlib/interface/symbol_name_list.h"

#include <cerrno>
#include <string_view>
#include <utility>

namespace arlib {

namespace {

constexpr size_t NamesRegionSize = 1024;

} // namespace

std::optional<uint64_t> DerivedTable::getSizeAfter(const ArchiveMember* table) const {
  if (fate == Fate::Made) return text->getSize();
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

bool makeLongNameTable(const Archive& archive, DerivedTables& tables) {
  alloclib::RegionOwner region(
      alloclib::RegionGeneral::Create(NamesRegionSize, "arlib::makeLongNameTable() region"));
  auto* names = alloclib::create<SymbolNameList>(*region, region.get());
  uint64_t required = 0;
  for (const ArchiveMember* member : archive.getMembers()) {
    if (!isLongName(member->getName())) continue;
    // One that doesn't fit is never used.
    tables.nameOffsets.push_back(static_cast<uint32_t>(required));
    names->addCopied(member->getName());
    required += member->getName().size() + LongNameTerminator.size();
  }
  if (required == 0) {
    tables.longNames.fate = DerivedTable::Fate::Dropped;
    return true;
  }
  if (required > MaximumFileSize) {
    return archive.fail(&ErrorHandler::reportWriteError, archive.getFileName(), EFBIG);
  }
  auto text = std::make_unique<TableText>(std::move(region));
  text->addTexts(names->getNames(), names->getTextSize(), LongNameTerminator);
  QUARN_ASSERT(1, text->getSize() == required);
  tables.longNames = {DerivedTable::Fate::Made, std::move(text)};
  return true;
}

} // namespace arlib
