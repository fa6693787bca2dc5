// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/RecordFraming.h"

#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

using test::hex;

TEST(RecordFraming, IgnoresAMessageShorterThanAHeader) {
  EXPECT_FALSE(frameRecord({}));
  EXPECT_FALSE(frameRecord(hex("01 0000 3271 00000000 000000")));  // 12 bytes
}

TEST(RecordFraming, TakesTheLengthBeforeThePrefixIsRemoved) {
  const Bytes message = hex("81 00 01 0000 3271 000000000000");  // 13 bytes
  const auto framed = frameRecord(message);
  ASSERT_TRUE(framed);
  EXPECT_EQ(framed->record.size(), 11u);
  EXPECT_EQ(framed->logCode, 0x7132u);
  EXPECT_TRUE(framed->hasKnownType());
}

TEST(RecordFraming, RemovesThePrefixOnce) {
  const Bytes message = hex("81 00 81 00 01 0000 3271 0000000000000000");
  const auto framed = frameRecord(message);
  ASSERT_TRUE(framed);
  EXPECT_EQ(framed->logType, 0x81);
  EXPECT_FALSE(framed->hasKnownType());
}

TEST(RecordFraming, OnlyExtraRecordsHaveHighCodes) {
  EXPECT_EQ(frameRecord(hex("FF 0000 0100 0000000000000000"))->logCode, 0xFF0001u);
  EXPECT_EQ(frameRecord(hex("01 0000 0100 0000000000000000"))->logCode, 0x0001u);
  EXPECT_EQ(frameRecord(hex("FE 0000 0100 0000000000000000"))->logCode, 0x0001u);
}

TEST(RecordFraming, KnowsTwoLogTypes) {
  for (unsigned type = 0; type <= 0xFF; ++type) {
    Bytes message = hex("00 0000 3271 0000000000000000");
    message[0] = static_cast<std::uint8_t>(type);
    if (type == 0x81) continue;  // that is the prefix
    EXPECT_EQ(frameRecord(message)->hasKnownType(), type == 1 || type == 0xFF) << type;
  }
}

}  // namespace
}  // namespace kelvasi
