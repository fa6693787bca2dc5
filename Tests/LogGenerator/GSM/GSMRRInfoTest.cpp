// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/SectionTest.h"

namespace kelvasi {
namespace {

using test::record;
using Section = test::SectionFixture<GSMRRInfo>;

std::string shown(LogCode logCode, std::string_view payload, std::size_t length) {
  auto section = Section::rows();
  section.take(record(logCode, payload, length));
  return section.text();
}

TEST(GSMRRInfo, ShowsTheStateInThisOrder) {
  EXPECT_EQ(shown(0x512C, "09 FF 80 02", 17),
            "RR State=RR_DATA_TRANSFER\nRR Sub State=255\nRR Status=128\nRR Mode=Data\n");
  EXPECT_EQ(shown(0x512C, "00 00 00 00", 17),
            "RR State=RR_INACTIVE\nRR Sub State=0\nRR Status=0\nRR Mode=Voice\n");
  EXPECT_EQ(shown(0x512C, "00 00 00", 16), "");
}

TEST(GSMRRInfo, StatesEndAt21AndKeepTheirBlanks) {
  const char* states[] = {"RR_INACTIVE",
                          "RR_GOING_ACTIVE",
                          "RR_GOING_INACTIVE",
                          "RR_CELL_SELECTION",
                          "RR_PLMN_LIST_CONSTRUCTION",
                          "RR_IDLE",
                          "RR_CELL_RESELECTION",
                          "RR_CONNECTION_PENDING",
                          "RR_CHOOSE_CELL",
                          "RR_DATA_TRANSFER",
                          "RR_NO_CHANNELS",
                          "RR_CONNECTION_RELEASE",
                          "RR_EARLY_CAMPED_WAIT_FOR_SI",
                          "RR_W2G_INTERRAT_HANDOVER_ PROGRESS",
                          "RR_W2G_INTERRAT_RESELECTION_PROGRESS",
                          "RR_WAIT_FOR_EARLY_PSCAN",
                          "GRR51",
                          "GRR52",
                          "RR_G2W_INTERRAT_RESELECTION_PROGRESS",
                          "RR_G2W_INTERRAT_HANDOVER_ PROGRESS",
                          "RR_CELL_REEST",
                          "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS",
                          "Unknown",
                          "Unknown"};
  for (std::size_t state = 0; state < std::size(states); ++state) {
    Bytes bytes = record(0x512C, "", 17);
    bytes[13] = static_cast<std::uint8_t>(state);
    auto section = Section::rows();
    section.take(bytes);
    EXPECT_THAT(section.text(), testing::StartsWith(std::string("RR State=") + states[state] + "\n"));
  }
  EXPECT_THAT(shown(0x512C, "FF", 17), testing::StartsWith("RR State=Unknown\n"));
}

TEST(GSMRRInfo, ReceiveQualitiesAreWholeWords) {
  EXPECT_EQ(shown(0x5137, "0000 FF 45230100 FEFFFFFF", 29),
            "Serving Rx Level=255\nRx Quality Full=74565\nRx Quality Sub=-2\n");
  EXPECT_EQ(shown(0x5137, "0000 FF 45230100 FEFFFFFF", 28), "");
}

TEST(GSMRRInfo, ShowsWhetherDtxIsUsed) {
  EXPECT_EQ(shown(0x5072, "000000000000 01", 20), "DTX Used=ON\n");
  EXPECT_EQ(shown(0x5072, "FFFFFFFFFFFF 00", 20), "DTX Used=OFF\n");
  EXPECT_EQ(shown(0x5072, "000000000000", 19), "");
}

TEST(GSMRRInfo, ShowsTheDrxTimerInSeconds) {
  EXPECT_EQ(shown(0x51F6, "0000 00 C8", 24), "DRX Used=200 sec\n");
  EXPECT_EQ(shown(0x51F6, "0000 00 C8", 23), "");
}

TEST(GSMRRInfo, RowsThatARecordDoesNotCarryStay) {
  auto section = Section::rows();
  section.take(record(0x5072, "000000000000 01", 20));
  section.take(record(0x51F6, "0000 00 02", 24));
  EXPECT_EQ(section.text(), "DTX Used=ON\nDRX Used=2 sec\n");
}

}  // namespace
}  // namespace kelvasi
