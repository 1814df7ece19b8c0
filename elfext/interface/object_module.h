// SPDX-License-Identifier: Apache-2.0
//
// One ELF file in memory: not a wrapper round its bytes but a model, in which each section,
// segment, symbol, relocation, group, needed library and preemption is an object. A module is made
// on the stack, pointed at an error handler, handed to the reader, looked at and destroyed. All
// objects and texts that it returns are its own and go with it, or when they are deleted.
//
// A program that uses modules has an alloclib::Session (alloclib/interface/session.h) for as long
// as it does: all that a module holds lives in regions.
//
// Texts that are handed in are copied.
//
// `getX(index)`, `getXCount()`, `getXIndex(x)` and `setXIndex(x, index)` come in families, one for
// each list. Indexes count from 0, but for the two symbol tables: there the null symbol, which is
// no object, has index 0 and is counted wherever there are symbols at all. `setXIndex` moves an
// object among the others, whose order stays.
#pragma once

#include "elfext/interface/elf_header.h"
#include "elfext/interface/fast_array.h"
#include "elfext/interface/fast_hash_table.h"
#include "elfext/interface/image_source.h"
#include "elfext/interface/object_module_base.h"
#include "elfext/interface/object_with_build_attributes.h"
#include "elfext/interface/program_header_table.h"
#include "elfext/interface/section.h"
#include "elfext/interface/section_header_table.h"
#include "elfext/interface/section_list.h"
#include "elfext/interface/stringlett.h"
#include "elfext/interface/symbol.h"
#include "elfext/interface/symbol_list.h"

#include <array>
#include <cstdint>
#include <memory>
#include <span>
#include <vector>

namespace elfext {

class BuildAttributesCache;
class BuildAttributesSection;
class DebugOverlaySection;
class DynamicSection;
class ErrorHandler;
class Group;
class GroupSection;
class HashSection;
class LibrarySearchPath;
class NeededLibrary;
class NullSection;
class Preemption;
class PreemptionMapSection;
class PruneCriterion;
class RawDataBlock;
class RelocationSection;
class Segment;
class ShndxSection;
class StringTableSection;
class SymbolTableSection;
class VerdefSection;
class VerneedSection;
class VersymSection;
struct FileVersionDefinition;

/// What the reader has seen; a set of bits.
enum ReadCondition : uint32_t {
  /// The first PT_LOAD segment overlaps the header or the table.
  ReadCondition_LoadOverlapsElfHeader = 0x1,
  ReadCondition_LoadOverlapsSectionHeaderTable = 0x2,
  ReadCondition_LoadOverlapsProgramHeaderTable = 0x4,
  ReadCondition_HasBuildAttributesSymbol = 0x8,
  ReadCondition_HasBuildAttributesSection = 0x10,
  /// Texts are copies, and do not point into the read buffer.
  ReadCondition_HasCopiedStrings = 0x20,
  /// The dynamic section has tag 0x70000001.
  ReadCondition_HasSymbolTableSizeTag = 0x40,
  ReadCondition_ChecksRepeatedRelocations = 0x80,
  ReadCondition_HasEmptySectionHeaderTable = 0x100,
  ReadCondition_WasRead = 0x200,
  /// p_vaddr and p_offset of some segment differ by no multiple of its alignment.
  ReadCondition_HasIncongruentSegment = 0x20000000,
  /// Some auxiliary section has a symbol, or a relocation, in it.
  ReadCondition_HasSymbolInAuxiliarySection = 0x40000000,
  ReadCondition_HasRelocationInAuxiliarySection = 0x80000000,
};

/// Values of the dynamic section that the model keeps as they are.
enum DynamicValue : uint32_t {
  DynamicValue_Init,
  DynamicValue_InitArray,
  DynamicValue_InitArraySize,
  DynamicValue_PreinitArray,
  DynamicValue_PreinitArraySize,
  DynamicValue_Fini,
  DynamicValue_FiniArray,
  DynamicValue_FiniArraySize,
  DynamicValue_Count,
};

/// A record of a debug overlay section.
struct DebugOverlayRecord {
  uint64_t word;
  Section* debugSection;
  Section* section;
};

class ObjectModule final : public ObjectModuleBase, public ObjectWithBuildAttributes {
public:
  /// An empty module.
  ObjectModule();
  ~ObjectModule();

  // ---- Set-up

  /// Not owned; may be null, which is as good as a handler that always refuses to go on.
  [[nodiscard]] ErrorHandler* getErrorHandler() const { return m_ErrorHandler; }
  void setErrorHandler(ErrorHandler* errorHandler) { m_ErrorHandler = errorHandler; }

