// SPDX-License-Identifier: Apache-2.0
//
// Each object is read once: names, attributes, sizes and entry point come from the same outline.
// What the host can't give is an error of the run, and no document comes out of it.
#include "quarn-json/member_facts.h"

#include "elfext/interface/attribute_string.h"
#include "quarn/object_facts.h"

#include <nlohmann/json.hpp>

#include <optional>
#include <string>

namespace quarn_json {

using arlib::ArchiveMember;

namespace {

Json headerOf(const ArchiveMember& member) {
  Json row;
  putName(row, "name", member.getName());
  row["offset"] = member.getOffset();
  row["size"] = member.getSize();
  row["date"] = member.getDate();
  row["uid"] = member.getUid();
  row["gid"] = member.getGid();
  row["mode"] = member.getMode();
  return row;
}

Json rowOf(const quarn::ObjectSizes& sizes) {
  return {{"code", sizes.code},
          {"readOnlyData", sizes.readOnlyData},
          {"readWriteData", sizes.readWriteData},
          {"zeroInitialised", sizes.zeroInitialised},
          {"debug", sizes.debug}};
}

// False if there is no reason: then it was the host, which has been reported.
bool addRefusal(std::string_view reason, Json& row) {
  row["kind"] = "unreadable";
  row["reason"] = reason;
  return !reason.empty();
}

// Nothing if there are more bytes of names than the object has in all: a hostile one lets a million
// sections share a name of a megabyte.
std::optional<Json> entrySectionsOf(const elfext::ObjectOutline& outline, uint64_t objectSize) {
  Json sections = Json::array();
  uint64_t bytes = 0;
  for (const char* text : quarn::entrySectionsOf(outline)) {
    const std::string_view name = text;
    bytes += name.size();
    if (bytes > objectSize) return std::nullopt;
    Json section;
    putName(section, "name", name);
    sections.push_back(std::move(section));
  }
  return sections;
}

} // namespace

MemberReader::MemberReader(elfext::ObjectOutline::Machines machines,
                           alloclib::RegionGeneral& region)
    : m_Region(region), m_Records(elfext::parseAttributeString), m_Reading{m_Records} {
  m_Reading.outline.setMachines(machines);
}

std::optional<Json> MemberReader::read(ArchiveMember& member, uint32_t place) {
  Json row = headerOf(member);
  if (!member.getType()->isObjectModule())
    row["kind"] = "file";
  else if (!addObject(member, place, row))
    return std::nullopt;
  return row;
}

bool MemberReader::addObject(ArchiveMember& member, uint32_t place, Json& row) {
  const auto* type = static_cast<const arlib::ObjectModuleArchiveMemberType*>(member.getType());
  auto* names = alloclib::create<arlib::SymbolNameList>(m_Region, &m_Region);
  std::optional<elfext::FullAttr> attributes;
  std::string reason;
  if (!type->getPublished(&member, m_Reading, *names, attributes, reason))
    return addRefusal(reason, row);
  const elfext::ObjectOutline& outline = m_Reading.outline;
  if (names->getSize() != 0) {
    m_HostingMembers.push_back({&member, place, names, arlib::NamesKey(*names),
                                attributes ? *attributes : m_Records.get(""), outline.isForeign()});
  }
  if (outline.isEmpty()) {
    row["kind"] = "file"; // it only begins like an object
  } else if (outline.isForeign()) {
    row["kind"] = "foreign";
    row["entry"] = outline.getEntry();
  } else {
    return addOwnObject(member, attributes, row);
  }
  return true;
}

bool MemberReader::addOwnObject(const ArchiveMember& member,
                                const std::optional<elfext::FullAttr>& attributes, Json& row) {
  elfext::ObjectOutline& outline = m_Reading.outline;
  const std::optional<elfext::SizesStatistics> totals = outline.computeSizes();
  if (!totals) {
    arlib::ElfImageArchiveMemberType::reportHostFailure(member, m_Reading.failure);
    return addRefusal(m_Reading.failure.getText(), row);
  }
  std::optional<Json> entrySections = entrySectionsOf(outline, member.getSize());
  if (!entrySections)
    return addRefusal("Names of sections with the entry point share their bytes", row);
  row["kind"] = "object";
  row["sizes"] = rowOf(quarn::columnsOf(*totals));
  row["entry"] = outline.getEntry();
  row["entrySections"] = std::move(*entrySections);
  row["attributes"] = nullptr;
  if (attributes) row["attributes"] = elfext::printAttributeString(*attributes);
  return true;
}

} // namespace quarn_json
