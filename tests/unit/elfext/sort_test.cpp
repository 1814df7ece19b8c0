// SPDX-License-Identifier: Apache-2.0
//
// Both sorts, against the standard ones over permutations and random inputs. They must never be
// quadratic, and must stay within their items whatever a comparison says, even one that contradicts
// itself.

#include "elfext/interface/sort.h"

#include "counting_region.h"

#include <algorithm>
#include <cstdint>
#include <functional>
#include <numeric>
#include <random>
#include <span>
#include <string>
#include <utility>
#include <vector>

namespace elfext {
namespace {

using testing::ElementsAre;
using testing::ElementsAreArray;
using testing::IsEmpty;

struct Item {
  int32_t key;
  uint32_t place;

  bool operator==(const Item&) const = default;
};
static_assert(sizeof(Item) == 8);

bool hasSmallerKey(const Item& left, const Item& right) {
  return left.key < right.key;
}

int compareKeys(const void* left, const void* right, void*) {
  const auto* a = static_cast<const Item*>(left);
  const auto* b = static_cast<const Item*>(right);
  return a->key < b->key ? -1 : a->key > b->key ? 1 : 0;
}

std::vector<Item> makeItems(const std::vector<int>& keys) {
  std::vector<Item> items;
  for (int key : keys)
    items.push_back({key, static_cast<uint32_t>(items.size())});
  return items;
}

// Sizes round every Leonardo number and its neighbours, and some large ones.
std::vector<size_t> interestingSizes() {
  std::vector<size_t> sizes;
  for (size_t size = 0; size <= 70; ++size)
    sizes.push_back(size);
  for (size_t leonardo : {109u, 177u, 287u, 465u, 753u, 1219u, 1973u})
    for (size_t size = leonardo - 2; size <= leonardo + 2; ++size)
      sizes.push_back(size);
  return sizes;
}

std::vector<int> randomKeys(std::mt19937& random, size_t size, unsigned range) {
  std::vector<int> keys;
  for (size_t index = 0; index < size; ++index)
    keys.push_back(static_cast<int>(random() % range) - static_cast<int>(range / 2));
  return keys;
}

// The merge sort.

TEST(MergeSortTest, AgreesWithTheStandardStableSort) {
  std::mt19937 random(1);
  for (size_t size : interestingSizes()) {
    for (unsigned range : {1u, 2u, 10u, 100000u}) {
      std::vector<Item> items = makeItems(randomKeys(random, size, range));
      std::vector<Item> expected = items;
      std::ranges::stable_sort(expected, hasSmallerKey);
      Item none{};
      sort(items.empty() ? &none : items.data(), items.size(), compareKeys, nullptr);
      ASSERT_THAT(items, ElementsAreArray(expected)) << size << " of " << range;
    }
  }
}

TEST(MergeSortTest, LeavesEqualItemsInInputOrder) {
  std::vector<Item> items = makeItems({2, 1, 2, 1, 2, 1});
  sort(items.data(), items.size(), compareKeys, nullptr);
  EXPECT_THAT(items,
              ElementsAre(Item{1, 1}, Item{1, 3}, Item{1, 5}, Item{2, 0}, Item{2, 2}, Item{2, 4}));
}

TEST(MergeSortTest, TakesTheLeftItemForAnyResultBelowOne) {
  for (int result : {0, -1, -1000}) {
    std::vector<Item> items = makeItems({3, 2, 1});
    const auto compare = [result](const Item&, const Item&) { return result; };
    mergeSort(std::span(items), compare);
    EXPECT_THAT(items, ElementsAreArray(makeItems({3, 2, 1}))) << result;
  }
}

struct Log {
  std::string text;
  int calls = 0;
};

int compareAndLog(const void* left, const void* right, void* context) {
  auto* log = static_cast<Log*>(context);
  ++log->calls;
  log->text += std::to_string(static_cast<const Item*>(left)->place) +
               std::to_string(static_cast<const Item*>(right)->place) + " ";
  return compareKeys(left, right, nullptr);
}

TEST(MergeSortTest, PutsTheOddItemInTheRightHalf) {
  std::vector<Item> items = makeItems({1, 2, 3});
  Log log;
  sort(items.data(), items.size(), compareAndLog, &log);
  EXPECT_EQ(log.text, "12 01 ");
}

TEST(MergeSortTest, SortsTheLeftHalfFirst) {
  std::vector<Item> items = makeItems({4, 3, 2, 1});
  Log log;
  sort(items.data(), items.size(), compareAndLog, &log);
  EXPECT_EQ(log.text, "01 23 13 12 ");
  EXPECT_THAT(items, ElementsAre(Item{1, 3}, Item{2, 2}, Item{3, 1}, Item{4, 0}));
}

TEST(MergeSortTest, AsksNothingForFewerThanTwoItems) {
  Item item{5, 0};
  Log log;
  sort(&item, 0, compareAndLog, &log);
  sort(&item, 1, compareAndLog, &log);
  EXPECT_EQ(log.calls, 0);
  EXPECT_EQ(item, (Item{5, 0}));
}

TEST(MergeSortTest, SortsPointersByWhatTheyPointAt) {
  const std::string texts[] = {"c", "a", "b"};
  std::vector<const std::string*> items{&texts[0], &texts[1], &texts[2]};
  mergeSort(std::span(items), [](const std::string* left, const std::string* right) {
    return left->compare(*right);
  });
  EXPECT_THAT(items, ElementsAre(&texts[1], &texts[2], &texts[0]));
}

TEST(MergeSortTest, SortsItemsOfAnySize) {
  using Wide = std::array<int, 5>;
  std::vector<Wide> items{{3}, {1}, {2}};
  mergeSort(std::span(items),
            [](const Wide& left, const Wide& right) { return left[0] - right[0]; });
  EXPECT_THAT(items, ElementsAre(Wide{1}, Wide{2}, Wide{3}));
}

TEST(MergeSortTest, MustBeGivenItemsAndAComparison) {
  Item item{};
  EXPECT_FAILED_ASSERTION(sort(nullptr, 0, compareKeys, nullptr), "base != NULL");
  EXPECT_FAILED_ASSERTION(sort(&item, 1, nullptr, nullptr), "compareProc != NULL");
}

// The smoothsort.

void expectSmoothSorted(const std::vector<int>& keys) {
  std::vector<int> items = keys;
  std::vector<int> expected = keys;
  smoothSort(std::span(items), std::less<int>());
  std::ranges::sort(expected);
  ASSERT_THAT(items, ElementsAreArray(expected));
}

TEST(SmoothSortTest, SortsEveryPermutationOfUpToEightItems) {
  for (int size = 0; size <= 8; ++size) {
    std::vector<int> keys(static_cast<size_t>(size));
    std::iota(keys.begin(), keys.end(), 0);
    std::vector<int> items;
    do {
      items = keys;
      smoothSort(std::span(items), std::less<int>());
      ASSERT_TRUE(std::ranges::is_sorted(items));
    } while (std::next_permutation(keys.begin(), keys.end()));
  }
}

TEST(SmoothSortTest, AgreesWithTheStandardSort) {
  std::mt19937 random(2);
  for (size_t size : interestingSizes())
    for (unsigned range : {1u, 2u, 10u, 100000u})
      expectSmoothSorted(randomKeys(random, size, range));
}

TEST(SmoothSortTest, SortsPatternsThatTroubleHeaps) {
  for (size_t size : interestingSizes()) {
    std::vector<int> ascending(size);
    std::iota(ascending.begin(), ascending.end(), 0);
    expectSmoothSorted(ascending);
    expectSmoothSorted({ascending.rbegin(), ascending.rend()});
    std::vector<int> organPipe = ascending;
    std::reverse(organPipe.begin() + static_cast<std::ptrdiff_t>(size / 2), organPipe.end());
    expectSmoothSorted(organPipe);
    std::vector<int> rotated = ascending;
    std::rotate(rotated.begin(), rotated.begin() + static_cast<std::ptrdiff_t>(size / 3),
                rotated.end());
    expectSmoothSorted(rotated);
  }
}

TEST(SmoothSortTest, MovesWholeItems) {
  std::mt19937 random(3);
  std::vector<Item> items = makeItems(randomKeys(random, 1000, 20));
  const std::vector<Item> before = items;
  smoothSort(std::span(items), hasSmallerKey);
  EXPECT_TRUE(std::ranges::is_sorted(items, hasSmallerKey));
  EXPECT_TRUE(std::ranges::is_permutation(items, before));
}

size_t countComparisons(std::vector<int> items) {
  size_t comparisons = 0;
  smoothSort(std::span(items), [&](int left, int right) {
    ++comparisons;
    return left < right;
  });
  EXPECT_TRUE(std::ranges::is_sorted(items));
  return comparisons;
}

#ifndef QUARN_SHAKE_ORDER
TEST(SmoothSortTest, IsLinearOnSortedInput) {
  for (size_t size : {1000u, 10000u, 100000u}) {
    std::vector<int> sorted(size);
    std::iota(sorted.begin(), sorted.end(), 0);
    EXPECT_LE(countComparisons(sorted), 8 * size);
    EXPECT_LE(countComparisons(std::vector<int>(size, 7)), 8 * size);
  }
}
#endif

TEST(SmoothSortTest, IsNeverQuadratic) {
  std::mt19937 random(4);
  constexpr size_t Size = 1 << 16;
  std::vector<int> descending(Size);
  std::iota(descending.rbegin(), descending.rend(), 0);
  EXPECT_LE(countComparisons(descending), Size * 16 * 4);
  EXPECT_LE(countComparisons(randomKeys(random, Size, 1u << 30)), Size * 16 * 4);
}

TEST(SmoothSortTest, AsksNothingForFewerThanTwoItems) {
  EXPECT_EQ(countComparisons({}), 0u);
  EXPECT_EQ(countComparisons({1}), 0u);
}

// What sorts bad data may be given a comparison that contradicts itself.
TEST(SmoothSortTest, StaysWithinItsItemsWhateverTheComparisonSays) {
  std::mt19937 random(5);
  for (size_t size : interestingSizes()) {
    for (unsigned odds : {1u, 2u, 3u}) {
      std::vector<int> items(size);
      std::iota(items.begin(), items.end(), 0);
      const std::vector<int> before = items;
      smoothSort(std::span(items), [&](int, int) { return random() % odds == 0; });
      std::sort(items.begin(), items.end());
      ASSERT_EQ(items, before);
    }
  }
}

} // namespace
} // namespace elfext
