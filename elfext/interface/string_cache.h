// SPDX-License-Identifier: Apache-2.0
//
// One heap copy of each text that was ever looked up, so that cached texts compare by address.
//
// For texts of the program's own that outlive all regions. Nothing is ever dropped, so texts of
// files don't belong here.

#pragma once

#include "elfext/interface/array.h"
#include "elfext/interface/hash_table.h"
#include "elfext/interface/stringlett.h"

namespace elfext {

class StringCache {
public:
  StringCache() = default;
  ~StringCache();
  StringCache(const StringCache&) = delete;
  StringCache& operator=(const StringCache&) = delete;

  /// The canonical copy of the text, the same pointer for equal texts; it belongs to the cache.
  [[nodiscard]] const char* lookup(const char* s);

private:
  HashTable<Stringlett, const char*> m_Texts;
  Array<char*> m_Copies;
};

} // namespace elfext
