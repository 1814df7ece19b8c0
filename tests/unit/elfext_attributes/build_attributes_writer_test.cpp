// SPDX-License-Identifier: Apache-2.0
//
// From the attributes of a module's objects to the bytes of its attribute section: which blocks
// each object has, what it inherits from around, and in which lists equal blocks are written. The
// result is held against a plain writer that goes through all objects for each vendor, over
// generated modules.

#include "elfext/interface/build_attributes_writer.h"

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/src/model/module_builder.h"
#include "tests/unit/elfext_attributes/attribute_module_fixture.h"

#include <algorithm>
#include <random>

namespace elfext {
namespace {

using testing::ElementsAre;
using testing::SizeIs;

class BuildAttributesWriterTest : public AttributeModuleTest {
protected:
  // The bytes of the section that is made from the blocks.
  std::string written() {
    updateBuildAttributesSection(m_Module);
    EXPECT_THAT(m_Module.getBuildAttributesSections(), SizeIs(1));
    EXPECT_TRUE(m_Module.isBuildAttributesSectionUpToDate());
    const Section& section = *m_Module.getBuildAttributesSections().front();
    EXPECT_EQ(section.getSize(), section.getContentsSize());
    return textOf({section.getContents(), section.getContentsSize()});
  }
};

// ---- Blocks

using ObjectBlocksTest = AttributeModuleTest;

TEST_F(ObjectBlocksTest, AreOneForEachVendor) {
  Section* section = makeSection();
  EXPECT_EQ(section->getBlockCount(), 0u);
  EXPECT_EQ(section->findBlock("qobix"), nullptr);
  EXPECT_FALSE(section->removeBlock("qobix"));
  const BuildAttributesBlock* first = section->setBlock("qobix", bytesOf("a"));
  const BuildAttributesBlock* second = section->setBlock("ZEV", bytesOf("b"));
  const BuildAttributesBlock* third = section->setBlock("qobix", bytesOf("c"));
  EXPECT_EQ(first->getVendor(), "qobix");
  EXPECT_EQ(textOf(first->getData()), "a");
  ASSERT_EQ(section->getBlockCount(), 2u);
  EXPECT_EQ(section->getBlock(0), third);
  EXPECT_EQ(section->getBlock(1), second);
  EXPECT_EQ(section->findBlock("qobix"), third);
  EXPECT_EQ(section->findBlock("QOBIX"), nullptr);
  EXPECT_EQ(section->findBlock("qobi"), nullptr);
}

TEST_F(ObjectBlocksTest, AreSharedByContent) {
  Section* section = makeSection();
  Section* other = makeSection();
  const BuildAttributesBlock* block = section->setBlock("v", bytesOf("abc"));
  EXPECT_EQ(other->setBlock("v", bytesOf("abc")), block);
  EXPECT_NE(other->setBlock("v", bytesOf("abd")), block);
  EXPECT_NE(other->setBlock("w", bytesOf("abc")), block);
  EXPECT_EQ(m_Module.setBlock("v", bytesOf("abc")), block);
}

TEST_F(ObjectBlocksTest, KeepTheirOrderWhenOneGoes) {
  for (const char* vendor : {"a", "b", "c", "d"})
    m_Module.setBlock(vendor, bytesOf("x"));
  EXPECT_TRUE(m_Module.removeBlock("b"));
  EXPECT_FALSE(m_Module.removeBlock("b"));
  const BuildAttributesBlock* block = m_Module.findBlock("c");
  EXPECT_TRUE(m_Module.removeBlock(block));
  EXPECT_FALSE(m_Module.removeBlock(block));
  ASSERT_EQ(m_Module.getBlockCount(), 2u);
  EXPECT_EQ(m_Module.getBlock(0)->getVendor(), "a");
  EXPECT_EQ(m_Module.getBlock(1)->getVendor(), "d");
}

TEST_F(ObjectBlocksTest, MakeTheSectionStale) {
  const auto makesStale = [this](auto change) {
    ModuleBuilder::setBuildAttributesSectionUpToDate(m_Module, true);
    change();
    return !m_Module.isBuildAttributesSectionUpToDate();
  };
  Symbol* symbol = makeAbsolute("a");
  EXPECT_TRUE(makesStale([&] { symbol->setBlock("v", bytesOf("x")); }));
  EXPECT_FALSE(makesStale([&] { symbol->removeBlock("w"); }));
  EXPECT_TRUE(makesStale([&] { symbol->removeBlock("v"); }));
  EXPECT_TRUE(makesStale([&] { ownTags(*symbol, tag(6, 1)); }));
  EXPECT_TRUE(makesStale([&] { symbol->setOwnBuildAttributes(nullptr); }));
}

// ---- What holds

TEST_F(ObjectBlocksTest, AreInheritedFromAround) {
  Section* section = makeSection();
  Symbol* hosted = makeHosted("h", section);
  Symbol* absolute = makeAbsolute("a");
  ownTags(m_Module, tag(6, 10) + tag(7, 65));
  ownTags(*section, tag(7, 82) + tag(30, 2));
  ownTags(*hosted, tag(38, 1));
  const auto effective = [](const ObjectWithBuildAttributes& object) {
    BuildAttributes attributes;
    object.getEffectiveBuildAttributes(attributes);
    std::string bytes;
    attributes.encodeQobix(bytes);
    return bytes;
  };
  EXPECT_EQ(effective(m_Module), tag(6, 10) + tag(7, 65));
  EXPECT_EQ(effective(*section), tag(6, 10) + tag(7, 82) + tag(30, 2));
  EXPECT_EQ(effective(*hosted), tag(6, 10) + tag(7, 82) + tag(30, 2) + tag(38, 1));
  EXPECT_EQ(effective(*absolute), effective(m_Module));
  // Whatever the tag's value, nothing else holds then.
  ownTags(*section, tag(7, 82) + tag(64, 0));
  EXPECT_EQ(effective(*section), "");
  EXPECT_EQ(effective(*hosted), tag(38, 1));
}

// ---- From attributes to blocks

using UpdateBlocksTest = AttributeModuleTest;

TEST_F(UpdateBlocksTest, AreTheDifferenceToWhatIsAround) {
  Section* section = makeSection();
  Section* same = makeSection();
  Symbol* hosted = makeHosted("h", section);
  Symbol* absolute = makeAbsolute("a");
  ownTags(m_Module, tag(6, 10) + tag(7, 65) + tag(8, 0), tag(18, 1));
  ownTags(*section, tag(6, 10) + tag(30, 2));
  ownTags(*same, tag(6, 10) + tag(8, 0));
  ownTags(*hosted, tag(30, 4));
  ownTags(*absolute, tag(7, 0), tag(20, 1));
  updateBuildAttributesBlocks(m_Module);
  // Fresh attributes have 0 for a tag that isn't there.
  EXPECT_EQ(blockOf(m_Module, "qobix"), tag(6, 10) + tag(7, 65));
  EXPECT_EQ(blockOf(m_Module, "ZEV"), tag(18, 1));
  EXPECT_EQ(blockOf(*section, "qobix"), tag(30, 2));
  EXPECT_EQ(blockOf(*section, "ZEV"), "none");
  EXPECT_EQ(same->getBlockCount(), 0u);
  EXPECT_EQ(blockOf(*hosted, "qobix"), tag(30, 4));
  EXPECT_EQ(blockOf(*absolute, "qobix"), tag(7, 0));
  EXPECT_EQ(blockOf(*absolute, "ZEV"), tag(20, 1));
}

TEST_F(UpdateBlocksTest, GoWhereThereIsNothingToSay) {
  Section* section = makeSection();
  Symbol* symbol = makeHosted("h", section);
  ownTags(m_Module, tag(6, 10));
  for (ObjectWithBuildAttributes* object : {static_cast<ObjectWithBuildAttributes*>(section),
                                            static_cast<ObjectWithBuildAttributes*>(symbol)}) {
    object->setBlock("qobix", bytesOf("old"));
    object->setBlock("other", bytesOf("kept"));
    object->setBlock("ZEV", bytesOf("old"));
  }
  ownTags(*symbol, tag(6, 10));
  updateBuildAttributesBlocks(m_Module);
  EXPECT_EQ(section->getBlockCount(), 1u);
  EXPECT_EQ(symbol->getBlockCount(), 1u);
  EXPECT_EQ(blockOf(*symbol, "other"), "kept");
  m_Module.setOwnBuildAttributes(nullptr);
  updateBuildAttributesBlocks(m_Module);
  EXPECT_EQ(m_Module.getBlockCount(), 0u);
}

TEST_F(UpdateBlocksTest, SayThatNothingElseHolds) {
  Section* section = makeSection();
  ownTags(m_Module, tag(6, 10));
  ownTags(*section, tag(6, 10) + tag(64, 5));
  updateBuildAttributesBlocks(m_Module);
  EXPECT_EQ(blockOf(*section, "qobix"), tag(6, 0) + tag(64, 0));
  // The value is the module's.
  ownTags(m_Module, tag(6, 10) + tag(64, 3));
  updateBuildAttributesBlocks(m_Module);
  EXPECT_EQ(blockOf(m_Module, "qobix"), tag(64, 3));
  EXPECT_EQ(blockOf(*section, "qobix"), tag(64, 3));
}

// ---- From blocks to bytes

TEST_F(BuildAttributesWriterTest, WritesTheVersionAloneWithoutBlocks) {
  EXPECT_EQ(written(), "A");
  const Section& section = *m_Module.getBuildAttributesSections().front();
  EXPECT_STREQ(section.getName(), ".ZEV.attributes");
  EXPECT_EQ(section.getType(), 0x70000003u);
}

TEST_F(BuildAttributesWriterTest, LeavesWhatIsUpToDate) {
  m_Module.setBlock("v", bytesOf("x"));
  ModuleBuilder::setBuildAttributesSectionUpToDate(m_Module, true);
  updateBuildAttributesSection(m_Module);
  EXPECT_THAT(m_Module.getBuildAttributesSections(), SizeIs(0));
}

TEST_F(BuildAttributesWriterTest, WritesOneListForEqualBlocks) {
  for (const uint32_t encoding : {1U, 2U}) {
    ObjectModule& module = m_Module;
    module.clear();
    module.setDataEncoding(encoding);
    module.setLittleEndian(encoding);
    module.createNullSection("", 0);
    Section* one = makeSection();
    Section* two = makeSection();
    Section* three = makeSection();
    Symbol* first = makeHosted("f", one);
    makeAbsolute("a");
    Symbol* third = makeAbsolute("b");
    module.setBlock("ZEV", bytesOf(tag(18, 1)));
    one->setBlock("qobix", bytesOf("same"));
    two->setBlock("qobix", bytesOf("else"));
    three->setBlock("qobix", bytesOf("same"));
    third->setBlock("qobix", bytesOf("symbol"));
    first->setBlock("other", bytesOf("same"));
    third->setBlock("other", bytesOf("same"));
    module.setBlock("qobix", bytesOf("file"));
    EXPECT_EQ(written(),
              attributeSection(
                  {vendorPart("qobix", {filePart("file"), sectionPart({1, 3}, "same"),
                                        sectionPart({2}, "else"), symbolPart({3}, "symbol")}),
                   vendorPart("ZEV", {filePart(tag(18, 1))}),
                   vendorPart("other", {symbolPart({1, 3}, "same")})},
                  encoding == 1));
  }
}

TEST_F(BuildAttributesWriterTest, DoesntListTheNullSection) {
  m_Module.getSection(0)->setBlock("v", bytesOf("x"));
  makeSection()->setBlock("v", bytesOf("x"));
  EXPECT_EQ(written(), attributeSection({vendorPart("v", {sectionPart({1}, "x")})}));
}

TEST_F(BuildAttributesWriterTest, WritesLargeIndices) {
  for (uint32_t i = 1; i <= 200; ++i)
    makeSection();
  m_Module.getSection(127)->setBlock("v", bytesOf("x"));
  m_Module.getSection(128)->setBlock("v", bytesOf("x"));
  EXPECT_EQ(written(), attributeSection({vendorPart("v", {sectionPart({127, 128}, "x")})}));
}

TEST_F(BuildAttributesWriterTest, WritesIntoTheFirstOfMoreSections) {
  BuildAttributesSection* first = m_Module.createBuildAttributesSection("first", 0);
  makeSection();
  m_Module.createBuildAttributesSection("second", 0);
  m_Module.createBuildAttributesSection("third", 0);
  Section* last = makeSection(".last");
  last->setBlock("v", bytesOf("x"));
  EXPECT_EQ(written(), attributeSection({vendorPart("v", {sectionPart({3}, "x")})}));
  EXPECT_THAT(m_Module.getBuildAttributesSections(), ElementsAre(first));
  EXPECT_EQ(m_Module.getSectionCount(), 4u);
}

TEST_F(BuildAttributesWriterTest, WritesLessThanThereWas) {
  m_Module.setBlock("v", bytesOf(std::string(5000, 'x')));
  EXPECT_EQ(written().size(), 5012u);
  m_Module.removeBlock("v");
  EXPECT_EQ(written(), "A");
}

// ---- Held against going through all objects for each vendor

class PlainWriterTest : public BuildAttributesWriterTest {
protected:
  using Objects = std::vector<const ObjectWithBuildAttributes*>;

