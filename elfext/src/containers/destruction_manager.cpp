// SPDX-License-Identifier: Apache-2.0
//
// The records are on the heap, since they must not outlive the manager in a region.

#include "elfext/interface/destruction_manager.h"

#include "alloclib/interface/handlers.h"

#include <cstdlib>
#include <new>

namespace elfext {

void DestructionManager::push(alloclib::Region* region, void* object, Destroyer destroy) {
  void* memory = std::malloc(sizeof(Record));
  if (memory == nullptr) alloclib::outOfMemory(sizeof(Record));
  m_Head = ::new (memory) Record{region, object, destroy, m_Head};
}

void DestructionManager::run() {
  while (m_Head != nullptr) {
    // The record is off the list before its object goes, as a destructor may add more.
    const Record record = *m_Head;
    std::free(m_Head);
    m_Head = record.next;
    record.destroy(record.region, record.object);
  }
}

} // namespace elfext
