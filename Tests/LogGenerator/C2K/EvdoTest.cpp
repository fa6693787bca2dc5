// SPDX-License-Identifier: Apache-2.0
// The EV-DO records.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/LogGenerator/C2K/C2KFixture.h"

namespace kelvasi {
namespace {

using test::C2KFixture;
using test::record;
using test::with;
using testing::ElementsAre;
using testing::IsEmpty;

constexpr auto statusNames = {"kChannel", "k1xEVDODeviceState", "kBandClass",    "kRxAGC0", "kRxAGC1",
                              "kTxAGC",   "kServingPNOffset",   "kSessionState", "kUATI24", "kColorCode"};

C2KFixture statusFixture() {
  return C2KFixture({"kChannel", "k1xEVDODeviceState", "kBandClass", "kRxAGC0", "kRxAGC1", "kTxAGC",
                     "kServingPNOffset", "kSessionState", "kUATI24", "kColorCode"});
}

// Channel 0x312, band class 1, AGC -70, -128 and +5 dBm, PN 100, the states given, UATI 0x030201, color 7.
Bytes status(std::string_view states) {
  return with(with(record(0x1183, "12 0B BA 80 05 64 00", 50), 36, states), 38, "01 02 03 07");
}

TEST(EvdoStatus, ShowsEveryFieldWhenConnected) {
  auto fixture = statusFixture();
  fixture.take(status("05 04"));
  EXPECT_EQ(fixture.display(),
            "kChannel=786\n"
            "k1xEVDODeviceState=Connected [5]\n"
            "kBandClass=1.8 to 2.0GHz PCS band [1]\n"
            "kRxAGC0=-70 dBm\n"
            "kRxAGC1=-128 dBm\n"
            "kTxAGC=+5 dBm\n"
            "kServingPNOffset=100 × 64chips\n"
            "kSessionState=Open [4]\n"
            "kUATI24=0x030201\n"
            "kColorCode=7\n");
}

TEST(EvdoStatus, BelowAccessOnlyTheFirstReceiverHasAPower) {
  auto fixture = statusFixture();
  fixture.take(status("03 00"));
  EXPECT_EQ(fixture.text("kRxAGC0"), "-70 dBm");
  EXPECT_EQ(fixture.text("kRxAGC1"), "N/A");
  EXPECT_EQ(fixture.text("kTxAGC"), "N/A");
  fixture.take(status("04 00"));
  EXPECT_EQ(fixture.text("kRxAGC1"), "-128 dBm");
  EXPECT_EQ(fixture.text("kTxAGC"), "+5 dBm");
}

TEST(EvdoStatus, ThePilot65535IsInvalid) {
  auto fixture = statusFixture();
  fixture.take(with(status("05 04"), 18, "FFFF"));
  EXPECT_EQ(fixture.text("kServingPNOffset"), "Invalid Value");
}

TEST(EvdoStatus, ShowsTheValueItselfPastEachTable) {
  auto fixture = statusFixture();
  fixture.take(with(status("06 05"), 14, "68"));
  EXPECT_EQ(fixture.text("k1xEVDODeviceState"), "[Reserved 6]");
  EXPECT_EQ(fixture.text("kSessionState"), "[Reserved 5]");
  EXPECT_EQ(fixture.text("kBandClass"), "[Bad Value 13]");
}

TEST(EvdoStatus, HasATextForEachStateAndBand) {
  const char* devices[] = {"Inactive [0]", "Acquisition [1]", "Sync [2]",
                           "Idle [3]",     "Access [4]",      "Connected [5]"};
  const char* sessions[] = {"Closed [0]", "AMP setup [1]", "AT-initiated neg [2]", "Initiated neg [3]",
                            "Open [4]"};
  const char* bands[] = {"800 MHz cellular band [0]",
                         "1.8 to 2.0GHz PCS band [1]",
                         "872 to 960MHz TACS band [2]",
                         "832 to 925MHz JTACS band [3]",
                         "1.75 to 1.87GHz Korean PCS band [4]",
                         "450MHz band [5]",
                         "2GHz band [6]",
                         "700MHz band [7]",
                         "1800 MHz band [8]",
                         "900 MHzband [9]",
                         "Secondary 800 MHz band [10]",
                         "400 MHz European PAMR band [11]",
                         "800 MHz European PAMR band [12]"};
  for (std::uint8_t value = 0; value < 13; ++value) {
    auto fixture = statusFixture();
    Bytes bytes = status("00 00");
    bytes[14] = static_cast<std::uint8_t>(value << 3);
    bytes[36] = value;
    bytes[37] = value;
    fixture.take(bytes);
    EXPECT_EQ(fixture.text("kBandClass"), bands[value]);
    if (value < 6) {
      EXPECT_EQ(fixture.text("k1xEVDODeviceState"), devices[value]);
    }
    if (value < 5) {
      EXPECT_EQ(fixture.text("kSessionState"), sessions[value]);
    }
  }
}

TEST(EvdoStatus, IsExactly50Bytes) {
  auto fixture = statusFixture();
  fixture.take(record(0x1183, "", 49));
  fixture.take(record(0x1183, "", 51));
  for (const char* name : statusNames) EXPECT_EQ(fixture.text(name), "") << name;
  EXPECT_THAT(fixture.errors(), ElementsAre("Log code 0x1183 is 49 bytes long but should be 50 bytes.",
                                            "Log code 0x1183 is 51 bytes long but should be 50 bytes."));
}

TEST(EvdoActiveSet, ShowsEachPilotByPlaceAndOffset) {
  C2KFixture fixture({"kActiveSetPilots"});
  // PN 300 at 512/512, PN 12 at 256/512.
  fixture.take(
      record(0x12B6, "0000 02 00000000 0000000000 2C01 0002 0000000000000000 0C00 0001 0000000000000000"));
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "_sorted=_sorted\n0;300=+0.00 dB\n1;12=-3.01 dB\n");
}

TEST(EvdoActiveSet, AListThatSomebodyHoldsStaysAsItIs) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.take(record(0x12B6, "0000 01 00000000 0000000000 2C01 0002", 37));
  const PlistValue held = fixture.shown("kActiveSetPilots");
  fixture.take(record(0x12B6, "0000 01 00000000 0000000000 0C00 0001", 37));
  EXPECT_EQ(test::asText(held), "_sorted=_sorted\n0;300=+0.00 dB\n");
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "_sorted=_sorted\n0;12=-3.01 dB\n");
}

