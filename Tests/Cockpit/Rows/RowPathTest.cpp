// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/RowPath.h"

#include <gtest/gtest.h>

namespace kelvasi::cockpit {
namespace {

TEST(RowPath, StepsAreUnescaped) {
  EXPECT_EQ(stepsOf("/1x/Active Set Ec~1Io/01;344"),
            (std::vector<std::string>{"1x", "Active Set Ec/Io", "01;344"}));
  EXPECT_EQ(stepsOf("/a~01"), std::vector<std::string>{"a~1"});
  EXPECT_EQ(stepsOf("/a~2~"), std::vector<std::string>{"a~2~"});
  EXPECT_EQ(stepsOf("").size(), 0U);
}

TEST(RowPath, NodesAreNamedAsPanesNameThem) {
  EXPECT_EQ(nodePathOf("/2;UMTS/UMTS Set/0/RSCP"), "/UMTS/UMTS Set/0/RSCP");
  EXPECT_EQ(nodePathOf("/1x/Active Set Ec~1Io/01;344"), "/1x/Active Set Ec/Io/344");
  EXPECT_EQ(nodePathOf("/a~1~1b"), "/a/b");
  EXPECT_EQ(nodePathOf("/a;b"), "/a;b");
  EXPECT_EQ(nodePathOf(""), "/");
}

TEST(RowPath, ARowAndItsPlaceHaveNames) {
  EXPECT_EQ(rowNameOf("/2;UMTS/UMTS Set/0/RSCP"), "RSCP");
  EXPECT_EQ(placeTextOf("/2;UMTS/UMTS Set/0/RSCP"), "UMTS, UMTS Set");
  EXPECT_EQ(rowNameOf("/GSM/Mobile Allocation/ARFCNs/3"), "ARFCNs 3");
  EXPECT_EQ(placeTextOf("/Row"), "");
  EXPECT_EQ(rowNameOf(""), "");
}

TEST(RowPath, EntriesOfAListAreOfOneShape) {
  EXPECT_EQ(shapeOf("/List/12/RSRP"), "/List/*/RSRP");
  EXPECT_EQ(shapeOf("/1x/Row"), "/1x/Row");
}

}  // namespace
}  // namespace kelvasi::cockpit