  /// Null for none. A new name is not possible while contents are deferred, which are in the file
  /// of the old one.
  [[nodiscard]] const char* getFileName() const { return m_FileName; }
  void setFileName(const char* name);
  /// What messages call the module: a path, or an archive's name and in parentheses the member's.
  /// Null for none.
  [[nodiscard]] const char* getObjectName() const { return m_ObjectName; }
  void setObjectName(const char* name);
  void setObjectName(const char* archiveName, const char* memberName);

  /// The file's bytes as long as the module needs them, where they are all in memory; null if not.
  [[nodiscard]] const uint8_t* getReadBuffer() const { return m_ReadBuffer; }
  /// Whether the file could not give bytes which somebody wanted to look at after the read. The
  /// handler has been told; what was made of the contents since is not to be trusted.
  [[nodiscard]] bool hasLostContents() const { return m_HasLostContents; }

  // ---- Header fields, under the ELF standard's names

  /// Sets the sizes of the headers and the alignment of their tables too.
  void setElfClass(uint32_t elfClass);
  [[nodiscard]] uint32_t getElfClass() const { return m_ElfClass; }
  [[nodiscard]] bool isClass64() const { return m_ElfClass == 2; }
  /// e_ident[EI_DATA]. All but 1 reads as big-endian.
  void setDataEncoding(uint32_t encoding);
  [[nodiscard]] uint32_t getDataEncoding() const { return m_DataEncoding; }
  /// 1 is little-endian. Not possible while contents are deferred.
  void setLittleEndian(uint32_t flag);
  [[nodiscard]] uint32_t getLittleEndian() const { return m_LittleEndian; }
  [[nodiscard]] bool isLittleEndian() const { return m_LittleEndian == 1; }

  /// e_machine, e_type, e_entry, e_flags, e_ident[EI_OSABI], e_ident[EI_ABIVERSION],
  /// e_ident[EI_VERSION] and e_version, as the file has them.
  [[nodiscard]] uint32_t getMachine() const { return m_Machine; }
  [[nodiscard]] uint32_t getFileType() const { return m_FileType; }
  [[nodiscard]] uint64_t getEntry() const { return m_Entry; }
  [[nodiscard]] uint32_t getElfFlags() const { return m_ElfFlags; }
  [[nodiscard]] uint32_t getOsAbi() const { return m_OsAbi; }
  [[nodiscard]] uint32_t getAbiVersion() const { return m_AbiVersion; }
  [[nodiscard]] uint32_t getIdentVersion() const { return m_IdentVersion; }
  [[nodiscard]] uint32_t getElfVersion() const { return m_ElfVersion; }
  /// Any value is taken; what readers accept is for them to say.
  void setMachine(uint32_t machine) { change(m_Machine, machine); }
  void setFileType(uint32_t type) { change(m_FileType, type); }
  void setEntry(uint64_t entry) { change(m_Entry, entry); }
  void setElfFlags(uint32_t flags) { change(m_ElfFlags, flags); }
  void setOsAbi(uint32_t osAbi) { change(m_OsAbi, osAbi); }
  void setAbiVersion(uint32_t version) { change(m_AbiVersion, version); }
  void setIdentVersion(uint32_t version) { change(m_IdentVersion, version); }
  void setElfVersion(uint32_t version) { change(m_ElfVersion, version); }
  /// Whether addresses are laid out: ET_EXEC, ET_DYN and ET_CORE.
  [[nodiscard]] bool hasLaidOutAddresses() const;

  /// What the file's header says of the headers; sizes in bytes.
  [[nodiscard]] uint32_t getElfHeaderSize() const { return m_ElfHeaderSize; }
  [[nodiscard]] uint64_t getSectionHeaderOffset() const { return m_SectionHeaderOffset; }
  [[nodiscard]] uint64_t getProgramHeaderOffset() const { return m_ProgramHeaderOffset; }
  [[nodiscard]] uint16_t getStoredSectionCount() const { return m_StoredSectionCount; }
  [[nodiscard]] uint16_t getStoredProgramHeaderCount() const { return m_StoredProgramHeaderCount; }
  [[nodiscard]] uint32_t getSectionHeaderEntrySize() const { return m_SectionHeaderEntrySize; }
  [[nodiscard]] uint32_t getProgramHeaderEntrySize() const { return m_ProgramHeaderEntrySize; }

  /// The three fixed regions of the file.
  [[nodiscard]] ELFHeader& getElfHeader() { return m_ElfHeader; }
  [[nodiscard]] SectionHeaderTable& getSectionHeaderTable() { return m_SectionHeaderTable; }
  [[nodiscard]] ProgramHeaderTable& getProgramHeaderTable() { return m_ProgramHeaderTable; }

