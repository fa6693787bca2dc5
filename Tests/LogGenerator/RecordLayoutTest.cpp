// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/RecordLayout.h"

#include <gtest/gtest.h>

#include "LogGenerator/RecordWriter.h"
#include "Tests/Support/HexBytes.h"

namespace kelvasi {
namespace {

constexpr std::array layout{
    Field{.name = "unsigned byte", .byte = 13},
    Field{.name = "signed byte", .byte = 14, .isSigned = true},
    Field{.name = "low bits", .byte = 15, .bit = 0, .width = 3},
    Field{.name = "across", .byte = 15, .bit = 3, .width = 10, .isSigned = true},
    Field{.name = "big-endian", .byte = 17, .width = 16, .isBigEndian = true},
    Field{.name = "word", .byte = 19, .width = 32},
};
static_assert(inWireOrder(layout));

constexpr std::array overlapping{Field{.name = "a", .byte = 0, .width = 9}, Field{.name = "b", .byte = 1}};
static_assert(!inWireOrder(overlapping));

std::int64_t field(const Bytes& record, std::string_view name) {
  for (const Field& candidate : layout) {
    if (candidate.name == name) return valueOf(RecordView(record), candidate);
  }
  throw std::out_of_range("no such field");
}

TEST(RecordLayout, ReadsEachKindOfFieldFromBytesTypedByHand) {
  const Bytes bytes = test::record(0x1234, "FF FF FD 1F 12 34 FFFFFFFF");
  EXPECT_EQ(field(bytes, "unsigned byte"), 255);
  EXPECT_EQ(field(bytes, "signed byte"), -1);
  EXPECT_EQ(field(bytes, "low bits"), 5);
  EXPECT_EQ(field(bytes, "across"), -1);
  EXPECT_EQ(field(bytes, "big-endian"), 0x1234);
  EXPECT_EQ(field(bytes, "word"), 4294967295);
}

TEST(RecordWriter, WritesWhatTheLayoutReads) {
  const Bytes bytes = RecordWriter(0xFF0001, layout)
                          .set("unsigned byte", 200)
                          .set("signed byte", -100)
                          .set("low bits", 6)
                          .set("across", -512)
                          .set("big-endian", 0xABCD)
                          .set("word", 0x80000001)
                          .bytes();
  EXPECT_EQ(bytes, test::record(0xFF0001, "C8 9C 06 10 AB CD 01 00 00 80"));
  EXPECT_EQ(field(bytes, "across"), -512);
  EXPECT_EQ(field(bytes, "big-endian"), 0xABCD);
}

TEST(RecordWriter, LeavesTheFieldsBesideAloneWhenOneIsSetAgain) {
  RecordWriter writer(0x1234, layout);
  writer.set("low bits", 7).set("across", -1).set("across", 0);
  EXPECT_EQ(field(writer.bytes(), "low bits"), 7);
  EXPECT_EQ(field(writer.bytes(), "across"), 0);
}

TEST(RecordWriter, RefusesWhatDoesNotFit) {
  RecordWriter writer(0x1234, layout);
  EXPECT_THROW(writer.set("low bits", 8), std::out_of_range);
  EXPECT_THROW(writer.set("unsigned byte", -1), std::out_of_range);
  EXPECT_THROW(writer.set("across", 512), std::out_of_range);
  EXPECT_THROW(writer.set("no such field", 0), std::out_of_range);
}

TEST(RecordWriter, PadsAndAppends) {
  const Bytes tail{1, 2};
  EXPECT_EQ(RecordWriter(0x1234, layout, 15).append(tail).padTo(18).bytes(),
            test::record(0x1234, "00 00 01 02 00"));
}

}  // namespace
}  // namespace kelvasi
