// SPDX-License-Identifier: Apache-2.0
//
// A module whose objects are given attributes as they stand in a section: a test writes tags as
// bytes, makes them an object's own, and looks at what follows for the objects around it.

#pragma once

#include "elfext/interface/build_attributes_cache.h"
#include "elfext/interface/build_attributes_parsers.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/object_module.h"
#include "tests/support/attribute_bytes.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace elfext {

using namespace testsupport;

class AttributeModuleTest : public testing::Test {
protected:
  // Section 0 is the null section.
  AttributeModuleTest() { m_Module.createNullSection("", 0); }

  Section* makeSection(const char* name = ".text") {
    return m_Module.createSection(name, SHT_PROGBITS, 0);
  }
  Symbol* makeHosted(const char* name, Section* section) {
    return m_Module.createHostedSymbol(name, 0, STT_NOTYPE, STB_GLOBAL, STV_DEFAULT, section);
  }
  Symbol* makeAbsolute(const char* name) {
    return m_Module.createAbsoluteSymbol(name, 0, STT_NOTYPE, STB_LOCAL, STV_DEFAULT);
  }

  // Makes the attributes the object's own.
  void own(ObjectWithBuildAttributes& object, const BuildAttributes& attributes) {
    object.setOwnBuildAttributes(m_Module.getBuildAttributesCache().getBuildAttributes(attributes));
  }
  void ownTags(ObjectWithBuildAttributes& object, std::string_view qobix,
               std::string_view zev = "") {
    BuildAttributes attributes;
    EXPECT_TRUE(QobixBuildAttributesDecodingParser(attributes).parse(bytesOf(qobix)));
    EXPECT_TRUE(ZevBuildAttributesDecodingParser(attributes).parse(bytesOf(zev)));
    own(object, attributes);
  }
  void ownText(ObjectWithBuildAttributes& object, const std::string& text) {
    own(object, BuildAttributes(text));
  }

  // The bytes of the object's block of that vendor; "none" if there is none.
  static std::string blockOf(const ObjectWithBuildAttributes& object, std::string_view vendor) {
    const BuildAttributesBlock* block = object.findBlock(vendor);
    return block == nullptr ? "none" : textOf(block->getData());
  }

  ObjectModule m_Module;
};

} // namespace elfext