  /// ReadCondition bits.
  [[nodiscard]] uint32_t getReadConditions() const { return m_ReadConditions; }

  // ---- Dynamic data

  /// DT_SONAME; null for none.
  [[nodiscard]] const char* getSoname() const { return m_Soname; }
  void setSoname(const char* soname);
  [[nodiscard]] bool hasDynamicValue(DynamicValue value) const {
    return m_DynamicValues[value].exists;
  }
  /// 0 for one that does not exist.
  [[nodiscard]] uint64_t getDynamicValue(DynamicValue value) const {
    return m_DynamicValues[value].value;
  }
  /// Makes it exist. The last value of a kind stays.
  void setDynamicValue(DynamicValue which, uint64_t value);
  /// DF_... bits.
  [[nodiscard]] bool hasDynamicFlags() const { return m_DynamicFlagsExists; }
  [[nodiscard]] uint32_t getDynamicFlags() const { return m_DynamicFlags; }
  /// ORs the flags in, and makes them exist.
  void addDynamicFlags(uint32_t flags);

  /// The file's own version; null for none.
  [[nodiscard]] const FileVersionDefinition* getFileVersionDefinition() const {
    return m_FileVersionDefinition;
  }
  void setFileVersionDefinition(const FileVersionDefinition* version);
  /// A version that the file defines, for its symbols or for the call above.
  FileVersionDefinition* createFileVersionDefinition(const char* name, uint32_t index,
                                                     uint32_t flags);

  [[nodiscard]] std::span<const DebugOverlayRecord> getDebugOverlayRecords() const {
    return m_DebugOverlayRecords.getSpan();
  }
  /// Both sections are of this module. The record goes when one of them does.
  void addDebugOverlayRecord(const DebugOverlayRecord& record);

  // ---- State

  /// Nothing may add, remove or reorder what has an index while indexes are frozen.
  [[nodiscard]] bool indexesAreFrozen() const { return m_IndexesFrozen; }
  void setIndexesFrozen(bool areFrozen) { m_IndexesFrozen = areFrozen; }
  /// Whether the bytes of auxiliary sections say what the objects do. Any change clears it.
  [[nodiscard]] bool areAuxiliarySectionsUpToDate() const { return m_AreAuxiliarySectionsUpToDate; }
  [[nodiscard]] bool areSortedViewsUpToDate() const { return m_AreSortedViewsUpToDate; }
  /// Whether the attribute section's bytes say what the blocks and attributes of all objects do.
  /// Any change of these clears it.
  [[nodiscard]] bool isBuildAttributesSectionUpToDate() const {
    return m_IsBuildAttributesSectionUpToDate;
  }

  /// No sections, groups, symbols, needed libraries, search paths, preemptions, nor a version.
  [[nodiscard]] bool isEmpty() const;
  /// Whether any section's are. Looks through the sections.
  [[nodiscard]] bool hasDeferredContents() const;
  /// Loads all that are deferred, in index order; false at the first failure.
  [[nodiscard]] bool loadDeferredContents();

  /// The checks that go beyond reading; problems go to the error handler. False at the first
  /// answer not to go on.
  [[nodiscard]] bool validate();

  // ---- Build attributes

  /// Made when first asked for; it goes with the module, or when that is cleared.
  [[nodiscard]] BuildAttributesCache& getBuildAttributesCache();
  /// The highest Tag_ZV_version of all objects' attributes; 0 for none.
  [[nodiscard]] uint32_t getHighestTagsVersion() const { return m_HighestTagsVersion; }

  // ---- Sections

  [[nodiscard]] uint32_t getSectionCount() const { return m_Sections.getSize(); }
  [[nodiscard]] Section* getSection(uint32_t index) const { return m_Sections[index]; }
  [[nodiscard]] uint32_t getSectionIndex(const Section* section) const;
  /// Linear in the sections: all others keep their order.
  void setSectionIndex(Section* section, uint32_t index);
  [[nodiscard]] std::span<Section* const> getSections() const { return m_Sections.getSpan(); }
  /// Room for so many more in all lists of that kind.
  void reserveSections(uint32_t count);

