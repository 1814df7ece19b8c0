// SPDX-License-Identifier: Apache-2.0
//
// A text as a key. The hash decides most comparisons: texts whose hashes differ are never read, and
// those of one address need not be. Files can choose names whose hashes collide; that costs time in
// one bucket, but no two texts are ever taken for one.

#include "elfext/interface/stringlett.h"

#include "elfext/interface/hash_functions.h"

#include <cstring>

namespace elfext {

Stringlett::Stringlett(const char* text)
    : m_Text(text), m_Hash(text != nullptr ? hashText(text) : 0) {}

bool Stringlett::operator==(const Stringlett& other) const {
  if (m_Text == other.m_Text) return true;
  if (m_Text == nullptr || other.m_Text == nullptr || m_Hash != other.m_Hash) return false;
  return std::strcmp(m_Text, other.m_Text) == 0;
}

} // namespace elfext
