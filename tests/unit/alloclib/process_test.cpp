// SPDX-License-Identifier: Apache-2.0
//
// The life of the region system, its default parents and its handlers. The two orders that go wrong
// in practice are held first: work before the start, and an end while a region lives. Faults end
// the process, so they are looked for in one of its own, by status and by what it says.

#include "region_fixture.h"

namespace alloclib {
namespace {

using testing::ExitedWithCode;

using ProcessTest = RegionTest;
using ProcessDeathTest = RegionTest;

TEST_F(ProcessDeathTest, ItCannotBeInitialisedTwice) {
  EXPECT_EXIT(initialise(), ExitedWithCode(1),
              "^Internal alloclib error: Alloclib cannot be initialised more than once\n$");
}

TEST(ProcessWithoutRegionsDeathTest, NothingWorksBeforeInitialise) {
  const char* text = "^Internal alloclib error: Alloclib not initialised\n$";
  EXPECT_EXIT(shutDown(), ExitedWithCode(1), text);
  EXPECT_EXIT(shutDown(false), ExitedWithCode(1), text);
  EXPECT_EXIT(RegionGeneral::Create(0, "early"), ExitedWithCode(1), text);
  EXPECT_EXIT(pushDefaultParent(nullptr), ExitedWithCode(1), text);
  EXPECT_EQ(getSystemSize(), 0u);
}

TEST(ProcessWithoutRegionsTest, ItStartsAgainAfterItsEnd) {
  for (int round = 0; round < 3; ++round) {
    initialise();
    RegionGeneral::Create(0, "round")->Destroy(true);
    shutDown();
  }
}

TEST_F(ProcessTest, TheRootIsTheFirstDefaultParent) {
  EXPECT_EQ(getSystemSize(), 16u);
  void* block = getDefaultParent()->AllocFull(100, 8, nullptr);
  EXPECT_EQ(getSystemSize(), 116u);
  getDefaultParent()->DiscardFull(block, 100, 8);
}

TEST_F(ProcessTest, DefaultParentsAreAStack) {
  RecordingRegion first;
  RecordingRegion second;
  Region* root = getDefaultParent();
  pushDefaultParent(&first);
  pushDefaultParent(&second);
  EXPECT_EQ(getDefaultParent(), &second);
  EXPECT_EQ(popDefaultParent(), &second);
  EXPECT_EQ(popDefaultParent(), &first);
  EXPECT_EQ(getDefaultParent(), root);
}

TEST_F(ProcessTest, APageAllocatorStandsOnTheDefaultParent) {
  RecordingRegion parent;
  pushDefaultParent(&parent);
  RegionLargeBlock* pages = RegionFastOld::Create("pages");
  EXPECT_THAT(parent.allocations, testing::Contains(size_t{1} << 20));
  pages->Destroy(true);
  EXPECT_EQ(parent.allocations.size(), parent.discards.size());
  popDefaultParent();
}

TEST_F(ProcessTest, AParentRecordCostsSixteenBytesOfTheSystem) {
  const size_t before = getSystemSize();
  RecordingRegion parent;
  pushDefaultParent(&parent);
  EXPECT_EQ(getSystemSize(), before + 16);
  popDefaultParent();
  EXPECT_EQ(getSystemSize(), before);
}

TEST_F(ProcessDeathTest, TheStackOfParentsHasAnEnd) {
  EXPECT_EXIT(
      {
        popDefaultParent();
        popDefaultParent();
      },
      ExitedWithCode(1), "^Internal alloclib error: No Default Parent to pop from stack\n$");
}

TEST_F(ProcessDeathTest, ALiveRegionStopsAnOrderedEnd) {
  EXPECT_EXIT(
      {
        RegionGeneral::Create(0, "forgotten");
        shutDown();
      },
      ExitedWithCode(1), "^Internal alloclib error: FreeAllStats called with live region\n$");
}

TEST_F(ProcessDeathTest, AnEndWithoutFreeingLeavesLiveRegionsAlone) {
  EXPECT_EXIT(
      {
        auto* object = static_cast<char*>(RegionGeneral::Create(0, "busy")->allocate(8));
        shutDown(false);
        *object = 1;
        std::_Exit(5);
      },
      ExitedWithCode(5), "^$");
}

TEST_F(ProcessDeathTest, AnInstalledHandlerGetsTheFault) {
  EXPECT_EXIT(
      {
        setInternalErrorHandler([](const char* text) {
          std::fprintf(stderr, "<%s>", text);
          std::exit(4);
        });
        initialise();
      },
      ExitedWithCode(4), "^<Alloclib cannot be initialised more than once>$");
}

TEST_F(ProcessDeathTest, AnInstalledHandlerGetsTheSizesThatDidNotFit) {
  EXPECT_EXIT(
      {
        setOutOfMemoryHandler([](size_t size, size_t systemSize) {
          std::fprintf(stderr, "<%zu %d>", size, systemSize == getSystemSize());
          std::exit(4);
        });
        outOfMemory(77);
      },
      ExitedWithCode(4), "^<77 1>$");
}

TEST_F(ProcessDeathTest, OutOfMemoryNamesTheRequestAndTheSystemsSize) {
  const std::string text = "^Out of memory. Allocation of 123 bytes failed, system size is " +
                           std::to_string(getSystemSize()) + " bytes\n$";
  EXPECT_EXIT(outOfMemory(123), ExitedWithCode(1), text);
}

TEST_F(ProcessDeathTest, AHandlerThatReturnsEndsInAnAbort) {
  EXPECT_EXIT(
      {
        setInternalErrorHandler([](const char*) {});
        internalError("anything");
      },
      testsupport::hasAborted, "");
  EXPECT_EXIT(
      {
        setOutOfMemoryHandler([](size_t, size_t) {});
        outOfMemory(1);
      },
      testsupport::hasAborted, "");
}

TEST_F(ProcessTest, ANullHandlerBringsTheDefaultBack) {
  const InternalErrorHandler mine = [](const char*) {};
  const InternalErrorHandler standard = setInternalErrorHandler(mine);
  EXPECT_EQ(setInternalErrorHandler(nullptr), mine);
  EXPECT_EQ(setInternalErrorHandler(nullptr), standard);
}

} // namespace
} // namespace alloclib
