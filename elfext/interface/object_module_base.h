// SPDX-License-Identifier: Apache-2.0
//
// The memory of an object module: all that it contains is in two regions, which go with it.
//
// A base class, so that the regions are there before the first list and go after the last one.
#pragma once

#include "alloclib/interface/region_objects.h"

namespace elfext {

class ObjectModuleBase {
public:
  ObjectModuleBase(const ObjectModuleBase&) = delete;
  ObjectModuleBase& operator=(const ObjectModuleBase&) = delete;

  /// For objects and texts.
  [[nodiscard]] alloclib::RegionGeneral& getObjectRegion() const { return *m_ObjectRegion; }
  /// For what arrays and tables store.
  [[nodiscard]] alloclib::RegionGeneral& getContainerRegion() const { return *m_ContainerRegion; }

protected:
  ObjectModuleBase();
  ~ObjectModuleBase() = default;

private:
  alloclib::RegionOwner m_ObjectRegion;
  alloclib::RegionOwner m_ContainerRegion;
};

} // namespace elfext
