// SPDX-License-Identifier: Apache-2.0
//
// Reads a map, and asks it what a library's name says. The file is a user's: it is read in pieces,
// a line without an end counts as several, and what is no line of the format says nothing. A map
// that isn't there is replaced by the built-in one. So is one that can't be read, and the caller is
// told why: who has asked for a map wants no other.
#include "elfext/interface/library_attribute_map.h"

#include "elfext/interface/attribute_relations.h"
#include "elfext/interface/attribute_string.h"
#include "support/interface/letters.h"
#include "support/interface/pattern.h"

#include <algorithm>
#include <cerrno>
#include <cstdint>

namespace elfext {

namespace {

// Each letter behind the "_" of a library's name tells of one choice.
// clang-format off
constexpr std::string_view BuiltInLines[] = {
    "*_a* $IEEE1$ZEV_ISAv4",
    "*_t* $IEEE1$KRELL_ISAv1",
    "*_w* $IEEE1$KRELL_ISAv4~$ZEV_ISAv1",
    "*_?f* $IEEE1$KCPv3",
    "*_?v* $IEEE1$HFUv1",
    "*_??p* $IEEE1$PE",
    "*_??m* $IEEE1$ME",
    "*_???s* $IEEE1$STKCKD",
    "*_???u* $IEEE1$~STKCKD",
    "*_????e* $IEEE1$RWPI",
    "*_????n* $IEEE1$~SHL",
    "g_* $IEEE1$IEEEX fz",
    "f_* $IEEE1$IEEEF fz",
    "fj_* $IEEE1$IEEEJ fz",
};
// clang-format on

// The next word of the line, which loses it; empty at the line's end.
std::string_view takeWord(std::string_view& line) {
  const auto begin = std::ranges::find_if_not(line, support::isWhiteSpace);
  const auto end = std::find_if(begin, line.end(), support::isWhiteSpace);
  const std::string_view word(begin, end);
  line = std::string_view(end, line.end());
  return word;
}

void addLine(LibraryAttributeMap& map, std::string_view line) {
  if (line.starts_with('#')) return;
  const std::string_view pattern = takeWord(line);
  const std::string_view attributes = takeWord(line);
  if (attributes.empty()) return;
  map.rows.push_back(
      {std::string(pattern), parseAttributeString(attributes), std::string(takeWord(line))});
}

LibraryAttributeMap makeBuiltInMap() {
  LibraryAttributeMap map;
  for (const std::string_view line : BuiltInLines)
    addLine(map, line);
  return map;
}

// Gathers the lines of a text that arrives in pieces.
class LineGatherer {
public:
  explicit LineGatherer(LibraryAttributeMap& map) : m_Map(map) {}

  void take(std::string_view text) {
    while (!text.empty()) {
      const std::string_view fitting = text.substr(0, LibraryAttributeLineLimit - m_Line.size());
      const size_t lineEnd = fitting.find('\n');
      m_Line += fitting.substr(0, lineEnd);
      if (lineEnd != std::string_view::npos || m_Line.size() == LibraryAttributeLineLimit)
        finishLine();
      text.remove_prefix(lineEnd != std::string_view::npos ? lineEnd + 1 : fitting.size());
    }
  }

  void finishLine() {
    addLine(m_Map, m_Line);
    m_Line.clear();
  }

private:
  LibraryAttributeMap& m_Map;
  std::string m_Line;
};

support::HostError readRows(support::Host& host, support::FileHandle file,
                            LibraryAttributeMap& map) {
  // The file is never in memory as a whole.
  std::vector<uint8_t> buffer(0x10000);
  LineGatherer lines(map);
  uint64_t offset = 0;
  size_t done = 0;
  do {
    const support::HostError error = host.readAt(file, buffer, offset, done);
    if (error != 0) return error;
    lines.take({reinterpret_cast<const char*>(buffer.data()), done});
    offset += done;
  } while (done == buffer.size());
  // The last line may have no end.
  lines.finishLine();
  return 0;
}

bool isMissing(support::HostError error) {
  return error == ENOENT || error == ENOTDIR;
}

// False if there is no such file, or if it can't be read, for that reason.
bool readFile(support::Host& host, const char* path, LibraryAttributeMap& map,
              support::HostError& error) {
  support::FileStatus status;
  error = host.status(path, status);
  // What isn't a file has no end, or waits for somebody.
  if (error == 0 && status.kind != support::FileKind::RegularFile) return false;
  support::FileHandle file;
  if (error == 0) error = host.openForReading(path, file);
  if (isMissing(error)) error = 0;
  if (!file.isOpen()) return false;
  error = readRows(host, file, map);
  // Nothing was written, so the close can lose nothing.
  static_cast<void>(host.close(file));
  return error == 0;
}

// Libraries are matched from the last backslash on, with it; "/" is no divider here.
std::string_view matchedPart(std::string_view name) {
  const size_t backslash = name.rfind('\\');
  return backslash == std::string_view::npos ? name : name.substr(backslash);
}

bool matches(const LibraryAttributeMap::Row& row, std::string_view part) {
  return support::matchesPattern(row.pattern, part, false);
}

} // namespace

LibraryAttributeMap readLibraryAttributeMap(support::Host& host, const char* path,
                                            bool& usedDefault, support::HostError& error) {
  LibraryAttributeMap map;
  error = 0;
  usedDefault = path == nullptr || !readFile(host, path, map, error);
  return usedDefault ? makeBuiltInMap() : map;
}

void getLibraryAttributes(FullAttr& result, std::string_view name, const LibraryAttributeMap& map) {
  FullAttr record = LibraryFullAttr;
  record.m_TargetClass = result.m_TargetClass;
  const std::string_view part = matchedPart(name);
  for (const LibraryAttributeMap::Row& row : map.rows) {
    // Also where rows clash: the record then says both.
    if (matches(row, part)) mergeFullAttr(record, record, row.attributes);
  }
  result = record;
}

std::string_view getLibraryClass(std::string_view name, const LibraryAttributeMap& map) {
  const std::string_view part = matchedPart(name);
  const auto row = std::ranges::find_if(map.rows, [&](const LibraryAttributeMap::Row& each) {
    return !each.className.empty() && matches(each, part);
  });
  return row != map.rows.end() ? std::string_view(row->className) : name;
}

bool isSameLibraryClass(std::string_view a, std::string_view b, const LibraryAttributeMap& map) {
  return getLibraryClass(a, map) == getLibraryClass(b, map);
}

} // namespace elfext
