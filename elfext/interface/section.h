// SPDX-License-Identifier: Apache-2.0
//
// A section. Ordinary sections carry the user's code and data. Auxiliary sections (symbol tables,
// string tables, relocation sections and the like) are bookkeeping: their bytes are consumed into
// the model's objects when a file is read, and from then on are only a cache of what the objects
// say. So nobody may write to them: all edits go to the objects.
#pragma once

#include "elfext/interface/buffer.h"
#include "elfext/interface/data_store.h"
#include "elfext/interface/file_region.h"
#include "elfext/interface/lazy_array.h"
#include "elfext/interface/object_with_build_attributes.h"
#include "elfext/interface/relocation_list.h"
#include "elfext/interface/section_header.h"
#include "elfext/interface/symbol_list.h"

#include <cstdint>

namespace elfext {

class DeferredContents;
class Group;
class Relocation;
class RelocationSection;
class Segment;
class Symbol;
struct HostedViews;

/// What getRelocationIndex and its like answer for what is not in the list.
constexpr uint32_t NoIndex = 0x80000000;

class Section : public ObjectWithBuildAttributes, public FileRegion, public DataStore {
public:
  /// What the creators of ObjectModule say of each class.
  struct Traits {
    bool isAuxiliary;
    bool isRelocatable;
    uint64_t entrySize;
  };

  /// Made by ObjectModule::createSection and its like.
  Section(ObjectModule* objectModule, const char* name, uint32_t type, uint32_t flags,
          const Traits& traits);
  virtual ~Section();

  /// Null for a section without a name.
  [[nodiscard]] const char* getName() const { return m_Name; }
  [[nodiscard]] uint32_t getType() const { return m_Type; }
  [[nodiscard]] uint32_t getFlags() const { return m_Flags; }
  /// sh_addr.
  [[nodiscard]] uint64_t getAddress() const { return m_Address; }
  /// sh_size: bytes, also of a section that has none in the file.
  [[nodiscard]] uint64_t getSize() const override { return m_Size; }
  /// Bytes in the file.
  [[nodiscard]] uint64_t getFileSize() const override;
  /// sh_addralign.
  [[nodiscard]] uint64_t getAlignment() const { return m_Alignment; }
  /// sh_entsize.
  [[nodiscard]] uint64_t getEntrySize() const { return m_EntrySize; }
  /// sh_link; null for none.
  [[nodiscard]] Section* getLink() const { return m_Link; }
  /// sh_info, where that is no section.
  [[nodiscard]] uint32_t getInfo() const { return m_Info; }
  /// In the section header table.
  [[nodiscard]] uint32_t getIndex() const { return m_Index; }
  [[nodiscard]] bool isAuxiliary() const { return m_IsAuxiliary; }
  /// Whether relocations may apply to the section.
  [[nodiscard]] bool isRelocatable() const { return m_IsRelocatable; }
  /// Null for a section in no group.
  [[nodiscard]] Group* getGroup() const { return m_Group; }
  /// Sections whose links point here, in the order in which they were linked.
  [[nodiscard]] std::span<Section* const> getLinkingSections() const {
    return m_LinkingSections.getSpan();
  }
  /// The segment that a section/segment note names; null if there is none.
  [[nodiscard]] Segment* getSegment() const { return m_Segment; }

  /// The text is copied. Null clears it.
  void setName(const char* name);
  void setFlags(uint32_t flags);
  void addFlags(uint32_t flags);
  void setAddress(uint64_t address);
  void setEntrySize(uint64_t size);
  /// A section of the same module.
  void setLink(Section* link);
  void setInfo(uint32_t value);
  /// Sets the size in bytes, and that of the contents. New bytes are for the caller to fill.
  void setSize(uint64_t size);
  /// Adds to the size field only; returns the old size.
  uint64_t addSize(uint64_t delta);
  /// 0 or a power of two.
  void setAlignment(uint64_t alignment) override;
  /// The same, if it is greater than the present one.
  void increaseAlignment(uint64_t alignment);
  /// Makes it a SHT_PROGBITS section with contents of its size, for the caller to fill.
  void makeProgBits();

  /// Contents. Reading needs them to be here; writing also needs an ordinary section whose contents
  /// are in memory. Offsets and sizes are in bytes; words have the module's byte order. See Buffer.
  [[nodiscard]] const uint8_t* getContents() const { return getReadableBuffer().getContents(); }
  [[nodiscard]] uint64_t getContentsSize() const { return getReadableBuffer().getSize(); }
  [[nodiscard]] uint8_t getByte(uint64_t offset) const {
    return getReadableBuffer().getByte(offset);
  }
  [[nodiscard]] uint16_t get16(uint64_t offset) const { return getReadableBuffer().get16(offset); }
  [[nodiscard]] uint32_t get32(uint64_t offset) const { return getReadableBuffer().get32(offset); }
  [[nodiscard]] uint64_t get64(uint64_t offset) const { return getReadableBuffer().get64(offset); }
  [[nodiscard]] uint16_t getUnaligned16(uint64_t offset) const {
    return getReadableBuffer().getUnaligned16(offset);
  }
  [[nodiscard]] uint32_t getUnaligned32(uint64_t offset) const {
    return getReadableBuffer().getUnaligned32(offset);
  }
  [[nodiscard]] uint64_t getUnaligned64(uint64_t offset) const {
    return getReadableBuffer().getUnaligned64(offset);
  }
  bool read(uint64_t offset, void* destination, uint64_t count) const override;

