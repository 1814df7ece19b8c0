// SPDX-License-Identifier: Apache-2.0
//
// What it takes to make a module say what a file says, and is closed to the module's users: a
// file's word is taken as it stands, auxiliary section or not. Each class of the model has its
// builder for a friend; who uses it has checked what he takes over.
#pragma once

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/group.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/raw_data_block.h"

#include <algorithm>
#include <cstdint>
#include <memory>
#include <utility>

namespace elfext {

class ModuleBuilder {
public:
  ModuleBuilder() = delete;

  // ---- Where the bytes are

  // The source that buffers of the module refer to. It goes with the module, or when that is
  // cleared.
  static void adoptImageSource(ObjectModule& module, std::unique_ptr<ImageSource> source) {
    module.m_ImageSource = std::move(source);
  }
  [[nodiscard]] static ImageSource* getImageSource(const ObjectModule& module) {
    return module.m_ImageSource.get();
  }
  // The file's bytes, where they are all in memory for as long as the module needs them.
  static void setReadBuffer(ObjectModule& module, const uint8_t* readBuffer) {
    module.m_ReadBuffer = readBuffer;
  }
  // While set, the names of what is made are kept as they are and not copied; they must live as
  // long as the module's contents.
  static void setNamesInBuffer(ObjectModule& module, bool areNamesInBuffer) {
    module.m_AreNamesInBuffer = areNamesInBuffer;
  }

  // ---- What the file's header says of the headers
  //
  // The sizes, in bytes, also become those of the module's regions.

  static void setElfHeaderSize(ObjectModule& module, uint32_t size) {
    module.setElfHeaderSize(size);
  }
  static void setSectionHeaderOffset(ObjectModule& module, uint64_t offset) {
    module.change(module.m_SectionHeaderOffset, offset);
  }
  static void setProgramHeaderOffset(ObjectModule& module, uint64_t offset) {
    module.change(module.m_ProgramHeaderOffset, offset);
  }
  static void setStoredSectionCount(ObjectModule& module, uint16_t count) {
    module.change(module.m_StoredSectionCount, count);
  }
  static void setStoredProgramHeaderCount(ObjectModule& module, uint16_t count) {
    module.change(module.m_StoredProgramHeaderCount, count);
  }
  static void setSectionHeaderEntrySize(ObjectModule& module, uint32_t size) {
    module.setSectionHeaderEntrySize(size);
  }
  static void setProgramHeaderEntrySize(ObjectModule& module, uint32_t size) {
    module.setProgramHeaderEntrySize(size);
  }

  // ---- What is known of the module

  // ReadCondition bits.
  static void setReadConditions(ObjectModule& module, uint32_t conditions) {
    module.m_ReadConditions = conditions;
  }
  static void setAuxiliarySectionsUpToDate(ObjectModule& module, bool areUpToDate) {
    module.m_AreAuxiliarySectionsUpToDate = areUpToDate;
  }
  static void setBuildAttributesSectionUpToDate(ObjectModule& module, bool isUpToDate) {
    module.m_IsBuildAttributesSectionUpToDate = isUpToDate;
  }
  static void raiseHighestTagsVersion(ObjectModule& module, uint32_t version) {
    module.m_HighestTagsVersion = std::max(module.m_HighestTagsVersion, version);
  }
  // No object has attributes of its own any more; blocks stay.
  static void dropBuildAttributes(ObjectModule& module) { module.dropBuildAttributes(); }

  // ---- Sections

  // What a row of the section header table says: address, offset, entry size, info and alignment.
  static void adoptHeader(Section& section, const SectionHeader& header) {
    section.adoptHeader(header);
  }
  // Text that lives as long as the module's contents.
  static void adoptName(Section& section, const char* name) { section.m_Name = name; }
  static void adoptSize(Section& section, uint64_t size) { section.m_Size = size; }
  // Null for none.
  static void adoptLink(Section& section, Section* link) { section.adoptLink(link); }
  // The segment that a section/segment note names.
  static void setSegment(Section& section, Segment* segment) { section.m_Segment = segment; }
  static void setAuxiliary(Section& section, bool isAuxiliary) {
    section.m_IsAuxiliary = isAuxiliary;
  }
  // Whether relocations that do not come from a file may apply too.
  static void setRelocatable(Section& section, bool isRelocatable) {
    section.m_IsRelocatable = isRelocatable;
  }
  // The contents, without a look at whether they may be changed.
  [[nodiscard]] static Buffer& getBuffer(Section& section) { return section.m_Contents; }
  // What is put here must be of the block's size.
  [[nodiscard]] static Buffer& getBuffer(RawDataBlock& block) { return block.m_Contents; }
  // The record is of the module's object region; the section ends it.
  static void deferContents(Section& section, DeferredContents* deferredContents) {
    section.deferContents(deferredContents);
  }

  // ---- How auxiliary sections hang together

  static void markSectionNameTable(StringTableSection& table) { table.m_IsSectionNameTable = true; }
  static void markLinkedBySymtab(StringTableSection& table) { table.m_IsLinkedBySymtab = true; }
  static void markLinkedByDynsym(StringTableSection& table) { table.m_IsLinkedByDynsym = true; }
  static void markLinkedByOther(StringTableSection& table) { table.m_IsLinkedByOther = true; }
  static void setShndxSection(SymbolTableSection& table, ShndxSection* section) {
    table.m_ShndxSection = section;
  }
  static void setHashSection(SymbolTableSection& table, HashSection* section) {
    table.m_HashSection = section;
  }
  static void setSignatureSymbolIndex(GroupSection& section, uint32_t index) {
    section.m_SignatureSymbolIndex = index;
  }
  // The section that the group was read from.
  static void setGroupSection(Group& group, GroupSection* section) {
    group.m_GroupSection = section;
  }
  // Joins the target's list of static or dynamic relocation sections.
  static void setTarget(RelocationSection& relocations, Section* target, bool isDynamic) {
    relocations.setTarget(target, isDynamic);
  }
  // Checked rows whose relocations are still to be made. They live as long as the module. The
  // target must be known.
  static void setRows(RelocationSection& relocations, RelocationRows* rows, uint32_t rowCount) {
    relocations.setRows(rows, rowCount);
  }
};

} // namespace elfext