TEST(EvdoActiveSet, WithoutPilotsShowsNone) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.take(record(0x12B6, "", 25));
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "(none)");
}

TEST(EvdoActiveSet, AStrengthOfZeroPrintsMinusInfinity) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.take(record(0x12B6, "0000 01", 37));
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "_sorted=_sorted\n0;0=-inf dB\n");
}

TEST(EvdoActiveSet, ChecksItsLengthTwice) {
  C2KFixture fixture({"kActiveSetPilots"});
  fixture.take(record(0x12B6, "", 24));
  fixture.take(record(0x12B6, "0000 02", 48));
  EXPECT_EQ(fixture.text("kActiveSetPilots"), "");
  EXPECT_THAT(fixture.errors(), ElementsAre("Log code 0x12b6 is 24 bytes long but must be at least 25 bytes.",
                                            "Log code 0x12b6 is 48 bytes long, but has 2 substructs."));
  fixture.take(record(0x12B6, "0000 02", 49));
  fixture.take(record(0x12B6, "0000 02", 60));
  EXPECT_EQ(fixture.errors().size(), 2u);
}

Bytes forwardRate(std::string_view sequence, std::size_t counter = 0, std::string_view count = "00000000") {
  return with(with(record(0x1192, "", 241), 13, sequence), 17 + 4 * counter, count);
}

