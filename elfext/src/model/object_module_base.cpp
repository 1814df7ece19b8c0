// SPDX-License-Identifier: Apache-2.0
//
// The two regions of a module: one for objects and names, one for the blocks of lists and contents,
// which come and go as these grow. They are a base class so that they are there before the first
// member and go after the last one.
#include "elfext/interface/object_module_base.h"

namespace elfext {

// Small: a module is also made to carry a name to a handler.
constexpr size_t InitialRegionSize = 1024;

ObjectModuleBase::ObjectModuleBase()
    : m_ObjectRegion(
          alloclib::RegionGeneral::Create(InitialRegionSize, "elfext::ObjectModule::ObjectRegion")),
      m_ContainerRegion(alloclib::RegionGeneral::Create(InitialRegionSize,
                                                        "elfext::ObjectModule::ContainerRegion")) {}

} // namespace elfext
