// SPDX-License-Identifier: Apache-2.0
//
// The objects that the comparison measures with: the same on every machine, good, and in the
// shapes that they are said to have.
//
// Figures of different days and machines are compared by them, so an object that changes by one
// byte must fail here, where it is a decision, and not show there, as a trend.

#include "bench/compare/corpus.h"

#include "tests/support/reader_fixture.h"

#include <algorithm>
#include <map>
#include <set>

namespace bench {

namespace {

using elfext::ReadResult;
using elfext::Section;
using elfext::Symbol;

std::string bytesOf(std::string_view corpus, uint32_t number, uint64_t seed = 1) {
  return objectBytes(*findCorpus(corpus), seed, number);
}

uint64_t hashOf(const std::string& bytes) {
  uint64_t hash = 0xCBF29CE484222325;
  for (const char byte : bytes)
    hash = (hash ^ static_cast<uint8_t>(byte)) * 0x100000001B3;
  return hash;
}

uint32_t sectionsOfType(const ReadResult& object, uint32_t type) {
  uint32_t count = 0;
  for (uint32_t i = 1; i < object.module->getSectionCount(); ++i)
    count += object.section(i)->getType() == type ? 1 : 0;
  return count;
}

std::multiset<std::string> definedNames(const ReadResult& object) {
  std::multiset<std::string> names;
  for (uint32_t i = 1; i < object.module->getSymbolCount(); ++i) {
    const Symbol* symbol = object.symbol(i);
    if (symbol->getBinding() != elfext::STB_LOCAL &&
        symbol->getCategory() != Symbol::Category_Undefined)
      names.insert(symbol->getName());
  }
  return names;
}

// What the first objects of a corpus say of the size of all.
uint64_t estimatedBytes(const Corpus& corpus) {
  const uint32_t count = std::min(30U, objectCount(corpus, 0.1));
  uint64_t bytes = 0;
  for (uint32_t i = 0; i < count; ++i)
    bytes += objectBytes(corpus, 1, i).size();
  return bytes / count * corpus.objects;
}

class CorpusTest : public elfext::ReaderTest {};

TEST_F(CorpusTest, AreTheSameOnEveryMachine) {
  const std::map<std::string_view, uint64_t> expected = {{"small", 0x15A0B9801737B5E2},
                                                         {"cxx", 0x1808352E9F2AB485},
                                                         {"variants", 0x8F7EFD98724A40B2},
                                                         {"debug", 0x301C977188FCA6B6},
                                                         {"big", 0x285845EB50646689}};
  for (const Corpus& corpus : getAllCorpora())
    EXPECT_EQ(hashOf(objectBytes(corpus, 1, 1)), expected.at(corpus.name)) << corpus.name;
}

TEST_F(CorpusTest, OtherSeedsAndNumbersGiveOtherObjects) {
  EXPECT_NE(bytesOf("small", 1), bytesOf("small", 1, 2));
  EXPECT_NE(bytesOf("small", 1), bytesOf("small", 2));
}

TEST_F(CorpusTest, AllReadWithoutAComplaint) {
  for (const Corpus& corpus : getAllCorpora())
    readGood(objectBytes(corpus, 1, 0));
}

TEST_F(CorpusTest, ScaleIsThePartOfTheObjectsAndNeverNone) {
  EXPECT_EQ(objectCount(*findCorpus("small"), 1), 10000U);
  EXPECT_EQ(objectCount(*findCorpus("variants"), 0.1), 600U);
  EXPECT_EQ(objectCount(*findCorpus("big"), 0.0001), 1U);
  EXPECT_EQ(findCorpus("smaller"), nullptr);
}

TEST_F(CorpusTest, AreAboutAsLargeAsTheySay) {
  for (const Corpus& corpus : getAllCorpora()) {
    EXPECT_NEAR(static_cast<double>(estimatedBytes(corpus)) / static_cast<double>(corpus.bytes), 1,
                0.15)
        << corpus.name;
  }
}

TEST_F(CorpusTest, AQuarterOfTheNamesIsLong) {
  const Corpus& small = *findCorpus("small");
  EXPECT_EQ(objectName(small, 0), "small_00000_implementation.o");
  EXPECT_EQ(objectName(small, 1), "small_00001.o");
  EXPECT_EQ(objectName(*findCorpus("variants"), 5), "variants_00001_c.o");
}

TEST_F(CorpusTest, SmallOnesDefineAboutThirtyNames) {
  EXPECT_NEAR(static_cast<double>(definedNames(readGood(bytesOf("small", 0))).size()), 30, 5);
}

TEST_F(CorpusTest, ThoseOfManySectionsHaveAThousandToTwentyThousand) {
  const ReadResult fewest = readGood(bytesOf("cxx", 0));
  EXPECT_NEAR(fewest.module->getSectionCount(), 1000, 30);
  EXPECT_EQ(sectionsOfType(fewest, elfext::SHT_GROUP), fewest.module->getGroupCount());
  EXPECT_GT(fewest.module->getGroupCount(), 200U);
  const ReadResult most = readGood(bytesOf("cxx", 144));
  EXPECT_GT(most.module->getSectionCount(), 19000U);
  EXPECT_LT(most.module->getSectionCount(), 20100U);
}

TEST_F(CorpusTest, BuildsOfAModuleDefineTheSameNamesAndNeedDifferentTargets) {
  const auto names = definedNames(readGood(bytesOf("variants", 3)));
  std::set<std::string> needs;
  for (uint32_t number = 3; number < 6; ++number) {
    const ReadResult object = readGood(bytesOf("variants", number));
    EXPECT_EQ(definedNames(object), names);
    for (uint32_t i = 1; i < object.module->getSymbolCount(); ++i) {
      if (object.symbol(i)->isBuildAttributesSymbol()) needs.insert(object.symbol(i)->getName());
    }
  }
  EXPECT_EQ(needs.size(), 3U);
  EXPECT_NE(definedNames(readGood(bytesOf("variants", 6))), names);
}

TEST_F(CorpusTest, ThoseOfDebugInformationHaveASixthOfAMillionRelocations) {
  const ReadResult object = readGood(bytesOf("debug", 1));
  uint64_t bytes = 0;
  for (uint32_t i = 1; i < object.module->getSectionCount(); ++i) {
    if (object.section(i)->getType() == elfext::SHT_REL) bytes += object.section(i)->getSize();
  }
  EXPECT_NEAR(static_cast<double>(bytes) / 8, 165000, 0.25 * 165000);
}

} // namespace

} // namespace bench
