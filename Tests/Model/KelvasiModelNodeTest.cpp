// SPDX-License-Identifier: Apache-2.0
#include "Model/KelvasiModelNode.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <future>

#include "LogGenerator/ArrayLock.h"

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

// Builds a tree on a thread of its own.
std::future<void> treeBuiltElsewhere(const PlistValue& display) {
  return std::async(std::launch::async, [&display] { const Tree tree(display); });
}

TEST(KelvasiModelNode, AnArrayIsWalkedUnderTheArrayLock) {
  const PlistValue display = PlistDictionary::make({{"List", PlistArray::make({"a"})}});
  std::future<void> builder;
  {
    const ArrayGuard guard;
    builder = treeBuiltElsewhere(display);
    EXPECT_EQ(builder.wait_for(std::chrono::milliseconds(100)), std::future_status::timeout);
  }
  builder.get();
}

TEST(KelvasiModelNode, DictionariesAreWalkedWithoutTheArrayLock) {
  const PlistValue display = PlistDictionary::make({{"Section", PlistDictionary::make({{"Row", "a"}})}});
  const ArrayGuard guard;
  treeBuiltElsewhere(display).get();
}

// A lock that is taken again inside stays held once more than it is released; so whether it is free
// afterwards tells whether it was held while what is nested in an array was built.
bool isFreeAfterTheWalkOf(const PlistValue& display) {
  { const Tree tree(display); }
  auto other = std::async(std::launch::async, [] { const ArrayGuard guard; });
  const bool isFree = other.wait_for(std::chrono::milliseconds(200)) == std::future_status::ready;
  if (!isFree) std::_Exit(1);  // the future would wait for ever
  return true;
}

TEST(KelvasiModelNode, TheArrayLockIsFreeAfterArraysSideBySide) {
  const PlistValue list = PlistArray::make({"a"});
  EXPECT_EXIT(std::_Exit(isFreeAfterTheWalkOf(PlistDictionary::make({{"A", list}, {"B", list}})) ? 0 : 1),
              testing::ExitedWithCode(0), "");
}

TEST(KelvasiModelNode, TheArrayLockIsHeldWhileWhatIsNestedInAnArrayIsBuilt) {
  const PlistValue list = PlistArray::make({"a"});
  const PlistValue nested = PlistArray::make({PlistDictionary::make({{"List", list}})});
  EXPECT_EXIT(std::_Exit(isFreeAfterTheWalkOf(nested) ? 0 : 1), testing::ExitedWithCode(1), "");
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
