// SPDX-License-Identifier: Apache-2.0
//
// How the objects of a module come to be: each is made in the module's region and joins the lists
// that it belongs to.
//
// Which list an object joins is decided here and nowhere else: the table of its kind, and for
// sections the list of their type, for symbols that of their category. Names are copied, except
// while a read says that they last. The reader calls these for what a file says, and has checked
// that; for everybody else what must not be is an assertion.
#include "checking/interface/checking.h"
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/group.h"
#include "elfext/interface/library_search_path.h"
#include "elfext/interface/needed_library.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/preemption.h"
#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/segment.h"

#include <cstring>

namespace elfext {

// ---- Sections

void ObjectModule::reserveSections(uint32_t count) {
  m_Sections.reserve(m_Sections.getSize() + count);
}

template <class SectionClass, class... Arguments>
SectionClass* ObjectModule::makeSection(const char* name, Arguments... arguments) {
  QUARN_ASSERT(1, !m_IndexesFrozen);
  auto* section =
      alloclib::create<SectionClass>(getObjectRegion(), this, keepText(name), arguments...);
  section->m_Index = m_Sections.getSize();
  m_Sections.append(section);
  markChanged();
  return section;
}

Section* ObjectModule::createSection(const char* name, uint32_t type, uint32_t flags) {
  // These have classes of their own, with which other parts of the model count.
  QUARN_ASSERT(1, type != SHT_NULL && type != SHT_STRTAB && type != SHT_SYMTAB &&
                      type != SHT_DYNSYM && type != SHT_REL && type != SHT_RELA &&
                      type != SHT_GROUP && type != SHT_SYMTAB_SHNDX && type != SHT_HASH &&
                      type != SHT_ZEV_PREEMPTMAP && type != SHT_GNU_verdef &&
                      type != SHT_GNU_verneed && type != SHT_GNU_versym && type != SHT_DYNAMIC &&
                      type != SHT_ZEV_ATTRIBUTES && type != SHT_ZEV_DEBUGOVERLAY);
  return makeSection<Section>(name, type, flags, Section::Traits{false, type != SHT_NOTE, 0});
}

NullSection* ObjectModule::createNullSection(const char* name, uint32_t flags) {
  return makeSection<NullSection>(name, flags);
}

StringTableSection* ObjectModule::createStringTableSection(const char* name, uint32_t flags) {
  auto* section = makeSection<StringTableSection>(name, flags);
  m_StringTableSections.append(section);
  return section;
}

SymbolTableSection* ObjectModule::createSymbolTableSection(const char* name, uint32_t type,
                                                           uint32_t flags) {
  QUARN_ASSERT(1, type == SHT_SYMTAB || type == SHT_DYNSYM);
  auto* section = makeSection<SymbolTableSection>(name, type, flags);
  (type == SHT_SYMTAB ? m_SymtabSections : m_DynsymSections).append(section);
  return section;
}

RelocationSection* ObjectModule::createRelocationSection(const char* name, uint32_t type,
                                                         uint32_t flags) {
  QUARN_ASSERT(1, type == SHT_REL || type == SHT_RELA);
  return makeSection<RelocationSection>(name, type, flags);
}

GroupSection* ObjectModule::createGroupSection(const char* name, uint32_t flags) {
  auto* section = makeSection<GroupSection>(name, flags);
  m_GroupSections.append(section);
  return section;
}

ShndxSection* ObjectModule::createShndxSection(const char* name, uint32_t flags) {
  auto* section = makeSection<ShndxSection>(name, flags);
  m_ShndxSections.append(section);
  return section;
}

HashSection* ObjectModule::createHashSection(const char* name, uint32_t flags) {
  auto* section = makeSection<HashSection>(name, flags);
  m_HashSections.append(section);
  return section;
}

PreemptionMapSection* ObjectModule::createPreemptionMapSection(const char* name, uint32_t flags) {
  auto* section = makeSection<PreemptionMapSection>(name, flags);
  m_PreemptionMapSections.append(section);
  return section;
}

VerdefSection* ObjectModule::createVerdefSection(const char* name, uint32_t flags) {
  auto* section = makeSection<VerdefSection>(name, flags);
  m_VerdefSections.append(section);
  return section;
}

VerneedSection* ObjectModule::createVerneedSection(const char* name, uint32_t flags) {
  auto* section = makeSection<VerneedSection>(name, flags);
  m_VerneedSections.append(section);
  return section;
}

VersymSection* ObjectModule::createVersymSection(const char* name, uint32_t flags) {
  auto* section = makeSection<VersymSection>(name, flags);
  m_VersymSections.append(section);
  return section;
}

DynamicSection* ObjectModule::createDynamicSection(const char* name, uint32_t flags) {
  auto* section = makeSection<DynamicSection>(name, flags);
  m_DynamicSections.append(section);
  return section;
}

BuildAttributesSection* ObjectModule::createBuildAttributesSection(const char* name,
                                                                   uint32_t flags) {
  auto* section = makeSection<BuildAttributesSection>(name, flags);
  m_BuildAttributesSections.append(section);
  return section;
}

DebugOverlaySection* ObjectModule::createDebugOverlaySection(const char* name, uint32_t flags) {
  auto* section = makeSection<DebugOverlaySection>(name, flags);
  m_DebugOverlaySections.append(section);
  return section;
}

Section* ObjectModule::createSectionOfType(const char* name, uint32_t type, uint32_t flags) {
  // clang-format off
  switch (type) {
  case SHT_NULL:             return createNullSection(name, flags);
  case SHT_STRTAB:           return createStringTableSection(name, flags);
  case SHT_SYMTAB:
  case SHT_DYNSYM:           return createSymbolTableSection(name, type, flags);
  case SHT_REL:
  case SHT_RELA:             return createRelocationSection(name, type, flags);
  case SHT_GROUP:            return createGroupSection(name, flags);
  case SHT_SYMTAB_SHNDX:     return createShndxSection(name, flags);
  case SHT_HASH:             return createHashSection(name, flags);
  case SHT_ZEV_PREEMPTMAP:   return createPreemptionMapSection(name, flags);
  case SHT_GNU_verdef:       return createVerdefSection(name, flags);
  case SHT_GNU_verneed:      return createVerneedSection(name, flags);
  case SHT_GNU_versym:       return createVersymSection(name, flags);
  case SHT_DYNAMIC:          return createDynamicSection(name, flags);
  case SHT_ZEV_ATTRIBUTES:   return createBuildAttributesSection(name, flags);
  case SHT_ZEV_DEBUGOVERLAY: return createDebugOverlaySection(name, flags);
  default:                   return createSection(name, type, flags);
  }
  // clang-format on
}

Section* ObjectModule::createCommentSection(const char* first, const char* second, uint8_t byte,
                                            const char* third) {
  Section* section = createSection(".comment", SHT_PROGBITS, 0);
  const size_t firstSize = std::strlen(first) + 1;
  const size_t secondSize = std::strlen(second);
  const size_t thirdSize = std::strlen(third) + 1;
  section->setSize(firstSize + secondSize + 1 + thirdSize);
  // Three texts, of which the second ends with the byte in place of a zero.
  section->write(0, first, firstSize);
  section->write(firstSize, second, secondSize);
  section->setByte(firstSize + secondSize, byte);
  section->write(firstSize + secondSize + 1, third, thirdSize);
  return section;
}

// ---- Symbols

void ObjectModule::reserveSymbols(uint32_t count) {
  m_Symbols.reserve(m_Symbols.getSize() + count);
}

void ObjectModule::reserveDynamicSymbols(uint32_t count) {
  m_DynamicSymbols.reserve(m_DynamicSymbols.getSize() + count);
}

FastArray<Symbol*>& ObjectModule::getCategoryList(Symbol::Category category, bool isDynamic) {
  switch (category) {
  case Symbol::Category_Absolute:
    return isDynamic ? m_AbsoluteDynamicSymbols : m_AbsoluteSymbols;
  case Symbol::Category_Common:
    return isDynamic ? m_CommonDynamicSymbols : m_CommonSymbols;
  case Symbol::Category_Hosted:
    // Hosted symbols are in lists of their sections.
    QUARN_ASSERT(1, false);
    [[fallthrough]];
  case Symbol::Category_Undefined:
    break;
  }
  return isDynamic ? m_UndefinedDynamicSymbols : m_UndefinedSymbols;
}

// A new symbol is in its table but in no other list yet.
Symbol* ObjectModule::createSymbol(const NewSymbol& info) {
  QUARN_ASSERT(1, !m_IndexesFrozen);
  Section* section = info.section;
  if (info.category == Symbol::Category_Hosted) {
    QUARN_ASSERT(1, section != NULL);
    QUARN_ASSERT(1, section->m_ObjectModule == this);
  }
  auto* symbol = alloclib::create<Symbol>(getObjectRegion(), this, keepText(info.name), info.type,
                                          info.binding, info.visibility, info.isDynamic);
  FastArray<Symbol*>& table = info.isDynamic ? m_DynamicSymbols : m_Symbols;
  table.append(symbol);
  symbol->m_Index = table.getSize();
  symbol->m_Category = info.category;
  symbol->m_Section = section;
  symbol->m_Word = info.value;
  symbol->joinList();
  symbol->markChanged();
  return symbol;
}

// ---- The other lists

template <class Object, class... Arguments>
Object* ObjectModule::makeListed(FastArray<Object*>& list, Arguments... arguments) {
  QUARN_ASSERT(1, !m_IndexesFrozen);
  auto* object = alloclib::create<Object>(getObjectRegion(), this, arguments...);
  object->m_Index = list.getSize();
  list.append(object);
  markChanged();
  return object;
}

Group* ObjectModule::createGroup(const char* signature, const char* name, uint32_t flags) {
  QUARN_ASSERT(1, signature != NULL);
  Group* group = makeListed(m_Groups, keepText(signature), keepText(name), flags);
  // Its signature is hashed when somebody first looks for one.
  m_UnnotedGroups.append(group);
  return group;
}

// The first group of a signature is the one that is kept.
void ObjectModule::noteComdatGroup(Group* group) {
  const Stringlett signature(group->getSignature());
  if (group->isComdat() && !m_MapSignaturesToComdatGroups.containsKey(signature))
    m_MapSignaturesToComdatGroups.put(signature, group);
}

// NOLINTNEXTLINE(readability-function-size): the fields of a program header
Segment* ObjectModule::createSegment(uint32_t type, uint64_t offset, uint64_t vaddr, uint64_t paddr,
                                     uint64_t filesz, uint64_t memsz, uint32_t flags,
                                     uint64_t align) {
  return makeListed(m_Segments, type, offset, vaddr, paddr, filesz, memsz, flags, align);
}

NeededLibrary* ObjectModule::createNeededLibrary(const char* name) {
  QUARN_ASSERT(1, name != NULL);
  return makeListed(m_NeededLibraries, keepText(name));
}

LibrarySearchPath* ObjectModule::createLibrarySearchPath(const char* path, uint32_t tag) {
  QUARN_ASSERT(1, path != NULL);
  return makeListed(m_LibrarySearchPaths, keepText(path), tag);
}

Preemption* ObjectModule::createPreemption(const char* symbolName, const char* preemptingDllName) {
  QUARN_ASSERT(1, symbolName != NULL);
  QUARN_ASSERT(1, preemptingDllName != NULL);
  return makeListed(m_Preemptions, keepText(symbolName), keepText(preemptingDllName));
}

RawDataBlock* ObjectModule::createRawDataBlock(Segment* segment, uint64_t size) {
  QUARN_ASSERT(1, segment != NULL);
  auto* block = alloclib::create<RawDataBlock>(getObjectRegion(), this, segment, size);
  m_RawDataBlocks.append(block);
  markChanged();
  return block;
}

} // namespace elfext