  /// For a type without a class of its own.
  Section* createSection(const char* name, uint32_t type, uint32_t flags);
  /// One creator for each class of auxiliary sections. The section goes to the end of the table,
  /// and belongs to the module; the name may be null, and flags are those of sh_flags.
  NullSection* createNullSection(const char* name, uint32_t flags);
  StringTableSection* createStringTableSection(const char* name, uint32_t flags);
  /// SHT_SYMTAB or SHT_DYNSYM.
  SymbolTableSection* createSymbolTableSection(const char* name, uint32_t type, uint32_t flags);
  /// SHT_REL or SHT_RELA.
  RelocationSection* createRelocationSection(const char* name, uint32_t type, uint32_t flags);
  GroupSection* createGroupSection(const char* name, uint32_t flags);
  ShndxSection* createShndxSection(const char* name, uint32_t flags);
  HashSection* createHashSection(const char* name, uint32_t flags);
  PreemptionMapSection* createPreemptionMapSection(const char* name, uint32_t flags);
  VerdefSection* createVerdefSection(const char* name, uint32_t flags);
  VerneedSection* createVerneedSection(const char* name, uint32_t flags);
  VersymSection* createVersymSection(const char* name, uint32_t flags);
  DynamicSection* createDynamicSection(const char* name, uint32_t flags);
  BuildAttributesSection* createBuildAttributesSection(const char* name, uint32_t flags);
  DebugOverlaySection* createDebugOverlaySection(const char* name, uint32_t flags);
  /// Of the class that the type has.
  Section* createSectionOfType(const char* name, uint32_t type, uint32_t flags);
  /// A SHT_PROGBITS section named ".comment" of `first` and its terminator, `second` without one,
  /// the byte, and `third` with its terminator.
  Section* createCommentSection(const char* first, const char* second, uint8_t byte,
                                const char* third);

  /// The auxiliary sections of one type each, in the order in which they were made.
  [[nodiscard]] std::span<StringTableSection* const> getStringTableSections() const {
    return m_StringTableSections.getSpan();
  }
  [[nodiscard]] std::span<SymbolTableSection* const> getSymtabSections() const {
    return m_SymtabSections.getSpan();
  }
  [[nodiscard]] std::span<SymbolTableSection* const> getDynsymSections() const {
    return m_DynsymSections.getSpan();
  }
  [[nodiscard]] std::span<GroupSection* const> getGroupSections() const {
    return m_GroupSections.getSpan();
  }
  [[nodiscard]] std::span<HashSection* const> getHashSections() const {
    return m_HashSections.getSpan();
  }
  [[nodiscard]] std::span<ShndxSection* const> getShndxSections() const {
    return m_ShndxSections.getSpan();
  }
  [[nodiscard]] std::span<PreemptionMapSection* const> getPreemptionMapSections() const {
    return m_PreemptionMapSections.getSpan();
  }
  [[nodiscard]] std::span<VerdefSection* const> getVerdefSections() const {
    return m_VerdefSections.getSpan();
  }
  [[nodiscard]] std::span<VerneedSection* const> getVerneedSections() const {
    return m_VerneedSections.getSpan();
  }
  [[nodiscard]] std::span<VersymSection* const> getVersymSections() const {
    return m_VersymSections.getSpan();
  }
  [[nodiscard]] std::span<DynamicSection* const> getDynamicSections() const {
    return m_DynamicSections.getSpan();
  }
  [[nodiscard]] std::span<DebugOverlaySection* const> getDebugOverlaySections() const {
    return m_DebugOverlaySections.getSpan();
  }
  [[nodiscard]] std::span<BuildAttributesSection* const> getBuildAttributesSections() const {
    return m_BuildAttributesSections.getSpan();
  }

  // ---- Symbols
  //
  // Four categories, each static and dynamic.

  /// What a new symbol is. The name may be null; type, binding and visibility are those of st_info
  /// and st_other. The value is an offset in its section for a hosted one, which has a section, and
  /// the alignment for a common one.
  struct NewSymbol {
    Symbol::Category category;
    bool isDynamic;
    const char* name;
    uint64_t value;
    uint32_t type;
    uint32_t binding;
    uint32_t visibility;
    Section* section = nullptr;
  };
  /// The one way in which symbols come to be; the next eight say the category and the table.
  Symbol* createSymbol(const NewSymbol& info);

