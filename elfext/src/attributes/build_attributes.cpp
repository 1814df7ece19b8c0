// SPDX-License-Identifier: Apache-2.0
//
// A set of tags: setting and asking, what one tag does to others, equality, and the set operations.
// The tags are the truth; the record follows when it is asked for. Values are the file's: numbers
// are cut to a byte and texts to 31 bytes as they come in, and lists (Tag_compatibility,
// Tag_also_compatible_with) may be as long as an attribute section, so one list is held against
// another by sets and not entry by entry.
#include "elfext/interface/build_attributes.h"

#include "checking/interface/checking.h"
#include "elfext/interface/attribute_relations.h"
#include "elfext/interface/attribute_string.h"
#include "elfext/src/attributes/standard_tags.h"

#include <algorithm>
#include <functional>
#include <set>

namespace elfext {

namespace {

// Says that code wants more than the public ABI has: the interlocks below keep it.
const CompatibilityTag ZevCompatibility = {2, std::string(ZevVendor)};

constexpr std::string_view DefaultConformance = "2.09";

std::string cut(std::string_view text) {
  return std::string(text.substr(0, LongestText));
}

template <class List>
bool contains(const OwnedValue<List>& list, const typename List::value_type& entry) {
  return list && std::ranges::find(*list, entry) != list->end();
}

template <class Map>
bool hasEntry(const OwnedValue<Map>& map, const typename Map::value_type& entry) {
  if (!map) return false;
  const auto found = map->find(entry.first);
  return found != map->end() && found->second == entry.second;
}

// For who looks for many: lists may have thousands.
template <class Entry>
std::set<Entry> entriesOf(const OwnedValue<std::vector<Entry>>& list) {
  return list ? std::set<Entry>(list->begin(), list->end()) : std::set<Entry>();
}

// In their order, as often as they are there.
template <class Entry>
std::vector<Entry> entriesBeyond(const OwnedValue<std::vector<Entry>>& list,
                                 const OwnedValue<std::vector<Entry>>& other) {
  std::vector<Entry> beyond;
  if (!list) return beyond;
  const std::set<Entry> known = entriesOf(other);
  for (const Entry& entry : *list) {
    if (!known.contains(entry)) beyond.push_back(entry);
  }
  return beyond;
}

template <class Entry>
void keepCommon(OwnedValue<std::vector<Entry>>& kept, const OwnedValue<std::vector<Entry>>& left,
                const OwnedValue<std::vector<Entry>>& right) {
  if (!left || !right) return;
  const std::set<Entry> known = entriesOf(right);
  for (const Entry& entry : *left) {
    if (known.contains(entry)) kept.make().push_back(entry);
  }
}

template <class Value>
void keepCommon(OwnedValue<std::map<uint32_t, Value>>& kept,
                const OwnedValue<std::map<uint32_t, Value>>& left,
                const OwnedValue<std::map<uint32_t, Value>>& right) {
  if (!left) return;
  for (const auto& entry : *left) {
    if (hasEntry(right, entry)) kept.make().insert(entry);
  }
}

template <class List>
uint32_t countOf(const OwnedValue<List>& list) {
  return list ? static_cast<uint32_t>(list->size()) : 0;
}

void addToHash(size_t& hash, size_t value) {
  // The multiplier of FNV-1a.
  hash = (hash ^ value) * 0x100000001B3;
}

} // namespace

BuildAttributes::BuildAttributes(std::string_view attributeText)
    : m_FullAttr(parseAttributeString(attributeText)) {
  deriveStandardTags();
}

BuildAttributes BuildAttributes::makeInvalid() {
  BuildAttributes attributes;
  attributes.m_Valid = false;
  return attributes;
}

void BuildAttributes::setFullAttr(const FullAttr& record) {
  m_FullAttr = record;
  m_FlagsStale = false;
}

// ---- Tags

uint32_t BuildAttributes::getNumber(uint32_t place) const {
  if (!hasNumber(place)) return 0;
  // This one is kept whole; the others are bytes.
  return place == placeOf(Tag_CPU_arch) ? m_CpuArch : m_Numbers[place];
}

void BuildAttributes::putNumber(uint32_t place, uint32_t value) {
  m_Present |= uint64_t{1} << place;
  if (place == placeOf(Tag_CPU_arch))
    m_CpuArch = value;
  else
    m_Numbers[place] = static_cast<uint8_t>(value);
}

void BuildAttributes::markFed(uint32_t place) {
  // The record is made anew at the next look and not at each of forty tags.
  if (NumericTagRows[place].feedsRecord) m_FlagsStale = true;
}

bool BuildAttributes::hasTag(uint32_t tag) const {
  QUARN_ASSERT(1, tag >= FirstAttributeTag);
  if (tag == Tag_compatibility) return countOf(m_CompatibilityTags) != 0;
  if (tag == Tag_also_compatible_with) return countOf(m_AlsoCompatibilityTags) != 0;
  if (const uint8_t place = placeOf(tag); place != NoPlace) return hasNumber(place);
  if (const uint8_t place = textPlaceOf(tag); place != NoPlace) return m_Texts[place].has_value();
  return (m_OtherNumericTags && m_OtherNumericTags->contains(tag)) ||
         (m_OtherStringTags && m_OtherStringTags->contains(tag));
}

uint32_t BuildAttributes::getNumericTag(uint32_t tag) const {
  QUARN_ASSERT(1, BuildAttributesTagClassifier::isQobixNumericTag(tag));
  if (const uint8_t place = placeOf(tag); place != NoPlace) return getNumber(place);
  if (!m_OtherNumericTags) return 0;
  const auto found = m_OtherNumericTags->find(tag);
  return found == m_OtherNumericTags->end() ? 0 : found->second;
}

std::string_view BuildAttributes::getStringTag(uint32_t tag) const {
  QUARN_ASSERT(1, BuildAttributesTagClassifier::isQobixStringTag(tag));
  if (const uint8_t place = textPlaceOf(tag); place != NoPlace) {
    return m_Texts[place] ? std::string_view(*m_Texts[place]) : std::string_view();
  }
  if (!m_OtherStringTags) return {};
  const auto found = m_OtherStringTags->find(tag);
  return found == m_OtherStringTags->end() ? std::string_view() : found->second;
}

void BuildAttributes::setNumericTag(uint32_t tag, uint32_t value) {
  QUARN_ASSERT(1, BuildAttributesTagClassifier::isQobixNumericTag(tag));
  const uint8_t place = placeOf(tag);
  if (place == NoPlace) {
    m_OtherNumericTags.make()[tag] = value;
    return;
  }
  putNumber(place, value);
  markFed(place);
  if (tag != Tag_ABI_optimization_goals) return;
  const uint32_t goals = getNumber(place);
  applyFlagString(m_FullAttr.m_Flags, goals == 1 || goals == 2 ? "-otime" : "-ospace");
}

void BuildAttributes::setStringTag(uint32_t tag, std::string_view text) {
  QUARN_ASSERT(1, BuildAttributesTagClassifier::isQobixStringTag(tag));
  QUARN_ASSERT(1, tag != Tag_also_compatible_with);
  const uint8_t place = textPlaceOf(tag);
  // A set states a conformance or a compatibility; see setConformance.
  if (tag == Tag_conformance)
    setConformance(text);
  else if (place == NoPlace)
    m_OtherStringTags.make()[tag] = text;
  else
    m_Texts[place] = cut(text);
}

void BuildAttributes::removeTag(uint32_t tag) {
  QUARN_ASSERT(1, tag >= FirstAttributeTag);
  if (tag == Tag_compatibility && m_CompatibilityTags) m_CompatibilityTags->clear();
  if (tag == Tag_also_compatible_with && m_AlsoCompatibilityTags) m_AlsoCompatibilityTags->clear();
  if (const uint8_t place = placeOf(tag); place != NoPlace) {
    dropNumber(place);
    markFed(place);
  }
  if (const uint8_t place = textPlaceOf(tag); place != NoPlace) m_Texts[place].reset();
  if (m_OtherNumericTags) m_OtherNumericTags->erase(tag);
  if (m_OtherStringTags) m_OtherStringTags->erase(tag);
}

bool BuildAttributes::hasTag(ZevTag tag) const {
  return hasNumber(placeOf(tag));
}

uint32_t BuildAttributes::getNumericTag(ZevTag tag) const {
  return getNumber(placeOf(tag));
}

void BuildAttributes::setNumericTag(ZevTag tag, uint32_t value) {
  putNumber(placeOf(tag), value);
  followZevTag(tag);
}

void BuildAttributes::removeTag(ZevTag tag) {
  dropNumber(placeOf(tag));
  followZevTag(tag);
}

// ---- Interlocks

void BuildAttributes::followZevTag(ZevTag tag) {
  markFed(placeOf(tag));
  switch (tag) {
  case ZevTag::Tag_ZV_interworking:
  case ZevTag::Tag_ZV_mdivide:
    return followInterworking();
  case ZevTag::Tag_ZV_require8:
  case ZevTag::Tag_ZV_eba:
    return followStackAlignment();
  default:
    return;
  }
}

// Code that relies on the maker's interworking or division says so in the public ABI's way too.
void BuildAttributes::followInterworking() {
  if (getNumericTag(ZevTag::Tag_ZV_interworking) != 0 ||
      getNumericTag(ZevTag::Tag_ZV_mdivide) != 0) {
    addCompatibilityTag(ZevCompatibility.flag, ZevCompatibility.vendor);
    return;
  }
  if (!m_CompatibilityTags) return;
  const auto found = std::ranges::find(*m_CompatibilityTags, ZevCompatibility);
  if (found != m_CompatibilityTags->end()) m_CompatibilityTags->erase(found);
}

// An eba of 1 promises no alignment, even where require8 asks for it.
void BuildAttributes::followStackAlignment() {
  const uint32_t eba = getNumericTag(ZevTag::Tag_ZV_eba);
  uint32_t needed = 0;
  if (eba == 2)
    needed = 2;
  else if (eba == 0 && getNumericTag(ZevTag::Tag_ZV_require8) == 0)
    needed = 1;
  // The public ABI's tag for the same thing.
  setNumericTag(Tag_ABI_align_needed, needed);
}

// ---- Lists

bool BuildAttributes::addCompatibilityTag(uint32_t flag, std::string_view vendor) {
  m_Texts[textPlaceOf(Tag_conformance)].reset();
  CompatibilityTag entry = {flag, std::string(vendor)};
  if (contains(m_CompatibilityTags, entry)) return false;
  appendCompatibilityTag(std::move(entry));
  return true;
}

void BuildAttributes::appendCompatibilityTag(CompatibilityTag entry) {
  m_Texts[textPlaceOf(Tag_conformance)].reset();
  m_CompatibilityTags.make().push_back(std::move(entry));
}

// As one by one, but in one walk.
void BuildAttributes::addCompatibilityTags(const std::vector<CompatibilityTag>& entries) {
  std::set<CompatibilityTag> present = entriesOf(m_CompatibilityTags);
  for (const CompatibilityTag& entry : entries) {
    m_Texts[textPlaceOf(Tag_conformance)].reset();
    if (present.insert(entry).second) appendCompatibilityTag(entry);
  }
}

uint32_t BuildAttributes::removeCompatibilityTag(std::string_view vendor) {
  if (!m_CompatibilityTags) return 0;
  return static_cast<uint32_t>(std::erase_if(
      *m_CompatibilityTags, [vendor](const auto& entry) { return entry.vendor == vendor; }));
}

uint32_t BuildAttributes::getCompatibilityTagCount() const {
  return countOf(m_CompatibilityTags);
}

void BuildAttributes::getCompatibilityTag(uint32_t index, CompatibilityTag& result) const {
  QUARN_ASSERT(1, m_CompatibilityTags != NULL);
  result = (*m_CompatibilityTags)[index];
}

void BuildAttributes::addAlsoCompatibilityTag(AlsoCompatibilityTag entry) {
  m_AlsoCompatibilityTags.make().push_back(std::move(entry));
}

void BuildAttributes::addMissingAlsoCompatibilityTags(
    const std::vector<AlsoCompatibilityTag>& entries) {
  std::set<AlsoCompatibilityTag> present = entriesOf(m_AlsoCompatibilityTags);
  for (const AlsoCompatibilityTag& entry : entries) {
    if (present.insert(entry).second) addAlsoCompatibilityTag(entry);
  }
}

bool BuildAttributes::hasAlsoCompatibilityTag(const AlsoCompatibilityTag& entry) const {
  return contains(m_AlsoCompatibilityTags, entry);
}

uint32_t BuildAttributes::getAlsoCompatibilityTagCount() const {
  return countOf(m_AlsoCompatibilityTags);
}

void BuildAttributes::getAlsoCompatibilityTag(uint32_t index, AlsoCompatibilityTag& result) const {
  QUARN_ASSERT(1, m_AlsoCompatibilityTags != NULL);
  result = (*m_AlsoCompatibilityTags)[index];
}

void BuildAttributes::setConformance(std::string_view text) {
  if (countOf(m_CompatibilityTags) == 0) m_Texts[textPlaceOf(Tag_conformance)] = cut(text);
}

void BuildAttributes::setDefaultConformance() {
  setConformance(DefaultConformance);
}

// ---- Equality

bool BuildAttributes::operator==(const BuildAttributes& other) const {
  if (m_Valid != other.m_Valid) return false;
  if (!m_Valid) return true;
  constexpr uint64_t NotCompared = uint64_t{1} << placeOf(Tag_Z64_ISA_use);
  // One comparison for the presence of all numbers.
  if (((m_Present ^ other.m_Present) & ~NotCompared) != 0) return false;
  for (uint32_t place = 0; place < NumberCount; ++place) {
    if (place != placeOf(Tag_Z64_ISA_use) && getNumber(place) != other.getNumber(place))
      return false;
  }
  return m_Texts == other.m_Texts && m_CompatibilityTags == other.m_CompatibilityTags &&
         m_AlsoCompatibilityTags == other.m_AlsoCompatibilityTags &&
         m_OtherNumericTags == other.m_OtherNumericTags &&
         m_OtherStringTags == other.m_OtherStringTags;
}

bool BuildAttributes::hasEqualRecordToo(const BuildAttributes& other) const {
  return *this == other && getFullAttr() == other.getFullAttr();
}

size_t BuildAttributes::getHash() const {
  size_t hash = 0;
  for (uint32_t place = 0; place < NumberCount; ++place) {
    // What equality leaves out the hash leaves out too.
    if (place != placeOf(Tag_Z64_ISA_use) && hasNumber(place))
      addToHash(hash, size_t{place} << 32 | getNumber(place));
  }
  for (const std::optional<std::string>& text : m_Texts)
    addToHash(hash, std::hash<std::string_view>{}(text ? *text : std::string_view("-")));
  if (m_CompatibilityTags) {
    for (const CompatibilityTag& entry : *m_CompatibilityTags)
      addToHash(hash, entry.flag ^ std::hash<std::string>{}(entry.vendor));
  }
  if (m_AlsoCompatibilityTags) {
    for (const AlsoCompatibilityTag& entry : *m_AlsoCompatibilityTags) {
      addToHash(hash, size_t{entry.tag} << 32 | entry.number.value_or(0));
      addToHash(hash, std::hash<std::string_view>{}(entry.text ? *entry.text : std::string_view()));
    }
  }
  return hash;
}

// ---- Set operations

void BuildAttributes::copyMissingNumbers(const BuildAttributes& other) {
  for (uint32_t place = 0; place < NumberCount; ++place) {
    const NumericTagRow& row = NumericTagRows[place];
    if (!other.hasNumber(place) || hasNumber(place)) continue;
    if (row.isZev)
      setNumericTag(static_cast<ZevTag>(row.number), other.getNumber(place));
    else
      setNumericTag(row.number, other.getNumber(place));
  }
}

void BuildAttributes::copyMissingOthers(const BuildAttributes& other) {
  if (other.m_CompatibilityTags) addCompatibilityTags(*other.m_CompatibilityTags);
  if (other.m_AlsoCompatibilityTags)
    addMissingAlsoCompatibilityTags(*other.m_AlsoCompatibilityTags);
  if (other.m_OtherNumericTags) {
    for (const auto& entry : *other.m_OtherNumericTags)
      m_OtherNumericTags.make().insert(entry);
  }
  if (other.m_OtherStringTags) {
    for (const auto& entry : *other.m_OtherStringTags)
      m_OtherStringTags.make().insert(entry);
  }
}

// Tags of vendor "ZEV" come last, as they have consequences for others.
BuildAttributes BuildAttributes::getUnion(const BuildAttributes& a, const BuildAttributes& b) {
  if (!a.m_Valid || !b.m_Valid) return makeInvalid();
  // What `b` has stays, and `a` fills the gaps.
  BuildAttributes result = b;
  for (uint32_t place = 0; place < TextCount; ++place) {
    if (!a.m_Texts[place] || result.m_Texts[place]) continue;
    result.setStringTag(TextTags[place], *a.m_Texts[place]);
  }
  result.copyMissingOthers(a);
  result.copyMissingNumbers(a);
  return result;
}

void BuildAttributes::copyDifferentOthers(const BuildAttributes& from,
                                          const BuildAttributes& against) {
  addCompatibilityTags(entriesBeyond(from.m_CompatibilityTags, against.m_CompatibilityTags));
  for (AlsoCompatibilityTag& entry :
       entriesBeyond(from.m_AlsoCompatibilityTags, against.m_AlsoCompatibilityTags))
    addAlsoCompatibilityTag(std::move(entry));
  if (from.m_OtherNumericTags) {
    for (const auto& entry : *from.m_OtherNumericTags) {
      if (!hasEntry(against.m_OtherNumericTags, entry)) m_OtherNumericTags.make().insert(entry);
    }
  }
  if (from.m_OtherStringTags) {
    for (const auto& entry : *from.m_OtherStringTags) {
      if (!hasEntry(against.m_OtherStringTags, entry)) m_OtherStringTags.make().insert(entry);
    }
  }
}

BuildAttributes BuildAttributes::getDifference(const BuildAttributes& a, const BuildAttributes& b) {
  if (!a.m_Valid || !b.m_Valid) return makeInvalid();
  BuildAttributes result;
  differenceFullAttr(result.m_FullAttr, b.getFullAttr(), a.getFullAttr());
  for (uint32_t place = 0; place < NumberCount; ++place) {
    // It is there or not; its value says nothing.
    const bool differs = place == placeOf(Tag_nodefaults)
                             ? !a.hasNumber(place) && b.hasNumber(place)
                             : a.getNumber(place) != b.getNumber(place);
    if (differs) result.putNumber(place, b.getNumber(place));
  }
  for (const uint32_t tag : TextTags) {
    if (a.getStringTag(tag) != b.getStringTag(tag)) result.setStringTag(tag, b.getStringTag(tag));
  }
  result.copyDifferentOthers(b, a);
  return result;
}

BuildAttributes BuildAttributes::getIntersection(const BuildAttributes& a,
                                                 const BuildAttributes& b) {
  if (!a.m_Valid || !b.m_Valid) return makeInvalid();
  BuildAttributes result;
  result.m_FullAttr = intersectFullAttr(a.getFullAttr(), b.getFullAttr());
  for (uint32_t place = 0; place < NumberCount; ++place) {
    if (a.hasNumber(place) && b.hasNumber(place) && a.getNumber(place) == b.getNumber(place))
      result.putNumber(place, a.getNumber(place));
  }
  for (uint32_t place = 0; place < TextCount; ++place) {
    if (a.m_Texts[place] == b.m_Texts[place]) result.m_Texts[place] = a.m_Texts[place];
  }
  keepCommon(result.m_CompatibilityTags, a.m_CompatibilityTags, b.m_CompatibilityTags);
  keepCommon(result.m_AlsoCompatibilityTags, a.m_AlsoCompatibilityTags, b.m_AlsoCompatibilityTags);
  keepCommon(result.m_OtherNumericTags, a.m_OtherNumericTags, b.m_OtherNumericTags);
  keepCommon(result.m_OtherStringTags, a.m_OtherStringTags, b.m_OtherStringTags);
  return result;
}

BuildAttributes BuildAttributes::getCheckedCombination(const BuildAttributes& a,
                                                       const BuildAttributes& b) {
  FullAttr merged;
  if (!a.m_Valid || !b.m_Valid || !mergeFullAttr(merged, a.getFullAttr(), b.getFullAttr()))
    return makeInvalid();
  BuildAttributes result = getUnion(a, b);
  // Together they need the higher one.
  if (result.hasTag(Tag_CPU_arch))
    result.m_CpuArch = std::max(a.getNumericTag(Tag_CPU_arch), b.getNumericTag(Tag_CPU_arch));
  result.setFullAttr(merged);
  return result;
}

} // namespace elfext
