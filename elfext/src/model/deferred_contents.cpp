// SPDX-License-Identifier: Apache-2.0
//
// A section's claim on the file that its bytes are still in: from here on the file stays open for
// it. The header is a copy, as the section's own fields may be changed before the bytes are asked
// for.
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
