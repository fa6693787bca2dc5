// SPDX-License-Identifier: Apache-2.0
#include "Radio/CellCarriers.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

std::string carriersInText(RadioFamily family, std::int64_t channel) {
  return textOf(carriersOf({family, channel, CellIdentity::unknown}));
}

TEST(CellCarriers, EachFamilyHasItsOwnNumbers) {
  EXPECT_EQ(carriersInText(RadioFamily::gsm, 62), "P-GSM 900 947.4 MHz");
  EXPECT_EQ(carriersInText(RadioFamily::umts, 10700), "Band I 2140 MHz");
  EXPECT_EQ(carriersInText(RadioFamily::utraTdd, 10054), "TDD band a 2010.8 MHz");
  EXPECT_EQ(carriersInText(RadioFamily::lte, 3350), "B7 2680 MHz");
  EXPECT_EQ(carriersInText(RadioFamily::cdma, 1300),
            "BC0 868.32 MHz or BC3 839.25 MHz or BC5 466.53 MHz or BC8 1870 MHz or BC13 2685 MHz");
  EXPECT_EQ(carriersInText(RadioFamily::evdo, 2016), "BC2 934.1875 MHz or BC5 493.48 MHz");
  EXPECT_EQ(carriersInText(RadioFamily::none, 62), "");
}

TEST(CellCarriers, WhereItIsKnownTheBandClassChoosesAmongThoseOfACdmaChannel) {
  EXPECT_EQ(textOf(carriersOf({RadioFamily::cdma, 283, 132}, 0)), "BC0 878.49 MHz");
  EXPECT_EQ(textOf(carriersOf({RadioFamily::evdo, 283, 132}, 1)), "BC1 1944.15 MHz");
  EXPECT_EQ(textOf(carriersOf({RadioFamily::cdma, 283, 132}, 31)), "");
  EXPECT_EQ(textOf(carriersOf({RadioFamily::cdma, 283, 132}, -1)), "");
  EXPECT_EQ(carriersOf({RadioFamily::cdma, 1300, 132}, std::nullopt).size(), 5u);
  EXPECT_EQ(textOf(carriersOf({RadioFamily::lte, 3350, 404}, 0)), "B7 2680 MHz");
}

TEST(CellCarriers, AChannelThatIsNotKnownOrTooLargeHasNone) {
  EXPECT_EQ(carriersInText(RadioFamily::lte, CellIdentity::unknown), "");
  EXPECT_EQ(carriersInText(RadioFamily::lte, (std::int64_t{1} << 32) + 3350), "");
}

}  // namespace
}  // namespace kelvasi
