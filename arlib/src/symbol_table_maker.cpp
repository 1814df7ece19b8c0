// SPDX-License-Identifier: Apache-2.0
//
// The order of the table is the order in which a linker finds a name: builds of one module first,
// each with its decoration, then all other members in file order. An object that can't be read is
// told of and publishes nothing; it stays a member, and the others are published as ever. One that
// the host can't give may publish anything: there is no table then.
//
// Members that are no objects have nothing to publish, but for what the table that was read says of
// them, where objects of any machine are taken.
#include "arlib/src/symbol_table_maker.h"

#include "arlib/interface/archive_format.h"
#include "elfext/interface/attribute_string.h"
#include "support/interface/text_numbers.h"

#include <algorithm>
#include <cerrno>
#include <optional>
#include <string>
#include <unordered_set>
#include <utility>

namespace arlib {

namespace {

constexpr size_t ScratchRegionSize = 0x100000;

// A plain file that was in the archive before this run.
bool mayBeKnown(const ArchiveMember* member) {
  return !member->isModified() && !member->isAuxiliary() && !member->getType()->isObjectModule();
}

} // namespace

SymbolTableMaker::SymbolTableMaker(Archive& archive)
    : m_Archive(archive),
      m_Region(alloclib::RegionGeneral::Create(ScratchRegionSize,
                                               "arlib::Archive::updateAuxiliaryMembers() region")),
      m_Records(elfext::parseAttributeString), m_SymbolHostingMembers(m_Region.get()),
      m_Output(m_Region.get()) {}

bool SymbolTableMaker::collect() {
  if (!collectKnownNames()) return false;
  collectSymbolHostingMembers();
  if (m_HasHostFailed) return false;
  if (!isTableWanted()) return true;
  if (!addVariantSymbols()) return false;
  addPlainSymbols();
  return true;
}

bool SymbolTableMaker::isTableWanted() const {
  if (m_SymbolHostingMembers.getSize() != 0) return true;
  const SymbolTableMode mode = m_Archive.getSymbolTableMode();
  return mode == SymbolTableMode::Always || (mode == SymbolTableMode::IfObjects && hasObjects());
}

bool SymbolTableMaker::hasObjects() const {
  const std::span<ArchiveMember* const> members = m_Archive.getMembers();
  return std::any_of(members.begin(), members.end(), [](const ArchiveMember* member) {
    return member->getType()->isObjectModule();
  });
}

// Another compiler's intermediate code is published by its own tools. What they have said of it is
// true as long as its bytes are the same. False after a report.
bool SymbolTableMaker::collectKnownNames() {
  if (m_Archive.getMachines() != elfext::ObjectOutline::Machines::Any) return true;
  // Most libraries hold objects and nothing else.
  const std::span<ArchiveMember* const> members = m_Archive.getMembers();
  if (!std::any_of(members.begin(), members.end(), mayBeKnown)) return true;
  return m_Archive.visitSymbols([this](const Symbol& symbol) {
    const ArchiveMember* member = symbol.getDefiningMember();
    if (!mayBeKnown(member)) return;
    if (symbol.hasBuildAttributes() || symbol.getName().empty()) return;
    SymbolNameList*& names = m_KnownNames[member];
    if (names == nullptr) names = alloclib::create<SymbolNameList>(*m_Region, m_Region.get());
    names->add(symbol.getName());
  });
}

void SymbolTableMaker::collectSymbolHostingMembers() {
  ObjectReading reading{m_Records};
  reading.outline.setMachines(m_Archive.getMachines());
  QUARN_ASSERT(1, m_SymbolHostingMembers.getSize() == 0);
  const std::span<ArchiveMember* const> members = m_Archive.getMembers();
  for (uint32_t place = 0; place < members.size(); ++place) {
    ArchiveMember* member = members[place];
    if (!member->getType()->isObjectModule())
      collectKnown(member, place);
    else if (!collectObject(member, place, reading))
      return;
  }
}

void SymbolTableMaker::collectKnown(ArchiveMember* member, uint32_t place) {
  const auto known = m_KnownNames.find(member);
  if (known == m_KnownNames.end()) return;
  const SymbolNameList* names = known->second;
  constexpr bool IsForeign = true;
  m_SymbolHostingMembers.append(
      {member, place, names, NamesKey(*names), m_Records.get(""), IsForeign});
}

// A member that can't be read is told of and has no entries. A handler that says to stop there
// leaves the table with the members collected so far.
bool SymbolTableMaker::collectObject(ArchiveMember* member, uint32_t place,
                                     ObjectReading& reading) {
  const auto* type = static_cast<const ObjectModuleArchiveMemberType*>(member->getType());
  auto* names = alloclib::create<SymbolNameList>(*m_Region, m_Region.get());
  std::optional<elfext::FullAttr> attributes;
  std::string reason;
  if (!type->getPublished(member, reading, *names, attributes, reason)) {
    m_HasHostFailed = reason.empty();
    if (m_HasHostFailed ||
        !m_Archive.goOn(&ErrorHandler::reportUnreadableMemberSymbols, *member, reason)) {
      return false;
    }
  }
  if (names->getSize() == 0) return true;
  m_SymbolHostingMembers.append({member, place, names, NamesKey(*names),
                                 attributes.value_or(m_Records.get("")),
                                 reading.outline.isForeign()});
  return true;
}

// They come before all others. A name of theirs may stand in the table more than once, also where
// other names may not.
bool SymbolTableMaker::addVariantSymbols() {
  m_IsMinorVariant.resize(m_SymbolHostingMembers.getSize());
  MinorVariants variants(m_Archive, *m_Region, m_Records);
  std::vector<HostingMember> members;
  for (const VariantGroup& group : findMinorVariants(m_SymbolHostingMembers.getSpan())) {
    members.clear();
    for (const uint32_t index : group) {
      m_IsMinorVariant[index] = true;
      members.push_back(m_SymbolHostingMembers[index]);
    }
    if (!variants.addSymbols(members, m_Output)) return false;
  }
  return true;
}

void SymbolTableMaker::addPlainSymbols() {
  if (m_Archive.getUniqueSymbolsOnly())
    return doNamesShareBytes() ? addUniqueSymbolsOfSharedBytes() : addUniqueSymbols();
  for (const HostingMember* hosting : getPlainMembers())
    m_Output.append({hosting->place, hosting->names, PlainEnding});
}

std::vector<const HostingMember*> SymbolTableMaker::getPlainMembers() const {
  std::vector<const HostingMember*> members;
  for (uint32_t index = 0; index < m_SymbolHostingMembers.getSize(); ++index) {
    if (!m_IsMinorVariant[index]) members.push_back(&m_SymbolHostingMembers[index]);
  }
  return members;
}

template <class IsKept>
void SymbolTableMaker::addSome(const HostingMember& hosting, IsKept isKept) {
  auto* kept = alloclib::create<SymbolNameList>(*m_Region, m_Region.get());
  for (const std::string_view name : hosting.names->getNames()) {
    if (isKept(name)) kept->addCopied(name);
  }
  m_Output.append({hosting.place, kept, PlainEnding});
}

void SymbolTableMaker::addUniqueSymbols() {
  std::unordered_set<std::string_view> seen;
  for (const HostingMember* hosting : getPlainMembers())
    addSome(*hosting, [&seen](std::string_view name) { return seen.insert(name).second; });
}

// Names that are more bytes than their object has in all.
bool SymbolTableMaker::doNamesShareBytes() const {
  return std::any_of(m_SymbolHostingMembers.begin(), m_SymbolHostingMembers.end(),
                     [](const HostingMember& hosting) {
                       return hosting.key.textSize > hosting.member->getSize();
                     });
}

// To look at each of them would take the sum of their lengths.
void SymbolTableMaker::addUniqueSymbolsOfSharedBytes() {
  const std::vector<const HostingMember*> members = getPlainMembers();
  std::vector<std::string_view> names;
  for (const HostingMember* hosting : members) {
    const std::span<const std::string_view> own = hosting->names->getNames();
    names.insert(names.end(), own.begin(), own.end());
  }
  const std::vector<bool> isFirst =
      support::findFirst(support::numberTexts(names, [](char character) { return character; }));
  size_t next = 0;
  for (const HostingMember* hosting : members)
    addSome(*hosting, [&](std::string_view) { return isFirst[next++]; });
}

uint64_t SymbolTableMaker::computeTableSize() const {
  uint64_t size = 4;
  for (const SymbolTableEntries& entries : m_Output)
    size += (4 + entries.ending.size()) * uint64_t{entries.names->getSize()} +
            entries.names->getTextSize();
  return size;
}

// The count, and the offset of each name's member.
std::vector<uint8_t> SymbolTableMaker::makeHead(const MemberLayout& layout) const {
  uint32_t count = 0;
  for (const SymbolTableEntries& entries : m_Output)
    count += entries.names->getSize();
  std::vector<uint8_t> bytes(4 + 4 * size_t{count});
  putBigEndian32(bytes.data(), count);
  size_t position = 4;
  for (const SymbolTableEntries& entries : m_Output) {
    for (uint32_t i = 0; i < entries.names->getSize(); ++i, position += 4)
      putBigEndian32(bytes.data() + position, layout.members[entries.place]);
  }
  return bytes;
}

std::unique_ptr<TableText> SymbolTableMaker::takeTable(const MemberLayout& layout) {
  auto text = std::make_unique<TableText>(std::move(m_Region));
  text->addHead(makeHead(layout));
  for (const auto& [place, names, ending] : m_Output)
    text->addTexts(names->getNames(), names->getTextSize(), ending);
  return text;
}

bool makeSymbolTable(Archive& archive, DerivedTables& tables) {
  const std::optional<uint64_t> longNamesSize =
      tables.longNames.getSizeAfter(archive.getFileNameTable());
  tables.symbols.fate = DerivedTable::Fate::Dropped;
  tables.layout = layOut(archive.getMembers(), std::nullopt, longNamesSize);
  if (archive.getSymbolTableMode() == SymbolTableMode::Never) return true;
  SymbolTableMaker maker(archive);
  if (!maker.collect()) return false;
  if (!maker.isTableWanted()) return true;
  const uint64_t size = maker.computeTableSize();
  if (size > MaximumFileSize) {
    return archive.fail(&ErrorHandler::reportWriteError, archive.getFileName(), EFBIG);
  }
  tables.layout = layOut(archive.getMembers(), size, longNamesSize);
  tables.symbols = {DerivedTable::Fate::Made, maker.takeTable(tables.layout)};
  QUARN_ASSERT(1, tables.symbols.text->getSize() == size);
  return true;
}

} // namespace arlib
