// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/LargeBlocks.h"

#include <gtest/gtest.h>
#include <malloc.h>

#include <vector>

namespace kelvasi {
namespace {

std::size_t blocksWithPagesOfTheirOwn() {
  return mallinfo2().hblks;
}

// The first one that is freed would otherwise raise the limit above the second.
TEST(LargeBlocks, HavePagesOfTheirOwnAlsoAfterOneWasFreed) {
  keepLargeBlocksApart();
  {
    const std::vector<char> large(8 << 20);
    EXPECT_EQ(large.back(), 0);
  }
  const std::size_t before = blocksWithPagesOfTheirOwn();
  const std::vector<char> next(300 << 10);
  EXPECT_EQ(next.back(), 0);
  EXPECT_EQ(blocksWithPagesOfTheirOwn(), before + 1);
}

}  // namespace
}  // namespace kelvasi
