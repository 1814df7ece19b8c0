// SPDX-License-Identifier: Apache-2.0
//
// Members, the symbol table as it stands in the file, and which members are builds of one module by
// what they hold now. Other facts refer to members by their places in the list, as names need not
// be the only ones of their kind.
#include "quarn-json/library_facts.h"

#include "alloclib/interface/region_objects.h"
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/attribute_text_cache.h"
#include "quarn-json/member_facts.h"

#include <nlohmann/json.hpp>

#include <optional>
#include <unordered_map>
#include <vector>

namespace quarn_json {

using arlib::Archive;
using arlib::ArchiveMember;

namespace {

constexpr size_t NamesRegionSize = 0x100000;

std::string reprinted(std::string_view attributeText) {
  return elfext::printAttributeString(elfext::parseAttributeString(attributeText));
}

class LibraryFacts {
public:
  LibraryFacts(Archive& archive, Document& document)
      : m_Archive(archive), m_Document(document),
        m_Region(alloclib::RegionGeneral::Create(NamesRegionSize, "names of a library")),
        m_Reader(archive.getMachines(), *m_Region) {}

  // False after a report, and the document is of no use.
  [[nodiscard]] bool put();

private:
  void putHead();
  [[nodiscard]] bool putMembers();
  [[nodiscard]] bool putSymbols();
  void putVariantGroups();
  [[nodiscard]] Json rowOf(const arlib::VariantGroup& group);
  [[nodiscard]] Json rowOf(const arlib::HostingMember& hosting, const elfext::FullAttr& attributes,
                           const elfext::FullAttr& common);

  Archive& m_Archive;
  Document& m_Document;
  alloclib::RegionOwner m_Region;
  MemberReader m_Reader;
  std::unordered_map<const ArchiveMember*, uint32_t> m_Places; // in the document; only to find them
};

bool LibraryFacts::put() {
  m_Document.startLibrary();
  putHead();
  if (!putMembers() || !putSymbols()) return false;
  putVariantGroups();
  m_Document.endLibrary();
  return true;
}

void LibraryFacts::putHead() {
  Json head;
  putName(head, "file", m_Archive.getFileName());
  head["attributes"] = nullptr;
  if (const elfext::FullAttr* attributes = m_Archive.getLibraryAttributes(); attributes != nullptr)
    head["attributes"] = elfext::printAttributeString(*attributes);
  head["symbolTable"] = nullptr;
  if (const ArchiveMember* table = m_Archive.getSymbolTable(); table != nullptr)
    head["symbolTable"] = {{"offset", table->getOffset()}, {"size", table->getSize()}};
  for (const auto& [name, value] : head.items())
    m_Document.putField(name, value);
}

bool LibraryFacts::putMembers() {
  m_Document.startList("members");
  for (ArchiveMember* member : m_Archive.getMembers()) {
    if (member->isAuxiliary()) continue;
    const auto place = static_cast<uint32_t>(m_Places.size());
    m_Places.emplace(member, place);
    const std::optional<Json> row = m_Reader.read(*member, place);
    if (!row) return false;
    m_Document.putRow(*row);
  }
  m_Document.endList();
  return true;
}

bool LibraryFacts::putSymbols() {
  elfext::AttributeTextCache<std::string> attributes(reprinted);
  m_Document.startList("symbols");
  const bool isWhole = m_Archive.visitSymbols([&](const arlib::Symbol& symbol) {
    Json row;
    putName(row, "name", symbol.getName());
    row["member"] = m_Places.at(symbol.getDefiningMember());
    if (symbol.hasBuildAttributes()) row["attributes"] = attributes.get(symbol.getAttributeText());
    m_Document.putRow(row);
  });
  m_Document.endList();
  return isWhole;
}

void LibraryFacts::putVariantGroups() {
  m_Document.startList("variantGroups");
  for (const arlib::VariantGroup& group : arlib::findMinorVariants(m_Reader.getHostingMembers()))
    m_Document.putRow(rowOf(group));
  m_Document.endList();
}

// What no target can have together is told of by the run that makes the symbol table. It counts
// here as it does there.
Json LibraryFacts::rowOf(const arlib::VariantGroup& group) {
  const elfext::FullAttr* library = m_Archive.getLibraryAttributes();
  std::vector<elfext::FullAttr> builds;
  for (const uint32_t index : group)
    builds.push_back(m_Reader.getHostingMembers()[index].attributes);
  elfext::FullAttr common = arlib::computeCommonAttributes(builds);
  static_cast<void>(arlib::addLibraryAttributes(common, library));
  Json variants = Json::array();
  for (size_t i = 0; i < group.size(); ++i) {
    static_cast<void>(arlib::addLibraryAttributes(builds[i], library));
    variants.push_back(rowOf(m_Reader.getHostingMembers()[group[i]], builds[i], common));
  }
  return {{"attributes", elfext::printAttributeString(common)}, {"variants", std::move(variants)}};
}

Json LibraryFacts::rowOf(const arlib::HostingMember& hosting, const elfext::FullAttr& attributes,
                         const elfext::FullAttr& common) {
  const std::optional<arlib::Decoration> decoration =
      arlib::computeDecoration(attributes, common, m_Reader.getRecords());
  if (!decoration) return {{"member", hosting.place}, {"isBase", true}};
  return {{"member", hosting.place},
          {"isBase", false},
          {"decoration", decoration->text},
          {"isComplete", decoration->isComplete}};
}

} // namespace

void putFacts(Archive& archive, Document& document) {
  // A member that somebody has cut short meanwhile looks like one that can't be read.
  if (LibraryFacts(archive, document).put()) archive.checkOwnFile();
}

} // namespace quarn_json