  void makeObjects(std::mt19937& random) {
    m_Module.clear();
    m_Module.createNullSection("", 0);
    setBlocks(random, m_Module);
    for (uint64_t i = random() % 6; i > 0; --i)
      setBlocks(random, *makeSection());
    for (uint64_t i = random() % 6; i > 0; --i)
      setBlocks(random, *makeAbsolute("x"));
  }

  [[nodiscard]] std::string plainlyWritten() const {
    std::vector<VendorPart> parts;
    for (const std::string& vendor : plainVendors()) {
      parts.push_back(vendorPart(vendor, {}));
      const BuildAttributesBlock* ofFile = m_Module.findBlock(vendor);
      if (ofFile != nullptr) parts.back().parts.push_back(filePart(textOf(ofFile->getData())));
      addPlainParts(Tag_Section, listedSections(), parts.back());
      addPlainParts(Tag_Symbol, symbols(), parts.back());
    }
    return attributeSection(parts);
  }

private:
  static void setBlocks(std::mt19937& random, ObjectWithBuildAttributes& object) {
    for (uint64_t i = random() % 4; i > 0; --i) {
      const char* const vendors[] = {"a", "b", "qobix", "ZEV"};
      object.setBlock(vendors[random() % 4], bytesOf(std::string(1, "xyz"[random() % 3])));
    }
  }

