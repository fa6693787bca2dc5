#include "Model/KelvasiModelNode.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace kelvasi {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

struct Tree {
  explicit Tree(const PlistValue& display)
      : root(KelvasiModelNode::makeTreeFromObject(display, nodesByPath)) {}

  std::vector<std::string> names(const std::string& path = "/") const {
    std::vector<std::string> result;
    for (const NodeRef& child : *nodesByPath.at(path)->childNodes()) result.push_back(child->displayName());
    return result;
  }
  const std::string& text(const std::string& path) const { return *nodesByPath.at(path)->value(); }

  PathDictionary nodesByPath;
  NodeRef root;
};

TEST(KelvasiModelNode, ASingleStringIsALeafAtTheRoot) {
  const Tree tree("text");
  EXPECT_EQ(tree.root->displayName(), "Kelvasi");
  EXPECT_EQ(*tree.root->value(), "text");
  EXPECT_EQ(tree.root->childNodes(), nullptr);
  EXPECT_EQ(tree.nodesByPath.at("/"), tree.root);
}

TEST(KelvasiModelNode, AnAbsentDisplayIsALeafOfUnknownKind) {
  const Tree tree{PlistValue()};
  EXPECT_EQ(*tree.root->value(), "(unknown)");
}

TEST(KelvasiModelNode, ASortedDictionaryIsOrderedByPrefixAndShowsTheNames) {
  const Tree tree(PlistDictionary::make(
      {{"02;Beta", "b"}, {"01;Alpha", "a"}, {"_sorted", "_sorted"}, {"10;Gamma", "c"}}));
  EXPECT_THAT(tree.names(), ElementsAre("Alpha", "Beta", "Gamma"));
  EXPECT_EQ(tree.text("/Alpha"), "a");
  EXPECT_EQ(tree.text("/Gamma"), "c");
}

TEST(KelvasiModelNode, SortingIsOrdinal) {
  const Tree tree(
      PlistDictionary::make({{"2;two", "x"}, {"10;ten", "x"}, {"a", "x"}, {"B", "x"}, {"_sorted", 1}}));
  EXPECT_THAT(tree.names(), ElementsAre("ten", "two", "B", "a"));
}

TEST(KelvasiModelNode, OnlyOneSeparatorMakesAPrefix) {
  const Tree tree(
      PlistDictionary::make({{"_sorted", true}, {"a;b;c", "x"}, {"d", "x"}, {"e;", "x"}, {";f", "x"}}));
  EXPECT_THAT(tree.names(), ElementsAre("f", "a;b;c", "d", ""));
}

TEST(KelvasiModelNode, AnUnsortedDictionaryKeepsItsOrderAndItsSeparators) {
  const Tree tree(PlistDictionary::make({{"b", "x"}, {"01;Alpha", "y"}, {"a", "z"}}));
  EXPECT_THAT(tree.names(), ElementsAre("b", "01;Alpha", "a"));
  EXPECT_EQ(tree.text("/01;Alpha"), "y");
}

TEST(KelvasiModelNode, ArrayElementsAreNumbered) {
  const Tree tree(PlistArray::make({"x", "y", "z"}));
  EXPECT_THAT(tree.names(), ElementsAre("0", "1", "2"));
  EXPECT_EQ(tree.text("/2"), "z");
}

TEST(KelvasiModelNode, OtherKindsAreUnknown) {
  const Tree tree(PlistArray::make({1, 2.5, true, Bytes{1}, PlistDate{}}));
  for (const char* path : {"/0", "/1", "/2", "/3", "/4"}) EXPECT_EQ(tree.text(path), "(unknown)") << path;
}

TEST(KelvasiModelNode, AnEmptyContainerIsABranchWithoutChildren) {
  const Tree tree(PlistDictionary::make({{"d", PlistDictionary::make()}, {"a", PlistArray::make()}}));
  EXPECT_THAT(tree.names("/d"), IsEmpty());
  EXPECT_THAT(tree.names("/a"), IsEmpty());
  EXPECT_EQ(tree.nodesByPath.at("/d")->value(), nullptr);
}

TEST(KelvasiModelNode, PathsJoinTheNames) {
  const Tree tree(PlistDictionary::make({{"A", PlistDictionary::make({{"B", PlistArray::make({"x"})}})}}));
  EXPECT_EQ(tree.text("/A/B/0"), "x");
  EXPECT_EQ(tree.nodesByPath.size(), 4u);
}

TEST(KelvasiModelNode, OfTwoNodesWithOnePathTheLaterIsFound) {
  const Tree tree(
      PlistDictionary::make({{"_sorted", "_sorted"}, {"01;Same", "first"}, {"02;Same", "second"}}));
  EXPECT_THAT(tree.names(), ElementsAre("Same", "Same"));
  EXPECT_EQ(tree.text("/Same"), "second");
}

TEST(KelvasiModelNode, ANodeWithoutANameGivesItsPathToItsParent) {
  const Tree tree(PlistDictionary::make({{"A", PlistDictionary::make({{"", "child"}})}, {"/", "child"}}));
  EXPECT_NE(tree.nodesByPath.at("/A")->childNodes(), nullptr);
  EXPECT_EQ(tree.nodesByPath.at("/"), tree.root);
}

TEST(PathByAppending, FollowsFilePathRules) {
  EXPECT_EQ(pathByAppending("/", "Serving Cell"), "/Serving Cell");
  EXPECT_EQ(pathByAppending("/A", "B"), "/A/B");
  EXPECT_EQ(pathByAppending("/A", ""), "/A");
  EXPECT_EQ(pathByAppending("/", ""), "/");
  EXPECT_EQ(pathByAppending("/A", "B/"), "/A/B");
  EXPECT_EQ(pathByAppending("/A", "/B//C/"), "/A/B/C");
  EXPECT_EQ(pathByAppending("/", "/"), "/");
}

}  // namespace
}  // namespace kelvasi