  Symbol* createHostedSymbol(const char* name, uint64_t offset, uint32_t type, uint32_t binding,
                             uint32_t visibility, Section* section) {
    return createSymbol(
        {Symbol::Category_Hosted, false, name, offset, type, binding, visibility, section});
  }
  Symbol* createAbsoluteSymbol(const char* name, uint64_t value, uint32_t type, uint32_t binding,
                               uint32_t visibility) {
    return createSymbol({Symbol::Category_Absolute, false, name, value, type, binding, visibility});
  }
  Symbol* createCommonSymbol(const char* name, uint64_t value, uint32_t type, uint32_t binding,
                             uint32_t visibility) {
    return createSymbol({Symbol::Category_Common, false, name, value, type, binding, visibility});
  }
  Symbol* createUndefinedSymbol(const char* name, uint64_t value, uint32_t type, uint32_t binding,
                                uint32_t visibility) {
    return createSymbol(
        {Symbol::Category_Undefined, false, name, value, type, binding, visibility});
  }
  Symbol* createHostedDynamicSymbol(const char* name, uint64_t offset, uint32_t type,
                                    uint32_t binding, uint32_t visibility, Section* section) {
    return createSymbol(
        {Symbol::Category_Hosted, true, name, offset, type, binding, visibility, section});
  }
  Symbol* createAbsoluteDynamicSymbol(const char* name, uint64_t value, uint32_t type,
                                      uint32_t binding, uint32_t visibility) {
    return createSymbol({Symbol::Category_Absolute, true, name, value, type, binding, visibility});
  }
  Symbol* createCommonDynamicSymbol(const char* name, uint64_t value, uint32_t type,
                                    uint32_t binding, uint32_t visibility) {
    return createSymbol({Symbol::Category_Common, true, name, value, type, binding, visibility});
  }
  Symbol* createUndefinedDynamicSymbol(const char* name, uint64_t value, uint32_t type,
                                       uint32_t binding, uint32_t visibility) {
    return createSymbol({Symbol::Category_Undefined, true, name, value, type, binding, visibility});
  }
  /// Room for so many more.
  void reserveSymbols(uint32_t count);
  void reserveDynamicSymbols(uint32_t count);

  [[nodiscard]] uint32_t getSymbolCount() const;
  [[nodiscard]] Symbol* getSymbol(uint32_t index) const;
  [[nodiscard]] uint32_t getSymbolIndex(const Symbol* symbol) const;
  /// From 1. Linear in the distance of the move.
  void setSymbolIndex(Symbol* symbol, uint32_t index);
  /// Without the null symbol.
  [[nodiscard]] std::span<Symbol* const> getSymbols() const { return m_Symbols.getSpan(); }

  [[nodiscard]] uint32_t getDynamicSymbolCount() const;
  [[nodiscard]] Symbol* getDynamicSymbol(uint32_t index) const;
  [[nodiscard]] uint32_t getDynamicSymbolIndex(const Symbol* symbol) const;
  void setDynamicSymbolIndex(Symbol* symbol, uint32_t index);
  [[nodiscard]] std::span<Symbol* const> getDynamicSymbols() const {
    return m_DynamicSymbols.getSpan();
  }

  /// The static symbols of one category each, in the order in which they came to it; those that are
  /// hosted are in lists of their sections. Asking for an index here is a search through the list,
  /// and NoIndex says that the symbol is not in it.
  [[nodiscard]] uint32_t getAbsoluteSymbolCount() const { return m_AbsoluteSymbols.getSize(); }
  [[nodiscard]] Symbol* getAbsoluteSymbol(uint32_t index) const { return m_AbsoluteSymbols[index]; }
  [[nodiscard]] uint32_t getAbsoluteSymbolIndex(const Symbol* symbol) const;
  void setAbsoluteSymbolIndex(Symbol* symbol, uint32_t index);
  [[nodiscard]] uint32_t getCommonSymbolCount() const { return m_CommonSymbols.getSize(); }
  [[nodiscard]] Symbol* getCommonSymbol(uint32_t index) const { return m_CommonSymbols[index]; }
  [[nodiscard]] uint32_t getCommonSymbolIndex(const Symbol* symbol) const;
  void setCommonSymbolIndex(Symbol* symbol, uint32_t index);
  [[nodiscard]] uint32_t getUndefinedSymbolCount() const { return m_UndefinedSymbols.getSize(); }
  [[nodiscard]] Symbol* getUndefinedSymbol(uint32_t index) const {
    return m_UndefinedSymbols[index];
  }
  [[nodiscard]] uint32_t getUndefinedSymbolIndex(const Symbol* symbol) const;
  void setUndefinedSymbolIndex(Symbol* symbol, uint32_t index);

