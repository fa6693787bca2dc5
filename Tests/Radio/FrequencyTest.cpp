// SPDX-License-Identifier: Apache-2.0
#include "Radio/Frequency.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

std::string inMegahertz(Frequency frequency) {
  std::string text;
  appendMegahertz(text, frequency);
  return text;
}

TEST(Frequency, LiteralsAreExactToTheHertz) {
  EXPECT_EQ(2680_MHz, Frequency{2'680'000'000});
  EXPECT_EQ(889.9875_MHz, Frequency{889'987'500});
  EXPECT_EQ(12.5_kHz, Frequency{12'500});
  EXPECT_EQ(1844.9_MHz + 100_kHz, 1845_MHz);
  EXPECT_EQ(200_kHz * 10562, 2112.4_MHz);
}

TEST(Frequency, IsWrittenInMegahertzWithNoMoreDecimalsThanItHas) {
  EXPECT_EQ(inMegahertz(2680_MHz), "2680");
  EXPECT_EQ(inMegahertz(1932.5_MHz), "1932.5");
  EXPECT_EQ(inMegahertz(914.9875_MHz), "914.9875");
  EXPECT_EQ(inMegahertz(900.05_MHz), "900.05");
  EXPECT_EQ(inMegahertz(Frequency{1}), "0.000001");
  EXPECT_EQ(inMegahertz(Frequency{}), "0");
  EXPECT_EQ(inMegahertz(880_MHz - 925.5_MHz), "-45.5");
}

}  // namespace
}  // namespace kelvasi
