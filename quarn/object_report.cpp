// SPDX-License-Identifier: Apache-2.0
//
// The reports of sizes and entry points. They always cover the whole archive, whatever the words
// of the command line say. An object that can't be read has no row and adds nothing. One that the
// host can't give ends the report: without it a total would be wrong.
#include "quarn/actions.h"

#include "arlib/interface/archive_member.h"
#include "elfext/interface/object_outline.h"
#include "elfext/interface/sizes_statistics.h"
#include "quarn/object_facts.h"
#include "quarn/reporting.h"
#include "support/interface/shared_texts.h"

#include <algorithm>
#include <cstdint>
#include <deque>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace quarn {

using arlib::ArchiveMember;
using ElfImage = arlib::ElfImageArchiveMemberType;

namespace {

struct EntryRecord {
  uint32_t offset;
  std::string_view sectionName; // a copy: the object is gone when it is printed
  std::string_view objectName;
};

class ObjectReport {
public:
  ObjectReport(arlib::Archive& archive, uint32_t flags) : m_Archive(archive), m_Flags(flags) {}

  // False after a report.
  [[nodiscard]] bool print();

private:
  [[nodiscard]] bool shows(ReportFlag flag) const { return (m_Flags & flag) != 0; }
  // False, after a report, if the host can't give it.
  [[nodiscard]] bool addMember(ArchiveMember& member);
  [[nodiscard]] bool addMembers();
  void addEntries(const ArchiveMember& member);
  void addSizes(const ObjectSizes& sizes, const ArchiveMember& member);
  void printEntries() const;

  arlib::Archive& m_Archive;
  uint32_t m_Flags;
  ObjectSizes m_Totals;
  elfext::ElfextErrorStringCapture m_Failure; // which the outline refers to
  elfext::ObjectOutline m_Outline;
  std::vector<EntryRecord> m_Entries;
  std::deque<std::string> m_SectionNames;
};

// The report has room for 32 bits.
void printRow(const ObjectSizes& sizes, std::string_view name) {
  const auto cut = [](uint64_t size) { return static_cast<uint32_t>(size); };
  messages::listingMessage(messages::SizesRow, cut(sizes.code), cut(sizes.readOnlyData),
                           cut(sizes.readWriteData), cut(sizes.zeroInitialised), cut(sizes.debug),
                           name);
}

bool ObjectReport::print() {
  if (shows(Report_Sizes)) messages::listingMessage(messages::SizesHeader);
  if (!addMembers()) return false;
  // The row is followed by an empty line.
  if (shows(Report_Sizes)) printRow(m_Totals, "TOTAL\n");
  if (shows(Report_Entries)) printEntries();
  return true;
}

bool ObjectReport::addMembers() {
  const std::span<ArchiveMember* const> members = m_Archive.getMembers();
  return std::all_of(members.begin(), members.end(), [this](ArchiveMember* member) {
    return member->getType() != ElfImage::getInstance() || addMember(*member);
  });
}

bool ObjectReport::addMember(ArchiveMember& member) {
  if (!ElfImage::readOutline(member, m_Failure, false, m_Outline))
    return !m_Failure.getText().empty();
  const std::optional<elfext::SizesStatistics> totals = m_Outline.computeSizes();
  if (!totals) return !ElfImage::reportHostFailure(member, m_Failure);
  if (shows(Report_Entries)) addEntries(member);
  addSizes(columnsOf(*totals), member);
  return true;
}

void ObjectReport::addEntries(const ArchiveMember& member) {
  const auto copy = [this](std::string_view whole) -> std::string_view {
    return m_SectionNames.emplace_back(whole);
  };
  for (const std::string_view name : support::copyShared(entrySectionsOf(m_Outline), copy))
    m_Entries.push_back({static_cast<uint32_t>(m_Outline.getEntry()), name, member.getName()});
}

void ObjectReport::addSizes(const ObjectSizes& sizes, const ArchiveMember& member) {
  if (shows(Report_Sizes)) printRow(sizes, member.getName());
  m_Totals.code += sizes.code;
  m_Totals.readOnlyData += sizes.readOnlyData;
  m_Totals.readWriteData += sizes.readWriteData;
  m_Totals.zeroInitialised += sizes.zeroInitialised;
  m_Totals.debug += sizes.debug;
}

void ObjectReport::printEntries() const {
  for (const EntryRecord& entry : m_Entries) {
    messages::listingMessage(messages::EntryPoint, entry.offset, entry.sectionName,
                             entry.objectName);
  }
  if (m_Entries.empty()) messages::listingMessage(messages::NoEntryPoints);
}

} // namespace

void reportObjects(Run& run, uint32_t flags) {
  // A member that somebody has cut short meanwhile looks like one that is no object. Too late to
  // take anything back, but not to tell.
  if (ObjectReport(run.archive, flags).print()) run.archive.checkOwnFile();
}

} // namespace quarn
