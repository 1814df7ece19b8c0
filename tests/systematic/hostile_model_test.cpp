// SPDX-License-Identifier: Apache-2.0
//
// Objects of a few megabytes that were made to keep busy who has a model of them: what is asked of
// all sections, segments or relocations of one, or of long lists, takes little time.
//
// The tool makes no model; these are for other users of the library, who ask it the questions that
// are not met while reading.

#include "alloclib/interface/session.h"
#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/build_attributes.h"
#include "elfext/interface/build_attributes_writer.h"
#include "elfext/interface/error_handler.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/read_elf_file.h"
#include "elfext/interface/segment.h"
#include "elfext/src/model/module_builder.h"
#include "tests/support/attribute_bytes.h"
#include "tests/support/memory_host.h"
#include "tests/systematic/hostile_object.h"

#include <algorithm>
#include <ctime>
#include <functional>

namespace testsupport {

namespace {

using namespace elfext;

// Wants to see all that there is.
class CountingReports final : public ErrorHandler {
public:
  bool report(const ObjectModule&, uint32_t, const std::string&) override {
    ++m_Count;
    return true;
  }

  size_t m_Count = 0;
};

class HostileModel : public testing::Test {
protected:
  HostileModel() { m_Module.setErrorHandler(&m_Reports); }

  void read(const std::string& bytes) {
    ASSERT_LT(bytes.size(), 5 * Megabyte);
    m_Host.addFile("x.o", bytes);
    ASSERT_TRUE(readElfFile(m_Host, "x.o", 0, bytes.size(), m_Module, nullptr));
    ASSERT_EQ(m_Reports.m_Count, 0U);
  }

  // Of the processor, so that neighbours on it count for little.
  static void expectLittleTime(const std::function<void()>& work) {
    const std::clock_t start = std::clock();
    work();
    const double seconds = static_cast<double>(std::clock() - start) / CLOCKS_PER_SEC;
    if (!IsSanitized) {
      EXPECT_LT(seconds, MostSeconds);
    }
  }

