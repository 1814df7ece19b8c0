// SPDX-License-Identifier: Apache-2.0
#include "elfext/interface/debug_section_name.h"

#include <cstring>

namespace elfext {

bool isDebugSectionName(const char* name) {
  if (name == nullptr) return false;
  return std::strncmp(name, ".debug", 6) == 0 || std::strncmp(name, ".line", 5) == 0 ||
         std::strcmp(name, "C$$fpmap") == 0;
}

} // namespace elfext
