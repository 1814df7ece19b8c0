// SPDX-License-Identifier: Apache-2.0
//
// Decides which statement of build attributes counts, and whom it is for. Sections are walked
// first, then, for who keeps attributes, the symbols whose names are decorations:
// "BuildAttributes$" and a text for the file or the section of the symbol, name,
// "$$BuildAttributes$" and a text for the first symbol of that name. It is the last step of a read,
// since holders must have been checked before anything hangs on them.
//
// What is tried here: attribute sections that lie (the parsers and the injector's budget stop
// them), and thousands of decorations whose names are the ends of one long text, so that looking at
// each is a square of the file (NameReader stops those).
#include "elfext/src/tables/build_attributes_reader.h"

#include "elfext/interface/attribute_string.h"
#include "elfext/interface/build_attributes_cache.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/src/tables/build_attributes_injector.h"

#include <algorithm>
#include <cstring>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace elfext {

namespace {

// Where nothing is kept, nothing has to be there before something else.
bool parseSection(const ObjectTables& tables, AttributeStore& store, AttributeBytes bytes,
                  InjectionBudget& budget) {
  // One walk finds the same faults as three.
  if (!store.isKept())
    return BuildAttributesInjector(store, std::nullopt, budget)
        .parse(bytes, tables.format.isLittle);
  for (const AttributeScope scope : {Tag_File, Tag_Section, Tag_Symbol}) {
    BuildAttributesInjector injector(store, scope, budget);
    if (!injector.parse(bytes, tables.format.isLittle)) return false;
  }
  return true;
}

// What is known of the attribute sections.
enum class SectionState : uint8_t { None, Read, Corrupt };

// False ends the read.
bool readAttributeSections(ObjectTables& tables, AttributeStore& store, SectionState& state) {
  InjectionBudget budget(tables.image.getSize());
  for (uint32_t i = 0; i < tables.getSectionCount(); ++i) {
    if (tables.typeOf(i) != SHT_ZEV_ATTRIBUTES) continue;
    const uint64_t size = tables.sectionHeaders[i].size;
    const uint8_t* contents = size == 0 ? nullptr : tables.viewSection(i);
    // Bytes that can't be had are not a corrupted section: this has been reported.
    if (size != 0 && contents == nullptr) return false;
    state = SectionState::Read;
    if (parseSection(tables, store, {contents, size}, budget)) continue;
    state = SectionState::Corrupt;
    if (!goOn(tables.reporter, &ErrorHandler::corruptBuildAttributes, i)) return false;
    // Half of what an object says of itself would be taken for all of it.
    if (store.isKept()) store.drop();
    return true;
  }
  if (store.isKept()) store.markSectionsTaken();
  return true;
}

struct Decoration {
  AttributeSymbol symbol;
  std::string_view text; // of the attributes
  std::string_view base; // the name of the symbol that they are for, if they are for one
};

// The names of a good object are no longer than the object. Thousands of names that are ends of one
// long text are: of these, no more is looked at than the object has bytes, a few times over.
class NameReader {
public:
  explicit NameReader(uint64_t imageSize) : m_Left(imageSize * PerByte + Base) {}

  // Empty once too much has been read, as for a symbol without a name.
  [[nodiscard]] std::string_view read(const char* name) {
    // The string table ends with a zero byte, so this looks at no more than the table, and at no
    // more than is left.
    const size_t length = name == nullptr ? 0 : strnlen(name, m_Left + 1);
    const bool isTooLong = length > m_Left;
    m_Left -= std::min<uint64_t>(length, m_Left);
    return isTooLong ? std::string_view() : std::string_view(name, length);
  }

private:
  static constexpr uint64_t Base = 0x100000;
  static constexpr uint64_t PerByte = 4;

