// SPDX-License-Identifier: Apache-2.0
//
// A record of the preemption map: a symbol of one library takes the place of those of others.
//
// Its names are texts of the dynamic section's string table; the format of a map is in
// src/reader/object_module_reader_dynamic.cpp.
#pragma once

#include "elfext/interface/lazy_array.h"

#include <cstdint>

namespace elfext {

class ObjectModule;

class Preemption {
public:
  /// Made by ObjectModule::createPreemption.
  Preemption(ObjectModule* objectModule, const char* symbolName, const char* preemptingDllName)
      : m_ObjectModule(objectModule), m_SymbolName(symbolName),
        m_PreemptingDllName(preemptingDllName) {}

  /// Never null, both.
  [[nodiscard]] const char* getSymbolName() const { return m_SymbolName; }
  [[nodiscard]] const char* getPreemptingDllName() const { return m_PreemptingDllName; }
  [[nodiscard]] uint32_t getIndex() const { return m_Index; }
  [[nodiscard]] ObjectModule* getObjectModule() const { return m_ObjectModule; }

  /// The libraries whose symbols are preempted.
  [[nodiscard]] uint32_t getPreemptedDllCount() const { return m_PreemptedDllNames.getSize(); }
  [[nodiscard]] const char* getPreemptedDllName(uint32_t index) const {
    return m_PreemptedDllNames[index];
  }
  /// The name is kept as the texts of the module's creators are.
  void addPreemptedDll(const char* name);

private:
  friend class ObjectModule;
  friend class Pruner;

  ObjectModule* m_ObjectModule;
  const char* m_SymbolName;
  const char* m_PreemptingDllName;
  LazyArray<const char*> m_PreemptedDllNames;
  uint32_t m_Index = 0;
  bool m_Goes = false;
};

} // namespace elfext