  // Returns how many reports there are.
  size_t validate() {
    expectLittleTime([this] { EXPECT_TRUE(m_Module.validate()); });
    return m_Reports.m_Count;
  }

private:
  alloclib::Session m_Session;
  MemoryHost m_Host;
  CountingReports m_Reports;

protected:
  ObjectModule m_Module;
};

// Each of the sections has 4 bytes. All segments lie over each other and have `size` bytes, from
// the first section on.
constexpr uint32_t SectionCount = 20000;
constexpr uint32_t SegmentCount = 40000;

std::string segmentsOverSections(uint64_t size) {
  ObjectBuilder file = object().type(ET_EXEC);
  for (uint32_t i = 0; i < SegmentCount; ++i)
    file.segment({.offset = 52 + 32 * SegmentCount, .filesz = size, .memsz = size});
  for (uint32_t i = 0; i < SectionCount; ++i)
    file.section("", SHT_PROGBITS).flags(SHF_ALLOC).bytes("4321");
  return file.bytes();
}

// Both halves of an offset are the same number, so that they cancel each other out.
std::string relocationsAtDoubledOffsets() {
  std::string rows;
  for (uint32_t i = 0; i < 65000; ++i)
    put(rows, {i, i, 0, 0});
  ObjectBuilder file = object(ElfClass::Class64);
  file.section(".text", SHT_PROGBITS).flags(SHF_ALLOC | SHF_EXECINSTR).zeros(4);
  file.section("", SHT_STRTAB).zeros(1);
  file.section("", SHT_SYMTAB).link(2).zeros(24);
  file.section("", SHT_REL).link(3).info(1).bytes(rows);
  return file.bytes();
}

std::string withAttributes(uint32_t sectionCount, const std::string& subsections) {
  ObjectBuilder file = object();
  for (uint32_t i = 0; i < sectionCount; ++i)
    file.section("", SHT_PROGBITS);
  file.section("", SHT_ZEV_ATTRIBUTES).bytes("A" + subsections);
  return file.bytes();
}

// Lists of the file and of section 1, of which no entry is like another.
std::string listsOfCompatibility(std::string (*makeEntry)(uint32_t number)) {
  constexpr uint32_t Count = 60000;
  std::string ofFile;
  std::string ofSection;
  for (uint32_t i = 1; i <= Count; ++i) {
    ofFile += makeEntry(i);
    ofSection += makeEntry(Count + i);
  }
  return withAttributes(1, subsection(ntbs(QobixVendor) + subSubsection({Tag_File, ofFile}, true) +
                                      subSubsection(sectionPart({1}, ofSection), true)));
}

std::string compatible(uint32_t number) {
  return tag(Tag_compatibility, number, "");
}

std::string alsoCompatible(uint32_t number) {
  return uleb(Tag_also_compatible_with) + tag(Tag_CPU_arch, number) + '\0';
}

std::string sectionsOfAVendorEach() {
  constexpr uint32_t Count = 25000;
  std::string subsections;
  for (uint32_t i = 1; i <= Count; ++i)
    subsections += subsection(ntbs(std::to_string(i)) + subSubsection(sectionPart({i}, ""), true));
  return withAttributes(Count, subsections);
}

std::string attributeSections() {
  ObjectBuilder file = object().extendedNumbering();
  for (uint32_t i = 0; i < 110000; ++i)
    file.section("", SHT_ZEV_ATTRIBUTES).bytes("A");
  return file.bytes();
}

} // namespace

TEST_F(HostileModel, HasSegmentsOfWhichNoneHoldsASection) {
  read(segmentsOverSections(2));
  // All but one of the segments overlap one.
  EXPECT_EQ(validate(), SectionCount + SegmentCount - 1);
  expectLittleTime([this] {
    const std::vector<Segment*> holders = m_Module.findHolders(m_Module.getSegments());
    EXPECT_THAT(holders, testing::Each(nullptr));
  });
}

TEST_F(HostileModel, HasSegmentsThatAllHoldAllSections) {
  read(segmentsOverSections(4 * SectionCount));
  EXPECT_EQ(validate(), SegmentCount - 1);
  expectLittleTime([this] {
    const std::vector<Segment*> holders = m_Module.findHolders(m_Module.getSegments());
    EXPECT_EQ(std::count(holders.begin(), holders.end(), m_Module.getSegment(0)), SectionCount);
  });
}

TEST_F(HostileModel, HasRelocationsAtOffsetsThatHashAlike) {
  read(relocationsAtDoubledOffsets());
  ModuleBuilder::setReadConditions(m_Module, ReadCondition_ChecksRepeatedRelocations);
  EXPECT_EQ(validate(), 0U);
}

TEST_F(HostileModel, HasLongListsToUnite) {
  for (std::string (*makeEntry)(uint32_t) : {compatible, alsoCompatible}) {
    read(listsOfCompatibility(makeEntry));
    BuildAttributes effective;
    expectLittleTime([&] { m_Module.getSection(1)->getEffectiveBuildAttributes(effective); });
    EXPECT_EQ(effective.getCompatibilityTagCount() + effective.getAlsoCompatibilityTagCount(),
              2 * 60000U);
    expectLittleTime([&] { updateBuildAttributesBlocks(m_Module); });
  }
}

TEST_F(HostileModel, HasAVendorForEachSection) {
  read(sectionsOfAVendorEach());
  ModuleBuilder::setBuildAttributesSectionUpToDate(m_Module, false);
  const uint64_t size = m_Module.getBuildAttributesSections().front()->getSize();
  expectLittleTime([this] { updateBuildAttributesSection(m_Module); });
  EXPECT_EQ(m_Module.getBuildAttributesSections().front()->getSize(), size);
}

TEST_F(HostileModel, HasManyAttributeSections) {
  read(attributeSections());
  ModuleBuilder::setBuildAttributesSectionUpToDate(m_Module, false);
  expectLittleTime([this] { updateBuildAttributesSection(m_Module); });
  EXPECT_THAT(m_Module.getBuildAttributesSections(), testing::SizeIs(1));
}

} // namespace testsupport
