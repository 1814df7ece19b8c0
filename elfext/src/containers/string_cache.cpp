// SPDX-License-Identifier: Apache-2.0
//
// The keys of the cache point into its own copies, never to a caller's text.

#include "elfext/interface/string_cache.h"

#include <cstdlib>
#include <cstring>

namespace elfext {
namespace {

char* copyOnHeap(const char* text) {
  const size_t bytes = std::strlen(text) + 1;
  auto* copy = static_cast<char*>(std::malloc(bytes));
  if (copy == nullptr) alloclib::outOfMemory(bytes);
  std::memcpy(copy, text, bytes);
  return copy;
}

} // namespace

StringCache::~StringCache() {
  for (char* copy : m_Copies)
    std::free(copy);
}

const char* StringCache::lookup(const char* s) {
  QUARN_ASSERT(1, s != NULL);
  if (const char** known = m_Texts.find(Stringlett(s))) return *known;
  char* copy = copyOnHeap(s);
  // The table frees nothing that its keys point to, so the copies have a list of their own.
  m_Copies.append(copy);
  m_Texts.put(Stringlett(copy), copy);
  return copy;
}

} // namespace elfext
