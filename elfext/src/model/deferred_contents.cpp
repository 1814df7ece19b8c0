// SPDX-License-Identifier: Apache-2.0
#include "elfext/interface/deferred_contents.h"

#include "checking/interface/checking.h"

#include <cstddef>

namespace elfext {

DeferredContents::DeferredContents(ReferenceCountedFile* referenceCountedFile, bool usesFile,
                                   const SectionHeader& header)
    : m_ReferenceCountedFile(referenceCountedFile), m_UsesFile(usesFile), m_Header(header) {
  QUARN_ASSERT(1, referenceCountedFile != NULL);
  referenceCountedFile->addReference();
}

} // namespace elfext