TEST(EvdoForwardRate, TheFirstRecordOnlyPrimes) {
  C2KFixture fixture({"kFLDataRate"});
  fixture.take(forwardRate("05000000", 0, "01000000"));
  EXPECT_EQ(fixture.text("kFLDataRate"), "");
  EXPECT_EQ(fixture.extraInfo("FLDataSeqNum1"), PlistValue(5));
  EXPECT_EQ(fixture.extraInfo("FLDataSent1"), PlistValue(128));
  EXPECT_TRUE(fixture.extraInfo("FLDataSeqNum2").isAbsent());
}

TEST(EvdoForwardRate, TheSecondShowsTheRateAndBothReadings) {
  C2KFixture fixture({"kFLDataRate"});
  fixture.take(forwardRate("05000000"));
  fixture.take(forwardRate("07000000", 3, "03000000"));  // 3 packets of 1024 bits in 2 steps
  EXPECT_EQ(fixture.text("kFLDataRate"), "1.50 kbps");
  EXPECT_EQ(fixture.extraInfo("FLDataSeqNum1"), PlistValue(7));
  EXPECT_EQ(fixture.extraInfo("FLDataSent1"), PlistValue(3072));
  EXPECT_EQ(fixture.extraInfo("FLDataSeqNum2"), PlistValue(5));
  EXPECT_EQ(fixture.extraInfo("FLDataSent2"), PlistValue(0));
}

TEST(EvdoForwardRate, AnEqualOrSmallerSequenceUpdatesTheCountersButNotTheRate) {
  C2KFixture fixture({"kFLDataRate"});
  fixture.take(forwardRate("05000000"));
  fixture.take(forwardRate("07000000", 3, "03000000"));
  fixture.take(forwardRate("07000000", 3, "04000000"));
  EXPECT_EQ(fixture.text("kFLDataRate"), "1.50 kbps");
  EXPECT_EQ(fixture.extraInfo("FLDataSent1"), PlistValue(4096));
  EXPECT_EQ(fixture.extraInfo("FLDataSent2"), PlistValue(3072));
  fixture.take(forwardRate("01000000", 3, "05000000"));
  EXPECT_EQ(fixture.text("kFLDataRate"), "1.50 kbps");
  EXPECT_EQ(fixture.extraInfo("FLDataSeqNum1"), PlistValue(1));
  EXPECT_EQ(fixture.extraInfo("FLDataSeqNum2"), PlistValue(7));
}

TEST(EvdoForwardRate, PrimesAnewUnlessBothReadingsAreThere) {
  for (const char* lost : {"FLDataSeqNum", "FLDataSent"}) {
    C2KFixture fixture({"kFLDataRate"});
    fixture.take(forwardRate("05000000"));
    fixture.take(forwardRate("07000000", 3, "03000000"));
    fixture.state.remove(lost);
    fixture.take(forwardRate("09000000", 3, "03000000"));
    EXPECT_EQ(fixture.text("kFLDataRate"), "") << lost;
    EXPECT_EQ(fixture.extraInfo("FLDataSeqNum1"), PlistValue(9)) << lost;
    EXPECT_EQ(fixture.extraInfo("FLDataSeqNum2"), PlistValue(5)) << lost;
  }
}

TEST(EvdoForwardRate, CountersThatWereClearedGiveANegativeRate) {
  C2KFixture fixture({"kFLDataRate"});
  fixture.take(forwardRate("05000000", 3, "02000000"));
  fixture.take(forwardRate("06000000"));
  EXPECT_EQ(fixture.text("kFLDataRate"), "-2.00 kbps");
}

