// SPDX-License-Identifier: Apache-2.0
//
// A segment: one row of the program header table.
//
// The fields are those of Elf32_Phdr and Elf64_Phdr, kept as they were read: p_offset, p_filesz and
// p_memsz may be any number, and only segments whose bytes were needed have been held against the
// file.
#pragma once

#include "elfext/interface/file_region.h"

#include <cstdint>

namespace elfext {

class ObjectModule;

class Segment final : public FileRegion {
public:
  /// Made by ObjectModule::createSegment. The fields are those of the program header.
  Segment(ObjectModule* objectModule, uint32_t type, uint64_t offset, uint64_t vaddr,
          uint64_t paddr, uint64_t filesz, uint64_t memsz, uint32_t flags, uint64_t align);

  /// PT_... and PF_...
  [[nodiscard]] uint32_t getType() const { return m_Type; }
  [[nodiscard]] uint32_t getFlags() const { return m_Flags; }
  /// p_vaddr and p_paddr.
  [[nodiscard]] uint64_t getVirtualAddress() const { return m_VirtualAddress; }
  [[nodiscard]] uint64_t getPhysicalAddress() const { return m_PhysicalAddress; }
  /// p_memsz, in bytes.
  [[nodiscard]] uint64_t getMemorySize() const { return m_MemorySize; }
  /// p_align as it stands, which may be 0.
  [[nodiscard]] uint64_t getSegmentAlignment() const { return m_Alignment; }
  /// Its place in the program header table, from 0.
  [[nodiscard]] uint32_t getIndex() const { return m_Index; }
  [[nodiscard]] ObjectModule* getObjectModule() const { return m_ObjectModule; }

  /// p_filesz.
  [[nodiscard]] uint64_t getFileSize() const override { return m_FileSize; }
  void getAlignment(uint64_t* remainder, uint64_t* alignment) const override;
  DataStructure* createDataStructure(alloclib::RegionGeneral& region,
                                     uint64_t currentOffset) override;

private:
  friend class ObjectModule;
  friend class Pruner;

  ObjectModule* m_ObjectModule;
  uint64_t m_VirtualAddress;
  uint64_t m_PhysicalAddress;
  uint64_t m_FileSize;
  uint64_t m_MemorySize;
  uint64_t m_Alignment;
  uint32_t m_Type;
  uint32_t m_Flags;
  uint32_t m_Index = 0;
  bool m_Goes = false;
};

} // namespace elfext