  /// The same of the dynamic symbols.
  [[nodiscard]] uint32_t getAbsoluteDynamicSymbolCount() const {
    return m_AbsoluteDynamicSymbols.getSize();
  }
  [[nodiscard]] Symbol* getAbsoluteDynamicSymbol(uint32_t index) const {
    return m_AbsoluteDynamicSymbols[index];
  }
  [[nodiscard]] uint32_t getAbsoluteDynamicSymbolIndex(const Symbol* symbol) const;
  void setAbsoluteDynamicSymbolIndex(Symbol* symbol, uint32_t index);
  [[nodiscard]] uint32_t getCommonDynamicSymbolCount() const {
    return m_CommonDynamicSymbols.getSize();
  }
  [[nodiscard]] Symbol* getCommonDynamicSymbol(uint32_t index) const {
    return m_CommonDynamicSymbols[index];
  }
  [[nodiscard]] uint32_t getCommonDynamicSymbolIndex(const Symbol* symbol) const;
  void setCommonDynamicSymbolIndex(Symbol* symbol, uint32_t index);
  [[nodiscard]] uint32_t getUndefinedDynamicSymbolCount() const {
    return m_UndefinedDynamicSymbols.getSize();
  }
  [[nodiscard]] Symbol* getUndefinedDynamicSymbol(uint32_t index) const {
    return m_UndefinedDynamicSymbols[index];
  }
  [[nodiscard]] uint32_t getUndefinedDynamicSymbolIndex(const Symbol* symbol) const;
  void setUndefinedDynamicSymbolIndex(Symbol* symbol, uint32_t index);

  // ---- The other lists

  [[nodiscard]] uint32_t getGroupCount() const { return m_Groups.getSize(); }
  [[nodiscard]] Group* getGroup(uint32_t index) const { return m_Groups[index]; }
  [[nodiscard]] uint32_t getGroupIndex(const Group* group) const;
  void setGroupIndex(Group* group, uint32_t index);
  /// The name, which may be null, is that of the group's section.
  Group* createGroup(const char* signature, const char* name, uint32_t flags);
  /// The first comdat group of that signature; null if there is none.
  [[nodiscard]] Group* findComdatGroup(const char* signature);

  [[nodiscard]] uint32_t getSegmentCount() const { return m_Segments.getSize(); }
  /// In the order of the program header table.
  [[nodiscard]] Segment* getSegment(uint32_t index) const { return m_Segments[index]; }
  [[nodiscard]] uint32_t getSegmentIndex(const Segment* segment) const;
  void setSegmentIndex(Segment* segment, uint32_t index);
  [[nodiscard]] std::span<Segment* const> getSegments() const { return m_Segments.getSpan(); }
  /// For each section, by its index: the first of these segments that wholly contains it at a known
  /// distance, or null. For all sections at once, where Section::isInSegment is for one.
  [[nodiscard]] std::vector<Segment*> findHolders(std::span<Segment* const> segments) const;
  Segment* createSegment(uint32_t type, uint64_t offset, uint64_t vaddr, uint64_t paddr,
                         uint64_t filesz, uint64_t memsz, uint32_t flags, uint64_t align);

  [[nodiscard]] uint32_t getNeededLibraryCount() const { return m_NeededLibraries.getSize(); }
  [[nodiscard]] NeededLibrary* getNeededLibrary(uint32_t index) const {
    return m_NeededLibraries[index];
  }
  [[nodiscard]] uint32_t getNeededLibraryIndex(const NeededLibrary* neededLibrary) const;
  void setNeededLibraryIndex(NeededLibrary* neededLibrary, uint32_t index);
  NeededLibrary* createNeededLibrary(const char* name);

  [[nodiscard]] uint32_t getLibrarySearchPathCount() const {
    return m_LibrarySearchPaths.getSize();
  }
  [[nodiscard]] LibrarySearchPath* getLibrarySearchPath(uint32_t index) const {
    return m_LibrarySearchPaths[index];
  }
  [[nodiscard]] uint32_t getLibrarySearchPathIndex(const LibrarySearchPath* path) const;
  void setLibrarySearchPathIndex(LibrarySearchPath* librarySearchPath, uint32_t index);
  /// The tag is DT_RPATH or DT_RUNPATH.
  LibrarySearchPath* createLibrarySearchPath(const char* path, uint32_t tag);

  [[nodiscard]] uint32_t getPreemptionCount() const { return m_Preemptions.getSize(); }
  [[nodiscard]] Preemption* getPreemption(uint32_t index) const { return m_Preemptions[index]; }
  [[nodiscard]] uint32_t getPreemptionIndex(const Preemption* preemption) const;
  void setPreemptionIndex(Preemption* preemption, uint32_t index);
  /// Neither may be null; the libraries that are preempted are added to what is returned.
  Preemption* createPreemption(const char* symbolName, const char* preemptingDllName);

  /// In the order in which they were made.
  [[nodiscard]] std::span<RawDataBlock* const> getRawDataBlocks() const {
    return m_RawDataBlocks.getSpan();
  }
  /// `size` bytes of the segment; the caller gives them.
  RawDataBlock* createRawDataBlock(Segment* segment, uint64_t size);

  // ---- Deletion
  //
  // Each takes along what hangs on the object: with a section go its symbols, its relocations and
  // the relocation sections for it; with a symbol the relocations to it; with a group its section;
  // with a segment its raw data blocks. Links to what went become null; all indexes stay dense.

