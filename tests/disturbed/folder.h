// SPDX-License-Identifier: Apache-2.0
//
// A folder on disk, as a value: what stands in it can be taken down, compared, and put back.

#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <sys/types.h>

namespace disturbed {

enum class EntryKind { File, Link, Folder };

struct Entry {
  EntryKind kind = EntryKind::File;
  std::string bytes; // of a link: where it leads
  mode_t mode = 0644;
  uint64_t links = 1;
  std::string sameAs; // the first name of the same file, if this is a further one
  bool operator==(const Entry&) const = default;
};

using Entries = std::map<std::string, Entry>; // by name

class Folder {
public:
  // Makes an empty one, in memory where the machine has such a place.
  Folder();
  ~Folder();
  Folder(const Folder&) = delete;
  Folder& operator=(const Folder&) = delete;

  [[nodiscard]] const std::string& getName() const { return m_Name; }
  // Whatever stands there goes, and these come, with dates that are the same on every day.
  void put(const Entries& entries) const;
  [[nodiscard]] Entries take() const;

private:
  void putOne(const std::string& name, const Entry& entry) const;
  std::string m_Name;
};

// For programs that are told where to look: sets the date that tells a file from the one before.
void setDate(const std::string& path, int64_t seconds);

} // namespace disturbed
