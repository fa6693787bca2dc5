// SPDX-License-Identifier: Apache-2.0
#include "Tools/Top/Panes.h"

#include <gtest/gtest.h>

#include "Tests/Tools/Top/Screen.h"

namespace kelvasi::top {
namespace {

NodeRef tree(const PlistValue& display) {
  PathDictionary paths;
  return KelvasiModelNode::makeTreeFromObject(display, paths);
}

PlistValue cellWith(const char* level) {
  return PlistDictionary::make({{"PCI", "404"}, {"RSRP", level}});
}

PlistValue display() {
  return PlistDictionary::make({{"Serving Cell", PlistDictionary::make({{"Band", "7"}})},
                                {"Cells", PlistArray::make({cellWith("-95 dBm"), cellWith("-105 dBm")})},
                                {"State", "Idle"}});
}

std::string text(const Panes& panes, int columns = 20) {
  return asText(panes.lines(columns, 10, {}, false), columns);
}

TEST(Panes, BeginEmpty) {
  const Panes panes;
  EXPECT_EQ(panes.title(), "Kelvasi");
  EXPECT_EQ(text(panes), "Nothing received yet\n");
  EXPECT_EQ(panes.selected(), nullptr);
}

TEST(Panes, ListTheChildrenOfABranchInTheirOrder) {
  Panes panes;
  panes.reload(tree(display()));
  EXPECT_EQ(text(panes),
            "Serving Cell       ›\n"
            "Cells              ›\n"
            "State           Idle\n");
}

TEST(Panes, OpenAndGoBack) {
  Panes panes;
  panes.reload(tree(display()));
  panes.scroll().selected = 1;
  EXPECT_TRUE(panes.open());
  EXPECT_EQ(panes.title(), "Cells");
  panes.scroll().selected = 1;
  EXPECT_TRUE(panes.open());
  EXPECT_EQ(panes.way(), "Cells / 1");
  EXPECT_EQ(text(panes), "PCI              404\nRSRP        -105 dBm\n");
  EXPECT_FALSE(panes.open());  // a leaf
  EXPECT_TRUE(panes.back());
  EXPECT_TRUE(panes.back());
  EXPECT_FALSE(panes.back());
}

TEST(Panes, APaneWhoseBranchIsGoneGoes) {
  Panes panes;
  panes.reload(tree(display()));
  panes.openPath("/Cells/1/RSRP");
  EXPECT_EQ(panes.selectedPath(), "/Cells/1/RSRP");
  panes.reload(tree(PlistDictionary::make({{"Cells", PlistArray::make({cellWith("-95 dBm")})}})));
  EXPECT_EQ(panes.title(), "Cells");
  panes.reload(tree(PlistDictionary::make({{"State", "Idle"}})));
  EXPECT_EQ(panes.title(), "Kelvasi");
}

TEST(Panes, OfTwoNodesWithOnePathTheLaterIsFound) {
  PathDictionary paths;
  const PlistValue twice = PlistDictionary::make({{"A/B", "first"},
                                                  {"A", PlistDictionary::make({{"B", "second"}})},
                                                  {"", PlistDictionary::make({{"A", "third"}})}});
  const NodeRef root = KelvasiModelNode::makeTreeFromObject(twice, paths);
  for (const auto& [path, node] : paths) EXPECT_EQ(nodeAtPath(root, path), node) << path;
  EXPECT_EQ(nodeAtPath(root, "/Nowhere"), nullptr);
  EXPECT_EQ(nodeAtPath(nullptr, "/"), nullptr);
}

TEST(Panes, ALongValueCanBeMoved) {
  Panes panes;
  panes.reload(tree(PlistDictionary::make({{"APN", "a.very.long.name.of.an.access.point"}})));
  EXPECT_EQ(text(panes), "APN  a.very.long.na…\n");
  EXPECT_TRUE(panes.slide(16));
  EXPECT_EQ(asText(panes.lines(20, 10, {}, true), 20), ".name.of.an.access.…\n");
  EXPECT_TRUE(panes.slide(-16));
  EXPECT_FALSE(panes.slide(-16));
}

TEST(Panes, AListLongerThanItsRoomScrolls) {
  const auto many = PlistArray::make({});
  for (int row = 0; row < 30; ++row) many->append("x");
  Panes panes;
  panes.reload(tree(many));
  panes.scroll().take({.kind = terminal::Key::Kind::end}, 30, 10);
  EXPECT_EQ(panes.scroll().words(30, 10), "21-30 of 30");
  EXPECT_EQ(asText(panes.lines(8, 2, {}, false), 8), "20     x\n21     x\n");
}

}  // namespace
}  // namespace kelvasi::top
