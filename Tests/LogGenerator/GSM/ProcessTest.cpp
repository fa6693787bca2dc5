// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include "LogGenerator/GSM/GSMTables.h"
#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using test::SectionFixture;

TEST(ProcessCS, ShowsStateSubStateAndRejectCauseInThisOrder) {
  auto section = SectionFixture<ProcessCS>::rows();
  section.take(record(0x7131, "13 08 02"));
  EXPECT_EQ(section.text(),
            "MM State=MM_IDLE\n"
            "MM Sub State=MM_NORMAL_SERVICE\n"
            "LU Reject Cause=ROAMING_NOT_ALLOWED\n");
}

TEST(ProcessCS, WritesItsTraceAtEveryUpdate) {
  auto section = SectionFixture<ProcessCS>::rows();
  section.surroundings.log.clear();
  section.take(record(0x7131, "13 08 02"));
  section.take(record(0x7132, "01", 16));
  section.take(record(0x7131, "13 08"));
  EXPECT_EQ(section.surroundings.log.warnings(), std::vector<std::string>(3, "ProcessCS"));
}

TEST(ProcessCS, IgnoresAStateRecordOf15Bytes) {
  auto section = SectionFixture<ProcessCS>::rows();
  section.take(record(0x7131, "13 08"));
  EXPECT_EQ(section.text(), "");
}

TEST(ProcessCS, ShowsUnknownPastEachTable) {
  auto section = SectionFixture<ProcessCS>::rows();
  section.take(record(0x7131, "1A 09 04"));
  EXPECT_EQ(section.text(), "MM State=Unknown\nMM Sub State=Unknown\nLU Reject Cause=Unknown\n");
}

TEST(ProcessCO, ShowsUnknownForTheGapsInsideTheTableAsPastItsEnd) {
  for (const char* state : {"01", "02", "04", "0B", "0C", "10", "18", "1A", "FF"}) {
    auto section = SectionFixture<ProcessCO>::rows();
    section.take(record(0x7131, state, 16));
    EXPECT_EQ(section.text(), "MM State=Unknown\n") << state;
  }
}

TEST(ProcessCO, KeepsTheBlankInsideTwoOfTheTexts) {
  auto section = SectionFixture<ProcessCO>::rows();
  section.take(record(0x7131, "14", 16));
  EXPECT_EQ(section.text(), "MM State=MM_WAIT_FOR_ADDITIONAL_OUTGOING_MM_ CONNECTION\n");
  section.take(record(0x7131, "15", 16));
  EXPECT_EQ(section.text(), "MM State=MM_WAIT_FOR_RR_CONNECTION_ REESTABLISHMENT\n");
}

TEST(ProcessCO, WritesTheTraceOfProcessCS) {
  auto section = SectionFixture<ProcessCO>::rows();
  section.surroundings.log.clear();
  section.take(record(0x7131, "00", 16));
  EXPECT_EQ(section.surroundings.log.warnings(), std::vector<std::string>{"ProcessCS"});
}

TEST(ProcessPS, ShowsTheGmmStateUnderTheNamesOfTheMmRows) {
  auto section = SectionFixture<ProcessPS>::rows();
  section.take(record(0x7130, "03 09 01"));
  EXPECT_EQ(section.text(),
            "MM State=GMM_REGISTERED\n"
            "MM Sub State=GMM_ATTEMPING_TO_UPDATE\n"
            "Attach Reject Cause=GMM_GU2_NOT_UPDATED\n");
}

TEST(ProcessPS, IgnoresAStateRecordOf15Bytes) {
  auto section = SectionFixture<ProcessPS>::rows();
  section.take(record(0x7130, "03 09"));
  EXPECT_EQ(section.text(), "");
}

TEST(ProcessPS, WritesItsTrace) {
  auto section = SectionFixture<ProcessPS>::rows();
  section.surroundings.log.clear();
  section.take(record(0x7130, "03 09 01"));
  EXPECT_EQ(section.surroundings.log.warnings(), std::vector<std::string>{"ProcessPS"});
}

TEST(ProcessPS, KeepsRowsThatARecordDoesNotCarry) {
  auto section = SectionFixture<ProcessPS>::rows();
  section.take(record(0x7132, "06 00 00"));
  section.take(record(0x7130, "07 0D 04"));
  EXPECT_EQ(section.text(),
            "MM Service State=REG_STATE_OFFLINE\n"
            "MM State=Unknown\n"
            "MM Sub State=Unknown\n"
            "Attach Reject Cause=Unknown\n");
}

TEST(ProcessPS, LogsACodeThatItDidNotAskFor) {
  auto section = SectionFixture<ProcessPS>::rows();
  section.take(record(0x7131, "00 00 00"));
  EXPECT_EQ(section.text(), "");
  EXPECT_EQ(section.surroundings.log.errors(),
            std::vector<std::string>{"Received an unknown log message: 28977"});
}

}  // namespace
}  // namespace kelvasi
