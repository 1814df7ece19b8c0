// SPDX-License-Identifier: Apache-2.0
//
// Makes a module's decoration symbols say what its attributes do: what is right stays where it is.
//
// The names are those that tables/build_attributes_reader takes apart: "BuildAttributes$" and a
// text, for the module as an absolute symbol or in the section that it is for; or a symbol's name,
// "$$" and the same. What should be there is put into a set first, so that thousands of symbols are
// each looked up once.
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/build_attributes.h"
#include "elfext/interface/build_attributes_writer.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/prune_criterion.h"

#include <cstring>
#include <functional>
#include <string>
#include <unordered_set>
#include <utility>
#include <vector>

namespace elfext {

namespace {

// A decoration symbol that should be there: in a section, or absolute.
struct WantedDecoration {
  std::string name;
  Section* section;

  bool operator==(const WantedDecoration&) const = default;
};

struct WantedHash {
  size_t operator()(const WantedDecoration& wanted) const {
    // An address in a hash is harmless here: the set is never walked through.
    return std::hash<std::string>{}(wanted.name) ^ std::hash<const void*>{}(wanted.section);
  }
};

// In the order in which they are to be made.
class WantedDecorations {
public:
  explicit WantedDecorations(ObjectModule& module) {
    addForModule(module);
    for (Section* section : module.getSections()) {
      const std::string text = differingText(*section);
      if (!text.empty()) add({text, section});
    }
    for (const Symbol* symbol : module.getSymbols()) {
      if (symbol->getName() == nullptr) continue;
      const std::string text = differingText(*symbol);
      if (!text.empty()) add({symbol->getName() + ("$$" + text), nullptr});
    }
  }

  // Whether the symbol was wanted; it then is not any more.
  bool cancel(const Symbol& symbol) {
    Section* section =
        symbol.getCategory() == Symbol::Category_Hosted ? symbol.getHostedSymbolSection() : nullptr;
    // So a second symbol of the same name goes.
    return m_Wanted.erase({symbol.getName(), section}) != 0;
  }

  void makeAll(ObjectModule& module) const {
    for (const WantedDecoration& wanted : m_InOrder) {
      if (!m_Wanted.contains(wanted)) continue;
      if (wanted.section == nullptr)
        module.createAbsoluteSymbol(wanted.name.c_str(), 0, STT_NOTYPE, STB_LOCAL, STV_DEFAULT);
      else
        module.createHostedSymbol(wanted.name.c_str(), 0, STT_NOTYPE, STB_LOCAL, STV_DEFAULT,
                                  wanted.section);
    }
  }

private:
  static std::string nameOf(const BuildAttributes& attributes) {
    return std::string(DecorationPrefix) + printAttributeString(attributes.getFullAttr());
  }

  void addForModule(const ObjectModule& module) {
    const BuildAttributes* own = module.getOwnBuildAttributes();
    if (own != nullptr && own->hasTag(Tag_nodefaults)) return;
    BuildAttributes effective;
    module.getEffectiveBuildAttributes(effective);
    add({nameOf(effective), nullptr});
  }

  // Empty where nothing has to be said.
  static std::string differingText(const ObjectWithBuildAttributes& object) {
    if (object.getOwnBuildAttributes() == nullptr) return {};
    BuildAttributes inherited;
    BuildAttributes effective;
    object.getInheritedBuildAttributes(inherited);
    object.getEffectiveBuildAttributes(effective);
    return inherited == effective ? std::string() : nameOf(effective);
  }

  void add(WantedDecoration wanted) {
    if (m_Wanted.insert(wanted).second) m_InOrder.push_back(std::move(wanted));
  }

  std::unordered_set<WantedDecoration, WantedHash> m_Wanted;
  std::vector<WantedDecoration> m_InOrder;
};

struct DoomedSymbols final : PruneCriterion {
  using PruneCriterion::goes;
  bool goes(const Symbol& symbol) const override { return symbols.contains(&symbol); }

  std::unordered_set<const Symbol*> symbols;
};

} // namespace

void updateDecorationSymbols(ObjectModule& module) {
  WantedDecorations wanted(module);
  DoomedSymbols doomed;
  for (const Symbol* symbol : module.getSymbols()) {
    if (symbol->isBuildAttributesSymbol() && !wanted.cancel(*symbol)) doomed.symbols.insert(symbol);
  }
  for (const Symbol* symbol : module.getDynamicSymbols()) {
    // Attributes are stated in the static table only.
    if (symbol->isBuildAttributesSymbol()) doomed.symbols.insert(symbol);
  }
  // All at once: taking each out by itself would renumber the table each time.
  if (!doomed.symbols.empty()) module.prune(doomed);
  wanted.makeAll(module);
}

} // namespace elfext