  void deleteSection(Section* section);
  void deleteGroup(Group* group);
  void deleteSegment(Segment* segment);
  void deleteSymbol(Symbol* symbol);
  void deleteNeededLibrary(NeededLibrary* neededLibrary);
  void deleteLibrarySearchPath(LibrarySearchPath* librarySearchPath);
  void deletePreemption(Preemption* preemption);
  /// All that the criterion says, in one pass over the module.
  void prune(const PruneCriterion& criterion);
  /// Leaves an empty module, which keeps its names, its handler and what its header says.
  void clear();

  // ---- Look-ups
  //
  // Each fills the list and answers whether it found something. What is found by name comes in
  // index order, what is found by address in the order of addresses, then of indexes; addresses
  // are those of Symbol::getAddress.

  bool getSectionsByName(const char* name, SectionList* sections) const;
  bool getSymbolsByName(const char* name, SymbolList* symbols);
  bool getDynamicSymbolsByName(const char* name, SymbolList* symbols);
  /// Static symbols of the classes in the mask, a set of Symbol::Class: at addresses from the first
  /// to the last, both included; at one address; at the highest address not above the given one at
  /// which there is one; at the lowest address not below it at which there is one.
  bool getSymbolsInRange(uint64_t fromAddress, uint64_t toAddress, uint32_t mask,
                         SymbolList* symbols);
  bool getSymbolsAtAddress(uint64_t address, uint32_t mask, SymbolList* symbols);
  bool getPrecedingSymbols(uint64_t address, uint32_t mask, SymbolList* symbols);
  bool getFollowingSymbols(uint64_t address, uint32_t mask, SymbolList* symbols);

  [[nodiscard]] bool inheritsBuildAttributes() const override { return false; }
  void getInheritedBuildAttributes(BuildAttributes& result) const override;

private:
  friend class Buffer;
  friend class Group;
  friend class ModuleBuilder;
  friend class ObjectWithBuildAttributes;
  friend class Preemption;
  friend class Pruner;
  friend class Relocation;
  friend class Section;
  friend class Symbol;

  struct OptionalValue {
    uint64_t value = 0;
    bool exists = false;
  };

  template <class Field, class Value>
  void change(Field& field, Value value) {
    field = value;
    markChanged();
  }
  void markChanged() { m_AreAuxiliarySectionsUpToDate = false; }
  void markBuildAttributesChanged() { m_IsBuildAttributesSectionUpToDate = false; }
  void markSymbolsChanged() {
    m_AreSortedViewsUpToDate = false;
    markChanged();
  }

  /// The text, or a copy of it in the object region, as the builder has said of names. Null stays
  /// null.
  [[nodiscard]] const char* keepText(const char* text) const;
  /// A copy of the text in the object region. Null stays null.
  [[nodiscard]] const char* copyText(const char* text) const;
  void reportLostContents(support::HostError error);

  /// The sizes also become those of the regions.
  void setElfHeaderSize(uint32_t size);
  void setSectionHeaderEntrySize(uint32_t size);
  void setProgramHeaderEntrySize(uint32_t size);

  template <class SectionClass, class... Arguments>
  SectionClass* makeSection(const char* name, Arguments... arguments);
  template <class Object, class... Arguments>
  Object* makeListed(FastArray<Object*>& list, Arguments... arguments);
  void noteComdatGroup(Group* group);
  void noteComdatGroups();

  template <class Object>
  void move(FastArray<Object*>& list, Object* object, uint32_t index, uint32_t firstIndex);
  /// Hosted symbols are in lists of their sections.
  [[nodiscard]] FastArray<Symbol*>& getCategoryList(Symbol::Category category, bool isDynamic);
  void materializeAllRelocations();
  [[nodiscard]] uint32_t findInCategory(const FastArray<Symbol*>& list, const Symbol* symbol) const;
  void moveInCategory(FastArray<Symbol*>& list, Symbol* symbol, uint32_t index);

  template <class Object>
  void deleteOne(const Object* object);
  void clearDynamicData();
  void clearHeaderTables();
  void dropBuildAttributes();
  void clearBuildAttributes();
  void forgetPlacement();

  void updateSortedViews();
  bool collectByAddress(uint32_t fromIndex, uint32_t toIndex, uint32_t mask,
                        SymbolList* symbols) const;

  const uint8_t* m_ReadBuffer = nullptr;
  /// During a read: names are views of the image, and not copied.
  bool m_AreNamesInBuffer = false;
  std::unique_ptr<ImageSource> m_ImageSource;
  bool m_HasLostContents = false;
  ErrorHandler* m_ErrorHandler = nullptr;
  const char* m_FileName = nullptr;
  const char* m_ObjectName = nullptr;

