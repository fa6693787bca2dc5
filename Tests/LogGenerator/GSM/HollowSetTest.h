// SPDX-License-Identifier: Apache-2.0
// What holds for the three sets that are emptied and never filled.
#pragma once

#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi::test {

template <typename Set>
SectionFixture<Set> setThatShowsACell() {
  return SectionFixture<Set>(PlistArray::make({PlistDictionary::make({{"Scrambling Code", "1"}})}));
}

// One cell of each membership, 0 to 7.
inline Bytes cellsOfEverySet() {
  std::string payload = "0000 08";
  for (const char* identity : {"0100", "0120", "0140", "0160", "0180", "01A0", "01C0", "01E0"}) {
    payload += std::string("00000000000000") + identity + "000000000000";
  }
  return record(0x417A, payload, 16 + 8 * (15 + 44));
}

template <typename Set>
void expectHollow() {
  for (const Bytes& bytes : {cellsOfEverySet(), record(0x417A, "0000 00"), record(0x417A, "0000 FF")}) {
    auto section = setThatShowsACell<Set>();
    ASSERT_NE(section.text(), "");
    section.take(bytes);
    EXPECT_EQ(section.text(), "");
  }
}

template <typename Set>
void expectShortRecordsIgnored() {
  auto section = setThatShowsACell<Set>();
  section.take(record(0x417A, "0000"));
  EXPECT_EQ(section.text(), "[Scrambling Code=1\n]");
}

}  // namespace kelvasi::test
