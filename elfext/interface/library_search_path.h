// SPDX-License-Identifier: Apache-2.0
//
// A list of directories in which the needed libraries are looked for.
//
// From a dynamic section: the text that a DT_RPATH or DT_RUNPATH tag names, as it stands. Nobody
// here takes it apart or looks into the directories.
#pragma once

#include <cstdint>

namespace elfext {

class ObjectModule;

class LibrarySearchPath {
public:
  /// Made by ObjectModule::createLibrarySearchPath.
  LibrarySearchPath(ObjectModule* objectModule, const char* path, uint32_t tag)
      : m_ObjectModule(objectModule), m_Path(path), m_Tag(tag) {}

  /// Never null.
  [[nodiscard]] const char* getPath() const { return m_Path; }
  /// DT_RPATH or DT_RUNPATH.
  [[nodiscard]] uint32_t getTag() const { return m_Tag; }
  [[nodiscard]] uint32_t getIndex() const { return m_Index; }
  [[nodiscard]] ObjectModule* getObjectModule() const { return m_ObjectModule; }

private:
  friend class ObjectModule;
  friend class Pruner;

  ObjectModule* m_ObjectModule;
  const char* m_Path;
  uint32_t m_Tag;
  uint32_t m_Index = 0;
  bool m_Goes = false;
};

} // namespace elfext
