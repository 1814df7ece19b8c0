// SPDX-License-Identifier: Apache-2.0
//
// Build attributes, from the two places where objects state them. A section of a new enough tool
// outranks decoration symbols, and these outrank the section of an older one.
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/build_attributes_cache.h"
#include "elfext/src/build_attributes_injector.h"
#include "elfext/src/object_module_reader.h"

#include <algorithm>
#include <cstring>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace elfext {

namespace {

// False ends the read.
bool viewContents(ReadContext& context, const Section& section, AttributeBytes& bytes) {
  bytes = {};
  if (section.getSize() == 0) return true;
  const uint8_t* contents = context.viewSection(section.getIndex());
  if (contents == nullptr) return false;
  bytes = {contents, section.getSize()};
  return true;
}

bool parseSection(ReadContext& context, AttributeBytes bytes, InjectionBudget& budget) {
  for (const AttributeScope scope : {Tag_File, Tag_Section, Tag_Symbol}) {
    BuildAttributesInjector injector(context.module, scope, budget);
    if (!injector.parse(bytes, context.format.isLittle)) return false;
  }
  return true;
}

// False ends the read; the flag tells whether there were sections, and all of them well.
bool readAttributeSections(ReadContext& context, bool& areSectionsRead) {
  ObjectModule& module = context.module;
  areSectionsRead = false;
  InjectionBudget budget(context.image.getSize());
  for (const Section* section : module.getBuildAttributesSections()) {
    AttributeBytes bytes;
    if (!viewContents(context, *section, bytes)) return false;
    if (parseSection(context, bytes, budget)) continue;
    const uint32_t index = section->getIndex();
    if (!goOn(context.reporter, &ErrorHandler::corruptBuildAttributes, index)) return false;
    module.dropBuildAttributes();
    return true;
  }
  module.setBuildAttributesSectionUpToDate(true);
  areSectionsRead = !module.getBuildAttributesSections().empty();
  return true;
}

struct Decoration {
  Symbol* symbol;
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

bool readDecoration(Symbol* symbol, NameReader& names, Decoration& decoration) {
  if (symbol->startsAsBuildAttributes()) {
    decoration = {symbol, names.read(symbol->getName()), {}};
    if (decoration.text.empty()) return false;
    decoration.text.remove_prefix(DecorationPrefix.size());
    return true;
  }
  if (symbol->getCategory() != Symbol::Category_Absolute) return false;
  const std::string_view name = names.read(symbol->getName());
  const size_t marker = name.find(DecorationMarker);
  if (marker == name.npos) return false;
  decoration = {symbol, name.substr(marker + DecorationMarker.size()), name.substr(0, marker)};
  return true;
}

std::vector<Decoration> findDecorations(const ObjectModule& module, NameReader& names) {
  std::vector<Decoration> decorations;
  Decoration decoration = {};
  for (Symbol* symbol : module.getSymbols()) {
    if (readDecoration(symbol, names, decoration)) decorations.push_back(decoration);
  }
  return decorations;
}

// By the names of the symbols that decorations are for: the first symbol of that name, or null.
using BaseSymbols = std::unordered_map<std::string_view, Symbol*>;

BaseSymbols findBaseSymbols(const ObjectModule& module, std::span<const Decoration> decorations,
                            NameReader& names) {
  BaseSymbols symbols;
  for (const Decoration& decoration : decorations) {
    if (!decoration.base.empty()) symbols.emplace(decoration.base, nullptr);
  }
  if (symbols.empty()) return symbols;
  for (Symbol* symbol : module.getSymbols()) {
    const auto found = symbols.find(names.read(symbol->getName()));
    if (found != symbols.end() && found->second == nullptr) found->second = symbol;
  }
  return symbols;
}

// What the decoration is for; null if that is not there.
ObjectWithBuildAttributes* findTarget(ObjectModule& module, const Decoration& decoration,
                                      const BaseSymbols& baseSymbols) {
  if (decoration.symbol->startsAsBuildAttributes()) {
    Section* section = decoration.symbol->getCategory() == Symbol::Category_Hosted
                           ? decoration.symbol->getHostedSymbolSection()
                           : nullptr;
    if (section != nullptr) return section;
    return &module;
  }
  const auto found = baseSymbols.find(decoration.base);
  return found == baseSymbols.end() ? nullptr : found->second;
}

void apply(ObjectModule& module, const Decoration& decoration, ObjectWithBuildAttributes& target) {
  BuildAttributesCache& cache = module.getBuildAttributesCache();
  const BuildAttributes& stated = cache.getBuildAttributesOf(decoration.text);
  const BuildAttributes* own = target.getOwnBuildAttributes();
  target.setOwnBuildAttributes(
      cache.getBuildAttributes(own == nullptr ? stated : BuildAttributes::getUnion(*own, stated)));
}

void readDecorationSymbols(ReadContext& context, bool areSectionsRead) {
  ObjectModule& module = context.module;
  NameReader names(context.image.getSize());
  const std::vector<Decoration> decorations = findDecorations(module, names);
  if (decorations.empty()) return;
  if (areSectionsRead) {
    if (module.getHighestTagsVersion() > 0) return;
    module.dropBuildAttributes();
  }
  const BaseSymbols baseSymbols = findBaseSymbols(module, decorations, names);
  for (const Decoration& decoration : decorations) {
    ObjectWithBuildAttributes* target = findTarget(module, decoration, baseSymbols);
    if (target != nullptr) apply(module, decoration, *target);
  }
}

} // namespace

bool readBuildAttributes(ReadContext& context) {
  bool areSectionsRead = false;
  if (!readAttributeSections(context, areSectionsRead)) return false;
  readDecorationSymbols(context, areSectionsRead);
  return true;
}

} // namespace elfext
