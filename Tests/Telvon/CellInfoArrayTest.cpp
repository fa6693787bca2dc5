// SPDX-License-Identifier: Apache-2.0
#include "Telvon/CellInfoArray.h"

#include <gtest/gtest.h>

#include <limits>

namespace kelvasi {
namespace {

using Number = std::optional<std::int32_t>;

Number numberOf(PlistValue value) {
  return cellNumber(PlistDictionary{{"key", std::move(value)}}, "key");
}

TEST(CellNumber, IsAnIntegerOf32BitsWithSign) {
  EXPECT_EQ(numberOf(310), Number(310));
  EXPECT_EQ(numberOf(2147483647), Number(2147483647));
  EXPECT_EQ(numberOf(std::int64_t{-2147483648}), Number(std::numeric_limits<std::int32_t>::min()));
  EXPECT_EQ(numberOf(std::int64_t{2147483648}), Number());
  EXPECT_EQ(numberOf(std::int64_t{-2147483649}), Number());
  EXPECT_EQ(numberOf(std::uint64_t{1} << 63), Number());
  EXPECT_EQ(numberOf(~std::uint64_t{0}), Number());
}

TEST(CellNumber, MayBeARealThatIsWhole) {
  EXPECT_EQ(numberOf(310.0), Number(310));
  EXPECT_EQ(numberOf(-0.0), Number(0));
  EXPECT_EQ(numberOf(2147483647.0), Number(2147483647));
  EXPECT_EQ(numberOf(-2147483648.0), Number(std::numeric_limits<std::int32_t>::min()));
}

TEST(CellNumber, IsNoRealThatWouldLoseSomething) {
  EXPECT_EQ(numberOf(310.5), Number());
  EXPECT_EQ(numberOf(2147483648.0), Number());
  EXPECT_EQ(numberOf(-2147483649.0), Number());
  EXPECT_EQ(numberOf(std::numeric_limits<double>::infinity()), Number());
  EXPECT_EQ(numberOf(std::numeric_limits<double>::quiet_NaN()), Number());
}

TEST(CellNumber, IsNothingElse) {
  EXPECT_EQ(numberOf(true), Number());
  EXPECT_EQ(numberOf("310"), Number());
  EXPECT_EQ(numberOf(PlistArray::make({310})), Number());
  EXPECT_EQ(cellNumber(PlistDictionary{}, "key"), Number());
}

}  // namespace
}  // namespace kelvasi
