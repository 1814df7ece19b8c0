// SPDX-License-Identifier: Apache-2.0
//
// Gives the holders in a store what an attribute section says of them: in three walks over the
// section, so that what holds for the file is there before what holds for its sections, and that
// before what holds for symbols, in whatever order the section has them.
//
// Indexes in a section are those of the section header table and of the static symbols, both from
// 1; the base class has decoded them. One that names nothing makes the section corrupted.
#pragma once

#include "elfext/interface/build_attributes_parsers.h"
#include "elfext/src/tables/attribute_store.h"

#include <cstdint>
#include <optional>
#include <unordered_map>

namespace elfext {

class BuildAttributesBlock;

// Steps that all walks over an object's attribute sections may take beyond reading them. A run that
// is for many sections is decoded again for each set of attributes that they have already; that
// must not grow with the square of the object.
class InjectionBudget {
public:
  explicit InjectionBudget(uint64_t objectSize) : m_Left(Base + PerByte * objectSize) {}

  // Whether attribute sections of so many bytes in all can never use it up. An index, a byte of a
  // run and half an entry of a list are a byte each, so there are no more than a quarter of the
  // square of times that a byte is decoded, and an eighth of it of entries that wait for it.
  [[nodiscard]] static constexpr bool alwaysCovers(uint64_t sectionBytes) {
    return sectionBytes <= AlwaysCovered;
  }
  // False if there are not so many left.
  [[nodiscard]] bool take(uint64_t steps) {
    if (steps > m_Left) return false;
    m_Left -= steps;
    return true;
  }

private:
  // A small object with an honest section needs far less; a large one gets more by its size.
  static constexpr uint64_t Base = 2 << 20;
  static constexpr uint64_t PerByte = 4;
  static constexpr uint64_t AlwaysCovered = 80;
  static constexpr uint64_t Square = AlwaysCovered * AlwaysCovered;
  static_assert(2 * Square + (8 * AlwaysCovered + Square / 4) * (Square / 8) <= Base);

  uint64_t m_Left;
};

class BuildAttributesInjector final : public BuildAttributesSectionParser {
public:
  // Of the scopes, this walk looks at the given one only, or without one at all of them.
  BuildAttributesInjector(AttributeStore& store, std::optional<AttributeScope> scope,
                          InjectionBudget& budget)
      : m_Store(store), m_Scope(scope), m_Budget(budget) {}

  bool parseFileSubSubsection(std::string_view vendor, AttributeBytes bytes) override;
  // False for indices that are not those of sections, or of symbols.
  bool parseSectionSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                 AttributeBytes bytes) override;
  bool parseSymbolSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                AttributeBytes bytes) override;

private:
  struct Run;

  [[nodiscard]] bool looksAt(AttributeScope scope) const { return !m_Scope || *m_Scope == scope; }
  bool inject(AttributeHolder holder, std::optional<Run>& run);
  void open(std::string_view vendor, AttributeBytes bytes, std::optional<Run>& run);
  [[nodiscard]] const BuildAttributes* decode(const BuildAttributes* start, const Run& run);

  AttributeStore& m_Store;
  std::optional<AttributeScope> m_Scope;
  InjectionBudget& m_Budget;
};

} // namespace elfext
