// SPDX-License-Identifier: Apache-2.0
//
// What the tests of the object model share: a module in regions that come and go with each test,
// short ways to make sections and symbols in it, and the way to expect a failed assertion.

#pragma once

#include "alloclib/interface/session.h"
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/build_attributes_cache.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/error_handler.h"
#include "elfext/interface/object_module.h"
#include "elfext/src/model/module_builder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

// A failed assertion, with the text of its expression.
#define EXPECT_ASSERTION(statement, text)                                                          \
  EXPECT_EXIT(statement, testing::ExitedWithCode(1),                                               \
              testing::HasSubstr(std::string("(") + (text) + ")"))

namespace elfext {

class ModuleTest : public testing::Test {
private:
  alloclib::Session m_Session;

protected:
  Section* makeSection(const char* name = ".text", uint32_t type = SHT_PROGBITS) {
    return module.createSection(name, type, 0);
  }
  // A section with these contents.
  Section* makeSection(const std::vector<uint8_t>& bytes) {
    Section* section = makeSection();
    section->setSize(bytes.size());
    if (!bytes.empty()) section->write(0, bytes.data(), bytes.size());
    return section;
  }
  Symbol* makeHosted(const char* name, Section* section, uint64_t offset = 0) {
    return module.createHostedSymbol(name, offset, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT, section);
  }
  Symbol* makeHostedDynamic(const char* name, Section* section, uint64_t offset = 0) {
    return module.createHostedDynamicSymbol(name, offset, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT,
                                            section);
  }
  Symbol* makeAbsolute(const char* name, uint64_t value = 0) {
    return module.createAbsoluteSymbol(name, value, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT);
  }
  Symbol* makeUndefined(const char* name) {
    return module.createUndefinedSymbol(name, 0, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT);
  }
  Symbol* makeUndefinedDynamic(const char* name) {
    return module.createUndefinedDynamicSymbol(name, 0, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT);
  }

  // Of the module's cache.
  const BuildAttributes* attributesWithArchitecture(uint32_t number) {
    BuildAttributes attributes;
    attributes.setNumericTag(Tag_CPU_arch, number);
    return module.getBuildAttributesCache().getBuildAttributes(attributes);
  }
  static uint32_t inheritedArchitecture(const ObjectWithBuildAttributes& object) {
    BuildAttributes inherited;
    object.getInheritedBuildAttributes(inherited);
    return inherited.getNumericTag(Tag_CPU_arch);
  }

  // Whether the change clears the flag of the auxiliary sections.
  template <class Change>
  bool makesStale(Change change) {
    ModuleBuilder::setAuxiliarySectionsUpToDate(module, true);
    change();
    return !module.areAuxiliarySectionsUpToDate();
  }

  ObjectModule module;
};

template <class List>
auto elements(const List& list) {
  std::vector<decltype(list[0])> all;
  for (uint32_t index = 0; index < list.getSize(); ++index)
    all.push_back(list[index]);
  return all;
}

template <class T>
std::vector<T> elements(std::span<T const> span) {
  return {span.begin(), span.end()};
}

} // namespace elfext
