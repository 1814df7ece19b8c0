// SPDX-License-Identifier: Apache-2.0
//
// The greatest of any run of rows, for tables that lie over one another: held against a plain walk
// for every run of a random image, and with a count of the looks, since a row that many tables
// share is to be looked at once.

#include "elfext/src/bytes/row_maximum.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>

namespace elfext {

TEST(RowMaximumTest, FindsTheGreatestOfAnyRun) {
  std::mt19937 random(3);
  std::vector<uint8_t> image(200);
  for (uint8_t& byte : image)
    byte = static_cast<uint8_t>(random() % 200);
  for (const uint32_t rowSize : {1U, 3U, 8U, 16U}) {
    RowMaximum maximum(image, rowSize, [](const uint8_t* row) { return uint32_t{*row}; });
    for (uint64_t offset = 0; offset < image.size(); ++offset) {
      uint32_t greatest = 0;
      EXPECT_EQ(maximum.find(offset, 0), 0U);
      for (uint64_t count = 1; offset + count * rowSize <= image.size(); ++count) {
        greatest = std::max<uint32_t>(greatest, image[offset + (count - 1) * rowSize]);
        ASSERT_EQ(maximum.find(offset, count), greatest) << rowSize << " " << offset;
      }
    }
  }
}

TEST(RowMaximumTest, LooksAtEachRowOnce) {
  const std::vector<uint8_t> image(64);
  size_t looks = 0;
  RowMaximum maximum(image, 4, [&looks](const uint8_t*) {
    ++looks;
    return 1U;
  });
  for (int i = 0; i < 100; ++i)
    EXPECT_EQ(maximum.find(8, 10), 1U);
  EXPECT_EQ(looks, 16U);
}

} // namespace elfext
