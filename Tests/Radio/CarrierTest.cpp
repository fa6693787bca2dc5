// SPDX-License-Identifier: Apache-2.0
#include "Radio/Carrier.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

TEST(Carriers, AreEmptyUntilOneIsAdded) {
  Carriers carriers;
  EXPECT_TRUE(carriers.empty());
  carriers.add({{7, "B7"}, 2680_MHz, 2560_MHz});
  ASSERT_EQ(carriers.size(), 1U);
  EXPECT_EQ(carriers[0].band.number, 7);
}

TEST(Carriers, AllAreNamedInText) {
  Carriers carriers;
  EXPECT_EQ(textOf(carriers), "");
  carriers.add({{1800, "DCS 1800"}, 1835_MHz, 1740_MHz});
  carriers.add({{1900, "PCS 1900"}, 1960_MHz, 1880_MHz});
  EXPECT_EQ(textOf(carriers), "DCS 1800 1835 MHz or PCS 1900 1960 MHz");
}

}  // namespace
}  // namespace kelvasi
