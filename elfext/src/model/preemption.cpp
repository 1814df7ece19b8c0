// SPDX-License-Identifier: Apache-2.0
//
// A record of a preemption map: the symbol, the library that preempts it in others, and those
// others. The reader makes one for each record.
#include "elfext/interface/preemption.h"

#include "checking/interface/checking.h"
#include "elfext/interface/object_module.h"

#include <cstddef>

namespace elfext {

void Preemption::addPreemptedDll(const char* name) {
  QUARN_ASSERT(1, name != NULL);
  m_PreemptedDllNames.append(m_ObjectModule->getContainerRegion(), m_ObjectModule->keepText(name));
  m_ObjectModule->markChanged();
}

} // namespace elfext
