// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/FixedPoint.h"

#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <cstdio>
#include <limits>
#include <string>

namespace kelvasi {
namespace {

std::string quickly(double value) {
  std::array<char, 16> text;
  char* end = writeHundredths(text.data(), value);
  return end ? std::string(text.data(), end) : "(refused)";
}

std::string byPrintf(double value) {
  std::array<char, 32> text;
  std::snprintf(text.data(), text.size(), hundredths, value);
  return text.data();
}

TEST(FixedPoint, WritesEveryEighthUpTo65536AsPrintfDoes) {
  for (int eighths = -8 * 65536; eighths <= 8 * 65536; ++eighths)
    ASSERT_EQ(quickly(eighths / 8.0), byPrintf(eighths / 8.0));
}

TEST(FixedPoint, RoundsATieToTheEvenDigit) {
  EXPECT_EQ(quickly(0.125), "0.12");
  EXPECT_EQ(quickly(0.375), "0.38");
  EXPECT_EQ(quickly(-0.125), "-0.12");
  EXPECT_EQ(quickly(-19.875), "-19.88");
}

TEST(FixedPoint, KeepsTheSignOfNegativeZero) {
  EXPECT_EQ(quickly(0.0), "0.00");
  EXPECT_EQ(quickly(-0.0), byPrintf(-0.0));
}

TEST(FixedPoint, WritesUpToItsLimitAsPrintfDoes) {
  const double largest = 4294967295.875;
  EXPECT_EQ(quickly(largest), byPrintf(largest));
  EXPECT_EQ(quickly(-largest), byPrintf(-largest));
}

TEST(FixedPoint, RefusesWhatItCannotWriteExactly) {
  for (const double value :
       {0.1, 1.0 / 16, -2.0 / 3, 4294967296.0, -4294967296.0, 1e300, std::nan(""), -std::nan(""),
        std::numeric_limits<double>::infinity(), -std::numeric_limits<double>::infinity()})
    EXPECT_EQ(quickly(value), "(refused)") << value;
}

}  // namespace
}  // namespace kelvasi