  [[nodiscard]] Objects listedSections() const {
    const auto sections = m_Module.getSections().subspan(1);
    return {sections.begin(), sections.end()};
  }
  [[nodiscard]] Objects symbols() const {
    return {m_Module.getSymbols().begin(), m_Module.getSymbols().end()};
  }

  [[nodiscard]] std::vector<std::string> plainVendors() const {
    std::vector<std::string> vendors;
    Objects objects = {&m_Module};
    for (const Objects& more : {listedSections(), symbols()})
      objects.insert(objects.end(), more.begin(), more.end());
    for (const ObjectWithBuildAttributes* object : objects) {
      for (uint32_t i = 0; i < object->getBlockCount(); ++i) {
        const std::string vendor(object->getBlock(i)->getVendor());
        if (std::ranges::find(vendors, vendor) == vendors.end()) vendors.push_back(vendor);
      }
    }
    std::stable_partition(vendors.begin(), vendors.end(),
                          [](const std::string& vendor) { return vendor == "qobix"; });
    return vendors;
  }

  static void addPlainParts(uint32_t kind, const Objects& objects, VendorPart& vendor) {
    std::vector<const BuildAttributesBlock*> written = {nullptr};
    for (const ObjectWithBuildAttributes* object : objects) {
      const BuildAttributesBlock* block = object->findBlock(vendor.vendor);
      if (std::ranges::find(written, block) != written.end()) continue;
      std::vector<uint32_t> indices;
      for (uint32_t i = 0; i < objects.size(); ++i) {
        if (objects[i]->findBlock(vendor.vendor) == block) indices.push_back(i + 1);
      }
      vendor.parts.push_back(indexedPart(kind, indices, textOf(block->getData())));
      written.push_back(block);
    }
  }
};

TEST_F(PlainWriterTest, TheBytesAreTheSame) {
  std::mt19937 random(1);
  for (uint32_t round = 0; round < 500; ++round) {
    SCOPED_TRACE(round);
    makeObjects(random);
    const std::string expected = plainlyWritten();
    EXPECT_EQ(written(), expected);
  }
}

} // namespace
} // namespace elfext
