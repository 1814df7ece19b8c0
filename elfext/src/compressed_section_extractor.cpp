// SPDX-License-Identifier: Apache-2.0
#include "elfext/src/compressed_section_extractor.h"

#include "elfext/interface/elf_constants.h"

namespace elfext {

namespace {

bool hasSymbol(ObjectModule& module, const char* name) {
  SymbolList symbols;
  return module.getSymbolsByName(name, &symbols);
}

} // namespace

CompressedSectionExtractor::CompressedSectionExtractor(ObjectModule& module)
    : m_IsActive(module.getFileType() != ET_REL && module.getSymbolCount() != 0 &&
                 hasSymbol(module, "Region$$Table$$Base") &&
                 hasSymbol(module, "Region$$Table$$Limit")) {}

} // namespace elfext
