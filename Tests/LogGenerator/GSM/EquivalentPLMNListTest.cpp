// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/EquivalentPLMNList.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using Section = test::SectionFixture<EquivalentPLMNList>;

TEST(EquivalentPLMNList, ReadsInterleavedDigits) {
  auto section = Section::list();
  section.take(record(0x7150, "000000 01 02 03 06 01 02 05"));  // MCC 262, MNC 315
  EXPECT_EQ(section.text(), "[Mobile Country Code=262\nMobile Network Code=315\n]");
}

TEST(EquivalentPLMNList, WritesItsTraceAtEveryUpdate) {
  auto section = Section::list();
  section.surroundings.log.clear();
  section.take(record(0x7150, "000000 01"));
  section.take(record(0x7150, "000000"));
  EXPECT_EQ(section.surroundings.log.warnings(), std::vector<std::string>(2, "Equivalent PLMN List"));
}

TEST(EquivalentPLMNList, EntriesOverlapTheirSuccessor) {
  auto section = Section::list();
  section.take(record(0x7150, "000000 02 03 00 01 00 00 01 05 02 07"));
  EXPECT_EQ(section.text(),
            "[Mobile Country Code=310\nMobile Network Code=1\n]"
            "[Mobile Country Code=12\nMobile Network Code=57\n]");
}

TEST(EquivalentPLMNList, EntriesPastTheEndReadAsZero) {
  auto section = Section::list();
  section.take(record(0x7150, "000000 02"));
  EXPECT_EQ(section.text(),
            "[Mobile Country Code=0\nMobile Network Code=0\n]"
            "[Mobile Country Code=0\nMobile Network Code=0\n]");
}

TEST(EquivalentPLMNList, TakesAllOf255Entries) {
  auto section = Section::list();
  section.take(record(0x7150, "000000 FF"));
  EXPECT_EQ(section.section.array()->size(), 255u);
}

TEST(EquivalentPLMNList, ACountOfZeroEmptiesTheList) {
  auto section = Section::list();
  section.take(record(0x7150, "000000 01"));
  section.take(record(0x7150, "000000 00"));
  EXPECT_EQ(section.text(), "");
}

TEST(EquivalentPLMNList, ARecordOf16BytesLeavesTheListAsItWas) {
  auto section = Section::list();
  section.take(record(0x7150, "000000 01"));
  const std::string before = section.text();
  section.take(record(0x7150, "000000"));
  EXPECT_EQ(section.text(), before);
  EXPECT_NE(before, "");
}

TEST(EquivalentPLMNList, LogsACodeThatItDidNotAskFor) {
  auto section = Section::list();
  section.take(record(0x7151, "000000 01"));
  EXPECT_THAT(section.surroundings.log.errors(),
              testing::ElementsAre("Received an unknown log message: 29009"));
}

}  // namespace
}  // namespace kelvasi
