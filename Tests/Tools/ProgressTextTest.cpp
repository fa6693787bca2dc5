// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ProgressText.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

constexpr std::size_t wide = 200;

TEST(ProgressText, TellsMessagesBytesRateAndTimeLeft) {
  EXPECT_EQ(progressText(
                {.messages = 1'560'000, .bytes = 63'950'000, .bytesInAll = 127'900'000, .seconds = 3}, wide),
            "[#####     ] 50 %, 0:03 left, 1,560,000 messages, 63.9 of 127.9 MB, 520,000/s");
}

TEST(ProgressText, LeavesOutWhatNobodyKnows) {
  EXPECT_EQ(progressText({.messages = 999, .bytes = 99'999, .seconds = 0.5}, wide),
            "999 messages, 0.0 MB, 1,998/s");
  EXPECT_EQ(progressText({}, wide), "0 messages, 0.0 MB");
  EXPECT_EQ(progressText({.messages = 0, .bytes = 0, .bytesInAll = 1'000'000, .seconds = 1}, wide),
            "[          ] 0 %, 0 messages, 0.0 of 1.0 MB, 0/s");
  EXPECT_EQ(progressText({.messages = 0, .bytes = 0, .bytesInAll = 0, .seconds = 0}, wide),
            "0 messages, 0.0 MB");
}

TEST(ProgressText, TellsLongTimesInHours) {
  const std::string text =
      progressText({.messages = 1'000, .bytes = 100, .bytesInAll = 12'345'678'900, .seconds = 0.001}, wide);
  EXPECT_TRUE(text.starts_with("[          ] 0 %, 34:17:37 left, ")) << text;
}

// A file that grows while it is read.
TEST(ProgressText, IsNeverMoreThanAll) {
  EXPECT_EQ(progressText({.messages = 1, .bytes = 3'000'000, .bytesInAll = 2'000'000, .seconds = 1}, wide),
            "[##########] 100 %, 0:00 left, 1 messages, 3.0 of 2.0 MB, 1/s");
}

TEST(ProgressText, IsNoWiderThanTheTerminal) {
  EXPECT_EQ(progressText({.messages = 12'345, .bytes = 1, .seconds = 1}, 10), "12,345 mes");
}

}  // namespace
}  // namespace kelvasi
