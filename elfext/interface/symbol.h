// SPDX-License-Identifier: Apache-2.0
//
// One entry of a symbol table. By what a symbol is defined is told by its category: it has exactly
// one, and moves between the lists of the module and of the sections with it.
//
// There may be millions of symbols in a run, so they are plain data without an end of their own.
#pragma once

#include "checking/interface/checking.h"
#include "elfext/interface/object_with_build_attributes.h"

#include <cstddef>
#include <cstdint>

namespace elfext {

class Section;
struct FileVersionDefinition;
struct SymbolVersionDefinition;
struct SymbolVersionRequirement;

class Symbol final : public ObjectWithBuildAttributes {
public:
  enum Category : uint8_t {
    Category_Absolute = 0,
    Category_Hosted = 1,
    Category_Common = 2,
    Category_Undefined = 3,
  };

  /// What a symbol is by its name; queries take a mask of these.
  enum Class : uint32_t {
    Class_Ordinary = 1,
    /// "$a", "$d", "$t" or "$x", alone or before a full stop: says what the bytes from here on are.
    Class_Mapping = 2,
    /// "$b", "$f", "$p" or "$v", whatever follows.
    Class_Tag = 4,
    Class_All = 7,
  };

  /// Made undefined by the creators of ObjectModule, which then say more. The name may be null, and
  /// must live as long as the symbol. Of type and binding four bits count, of the visibility two.
  Symbol(ObjectModule* objectModule, const char* name, uint32_t type, uint32_t binding,
         uint32_t visibility, bool isDynamic)
      : ObjectWithBuildAttributes(objectModule), m_Name(name),
        m_Type(static_cast<uint8_t>(type & 0xF)), m_Binding(static_cast<uint8_t>(binding & 0xF)),
        m_Visibility(static_cast<uint8_t>(visibility & 0x3)), m_IsDynamic(isDynamic) {}

  /// Null for a symbol without a name.
  [[nodiscard]] const char* getName() const { return m_Name; }
  [[nodiscard]] Class getClass() const;
  /// st_size, in bytes.
  [[nodiscard]] uint64_t getSize() const { return m_Size; }
  /// STT_..., STB_... and STV_...; values that have no name stay as the file has them.
  [[nodiscard]] uint32_t getType() const { return m_Type; }
  [[nodiscard]] uint32_t getBinding() const { return m_Binding; }
  [[nodiscard]] uint32_t getVisibility() const { return m_Visibility; }
  /// Whether it is in the dynamic symbol table.
  [[nodiscard]] bool isDynamic() const { return m_IsDynamic; }
  [[nodiscard]] Category getCategory() const { return m_Category; }
  /// In its table, where the first symbol has index 1.
  [[nodiscard]] uint32_t getIndex() const { return m_Index; }

  /// Each is for its own category only.
  [[nodiscard]] uint64_t getAbsoluteValue() const {
    QUARN_ASSERT(1, m_Category == Category_Absolute);
    return m_Word;
  }
  /// Bytes.
  [[nodiscard]] uint64_t getCommonAlignment() const {
    QUARN_ASSERT(1, m_Category == Category_Common);
    return m_Word;
  }
  [[nodiscard]] uint64_t getUndefinedValue() const {
    QUARN_ASSERT(1, m_Category == Category_Undefined);
    return m_Word;
  }
  [[nodiscard]] Section* getHostedSymbolSection() const {
    QUARN_ASSERT(1, m_Category == Category_Hosted);
    return m_Section;
  }
  /// From the start of the section.
  [[nodiscard]] uint64_t getHostedSymbolOffset() const {
    QUARN_ASSERT(1, m_Category == Category_Hosted);
    return m_Word;
  }

  /// The value of an absolute symbol, the place of a hosted one, 0 for all others. Bit 0 of a
  /// function's address, which marks the instruction set, is part of it.
  [[nodiscard]] uint64_t getAddress() const;
  /// What st_value is to hold: without that bit, and relative to the section in files that are not
  /// laid out yet.
  [[nodiscard]] uint64_t getAbiValue() const;
  /// Whether the name carries build attributes.
  [[nodiscard]] bool isBuildAttributesSymbol() const;
  /// Whether it does so from its start on, as that of any symbol but an absolute one must.
  [[nodiscard]] bool startsAsBuildAttributes() const;

  /// The text is copied; null for none.
  void setName(const char* name);
  void setSize(uint64_t size);
  void setType(uint32_t type);
  void setBinding(uint32_t binding);
  void setVisibility(uint32_t visibility);

  /// Change the category. The symbol goes to the end of its new list.
  void makeUndefined();
  void makeAbsolute(uint64_t value);
  void makeCommon(uint64_t alignment);
  void makeHosted(Section* section, uint64_t offset);

  /// For dynamic symbols only. Null for a symbol without.
  [[nodiscard]] const SymbolVersionDefinition* getVersionDefinition() const {
    return m_VersionDefinition;
  }
  [[nodiscard]] const SymbolVersionRequirement* getVersionRequirement() const {
    return m_VersionRequirement;
  }
  /// A version of the same module, for a symbol that is defined.
  void setVersionDefinition(const FileVersionDefinition* version, bool hidden);
  /// The number that the symbol's word has, the version's name, and that of the file that should
  /// have it; texts are kept as the module keeps names.
  void setVersionRequirement(uint32_t version, const char* versionName, const char* fileName,
                             bool hidden);
  void clearVersionDefinition();
  void clearVersionRequirement();

  /// For the module's user, who says what it means; null at first, and again when that symbol goes.
  [[nodiscard]] Symbol* getAssociatedSymbol() const { return m_AssociatedSymbol; }
  /// One of the same module, or null.
  void setAssociatedSymbol(Symbol* symbol);

  [[nodiscard]] bool inheritsBuildAttributes() const override { return true; }
  void getInheritedBuildAttributes(BuildAttributes& result) const override;

private:
  friend class ObjectModule;
  friend class Pruner;
  friend class Section;

  void place(Category category, Section* section, uint64_t word);
  void leaveList();
  void joinList();
  void markChanged();

  const char* m_Name;
  uint64_t m_Size = 0;
  /// The value, the alignment, or the offset in the section.
  uint64_t m_Word = 0;
  Section* m_Section = nullptr;
  SymbolVersionDefinition* m_VersionDefinition = nullptr;
  SymbolVersionRequirement* m_VersionRequirement = nullptr;
  Symbol* m_AssociatedSymbol = nullptr;
  uint32_t m_Index = 0;
  uint8_t m_Type;
  uint8_t m_Binding;
  uint8_t m_Visibility;
  bool m_IsDynamic;
  bool m_Goes = false;
  Category m_Category = Category_Undefined;
};

} // namespace elfext
