// SPDX-License-Identifier: Apache-2.0
#include "Radio/Quantity.h"

#include <gtest/gtest.h>

#include <set>

namespace kelvasi {
namespace {

TEST(Quantity, HasAnIdentifierOfItsOwnForScripts) {
  std::set<std::string_view> ids;
  for (const Quantity* each : quantity::all) {
    EXPECT_TRUE(ids.insert(each->id).second) << each->id;
    EXPECT_EQ(each->id.find_first_not_of("abcdefghijklmnopqrstuvwxyz0123456789_"), std::string_view::npos)
        << each->id;
    EXPECT_FALSE(each->id.empty());
  }
}

TEST(Quantity, IsFoundByItsIdentifier) {
  EXPECT_EQ(quantityOf("rsrp"), &quantity::rsrp);
  EXPECT_EQ(quantityOf("RSRP"), nullptr);
}

TEST(Quantity, HasARangeWhereItIsANumber) {
  for (const Quantity* each : quantity::all) {
    const bool isNumber = each->kind != QuantityKind::text && each->kind != QuantityKind::container &&
                          each->kind != QuantityKind::none;
    EXPECT_EQ(each->least < each->most, isNumber) << each->id;
  }
}

TEST(Quantity, OfReceivedCodePowerIsInDecibelOfAMilliwatt) {
  EXPECT_EQ(quantity::rscp.unit, "dBm");
  EXPECT_EQ(quantity::ecno.unit, "dB");
}

}  // namespace
}  // namespace kelvasi
