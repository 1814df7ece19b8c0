// SPDX-License-Identifier: Apache-2.0
//
// Decides which sections are debug information: those whose names start with ".debug" or ".line",
// and "C$$fpmap". Sizes, the records of debug overlays and the archive's symbol table ask, the last
// for each symbol of each object, so most names are told apart before they are compared.
#include "elfext/interface/debug_section_name.h"

#include <cstring>

namespace elfext {

bool isDebugSectionName(const char* name) {
  // Most names are told apart by their first two characters.
  if (name == nullptr || (*name != '.' && *name != 'C')) return false;
  if (*name == 'C') return std::strcmp(name, "C$$fpmap") == 0;
  if (name[1] != 'd' && name[1] != 'l') return false;
  return std::strncmp(name, ".debug", 6) == 0 || std::strncmp(name, ".line", 5) == 0;
}

} // namespace elfext
