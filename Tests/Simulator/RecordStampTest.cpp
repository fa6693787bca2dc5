// SPDX-License-Identifier: Apache-2.0
#include "Simulator/RecordStamp.h"

#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"

namespace kelvasi::sim {
namespace {

using kelvasi::test::hex;
using kelvasi::test::record;
using namespace std::chrono_literals;

// 1 January 2024 is 1388102400 s after 6 January 1980: 1110481920000 (0x1028DE16000) units of 1.25 ms.
TEST(RecordStamp, SetsLengthAndTime) {
  Bytes stamped = record(0x7130, "AA BB");
  stampRecord(stamped, 0us);
  EXPECT_EQ(stamped, hex("01 0E 00 30 71 00 00 00 60 E1 8D 02 01 AA BB"));
}

TEST(RecordStamp, CountsFractionsOfATimeUnit) {
  Bytes stamped = record(0x7130, "");
  stampRecord(stamped, 1250us + 625us);
  EXPECT_EQ(stamped, hex("01 0C 00 30 71 00 80 01 60 E1 8D 02 01"));
}

TEST(RecordStamp, LeavesWhatHasNoHeaderAlone) {
  Bytes tooShort(12, 0xEE);
  stampRecord(tooShort, 1s);
  EXPECT_EQ(tooShort, Bytes(12, 0xEE));
}

}  // namespace
}  // namespace kelvasi::sim
