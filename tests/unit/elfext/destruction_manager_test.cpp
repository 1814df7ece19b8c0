// SPDX-License-Identifier: Apache-2.0
//
// Objects that own something outside of their region: each is destructed once, in the reverse order
// of registration, and given back to the region that it came from, also when the manager itself
// goes.

#include "elfext/interface/destruction_manager.h"

#include "counting_region.h"

#include <new>
#include <string>

namespace elfext {
namespace {

// Writes its letter when it goes.
class Mourned {
public:
  Mourned(std::string& log, char letter) : m_Log(log), m_Letter(letter) {}
  ~Mourned() { m_Log += m_Letter; }
  Mourned(const Mourned&) = delete;
  Mourned& operator=(const Mourned&) = delete;

private:
  std::string& m_Log;
  char m_Letter;
};

class DestructionManagerTest : public testing::Test {
protected:
  void addTo(DestructionManager& manager, CountingRegion& region, char letter) {
    void* memory = region.AllocFull(sizeof(Mourned), alignof(Mourned), nullptr);
    manager.add(&region, ::new (memory) Mourned(m_Log, letter));
  }

  std::string m_Log;
  CountingRegion m_Region;
};

TEST_F(DestructionManagerTest, DestroysInReverseOrderOfRegistration) {
  DestructionManager manager;
  for (char letter : {'a', 'b', 'c'})
    addTo(manager, m_Region, letter);
  EXPECT_EQ(m_Log, "");
  manager.run();
  EXPECT_EQ(m_Log, "cba");
}

TEST_F(DestructionManagerTest, GivesEachObjectBackToItsRegion) {
  CountingRegion other;
  DestructionManager manager;
  addTo(manager, m_Region, 'a');
  addTo(manager, other, 'b');
  manager.run();
  EXPECT_TRUE(m_Region.getBlocks().empty());
  EXPECT_TRUE(other.getBlocks().empty());
}

TEST_F(DestructionManagerTest, RunsOnceForEachObject) {
  DestructionManager manager;
  addTo(manager, m_Region, 'a');
  manager.run();
  manager.run();
  EXPECT_EQ(m_Log, "a");
  addTo(manager, m_Region, 'b');
  manager.run();
  EXPECT_EQ(m_Log, "ab");
}

TEST_F(DestructionManagerTest, RunsWhenItGoes) {
  {
    DestructionManager manager;
    addTo(manager, m_Region, 'a');
    addTo(manager, m_Region, 'b');
  }
  EXPECT_EQ(m_Log, "ba");
  EXPECT_TRUE(m_Region.getBlocks().empty());
}

TEST_F(DestructionManagerTest, TakesObjectsOfAnyType) {
  DestructionManager manager;
  void* memory = m_Region.AllocFull(sizeof(char), alignof(char), nullptr);
  manager.add(&m_Region, ::new (memory) char('x'));
  manager.run();
  EXPECT_TRUE(m_Region.getBlocks().empty());
}

TEST_F(DestructionManagerTest, MustBeGivenRegionAndObject) {
  DestructionManager manager;
  int object = 0;
  EXPECT_FAILED_ASSERTION(manager.add(noRegion, &object), "region != NULL");
  EXPECT_FAILED_ASSERTION(manager.add<int>(&m_Region, nullptr), "object != NULL");
}

} // namespace
} // namespace elfext
