// SPDX-License-Identifier: Apache-2.0
//
// The bytes of a section: here, still in the file, or outside of the model.
//
// Which of the three it is decides who may look and who may write: contents still in the file must
// be loaded first, and auxiliary or external contents are closed to writing. The extent was checked
// when the file was read, but the file may have been cut since; loading is told like any failed
// read and leaves the section without bytes.
#include "checking/interface/checking.h"
#include "elfext/interface/deferred_contents.h"
#include "elfext/interface/error_handler.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/section.h"

#include <memory>
#include <span>

namespace elfext {

const Buffer& Section::getReadableBuffer() const {
  QUARN_ASSERT(1, !isContentsDeferred());
  return m_Contents;
}

Buffer& Section::getWritableBuffer() {
  QUARN_ASSERT(1, !m_IsAuxiliary);
  QUARN_ASSERT(1, !isContentsDeferred());
  QUARN_ASSERT(1, !m_HasExternalContents);
  return m_Contents;
}

bool Section::isModifiable() const {
  return !m_IsAuxiliary && !m_HasExternalContents;
}

bool Section::read(uint64_t offset, void* destination, uint64_t count) const {
  return getReadableBuffer().read(offset, destination, count);
}

bool Section::write(uint64_t offset, const void* source, uint64_t count) {
  return getWritableBuffer().write(offset, source, count);
}

uint64_t Section::appendByte(uint8_t value) {
  const uint64_t oldSize = getWritableBuffer().appendByte(value);
  addSize(sizeof value);
  return oldSize;
}

uint64_t Section::append16(uint16_t value) {
  const uint64_t oldSize = getWritableBuffer().append16(value);
  addSize(sizeof value);
  return oldSize;
}

uint64_t Section::append32(uint32_t value) {
  const uint64_t oldSize = getWritableBuffer().append32(value);
  addSize(sizeof value);
  return oldSize;
}

uint64_t Section::append64(uint64_t value) {
  const uint64_t oldSize = getWritableBuffer().append64(value);
  addSize(sizeof value);
  return oldSize;
}

DataStore* Section::getDataStore() {
  return loadDeferredContents() ? this : nullptr;
}

void Section::setExternalContents(ExternalDataFunction function, void* handle, uint64_t size) {
  m_Contents.setExternalData(function, handle, size);
  m_HasExternalContents = true;
}

void Section::deferContents(DeferredContents* deferredContents) {
  QUARN_ASSERT(1, deferredContents != NULL);
  QUARN_ASSERT(1, !isContentsDeferred());
  m_DeferredContents = deferredContents;
}

// The last section to let go of the file closes it.
void Section::dropDeferredContents() {
  if (m_DeferredContents == nullptr) return;
  std::destroy_at(m_DeferredContents);
  m_DeferredContents = nullptr;
}

// A buffer can't hold more than 4 GiB, which is as good as a file that can't be read.
bool Section::readDeferredContents() {
  const SectionHeader& header = m_DeferredContents->getHeader();
  if (header.size > UINT32_MAX) return false;
  m_Contents.setSize(header.size);
  const std::span bytes(m_Contents.getModifiableContents(), header.size);
  // From the header as it was read: the section's own fields may have changed since.
  if (m_DeferredContents->getFile().read(bytes, header.offset)) return true;
  m_Contents.setSize(0);
  return false;
}

bool Section::loadDeferredContents() {
  if (!isContentsDeferred()) return true;
  if (!m_DeferredContents->usesFile()) {
    QUARN_ASSERT(1, false);
    return false;
  }
  if (readDeferredContents()) {
    dropDeferredContents();
    return true;
  }
  ErrorHandler* errorHandler = m_ObjectModule->getErrorHandler();
  const bool err_response =
      errorHandler != nullptr && errorHandler->ioErrorWriting(*m_ObjectModule, -1);
  QUARN_ASSERT(1, !err_response);
  // For all sections that share it: a file that has failed once is not asked again.
  m_DeferredContents->getFile().close();
  return false;
}

} // namespace elfext
