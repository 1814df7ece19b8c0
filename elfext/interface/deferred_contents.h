// SPDX-License-Identifier: Apache-2.0
//
// What a section holds instead of its bytes while they are still in the file.
//
// It is made for sections that a caller's selector chose, in files above 0x100000 bytes. The bytes
// come in when somebody asks the section to load them; until then the file stays open for them.
#pragma once

#include "elfext/interface/reference_counted_file.h"
#include "elfext/interface/section_header.h"

namespace elfext {

class DeferredContents {
public:
  /// Holds one reference to the file, which must outlive this object.
  DeferredContents(ReferenceCountedFile* referenceCountedFile, bool usesFile,
                   const SectionHeader& header);
  /// Lets go of the file. A close that fails has nobody to tell.
  ~DeferredContents() { m_ReferenceCountedFile->release(); }
  DeferredContents(const DeferredContents&) = delete;
  DeferredContents& operator=(const DeferredContents&) = delete;

  [[nodiscard]] ReferenceCountedFile& getFile() const { return *m_ReferenceCountedFile; }
  [[nodiscard]] bool usesFile() const { return m_UsesFile; }
  /// As it was read: the section's own fields may have changed since.
  [[nodiscard]] const SectionHeader& getHeader() const { return m_Header; }

private:
  ReferenceCountedFile* m_ReferenceCountedFile;
  bool m_UsesFile;
  SectionHeader m_Header;
};

} // namespace elfext