// 0x80000001 - 1 is the most negative difference, 0x7FFFFFFF the largest.
TEST(EvdoForwardRate, ADifferenceIsSigned) {
  C2KFixture fixture({"kFLDataRate"});
  fixture.take(forwardRate("01000000"));
  fixture.take(forwardRate("01000080", 52, "FFFFFFFF"));
  EXPECT_EQ(fixture.text("kFLDataRate"), "");
  fixture.take(forwardRate("00000000"));
  EXPECT_EQ(fixture.text("kFLDataRate"), "-10.00 kbps");
}

TEST(EvdoForwardRate, TheSequenceMayWrapForwards) {
  C2KFixture fixture({"kFLDataRate"});
  fixture.take(forwardRate("FFFFFFFF"));
  fixture.take(forwardRate("01000000", 3, "02000000"));
  EXPECT_EQ(fixture.text("kFLDataRate"), "1.00 kbps");
}

TEST(EvdoForwardRate, CountsIn64Bits) {
  C2KFixture fixture({"kFLDataRate"});
  fixture.take(forwardRate("00000000"));
  fixture.take(forwardRate("01000000", 52, "FFFFFFFF"));  // 4294967295 packets of 5120 bits
  EXPECT_EQ(fixture.extraInfo("FLDataSent1"), PlistValue(21990232550400));
  EXPECT_EQ(fixture.text("kFLDataRate"), "21474836475.00 kbps");
}

TEST(EvdoForwardRate, WeighsEachOfThe56Counters) {
  const int weights[] = {128,  256,  512, 1024, 0,    128,  256,  512,  1024, 0,    128,  256,  512,  1024,
                         0,    128,  256, 512,  1024, 0,    128,  256,  512,  1024, 0,    512,  1024, 2048,
                         0,    128,  256, 512,  1024, 0,    512,  1024, 2048, 0,    1024, 3072, 0,    512,
                         1024, 2048, 0,   4096, 0,    1024, 3072, 0,    4096, 0,    5120, 0,    5120, 0};
  for (std::size_t counter = 0; counter < 56; ++counter) {
    C2KFixture fixture({"kFLDataRate"});
    fixture.take(forwardRate("00000000", counter, "01000000"));
    EXPECT_EQ(fixture.extraInfo("FLDataSent1"), PlistValue(weights[counter])) << counter;
  }
}

TEST(EvdoForwardRate, NeedsAtLeast241Bytes) {
  C2KFixture fixture({"kFLDataRate"});
  fixture.take(record(0x1192, "", 240));
  EXPECT_THAT(fixture.errors(),
              ElementsAre("Log code 0x1192 is 240 bytes long but must be at least 241 bytes."));
  EXPECT_EQ(fixture.state.find("FLDataSeqNum"), nullptr);
  fixture.take(record(0x1192, "", 300));
  EXPECT_NE(fixture.state.find("FLDataSeqNum"), nullptr);
}

TEST(EvdoForwardRate, WithoutADisplayTheExtraInformationGoesNowhere) {
  C2KFixture fixture({});
  fixture.surroundings.resources.files.clear();
  fixture.take(forwardRate("05000000"));
  EXPECT_EQ(fixture.state.find("ExtraInfo"), nullptr);
  EXPECT_EQ(fixture.state.get("FLDataSeqNum"), PlistValue(5));
}

TEST(EvdoReverseRate, AddsUpItsCounters) {
  C2KFixture fixture({"kRLDataRate"});
  const Bytes first = record(0x127E, "", 1750);
  fixture.take(first);
  // The last counter of the last rate: 18 + 2 * 576 + 288 + 11 * 24 + 3 * 4.
  fixture.take(with(with(first, 14, "02000000"), 1734, "01000000"));
  EXPECT_EQ(fixture.text("kRLDataRate"), "6.00 kbps");
  EXPECT_EQ(fixture.extraInfo("RLDataSeqNum1"), PlistValue(2));
  EXPECT_EQ(fixture.extraInfo("RLDataSent1"), PlistValue(12288));
  EXPECT_EQ(fixture.extraInfo("RLDataSeqNum2"), PlistValue(0));
  EXPECT_EQ(fixture.extraInfo("RLDataSent2"), PlistValue(0));
}

