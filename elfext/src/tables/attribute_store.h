// SPDX-License-Identifier: Apache-2.0
//
// What build attributes hang on while they are read: the object as a whole, its sections and its
// static symbols. They are those of a model, or of an object's tables, of which none is made.
//
// The reader of attributes works on this interface alone, so that both roads take the same steps
// and give up at the same places. There are two of them: a module
// (reader/object_module_reader_attributes.cpp) and LooseAttributeStore.
#pragma once

#include "elfext/interface/symbol.h"

#include <cstdint>

namespace elfext {

class BuildAttributes;
class BuildAttributesBlock;
class BuildAttributesCache;

// One thing that can have attributes.
struct AttributeHolder {
  enum class Kind : uint8_t { File, Section, Symbol };

  Kind kind = Kind::File;
  // Of a section in its table; of a symbol from 0 on, without the null symbol.
  uint32_t index = 0;

  [[nodiscard]] bool operator==(const AttributeHolder&) const = default;
};

// What decorations want to know of a symbol; the section is that of a hosted one.
struct AttributeSymbol {
  const char* name;
  Symbol::Category category;
  uint32_t section;
};

class AttributeStore {
public:
  virtual ~AttributeStore() = default;

  // Whether attributes are wanted, and not only what is wrong with them.
  [[nodiscard]] virtual bool isKept() const = 0;
  [[nodiscard]] virtual uint32_t getSectionCount() const = 0;
  // Without the null symbol.
  [[nodiscard]] virtual uint32_t getSymbolCount() const = 0;
  [[nodiscard]] virtual AttributeSymbol getSymbol(uint32_t index) const = 0;

  // The rest is only for a store that keeps what it gets. It makes its own what it is given.
  [[nodiscard]] virtual BuildAttributesCache& getCache() = 0;
  [[nodiscard]] virtual uint32_t getBlockCount(AttributeHolder holder) const = 0;
  virtual void setBlock(AttributeHolder holder, const BuildAttributesBlock* block) = 0;
  // Null for a holder without any.
  [[nodiscard]] virtual const BuildAttributes* getOwn(AttributeHolder holder) const = 0;
  virtual void setOwn(AttributeHolder holder, const BuildAttributes* attributes) = 0;
  // What the holders have now is what the attribute sections say.
  virtual void markSectionsTaken() = 0;
  // No holder has attributes any more; blocks stay.
  virtual void drop() = 0;
  // The highest Tag_ZV_version of all attributes; 0 for none.
  [[nodiscard]] virtual uint32_t getHighestTagsVersion() const = 0;
  virtual void raiseHighestTagsVersion(uint32_t version) = 0;
};

} // namespace elfext
