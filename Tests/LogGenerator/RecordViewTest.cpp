// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/RecordView.h"

#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

using test::hex;

TEST(RecordView, ReadsZeroPastTheEnd) {
  const Bytes bytes = hex("FF FF");
  const RecordView record(bytes);
  EXPECT_EQ(record.byteAt(1), 0xFF);
  EXPECT_EQ(record.byteAt(2), 0);
  EXPECT_EQ(record.byteAt(static_cast<std::size_t>(-1)), 0);
  EXPECT_EQ(record.u16(1), 0x00FF);
  EXPECT_EQ(record.u32(0), 0x0000FFFFu);
  EXPECT_EQ(record.bits(1, 7, 32), 1u);
}

TEST(RecordView, ReadsLittleEndian) {
  const Bytes bytes = hex("78 56 34 12");
  EXPECT_EQ(RecordView(bytes).u16(1), 0x3456);
  EXPECT_EQ(RecordView(bytes).u32(0), 0x12345678u);
}

TEST(RecordView, HasNoPayloadBeforeTheHeaderEnds) {
  const Bytes bytes(14, 0xAB);
  EXPECT_EQ(RecordView(std::span(bytes).first(12)).payload().size(), 0u);
  EXPECT_EQ(RecordView(std::span(bytes).first(13)).payload().size(), 0u);
  EXPECT_EQ(RecordView(bytes).payload().size(), 1u);
}

TEST(RecordView, AnEntryPastTheEndIsEmpty) {
  const Bytes bytes = hex("01 02");
  EXPECT_EQ(RecordView(bytes).from(1).byteAt(0), 2);
  EXPECT_EQ(RecordView(bytes).from(2).size(), 0u);
  EXPECT_EQ(RecordView(bytes).from(1000).size(), 0u);
}

}  // namespace
}  // namespace kelvasi
