// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ReadingChoice.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

using namespace std::chrono_literals;

constexpr Arrival noon = 1709640000s;  // 5 March 2024, 12:00 UTC

TEST(MomentOf, ReadsADateWithItsTime) {
  EXPECT_EQ(momentOf("2024-03-05T12:00:00Z"), noon);
  EXPECT_EQ(momentOf("2024-03-05 12:00:00z"), noon);
  EXPECT_EQ(momentOf("2024-03-05T13:30:00+01:30"), noon);
  EXPECT_EQ(momentOf("2024-03-05T04:00:00-08:00"), noon);
  EXPECT_EQ(momentOf("2024-03-05T12:00:00.25Z"), noon + 250ms);
  EXPECT_EQ(momentOf("2024-03-05T12:00:00.000000001Z"), noon + 1ns);
}

TEST(MomentOf, ReadsSecondsSince1970) {
  EXPECT_EQ(momentOf("1709640000"), noon);
  EXPECT_EQ(momentOf("1709640000.5"), noon + 500ms);
  EXPECT_EQ(momentOf("0"), 0ns);
}

TEST(MomentOf, RefusesAnotherText) {
  for (const char* text : {"", "noon", "2024-03-05", "2024-02-30T12:00:00Z", "2024-03-05T12:00:00",
                           "2024-03-05T12:00:00.Z", "2024-03-05T12:00:00Z ", "1e30", "nan", "12:00"})
    EXPECT_EQ(momentOf(text), std::nullopt) << text;
}

}  // namespace
}  // namespace kelvasi
