// SPDX-License-Identifier: Apache-2.0
//
// Finds the builds of one module, and decorates the names of those that are not the base. Members
// are compared by a cheap key first and by all of their names only where keys are equal, in sorted
// order: names can be chosen so that any hash of theirs is equal, and must not make this slow. Nor
// may names that share their bytes: a member whose names are far longer than itself is compared
// with none.
#include "arlib/src/minor_variants.h"

#include "arlib/interface/archive_format.h"
#include "elfext/interface/attribute_relations.h"
#include "elfext/interface/attribute_string.h"

#include <algorithm>
#include <cstring>
#include <map>
#include <utility>

namespace arlib {

namespace {

void addWord(uint64_t& hash, uint64_t word) {
  constexpr uint64_t OddFactor = 0x9E3779B97F4A7C15;
  hash = (hash ^ word) * OddFactor;
  hash ^= hash >> 32;
}

// Eight bytes of the name; the last ones where there are fewer at the place, and those of a shorter
// name are filled up.
uint64_t wordAt(std::string_view name, size_t position) {
  uint64_t word = 0;
  if (name.size() >= sizeof word)
    std::memcpy(&word, name.data() + std::min(position, name.size() - sizeof word), sizeof word);
  else
    std::memcpy(&word, name.data(), name.size());
  return word;
}

// Of a few bytes of a name that tell most names apart, however long it is. Names that have it in
// common are compared whole, so that it needs to be no better than quick.
uint64_t quickHash(std::string_view name) {
  constexpr size_t WordSize = sizeof(uint64_t);
  constexpr size_t EndSize = 4 * WordSize;
  const size_t size = name.size();
  uint64_t hash = size;
  for (size_t i = 0; i < std::min(size, EndSize); i += WordSize)
    addWord(hash, wordAt(name, i));
  for (size_t i = std::max(size, 2 * EndSize) - EndSize; i < size; i += WordSize)
    addWord(hash, wordAt(name, i));
  return hash;
}

// Names of a good object are about as long as the object, at most. Those that share their bytes a
// thousand times over are a trap for whoever compares them. Of foreign objects nobody could say
// which build is which.
bool isComparable(const HostingMember& hosting) {
  constexpr uint64_t LargestExcess = 4;
  constexpr uint64_t AlwaysFine = 0x100000;
  const uint64_t size = hosting.key.textSize;
  if (hosting.isForeign) return false;
  return size <= AlwaysFine || size / LargestExcess <= hosting.member->getSize();
}

using SortedNames = std::vector<std::string_view>;

SortedNames sortedNames(const SymbolNameList& names) {
  SortedNames sorted;
  sorted.reserve(names.getSize());
  for (uint32_t i = 0; i < names.getSize(); ++i)
    sorted.push_back(names[i]);
  std::sort(sorted.begin(), sorted.end());
  return sorted;
}

// Adds the groups among members of one key.
void splitByNames(std::span<const HostingMember> hostingMembers,
                  std::span<const uint32_t> candidates, std::vector<VariantGroup>& groups) {
  std::map<SortedNames, VariantGroup> byNames;
  for (const uint32_t candidate : candidates)
    byNames[sortedNames(*hostingMembers[candidate].names)].push_back(candidate);
  for (auto& [names, group] : byNames) {
    if (group.size() > 1) groups.push_back(std::move(group));
  }
}

} // namespace

NamesKey::NamesKey(const SymbolNameList& names)
    : count(names.getSize()), textSize(names.getTextSize()) {
  for (uint32_t i = 0; i < count; ++i)
    hash += quickHash(names[i]);
}

// Sorted by their keys, since names can be chosen so that a table of hashes has them all in one
// place.
std::vector<VariantGroup> findMinorVariants(std::span<const HostingMember> hostingMembers) {
  const auto keyOf = [&](uint32_t index) -> const NamesKey& { return hostingMembers[index].key; };
  std::vector<uint32_t> sorted;
  for (uint32_t i = 0; i < hostingMembers.size(); ++i) {
    if (isComparable(hostingMembers[i])) sorted.push_back(i);
  }
  std::stable_sort(sorted.begin(), sorted.end(),
                   [&](uint32_t left, uint32_t right) { return keyOf(left) < keyOf(right); });
  std::vector<VariantGroup> groups;
  for (auto first = sorted.begin(), last = first; first != sorted.end(); first = last) {
    last = std::find_if(first, sorted.end(),
                        [&](uint32_t index) { return keyOf(index) != keyOf(*first); });
    if (last - first > 1) splitByNames(hostingMembers, {first, last}, groups);
  }
  std::sort(groups.begin(), groups.end(), [](const VariantGroup& left, const VariantGroup& right) {
    return left.front() < right.front();
  });
  return groups;
}

elfext::FullAttr computeCommonAttributes(std::span<const elfext::FullAttr> attributes) {
  elfext::FullAttr common = attributes.front();
  for (const elfext::FullAttr& other : attributes)
    common = elfext::intersectFullAttr(common, other);
  return common;
}

bool addLibraryAttributes(elfext::FullAttr& attributes, const elfext::FullAttr* library) {
  return library == nullptr || elfext::mergeFullAttr(attributes, attributes, *library);
}

std::optional<Decoration> computeDecoration(const elfext::FullAttr& attributes,
                                            const elfext::FullAttr& common,
                                            AttributeRecords& records) {
  if (elfext::isSameBuild(attributes, common)) return std::nullopt;
  elfext::FullAttr difference;
  elfext::differenceFullAttr(difference, attributes, common);
  std::string text = elfext::printAttributeString(difference);
  elfext::FullAttr restored;
  elfext::mergeFullAttr(restored, records.get(text), common);
  return Decoration{std::move(text), elfext::isSameBuild(restored, attributes)};
}

bool MinorVariants::addSymbols(std::span<const HostingMember> group,
                               elfext::FastArray<SymbolTableEntries>& output) {
  m_Members.clear();
  m_Attributes.clear();
  for (const HostingMember& hosting : group) {
    m_Members.push_back(hosting.member);
    m_Attributes.push_back(hosting.attributes);
  }
  if (!findCommon()) return false;
  std::vector<const ArchiveMember*> baseVariants;
  for (size_t i = 0; i < group.size(); ++i) {
    const HostingMember& hosting = group[i];
    if (!addLibrary(*hosting.member, m_Attributes[i])) return false;
    const std::optional<Decoration> decoration =
        computeDecoration(m_Attributes[i], m_Common, m_Records);
    if (!decoration) {
      baseVariants.push_back(hosting.member);
      output.append({hosting.place, hosting.names, PlainEnding});
      continue;
    }
    // It stands also where it can't say all of the difference, which is only told of.
    if (!decoration->isComplete &&
        !m_Archive.goOn(&ErrorHandler::reportUndecoratableDifference, *hosting.member, m_Members))
      return false;
    const std::string suffix = std::string(AttributeMarker) + decoration->text;
    output.append({hosting.place,
                   hosting.names,
                   {alloclib::copyString(m_Region, suffix), suffix.size() + PlainEnding.size()}});
  }
  return reportBases(baseVariants);
}

// What all members need, with what the library needs as a whole.
bool MinorVariants::findCommon() {
  m_Common = computeCommonAttributes(m_Attributes);
  return addLibraryAttributes(m_Common, m_Archive.getLibraryAttributes()) ||
         m_Archive.goOn(&ErrorHandler::reportCommonAttributesIncompatible, m_Members, m_Common);
}

bool MinorVariants::addLibrary(const ArchiveMember& member, elfext::FullAttr& attributes) const {
  return addLibraryAttributes(attributes, m_Archive.getLibraryAttributes()) ||
         m_Archive.goOn(&ErrorHandler::reportMemberAttributesIncompatible, member, attributes);
}

bool MinorVariants::reportBases(const std::vector<const ArchiveMember*>& baseVariants) const {
  if (baseVariants.empty()) return m_Archive.goOn(&ErrorHandler::reportNoBaseVariant, m_Members);
  if (baseVariants.size() == 1) return true;
  return m_Archive.goOn(&ErrorHandler::reportMultipleBaseVariants, baseVariants);
}

} // namespace arlib
