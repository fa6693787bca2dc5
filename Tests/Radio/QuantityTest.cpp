// SPDX-License-Identifier: Apache-2.0
#include "Radio/Quantity.h"

#include <gtest/gtest.h>

#include <set>
#include <utility>

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

// Typed from the clauses, not from what the records have room for.
TEST(Quantity, HasTheRangeThatItsSourceAllows) {
  const auto range = [](const Quantity& quantity) { return std::pair(quantity.least, quantity.most); };
  EXPECT_EQ(range(quantity::qrxlevmin), std::pair(2 * -70.0, 2 * -22.0));
  EXPECT_EQ(range(quantity::searchThreshold), std::pair(0.0, 2 * 31.0));
  EXPECT_EQ(range(quantity::priority), std::pair(0.0, 7.0));
  EXPECT_EQ(range(quantity::cellId), std::pair(0.0, 268435455.0));  // 28 bits
  EXPECT_EQ(range(quantity::antennas), std::pair(1.0, 4.0));
  EXPECT_EQ(range(quantity::frameNumber), std::pair(0.0, 10 * 1024 - 1.0));  // with the subframe
  EXPECT_EQ(range(quantity::pci), std::pair(0.0, 503.0));
}

TEST(Quantity, OfReceivedCodePowerIsInDecibelOfAMilliwatt) {
  EXPECT_EQ(quantity::rscp.unit, "dBm");
  EXPECT_EQ(quantity::ecno.unit, "dB");
}

}  // namespace
}  // namespace kelvasi
