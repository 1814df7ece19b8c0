// SPDX-License-Identifier: Apache-2.0
//
// The names that a member's object publishes, in the object's own symbol order.
#pragma once

#include "alloclib/interface/region_objects.h"
#include "checking/interface/checking.h"
#include "elfext/interface/fast_array.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace arlib {

class SymbolNameList {
public:
  /// Names and list live in the region, which must outlive the list.
  explicit SymbolNameList(alloclib::RegionGeneral* region) : m_Region(region), m_Names(region) {
    QUARN_ASSERT(1, region != NULL);
  }

  /// Makes room for so many names in all.
  void reserve(uint32_t count) { m_Names.reserve(count); }

  /// Copies the name, so that the object it came from can go.
  void add(const char* name) {
    QUARN_ASSERT(1, name != NULL);
    add(std::string_view(name));
  }
  void add(std::string_view name) { addCopied(copy(name)); }

  /// The same in two steps, for names that share a copy: a text of as long a life as the list, and
  /// a name that is a part of one.
  [[nodiscard]] std::string_view copy(std::string_view text) {
    return {alloclib::copyString(*m_Region, text), text.size()};
  }
  void addCopied(std::string_view name) {
    m_Names.append(name);
    m_TextSize += name.size();
  }

  [[nodiscard]] uint32_t getSize() const { return m_Names.getSize(); }
  [[nodiscard]] std::string_view operator[](uint32_t index) const { return m_Names[index]; }
  [[nodiscard]] std::span<const std::string_view> getNames() const {
    return {m_Names.begin(), m_Names.getSize()};
  }
  /// Of all names, in bytes.
  [[nodiscard]] uint64_t getTextSize() const { return m_TextSize; }
  void clear() {
    m_Names.setSize(0);
    m_TextSize = 0;
  }

private:
  alloclib::RegionGeneral* m_Region;
  elfext::FastArray<std::string_view> m_Names;
  uint64_t m_TextSize = 0;
};

} // namespace arlib
