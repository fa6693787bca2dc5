// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/TemporaryFile.h"

#include <gtest/gtest.h>

#include <string>

namespace kelvasi {
namespace {

TEST(TemporaryFile, GivesWhatWasAppendedInItsOrder) {
  TemporaryFile file;
  const std::string first(100'000, 'a');
  ASSERT_TRUE(file.append(first));
  ASSERT_TRUE(file.append("end"));
  std::string all;
  EXPECT_TRUE(file.giveTo([&](std::string_view piece) { all += piece; }));
  EXPECT_EQ(all, first + "end");
}

TEST(TemporaryFile, AnEmptyOneGivesNothing) {
  TemporaryFile file;
  EXPECT_TRUE(file.giveTo([](std::string_view) { FAIL(); }));
}

}  // namespace
}  // namespace kelvasi
