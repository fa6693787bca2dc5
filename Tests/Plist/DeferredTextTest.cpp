// SPDX-License-Identifier: Apache-2.0
// Texts that are made when somebody looks.
#include <gtest/gtest.h>

#include "Plist/PlistValue.h"

namespace kelvasi {
namespace {

struct Maker {
  mutable int made = 0;
};

std::string make(const void* source, std::int64_t number) {
  ++static_cast<const Maker*>(source)->made;
  return "number " + std::to_string(number);
}

TEST(DeferredText, IsAStringMadeAtTheFirstLook) {
  const Maker maker;
  const PlistValue value(DeferredText{make, &maker, 7});
  EXPECT_EQ(maker.made, 0);
  EXPECT_EQ(*value.string(), "number 7");
  EXPECT_EQ(*value.string(), "number 7");
  EXPECT_EQ(maker.made, 1);
  EXPECT_FALSE(value.isAbsent());
  EXPECT_EQ(value.integer(), nullptr);
}

TEST(DeferredText, IsNotMadeWhenAnotherOneComesFirst) {
  const Maker maker;
  PlistDictionary rows;
  for (std::int64_t number = 0; number < 10; ++number)
    rows.setText("row", DeferredText{make, &maker, number}, 0);
  EXPECT_EQ(*rows.find("row")->string(), "number 9");
  EXPECT_EQ(maker.made, 1);
}

TEST(DeferredText, EqualsTheStringThatItIs) {
  const Maker maker;
  EXPECT_EQ(PlistValue(DeferredText{make, &maker, 7}), PlistValue("number 7"));
  EXPECT_EQ(PlistValue("number 7"), PlistValue(DeferredText{make, &maker, 7}));
  EXPECT_FALSE(PlistValue(DeferredText{make, &maker, 7}) == PlistValue(DeferredText{make, &maker, 8}));
}

TEST(DeferredText, OfACopyIsTheCopysOwn) {
  const Maker maker;
  PlistValue value(DeferredText{make, &maker, 7});
  const PlistValue copy = value;
  value.set(DeferredText{make, &maker, 8});
  EXPECT_EQ(*copy.string(), "number 7");
  EXPECT_EQ(*value.string(), "number 8");
}

TEST(DeferredText, KeepsAndTakesThePlaceOfItsKey) {
  const Maker maker;
  PlistDictionary rows{{"first", "old"}, {"second", 2}};
  EXPECT_EQ(rows.setText("first", DeferredText{make, &maker, 1}, 0), 1u);
  EXPECT_EQ(rows.setText("second", DeferredText{make, &maker, 2}, 1), 2u);
  EXPECT_EQ(rows.setText("third", DeferredText{make, &maker, 3}, 2), 3u);
  EXPECT_EQ(*rows.get("second").string(), "number 2");
  EXPECT_EQ(rows.rewriteText("second", DeferredText{make, &maker, 4}, 0), 1u);
  EXPECT_EQ(rows.size(), 1u);
  rows.setText("second", "plain", 0);
  EXPECT_EQ(*rows.get("second").string(), "plain");
}

}  // namespace
}  // namespace kelvasi
