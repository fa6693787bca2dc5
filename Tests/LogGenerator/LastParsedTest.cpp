// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/LastParsed.h"

#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

using test::hex;

// What stands for the bytes is how many there are; none parse when there are none.
struct CountingSerialiser : PlistSerialiser {
  std::optional<PlistValue> parse(std::span<const std::uint8_t> bytes) const override {
    ++parses;
    if (bytes.empty()) return std::nullopt;
    return PlistArray::make({bytes.size()});
  }
  std::optional<Bytes> serialiseXml(const PlistValue&) const override { return hex("AB"); }
  std::optional<Bytes> serialiseBinary(const PlistValue&) const override { return hex("CD"); }
  mutable int parses = 0;
};

TEST(LastParsed, ParsesTheSameBytesOnce) {
  const CountingSerialiser serialiser;
  const LastParsed lastParsed(serialiser);
  const auto first = lastParsed.parse(hex("01 02"));
  const auto second = lastParsed.parse(hex("01 02"));
  EXPECT_EQ(serialiser.parses, 1);
  EXPECT_EQ(*first, PlistValue(PlistArray::make({2})));
  EXPECT_EQ(first->array(), second->array());
}

TEST(LastParsed, ParsesOtherBytesAnew) {
  const CountingSerialiser serialiser;
  const LastParsed lastParsed(serialiser);
  lastParsed.parse(hex("01 02"));
  EXPECT_EQ(*lastParsed.parse(hex("01 02 03")), PlistValue(PlistArray::make({3})));
  EXPECT_EQ(*lastParsed.parse(hex("01 03")), PlistValue(PlistArray::make({2})));
  EXPECT_EQ(*lastParsed.parse(hex("01 02")), PlistValue(PlistArray::make({2})));
  EXPECT_EQ(serialiser.parses, 4);
}

TEST(LastParsed, RemembersThatBytesDidNotParse) {
  const CountingSerialiser serialiser;
  const LastParsed lastParsed(serialiser);
  EXPECT_FALSE(lastParsed.parse({}));
  EXPECT_FALSE(lastParsed.parse({}));
  EXPECT_EQ(serialiser.parses, 1);
  EXPECT_TRUE(lastParsed.parse(hex("01")));
}

// Each document is the last one's array, written over.
struct OverwritingSerialiser : CountingSerialiser {
  bool parseOver(PlistValue& value, std::span<const std::uint8_t> bytes) const override {
    if (!value.array() || value.isShared()) value = PlistArray::make();
    value.array()->rewrite(0) = bytes.size();
    return true;
  }
};

TEST(LastParsed, WritesOverWhatNobodyHolds) {
  const OverwritingSerialiser serialiser;
  const LastParsed lastParsed(serialiser);
  const PlistArray* first = lastParsed.parse(hex("01"))->array();
  const auto second = lastParsed.parse(hex("01 02"));
  EXPECT_EQ(second->array(), first);
  const auto third = lastParsed.parse(hex("01 02 03"));
  EXPECT_EQ(*second, PlistValue(PlistArray::make({2})));
  EXPECT_EQ(*third, PlistValue(PlistArray::make({3})));
}

Bytes withFirstKey(std::string key, std::size_t size) {
  const std::string text = "<dict><key>" + key + "</key>" + std::string(size, ' ');
  return {text.begin(), text.end()};
}

TEST(LastParsed, KeepsAValueForEachKind) {
  const OverwritingSerialiser serialiser;
  const LastParsed lastParsed(serialiser);
  const PlistArray* cells = lastParsed.parse(withFirstKey("MCC", 1))->array();
  const PlistArray* contexts = lastParsed.parse(withFirstKey("APN", 1))->array();
  EXPECT_NE(contexts, cells);
  EXPECT_EQ(lastParsed.parse(withFirstKey("MCC", 2))->array(), cells);
  EXPECT_EQ(lastParsed.parse(withFirstKey("APN", 1))->array(), contexts);
}

TEST(LastParsed, KindsBeyondTheFirstFewShareAPlace) {
  const OverwritingSerialiser serialiser;
  const LastParsed lastParsed(serialiser);
  for (std::size_t size = 1; size < 20; ++size) {
    const Bytes bytes = withFirstKey(std::to_string(size), size);
    EXPECT_EQ(*lastParsed.parse(bytes), PlistValue(PlistArray::make({bytes.size()})));
  }
}

TEST(LastParsed, SerialisesThroughWhatItWasGiven) {
  const CountingSerialiser serialiser;
  EXPECT_EQ(LastParsed(serialiser).serialiseXml("text"), hex("AB"));
  EXPECT_EQ(LastParsed(serialiser).serialiseBinary("text"), hex("CD"));
}

}  // namespace
}  // namespace kelvasi