TEST(EvdoReverseRate, WeighsEveryCounterByItsRate) {
  const int weights[] = {128, 256, 512, 768, 1024, 1536, 2048, 3072, 4096, 6144, 8192, 12288};
  std::size_t at = 18;
  for (int half = 0; half < 6; ++half) {
    for (const int weight : weights) {
      for (int counter = 0; counter < 6; ++counter, at += 4) {
        C2KFixture fixture({});
        fixture.take(with(record(0x127E, "", 1750), at, "01000000"));
        EXPECT_EQ(fixture.extraInfo("RLDataSent1"), PlistValue(counter < 4 ? weight : 0)) << at;
      }
    }
  }
}

TEST(EvdoReverseRate, TheFirstRecordPrimesAndAnEqualSequenceKeepsTheRate) {
  C2KFixture fixture({"kRLDataRate"});
  const Bytes first = with(record(0x127E, "", 1750), 14, "05000000");
  fixture.take(first);
  EXPECT_EQ(fixture.text("kRLDataRate"), "");
  EXPECT_TRUE(fixture.extraInfo("RLDataSeqNum2").isAbsent());
  fixture.take(with(with(first, 14, "06000000"), 18, "08000000"));  // 8 packets of 128 bits
  EXPECT_EQ(fixture.text("kRLDataRate"), "1.00 kbps");
  fixture.take(with(with(first, 14, "06000000"), 18, "10000000"));
  EXPECT_EQ(fixture.text("kRLDataRate"), "1.00 kbps");
  EXPECT_EQ(fixture.extraInfo("RLDataSent1"), PlistValue(2048));
  EXPECT_EQ(fixture.extraInfo("RLDataSent2"), PlistValue(1024));
  EXPECT_EQ(fixture.state.get("RLDataSent"), PlistValue(2048));
}

// Of every entry of the history, the extra information as its keys and numbers.
std::vector<std::string> extraInfoOfHistory(C2KFixture& fixture) {
  std::vector<std::string> texts;
  for (const PlistValue& entry : *fixture.state.find("History")->array()) {
    std::string text;
    for (const auto& [key, value] : *entry.dictionary()->get("ExtraInfo").dictionary())
      text += key + "=" + std::to_string(*value.integer()) + " ";
    texts.push_back(text);
  }
  return texts;
}

TEST(EvdoRates, TheHistoryKeepsBothReadingsOfEachTick) {
  C2KFixture fixture({});
  fixture.take(forwardRate("05000000", 3, "01000000"));
  fixture.take(with(record(0x127E, "", 1750), 14, "0A000000 02000000"));
  fixture.generator.generateLogUsingState(fixture.state);
  fixture.take(forwardRate("07000000", 3, "03000000"));
  fixture.take(with(record(0x127E, "", 1750), 14, "0B000000 06000000"));
  fixture.generator.generateLogUsingState(fixture.state);
  EXPECT_THAT(extraInfoOfHistory(fixture),
              ElementsAre("FLDataSeqNum1=5 FLDataSent1=1024 RLDataSeqNum1=10 RLDataSent1=256 ",
                          "FLDataSeqNum1=7 FLDataSent1=3072 RLDataSeqNum1=11 RLDataSent1=768 "
                          "FLDataSeqNum2=5 FLDataSent2=1024 RLDataSeqNum2=10 RLDataSent2=256 "));
}

TEST(EvdoReverseRate, NeedsAtLeast1750Bytes) {
  C2KFixture fixture({"kRLDataRate"});
  fixture.take(record(0x127E, "", 1749));
  EXPECT_THAT(fixture.errors(),
              ElementsAre("Log code 0x127e is 1749 bytes long but must be at least 1750 bytes."));
}

}  // namespace
}  // namespace kelvasi