  void setByte(uint64_t offset, uint8_t value) { getWritableBuffer().setByte(offset, value); }
  void set16(uint64_t offset, uint16_t value) { getWritableBuffer().set16(offset, value); }
  void set32(uint64_t offset, uint32_t value) { getWritableBuffer().set32(offset, value); }
  void set64(uint64_t offset, uint64_t value) { getWritableBuffer().set64(offset, value); }
  bool write(uint64_t offset, const void* source, uint64_t count) override;
  /// Each adds to the size field too, and returns the old size of the contents.
  uint64_t appendByte(uint8_t value);
  uint64_t append16(uint16_t value);
  uint64_t append32(uint32_t value);
  uint64_t append64(uint64_t value);
  [[nodiscard]] bool isModifiable() const override;

  /// Contents that are still in a file that stays open for them.
  [[nodiscard]] bool isContentsDeferred() const { return m_DeferredContents != nullptr; }
  /// True if the contents are here now. A failure is reported to the module's error handler, and
  /// the file is closed.
  [[nodiscard]] bool loadDeferredContents();

  /// Contents that stay outside of the model.
  [[nodiscard]] bool hasExternalContents() const { return m_HasExternalContents; }
  /// `size` bytes that the function delivers; the handle is its first argument and stays its
  /// owner's.
  void setExternalContents(ExternalDataFunction function, void* handle, uint64_t size);

  /// Relocations that apply to this section, static and dynamic together. What a file said becomes
  /// objects when somebody asks for one; the counts and tests that come after `removeAll...` know
  /// without.
  Relocation* addRelocation(uint64_t offset, uint32_t type, Symbol* target);
  Relocation* addRelocation(uint64_t offset, uint32_t type, Symbol* target, int64_t addend);
  [[nodiscard]] Relocation* getRelocation(uint32_t index);
  /// NoIndex for one that is not in the list.
  [[nodiscard]] uint32_t getRelocationIndex(const Relocation* relocation);
  /// The others keep their order. Linear in the list, as is removing.
  void setRelocationIndex(Relocation* relocation, uint32_t index);
  void removeRelocation(Relocation* relocation);
  /// Also those that are still rows, which never become objects then.
  void removeAllRelocations();
  [[nodiscard]] uint32_t getRelocationCount() const;
  [[nodiscard]] bool hasStaticRelocationsWithAddend() const;
  [[nodiscard]] bool hasStaticRelocationsWithoutAddend() const;
  [[nodiscard]] bool hasDynamicRelocationsWithAddend() const;
  [[nodiscard]] bool hasDynamicRelocationsWithoutAddend() const;
  /// Dynamic relocations only, told apart by whether they are for a jump slot.
  [[nodiscard]] uint32_t getJumpSlotCountWithoutAddend();
  [[nodiscard]] uint32_t getJumpSlotCountWithAddend();
  [[nodiscard]] uint32_t getOtherDynamicCountWithoutAddend();
  [[nodiscard]] uint32_t getOtherDynamicCountWithAddend();
  /// Those at offsets from the first to the last, both included, in the order of their offsets.
  void getRelocationsInRange(uint64_t fromOffset, uint64_t toOffset, RelocationList* relocations);
  /// The sections that say so in the file.
  [[nodiscard]] std::span<RelocationSection* const> getStaticRelocationSections() const {
    return m_StaticRelocationSections.getSpan();
  }
  [[nodiscard]] std::span<RelocationSection* const> getDynamicRelocationSections() const {
    return m_DynamicRelocationSections.getSpan();
  }
  /// Makes all relocations that are still rows.
  void materializeRelocations();

  /// Symbols that are defined in this section. Indexes that are not found are NoIndex.
  [[nodiscard]] uint32_t getHostedSymbolCount() const { return m_HostedSymbols.getSize(); }
  [[nodiscard]] Symbol* getHostedSymbol(uint32_t index) const { return m_HostedSymbols[index]; }
  [[nodiscard]] uint32_t getHostedSymbolIndex(const Symbol* symbol) const;
  /// Moves the symbol among those of this section; its place in the symbol table stays.
  void setHostedSymbolIndex(Symbol* symbol, uint32_t index);
  [[nodiscard]] uint32_t getHostedDynamicSymbolCount() const {
    return m_HostedDynamicSymbols.getSize();
  }
  [[nodiscard]] Symbol* getHostedDynamicSymbol(uint32_t index) const {
    return m_HostedDynamicSymbols[index];
  }
  [[nodiscard]] uint32_t getHostedDynamicSymbolIndex(const Symbol* symbol) const;
  void setHostedDynamicSymbolIndex(Symbol* symbol, uint32_t index);

