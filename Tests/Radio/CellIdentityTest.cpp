// SPDX-License-Identifier: Apache-2.0
#include "Radio/CellIdentity.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

TEST(CellIdentity, ReadsFamilyChannelAndCode) {
  EXPECT_EQ(textOf({RadioFamily::lte, 3350, 404}), "lte:3350/404");
  EXPECT_EQ(textOf({RadioFamily::umts, 10612, 0}), "umts:10612/0");
  EXPECT_EQ(textOf({RadioFamily::utraTdd, 10055, 9}), "utra-tdd:10055/9");
}

TEST(CellIdentity, LeavesOutWhatIsNotKnown) {
  EXPECT_EQ(textOf({.family = RadioFamily::gsm, .channel = 62}), "gsm:62");
  EXPECT_EQ(textOf({.family = RadioFamily::umts, .code = 362}), "umts:?/362");
  EXPECT_EQ(textOf({}), "");
}

TEST(CellIdentity, CanBeTheSameAsLongAsNothingContradicts) {
  const CellIdentity whole{RadioFamily::gsm, 62, 13};
  EXPECT_TRUE(canBeSame(whole, whole));
  EXPECT_TRUE(canBeSame(whole, {.family = RadioFamily::gsm, .channel = 62}));
  EXPECT_FALSE(canBeSame(whole, {.family = RadioFamily::gsm, .channel = 63}));
  EXPECT_FALSE(canBeSame(whole, {RadioFamily::gsm, 62, 14}));
  EXPECT_FALSE(canBeSame(whole, {RadioFamily::lte, 62, 13}));
}

}  // namespace
}  // namespace kelvasi
