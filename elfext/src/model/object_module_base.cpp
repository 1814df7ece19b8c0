// SPDX-License-Identifier: Apache-2.0
#include "elfext/interface/object_module_base.h"

namespace elfext {

constexpr size_t InitialRegionSize = 1024;

ObjectModuleBase::ObjectModuleBase()
    : m_ObjectRegion(
          alloclib::RegionGeneral::Create(InitialRegionSize, "elfext::ObjectModule::ObjectRegion")),
      m_ContainerRegion(alloclib::RegionGeneral::Create(InitialRegionSize,
                                                        "elfext::ObjectModule::ContainerRegion")) {}

} // namespace elfext
