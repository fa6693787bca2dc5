// SPDX-License-Identifier: Apache-2.0
#include "Plist/PlistValue.h"

#include <gtest/gtest.h>

namespace kelvasi {
namespace {

std::vector<std::string> keysOf(const PlistDictionary& dictionary) {
  std::vector<std::string> keys;
  for (const auto& [key, value] : dictionary) keys.push_back(key);
  return keys;
}

TEST(PlistValue, KnowsItsKind) {
  EXPECT_TRUE(PlistValue().isAbsent());
  EXPECT_EQ(*PlistValue("text").string(), "text");
  EXPECT_EQ(*PlistValue(7u).integer(), 7);
  EXPECT_EQ(*PlistValue(0.5).real(), 0.5);
  EXPECT_EQ(*PlistValue(true).boolean(), true);
  EXPECT_EQ(PlistValue(PlistDate{12}).date()->secondsSince1970, 12);
  EXPECT_EQ(*PlistValue(Bytes{1, 2}).data(), (Bytes{1, 2}));
  EXPECT_EQ(PlistValue(true).integer(), nullptr);
  EXPECT_EQ(PlistValue(1).boolean(), nullptr);
  EXPECT_EQ(PlistValue("1").dictionary(), nullptr);
}

TEST(PlistValue, IntegersBeyondTheSignedOnesAreAKindOfTheirOwn) {
  constexpr std::uint64_t first = std::uint64_t{1} << 63;
  EXPECT_EQ(*PlistValue(first).unsignedInteger(), first);
  EXPECT_EQ(PlistValue(first).integer(), nullptr);
  EXPECT_EQ(*PlistValue(first - 1).integer(), 9223372036854775807);
  EXPECT_EQ(PlistValue(first - 1).unsignedInteger(), nullptr);
  EXPECT_NE(PlistValue(~std::uint64_t{0}), PlistValue(-1));
}

TEST(PlistValue, NullContainersAreAbsent) {
  EXPECT_TRUE(PlistValue(PlistValue::Dictionary()).isAbsent());
  EXPECT_TRUE(PlistValue(PlistValue::Array()).isAbsent());
  EXPECT_TRUE(PlistValue(PlistValue::Data()).isAbsent());
}

TEST(PlistValue, CopiesShareContainers) {
  const PlistValue one = PlistDictionary::make();
  const PlistValue other = one;
  one.dictionary()->set("key", "value");
  EXPECT_EQ(*other.dictionary()->get("key").string(), "value");
}

TEST(PlistValue, ShallowCopyOwnsItsOutermostContainerOnly) {
  const PlistValue inner = PlistArray::make();
  const PlistValue outer = PlistDictionary::make({{"inner", inner}, {"text", "before"}});
  const PlistValue copy = outer.shallowCopy();
  outer.dictionary()->set("text", "after");
  inner.array()->append("added");
  EXPECT_EQ(*copy.dictionary()->get("text").string(), "before");
  EXPECT_EQ(copy.dictionary()->get("inner").array()->size(), 1u);
}

TEST(PlistValue, EqualsByContentWhateverTheKeyOrder) {
  const PlistValue one = PlistDictionary::make({{"a", 1}, {"b", PlistArray::make({"x", 2.5})}});
  const PlistValue same = PlistDictionary::make({{"b", PlistArray::make({"x", 2.5})}, {"a", 1}});
  const PlistValue other = PlistDictionary::make({{"a", 1}, {"b", PlistArray::make({"x"})}});
  EXPECT_EQ(one, same);
  EXPECT_NE(one, other);
  EXPECT_NE(PlistValue(1), PlistValue(1.0));
  EXPECT_NE(PlistValue(1), PlistValue(true));
}

TEST(PlistDictionary, KeepsInsertionOrderAndPlaces) {
  PlistDictionary dictionary{{"b", 1}, {"a", 2}};
  dictionary.set("c", 3);
  dictionary.set("b", 4);
  EXPECT_EQ(keysOf(dictionary), (std::vector<std::string>{"b", "a", "c"}));
  EXPECT_EQ(*dictionary.get("b").integer(), 4);
}

TEST(PlistDictionary, ARemovedKeyComesBackLast) {
  PlistDictionary dictionary{{"a", 1}, {"b", 2}, {"c", 3}};
  EXPECT_TRUE(dictionary.remove("a"));
  EXPECT_FALSE(dictionary.remove("a"));
  dictionary.set("a", 4);
  EXPECT_EQ(keysOf(dictionary), (std::vector<std::string>{"b", "c", "a"}));
}

TEST(PlistDictionary, SettingTheAbsentValueRemoves) {
  PlistDictionary dictionary{{"a", 1}};
  dictionary.set("a", PlistValue());
  EXPECT_TRUE(dictionary.empty());
}

TEST(PlistDictionary, TextIsSetAtTheRightKeyWhateverTheGuess) {
  PlistDictionary dictionary{{"a", "1"}, {"b", 2}};
  EXPECT_EQ(dictionary.setText("b", "two", 0), 2u);
  EXPECT_EQ(dictionary.setText("a", "one", 0), 1u);
  EXPECT_EQ(dictionary.setText("c", "three", 9), 3u);
  EXPECT_EQ(PlistValue(std::make_shared<PlistDictionary>(dictionary)),
            PlistValue(PlistDictionary::make({{"a", "one"}, {"b", "two"}, {"c", "three"}})));
}

TEST(PlistDictionary, ManyKeysAreFoundAfterRemovals) {
  PlistDictionary dictionary;
  for (int number = 0; number < 200; ++number) dictionary.set(std::to_string(number), number);
  for (int number = 0; number < 200; number += 2) EXPECT_TRUE(dictionary.remove(std::to_string(number)));
  EXPECT_EQ(dictionary.size(), 100u);
  for (int number = 0; number < 200; ++number) {
    EXPECT_EQ(dictionary.find(std::to_string(number)) != nullptr, number % 2 == 1) << number;
  }
  dictionary.truncate(10);
  EXPECT_EQ(dictionary.size(), 10u);
  EXPECT_EQ(*dictionary.get("19").integer(), 19);
  EXPECT_EQ(dictionary.find("21"), nullptr);
}

TEST(PlistArray, DropsItsFirstElements) {
  PlistArray array{1, 2, 3};
  array.removeFirst(2);
  ASSERT_EQ(array.size(), 1u);
  EXPECT_EQ(*array.at(0).integer(), 3);
  array.removeFirst(9);
  EXPECT_TRUE(array.empty());
}

}  // namespace
}  // namespace kelvasi
