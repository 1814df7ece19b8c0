// SPDX-License-Identifier: Apache-2.0
//
// Gives the objects of a module what an attribute section says of them: in three walks over the
// section, so that what holds for the file is there before what holds for its sections, and that
// before what holds for symbols, in whatever order the section has them.
#pragma once

#include "elfext/interface/build_attributes_parsers.h"

#include <cstdint>
#include <unordered_map>

namespace elfext {

class BuildAttributesBlock;
class ObjectModule;
class ObjectWithBuildAttributes;

// Steps that all walks over an object's attribute sections may take beyond reading them. A run that
// is for many sections is decoded again for each set of attributes that they have already; that
// must not grow with the square of the object.
class InjectionBudget {
public:
  explicit InjectionBudget(uint64_t objectSize) : m_Left(Base + PerByte * objectSize) {}

  // False if there are not so many left.
  [[nodiscard]] bool take(uint64_t steps) {
    if (steps > m_Left) return false;
    m_Left -= steps;
    return true;
  }

private:
  static constexpr uint64_t Base = 2 << 20;
  static constexpr uint64_t PerByte = 4;

  uint64_t m_Left;
};

class BuildAttributesInjector final : public BuildAttributesSectionParser {
public:
  // Of the scopes, this walk looks at the given one only.
  BuildAttributesInjector(ObjectModule& module, AttributeScope scope, InjectionBudget& budget)
      : m_Module(module), m_Scope(scope), m_Budget(budget) {}

  bool parseFileSubSubsection(std::string_view vendor, AttributeBytes run) override;
  // False for indices that are not those of sections, or of symbols.
  bool parseSectionSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                 AttributeBytes run) override;
  bool parseSymbolSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                AttributeBytes run) override;

private:
  struct Run;

  bool inject(ObjectWithBuildAttributes& object, Run& run);
  [[nodiscard]] const BuildAttributes* decode(const BuildAttributes* start, const Run& run);

  ObjectModule& m_Module;
  AttributeScope m_Scope;
  InjectionBudget& m_Budget;
};

} // namespace elfext