  uint32_t m_Machine = 40;
  uint32_t m_ElfClass = 1;
  uint32_t m_DataEncoding = 1;
  uint32_t m_LittleEndian = 1;
  uint32_t m_OsAbi = 0;
  uint32_t m_AbiVersion = 0;
  uint32_t m_FileType = 0;
  uint64_t m_Entry = 0;
  uint32_t m_ElfFlags = 0;
  uint32_t m_ReadConditions = 0;
  uint32_t m_IdentVersion = 1;
  uint32_t m_ElfVersion = 1;

  const char* m_Soname = nullptr;
  std::array<OptionalValue, DynamicValue_Count> m_DynamicValues = {};
  uint32_t m_DynamicFlags = 0;
  bool m_DynamicFlagsExists = false;

  uint32_t m_ElfHeaderSize = NewElfHeaderSize32;
  uint64_t m_SectionHeaderOffset = 0;
  uint64_t m_ProgramHeaderOffset = 0;
  uint16_t m_StoredSectionCount = 0;
  uint16_t m_StoredProgramHeaderCount = 0;
  uint32_t m_SectionHeaderEntrySize = SectionHeaderSize32;
  uint32_t m_ProgramHeaderEntrySize = ProgramHeaderSize32;

  bool m_IndexesFrozen = false;
  /// What is derived from the objects, and whether it still says what they do. Changes clear these;
  /// whoever makes the derived things anew sets them.
  bool m_AreAuxiliarySectionsUpToDate = false;
  bool m_AreSortedViewsUpToDate = true;
  bool m_IsBuildAttributesSectionUpToDate = false;
  uint32_t m_HighestTagsVersion = 0;
  /// Made when it is first asked for.
  std::unique_ptr<BuildAttributesCache> m_BuildAttributesCache;

  ELFHeader m_ElfHeader;
  SectionHeaderTable m_SectionHeaderTable;
  ProgramHeaderTable m_ProgramHeaderTable;

  /// The lists of objects, each in the order of its indexes.
  FastArray<Section*> m_Sections;
  FastArray<Group*> m_Groups;
  FastArray<Segment*> m_Segments;
  FastArray<Symbol*> m_Symbols;
  FastArray<Symbol*> m_DynamicSymbols;
  FastArray<NeededLibrary*> m_NeededLibraries;
  FastArray<LibrarySearchPath*> m_LibrarySearchPaths;
  FastArray<Preemption*> m_Preemptions;
  FastArray<RawDataBlock*> m_RawDataBlocks;
  const FileVersionDefinition* m_FileVersionDefinition = nullptr;
  FastArray<DebugOverlayRecord> m_DebugOverlayRecords;

  /// The same symbols by category. The hosted ones are in their sections.
  FastArray<Symbol*> m_AbsoluteSymbols;
  FastArray<Symbol*> m_CommonSymbols;
  FastArray<Symbol*> m_UndefinedSymbols;
  FastArray<Symbol*> m_AbsoluteDynamicSymbols;
  FastArray<Symbol*> m_CommonDynamicSymbols;
  FastArray<Symbol*> m_UndefinedDynamicSymbols;

  /// The same sections by type, for who looks for one of them.
  FastArray<StringTableSection*> m_StringTableSections;
  FastArray<SymbolTableSection*> m_SymtabSections;
  FastArray<SymbolTableSection*> m_DynsymSections;
  FastArray<GroupSection*> m_GroupSections;
  FastArray<HashSection*> m_HashSections;
  FastArray<ShndxSection*> m_ShndxSections;
  FastArray<PreemptionMapSection*> m_PreemptionMapSections;
  FastArray<VerdefSection*> m_VerdefSections;
  FastArray<VerneedSection*> m_VerneedSections;
  FastArray<VersymSection*> m_VersymSections;
  FastArray<DynamicSection*> m_DynamicSections;
  FastArray<DebugOverlaySection*> m_DebugOverlaySections;
  FastArray<BuildAttributesSection*> m_BuildAttributesSections;

  /// Views for look-ups: pointers in another order, made when m_AreSortedViewsUpToDate is not set.
  FastArray<Symbol*> m_SymbolsSortedByAddress;
  FastArray<Symbol*> m_DynamicSymbolsSortedByAddress;
  FastArray<Symbol*> m_SymbolsSortedByName;
  FastArray<Symbol*> m_DynamicSymbolsSortedByName;
  FastHashTable<Stringlett, Group*> m_MapSignaturesToComdatGroups;
  /// Groups that came after the last look into the map.
  FastArray<Group*> m_UnnotedGroups;
};

} // namespace elfext