  /// Queries. Each fills the list, in the order of the offsets (by name: of the hosted lists), and
  /// answers whether it found something.
  ///
  /// The mapping symbols at offsets from the first to the last, both included.
  bool getSymbolsInRange(uint64_t fromOffset, uint64_t toOffset, SymbolList* symbols);
  /// The symbols of the classes in the mask, at the highest offset not above the given one at which
  /// there is one.
  bool getPrecedingSymbols(uint64_t offset, uint32_t mask, SymbolList* symbols);
  /// The mapping symbols at the lowest offset not below the given one at which there is one.
  bool getFollowingMappingSymbols(uint64_t offset, SymbolList* symbols);
  /// All symbols of exactly that name.
  bool getSymbolsByName(const char* name, SymbolList* symbols);
  /// The same of the dynamic symbols; the first yields those of all classes.
  bool getDynamicSymbolsInRange(uint64_t fromOffset, uint64_t toOffset, SymbolList* symbols);
  bool getDynamicSymbolsByName(const char* name, SymbolList* symbols);

  /// Whether a segment at a known distance wholly contains the section; the index of the first
  /// such segment goes to the pointer, which may be null. Looks through the segments: who asks for
  /// many sections has ObjectModule::findHolders.
  bool isInSegment(uint32_t* segmentIndex);

  [[nodiscard]] virtual RelocationSection* asRelocationSection() { return nullptr; }
  [[nodiscard]] virtual const RelocationSection* asRelocationSection() const { return nullptr; }

  [[nodiscard]] bool inheritsBuildAttributes() const override { return true; }
  void getInheritedBuildAttributes(BuildAttributes& result) const override;

  /// The file offset is always a multiple of something; 16 in sh_addralign still means 4 here.
  void getAlignment(uint64_t* remainder, uint64_t* alignment) const override;
  DataStore* getDataStore() override;
  DataStructure* createDataStructure(alloclib::RegionGeneral& region,
                                     uint64_t currentOffset) override;

private:
  friend class Group;
  friend class ModuleBuilder;
  friend class ObjectModule;
  friend class Pruner;
  friend class Relocation;
  friend class RelocationSection;
  friend class Symbol;

  void adoptHeader(const SectionHeader& header);
  void adoptLink(Section* link);
  void deferContents(DeferredContents* deferredContents);

  void markChanged();
  void markHostedChanged();
  [[nodiscard]] const Buffer& getReadableBuffer() const;
  [[nodiscard]] Buffer& getWritableBuffer();
  bool readDeferredContents();
  void dropDeferredContents();

  void mustTakeRelocation(const Symbol* target) const;
  Relocation* appendRelocation(const Relocation& relocation);
  [[nodiscard]] bool hasRelocations(bool isDynamic, bool hasAddend) const;
  [[nodiscard]] uint32_t countDynamicRelocations(bool isJumpSlot, bool hasAddend);
  [[nodiscard]] LazyArray<RelocationSection*>& getRelocationSections(bool isDynamic) {
    return isDynamic ? m_DynamicRelocationSections : m_StaticRelocationSections;
  }
  void sortRelocations();

  [[nodiscard]] LazyArray<Symbol*, 4>& getHostedList(bool isDynamic) {
    return isDynamic ? m_HostedDynamicSymbols : m_HostedSymbols;
  }
  HostedViews& getHostedViews();
  const HostedViews& getHostedViewsByOffset();
  const HostedViews& getHostedViewsByName();

  const char* m_Name = nullptr;
  /// The fields of Elf64_Shdr, but for what has become a pointer.
  uint64_t m_Address = 0;
  uint64_t m_Size = 0;
  uint64_t m_Alignment = 0;
  uint64_t m_EntrySize;
  Section* m_Link = nullptr;
  uint32_t m_Type;
  uint32_t m_Flags;
  uint32_t m_Info = 0;
  uint32_t m_Index = 0;
  bool m_IsAuxiliary;
  bool m_IsRelocatable;
  bool m_HasExternalContents = false;
  /// Whether the sorted views say what the lists do.
  bool m_AreHostedByOffsetUpToDate = false;
  bool m_AreHostedByNameUpToDate = false;
  bool m_AreRelocationsSorted = true;
  bool m_Goes = false;
  Buffer m_Contents;
  /// Rows of the relocation sections for this one that are no objects yet.
  uint32_t m_PendingRelocationCount = 0;
  DeferredContents* m_DeferredContents = nullptr;
  Group* m_Group = nullptr;
  Segment* m_Segment = nullptr;
  /// Lists that most sections never fill, see LazyArray.
  LazyArray<Relocation*> m_Relocations;
  LazyArray<Relocation*> m_RelocationsSortedByOffset;
  LazyArray<RelocationSection*> m_StaticRelocationSections;
  LazyArray<RelocationSection*> m_DynamicRelocationSections;
  LazyArray<Section*> m_LinkingSections;
  LazyArray<Symbol*, 4> m_HostedSymbols;
  LazyArray<Symbol*, 4> m_HostedDynamicSymbols;
  /// Made at the first query.
  HostedViews* m_HostedViews = nullptr;
};

} // namespace elfext
