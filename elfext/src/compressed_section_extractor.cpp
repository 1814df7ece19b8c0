// SPDX-License-Identifier: Apache-2.0
//
// Decides from two symbols whether an image has a region table. Only the sizes of a model ask. The
// look-up sorts the module's symbols by name, so what rules the table out is asked first.
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
