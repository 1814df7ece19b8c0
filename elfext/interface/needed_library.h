// SPDX-License-Identifier: Apache-2.0
//
// A library that the module needs at run time.
//
// From a dynamic section: the text that a DT_NEEDED tag names. Libraries are in the order of their
// tags.
#pragma once

#include <cstdint>

namespace elfext {

class ObjectModule;

class NeededLibrary {
public:
  /// Made by ObjectModule::createNeededLibrary.
  NeededLibrary(ObjectModule* objectModule, const char* name)
      : m_ObjectModule(objectModule), m_Name(name) {}

  /// Never null.
  [[nodiscard]] const char* getName() const { return m_Name; }
  [[nodiscard]] uint32_t getIndex() const { return m_Index; }
  [[nodiscard]] ObjectModule* getObjectModule() const { return m_ObjectModule; }

private:
  friend class ObjectModule;
  friend class Pruner;

  ObjectModule* m_ObjectModule;
  const char* m_Name;
  uint32_t m_Index = 0;
  bool m_Goes = false;
};

} // namespace elfext