  uint64_t m_Left;
};

bool startsAsDecoration(const AttributeSymbol& symbol) {
  const bool canBe =
      symbol.category == Symbol::Category_Hosted || symbol.category == Symbol::Category_Absolute;
  return canBe && symbol.name != nullptr &&
         // Ends at the name's own end, so it takes no part of what NameReader counts.
         std::strncmp(symbol.name, DecorationPrefix.data(), DecorationPrefix.size()) == 0;
}

bool readDecoration(const AttributeSymbol& symbol, NameReader& names, Decoration& decoration) {
  if (startsAsDecoration(symbol)) {
    decoration = {symbol, names.read(symbol.name), {}};
    if (decoration.text.empty()) return false;
    decoration.text.remove_prefix(DecorationPrefix.size());
    return true;
  }
  // Before the name is read: most symbols are not absolute and cost nothing.
  if (symbol.category != Symbol::Category_Absolute) return false;
  const std::string_view name = names.read(symbol.name);
  const size_t marker = name.find(DecorationMarker);
  if (marker == std::string_view::npos) return false;
  decoration = {symbol, name.substr(marker + DecorationMarker.size()), name.substr(0, marker)};
  return true;
}

std::vector<Decoration> findDecorations(const AttributeStore& store, NameReader& names) {
  std::vector<Decoration> decorations;
  Decoration decoration = {};
  for (uint32_t i = 0; i < store.getSymbolCount(); ++i) {
    if (readDecoration(store.getSymbol(i), names, decoration)) decorations.push_back(decoration);
  }
  return decorations;
}

// By the names of the symbols that decorations are for: the first symbol of that name, if any. One
// walk over all symbols fills it, where looking for each name would be decorations times symbols.
using BaseSymbols = std::unordered_map<std::string_view, std::optional<uint32_t>>;

BaseSymbols findBaseSymbols(const AttributeStore& store, std::span<const Decoration> decorations,
                            NameReader& names) {
  BaseSymbols symbols;
  for (const Decoration& decoration : decorations) {
    if (!decoration.base.empty()) symbols.emplace(decoration.base, std::nullopt);
  }
  if (symbols.empty()) return symbols;
  for (uint32_t i = 0; i < store.getSymbolCount(); ++i) {
    const auto found = symbols.find(names.read(store.getSymbol(i).name));
    if (found != symbols.end() && !found->second) found->second = i;
  }
  return symbols;
}

// What the decoration is for, unless that is not there.
std::optional<AttributeHolder> findHolder(const Decoration& decoration,
                                          const BaseSymbols& baseSymbols) {
  if (startsAsDecoration(decoration.symbol)) {
    if (decoration.symbol.category != Symbol::Category_Hosted) return AttributeHolder{};
    return AttributeHolder{AttributeHolder::Kind::Section, decoration.symbol.section};
  }
  const auto found = baseSymbols.find(decoration.base);
  if (found == baseSymbols.end() || !found->second) return std::nullopt;
  return AttributeHolder{AttributeHolder::Kind::Symbol, *found->second};
}

void apply(AttributeStore& store, const Decoration& decoration, AttributeHolder holder) {
  BuildAttributesCache& cache = store.getCache();
  const BuildAttributes& stated = cache.getBuildAttributesOf(decoration.text);
  const BuildAttributes* own = store.getOwn(holder);
  store.setOwn(holder, cache.getBuildAttributes(
                           own == nullptr ? stated : BuildAttributes::getUnion(*own, stated)));
}

void readDecorationSymbols(const ObjectTables& tables, AttributeStore& store, SectionState state) {
  NameReader names(tables.image.getSize());
  const std::vector<Decoration> decorations = findDecorations(store, names);
  if (decorations.empty()) return;
  if (state == SectionState::Read) {
    // Only tools that are new enough state a version.
    if (store.getHighestTagsVersion() > 0) return;
    store.drop();
  }
  const BaseSymbols baseSymbols = findBaseSymbols(store, decorations, names);
  for (const Decoration& decoration : decorations) {
    const std::optional<AttributeHolder> holder = findHolder(decoration, baseSymbols);
    if (holder) apply(store, decoration, *holder);
  }
}

} // namespace

bool readBuildAttributes(ObjectTables& tables, AttributeStore& store) {
  SectionState state = SectionState::None;
  if (!readAttributeSections(tables, store, state)) return false;
  if (store.isKept()) readDecorationSymbols(tables, store, state);
  return true;
}

} // namespace elfext
