// SPDX-License-Identifier: Apache-2.0
// The records of the 1x air interface.
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

TEST(Fingers, ShowsEachFingerByPlaceAndOffsetAndSkipsUnassignedOnes) {
  C2KFixture fixture({"kFingerC2I"});
  fixture.take(record(0x108A,
                      "000000000000000000 03"
                      "0400 00000000 0002 000000000000"
                      "FFFF 00000000 0002 000000000000"
                      "0800 00000000 0004 000000000000"));
  EXPECT_EQ(fixture.text("kFingerC2I"), "_sorted=_sorted\n0;4=+0.00 dB\n2;8=+3.01 dB\n");
}

TEST(Fingers, ShowsNoneWhenAllAreSkippedOrThereIsNone) {
  C2KFixture fixture({"kFingerC2I"});
  fixture.take(record(0x108A, "000000000000000000 01 FFFF", 37));
  EXPECT_EQ(fixture.text("kFingerC2I"), "(none)");
  C2KFixture other({"kFingerC2I"});
  other.take(record(0x108A, "", 23));
  EXPECT_EQ(other.text("kFingerC2I"), "(none)");
}

TEST(Fingers, ItsLengthIsExact) {
  C2KFixture fixture({"kFingerC2I"});
  fixture.take(record(0x108A, "", 22));
  fixture.take(record(0x108A, "000000000000000000 01", 36));
  fixture.take(record(0x108A, "000000000000000000 01", 38));
  EXPECT_EQ(fixture.text("kFingerC2I"), "");
  EXPECT_THAT(fixture.errors(),
              ElementsAre("Log code 0x108a is 22 bytes long but must be at least 23 bytes.",
                          "Log code 0x108a has bad length of 36 bytes, but has 1 substructs (size=23).",
                          "Log code 0x108a has bad length of 38 bytes, but has 1 substructs (size=23)."));
}

TEST(Fingers, ARatioOfZeroPrintsMinusInfinity) {
  C2KFixture fixture({"kFingerC2I"});
  fixture.take(record(0x108A, "000000000000000000 01 0700", 37));
  EXPECT_EQ(fixture.text("kFingerC2I"), "_sorted=_sorted\n0;7=-inf dB\n");
}

// Four sub-packets: state, radio (bands 1 and 0, channels 25 and 50, AGC -63.248 and -20.832... raw 0 and
// 127, Tx 105), active set as given, and one of fingers.
Bytes deviceStatus(std::string_view state, const std::string& activeSet) {
  return record(0x119C,
                "00 04 0000"
                "01 00 0500 " +
                    std::string(state) + "02 00 0E00 01 00 1900 3200 00 7F 6900" + activeSet + "04 00 0400");
}

const std::string noPilots = "03 00 0C00 0100 01 02 00 00 0000";

C2KFixture deviceFixture() {
  return C2KFixture({"k1xDeviceState", "k1xRx0BandClass", "k1xRx0ChanNum", "k1xRxAGC0", "k1xRx1BandClass",
                     "k1xRx1ChanNum", "k1xRxAGC1", "k1xTxAGC", "k1xActiveSetInfo", "k1xTrafficFER"});
}

TEST(DeviceStatus, ShowsBothReceiversInTraffic) {
  auto fixture = deviceFixture();
  fixture.take(deviceStatus("08", noPilots));
  EXPECT_EQ(fixture.display(),
            "k1xDeviceState=Traffic [8]\n"
            "k1xRx0BandClass=1.8 to 2.0GHz PCS band [1]\n"
            "k1xRx0ChanNum=25\n"
            "k1xRxAGC0=-63.25 dBm\n"
            "k1xRx1BandClass=800 MHz cellular band [0]\n"
            "k1xRx1ChanNum=50\n"
            "k1xRxAGC1=-20.83 dBm\n"
            "k1xTxAGC=+10.50 dBm\n"
            "k1xActiveSetInfo=_sorted=_sorted\n\n"
            "k1xTrafficFER=\n");
}

TEST(DeviceStatus, OutsideTrafficTheSecondReceiverAndTheTransmitterAreNotAvailable) {
  auto fixture = deviceFixture();
  fixture.take(deviceStatus("06", noPilots));
  EXPECT_EQ(fixture.text("k1xDeviceState"), "Paging [6]");
  for (const char* name : {"k1xRx1BandClass", "k1xRx1ChanNum", "k1xRxAGC1", "k1xTxAGC"}) {
    EXPECT_EQ(fixture.text(name), "N/A") << name;
  }
}

// Rx 0 -128, Rx 1 -1 and Tx -105: -128 * 0.334 - 63.248, -0.334 - 63.248, -10.5.
TEST(DeviceStatus, PowersAreSigned) {
  auto fixture = deviceFixture();
  fixture.take(record(0x119C,
                      "00 04 0000 01 00 0500 08"
                      "02 00 0E00 00 00 0000 0000 80 FF 97FF" +
                          noPilots + "04 00 0400"));
  EXPECT_EQ(fixture.text("k1xRxAGC0"), "-106.00 dBm");
  EXPECT_EQ(fixture.text("k1xRxAGC1"), "-63.58 dBm");
  EXPECT_EQ(fixture.text("k1xTxAGC"), "-10.50 dBm");
}

TEST(DeviceStatus, HasATextForEachStateAndShowsTheValueItselfPastThem) {
  const char* texts[] = {"Inactive [0]",
                         "Deep sleep in start state [1]",
                         "Initial state for CDMA operation [2]",
                         "Acquisition [3]",
                         "Sync [4]",
                         "Slew [5]",
                         "Paging [6]",
                         "Slotted mode sleep state [7]",
                         "Traffic [8]",
                         "UnSlew [9]",
                         "Operation in PCG state [10]",
                         "Powerup state [11]",
                         "[Bad Value 12]"};
  const char* values[] = {"00", "01", "02", "03", "04", "05", "06", "07", "08", "09", "0A", "0B", "0C"};
  for (std::size_t value = 0; value < 13; ++value) {
    auto fixture = deviceFixture();
    fixture.take(deviceStatus(values[value], noPilots));
    EXPECT_EQ(fixture.text("k1xDeviceState"), texts[value]);
  }
}

// W = 1, G = 1, E = 2 (P = 2), K = 1: D = 9, R = 1; a pilot every 20 bytes, PN at 12 and energy at 28 of it.
// The first pilot record lies over the sub-packet's own header.
TEST(DeviceStatus, ComputesEcIoOfOverlappingPilotRecords) {
  auto fixture = deviceFixture();
  fixture.take(deviceStatus("06",
                            "03 00 3800 0100 01 02 02 01 0700"
                            "0700 0000 0000 0000 0000 0000 0000 0000 4200 0000"
                            "0900 0000 0000 0000 0000 0000 0000 0000 0600 0000 0000 0000"));
  EXPECT_EQ(fixture.text("k1xActiveSetInfo"), "_sorted=_sorted\n0;7=(ref pilot) +11.36 dB\n1;9=-4.77 dB\n");
}

TEST(DeviceStatus, EcIoHasAFloorOfMinus50Decibels) {
  auto fixture = deviceFixture();
  fixture.take(
      deviceStatus("06", "03 00 2000 0100 01 02 01 00 0100 0000 00000000000000000000 00000000 00000000"));
  EXPECT_EQ(fixture.text("k1xActiveSetInfo"), "_sorted=_sorted\n0;0=-50.00 dB\n");
}

TEST(DeviceStatus, AWindowOfZeroPrintsWhatPrintfPrints) {
  auto fixture = deviceFixture();
  fixture.take(
      deviceStatus("06", "03 00 2000 0000 01 02 01 00 0000 0000 00000000000000000000 0500 0000 0000 0000"));
  EXPECT_THAT(fixture.text("k1xActiveSetInfo"),
              testing::MatchesRegex("_sorted=_sorted\n0;0=\\(ref pilot\\) [-+]nan dB\n"));
}

// Without gain the divisor is 0: energy 5 gives infinity, energy 0 no number.
TEST(DeviceStatus, AGainOfZeroPrintsWhatPrintfPrints) {
  auto fixture = deviceFixture();
  fixture.take(
      deviceStatus("06", "03 00 2000 0100 00 02 01 00 0000 0000 00000000000000000000 0500 0000 0000 0000"));
  EXPECT_EQ(fixture.text("k1xActiveSetInfo"), "_sorted=_sorted\n0;0=(ref pilot) +inf dB\n");
  fixture.take(
      deviceStatus("06", "03 00 2000 0100 00 02 01 00 0000 0000 00000000000000000000 0000 0000 0000 0000"));
  EXPECT_THAT(fixture.text("k1xActiveSetInfo"),
              testing::MatchesRegex("_sorted=_sorted\n0;0=\\(ref pilot\\) [-+]nan dB\n"));
}

// W = 2, G = 4, E = 0: P = 1/8, D = 144, R = 1/2. K = 0: a pilot every 12 bytes, its energy 24 bytes in,
// which is the PN offset of the next one. 1152 / 8 / 144 - 1/2 = 1/2.
TEST(DeviceStatus, WithoutFingersPilotRecordsAre12BytesApart) {
  auto fixture = deviceFixture();
  fixture.take(
      deviceStatus("06",
                   "03 00 3200 0200 04 00 02 00 0000"
                   "0300 00000000000000000000 8004 00000000000000000000 8004 00000000000000000000 0000"));
  EXPECT_EQ(fixture.text("k1xActiveSetInfo"), "_sorted=_sorted\n0;3=-3.01 dB\n1;1152=-3.01 dB\n");
}

// K = 3: 33 rounded down to 32 bytes, the energy 36 bytes in; E = 3: P = 8. 8 * 45 / (9 * 4) - 1/2 = 9.5.
TEST(DeviceStatus, ThePilotStrideIsRoundedDownToFour) {
  auto fixture = deviceFixture();
  fixture.take(deviceStatus("06",
                            "03 00 4800 0200 01 03 02 03 0500"
                            "0300 0000 00000000 00000000 00000000 00000000 00000000"
                            "2D00 0000 00000000 0500 0000 00000000 00000000 00000000 00000000 00000000"
                            "2D00 0000"));
  EXPECT_EQ(fixture.text("k1xActiveSetInfo"), "_sorted=_sorted\n0;3=+9.78 dB\n1;5=(ref pilot) +9.78 dB\n");
}

// 2^(2 * 255 - 3) is a finite number.
TEST(DeviceStatus, TheLargestExponentIsNoInfinity) {
  auto fixture = deviceFixture();
  fixture.take(
      deviceStatus("06", "03 00 2000 0100 01 FF 01 00 0000 0000 00000000000000000000 0100 0000 0000 0000"));
  EXPECT_EQ(fixture.text("k1xActiveSetInfo"), "_sorted=_sorted\n0;0=(ref pilot) +1516.68 dB\n");
}

TEST(DeviceStatus, SubPacketSizesOfZeroAndOf65535LeaveTheRestMissing) {
  auto fixture = deviceFixture();
  fixture.take(record(0x119C, "00 04 0000 01 00 0000 02 00 0E00"));
  EXPECT_EQ(fixture.warnings().back(), "Log code 0x119c: missing subpacket (ss=1,rf=0,ai=0,fi=0).");
  EXPECT_THAT(fixture.errors(), IsEmpty());
  fixture.take(record(0x119C, "00 04 0000 01 00 0400 02 00 FFFF"));
  EXPECT_EQ(fixture.warnings().back(), "Log code 0x119c: missing subpacket (ss=1,rf=0,ai=0,fi=0).");
  EXPECT_EQ(fixture.errors(), std::vector<std::string>(3, "Log code error in subpkt#1: bad size (65535)."));
}

TEST(DeviceStatus, A255PilotListStaysInsideTheRecord) {
  auto fixture = deviceFixture();
  fixture.take(deviceStatus("06", "03 00 0C00 0100 01 02 FF FF 0000"));
  EXPECT_EQ(fixture.shown("k1xActiveSetInfo").dictionary()->size(), 256u);
}

TEST(DeviceStatus, NamesTheSubPacketsThatAreMissing) {
  auto fixture = deviceFixture();
  fixture.surroundings.log.clear();
  fixture.take(record(0x119C, "00 02 0000 01 00 0500 08 03 00 0C00 0000000000000000"));
  EXPECT_EQ(fixture.warnings().back(), "Log code 0x119c: missing subpacket (ss=1,rf=0,ai=1,fi=0).");
  EXPECT_THAT(fixture.errors(), IsEmpty());
  EXPECT_EQ(fixture.text("k1xDeviceState"), "");
}

TEST(DeviceStatus, WithoutSubPacketsAllAreMissing) {
  auto fixture = deviceFixture();
  fixture.take(record(0x119C, "", 17));
  EXPECT_EQ(fixture.warnings().back(), "Log code 0x119c: missing subpacket (ss=0,rf=0,ai=0,fi=0).");
}

TEST(DeviceStatus, NeedsAtLeast17Bytes) {
  auto fixture = deviceFixture();
  fixture.take(record(0x119C, "", 16));
  EXPECT_THAT(fixture.errors(),
              ElementsAre("Log code 0x119c is 16 bytes long but must be at least 17 bytes."));
}

TEST(SubPackets, ASubPacketThatEndsPastTheRecordStopsTheSearchBeforeItsIdIsLookedAt) {
  C2KFixture fixture({"k1xTrafficFER"});
  // 21 bytes: a sub-packet may end before 17 + 21; this one, from 17, ends there exactly.
  fixture.take(record(0x119D, "00 01 0000 0B 00 1500"));
  EXPECT_THAT(fixture.errors(), ElementsAre("Log code error in subpkt#0: bad size (21)."));
  fixture.take(record(0x119D, "00 01 0000 0B 00 1400"));
  EXPECT_EQ(fixture.errors().size(), 1u);
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "0.00%");
}

// The record ends at 21 bytes; the second sub-packet starts at 30, before 17 + 21, and reads as zeros; or the
// third one does.
TEST(SubPackets, ASubPacketThatStartsPastTheRecordReadsAsZeros) {
  C2KFixture fixture({"k1xTrafficFER"});
  fixture.take(record(0x119D, "00 02 0000 01 00 0D00"));
  EXPECT_THAT(fixture.errors(), IsEmpty());
  EXPECT_EQ(fixture.warnings().back(), "Log code 0x119d: missing traffic demod subpacket.");
  fixture.take(record(0x119D, "00 03 0000 01 00 1400"));
  EXPECT_THAT(fixture.errors(), IsEmpty());
  fixture.take(record(0x119D, "00 03 0000 01 00 0D00 0B 00 0400"));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "");
}

TEST(SubPackets, SizesOfZeroAndOf65535EndTheSearch) {
  C2KFixture fixture({"k1xTrafficFER"});
  fixture.take(record(0x119D, "00 FF 0000 01 00 0000"));
  EXPECT_THAT(fixture.errors(), IsEmpty());
  EXPECT_EQ(fixture.warnings().back(), "Log code 0x119d: missing traffic demod subpacket.");
  fixture.take(record(0x119D, "00 FF 0000 01 00 FFFF"));
  EXPECT_THAT(fixture.errors(), ElementsAre("Log code error in subpkt#0: bad size (65535)."));
}

TEST(SubPackets, ASizeOfZeroIsFoundWhenItsIdMatches) {
  C2KFixture fixture({"k1xTrafficFER"});
  fixture.take(with(record(0x119D, "00 01 0000 0B 00 0000", 42), 41, "01"));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "1.56%");
}

TEST(SubPackets, TheSearchEndsWithTheCount) {
  C2KFixture fixture({"k1xTrafficFER"});
  fixture.take(record(0x119D, "00 01 0000 01 00 0400 0B 00 0400"));
  EXPECT_EQ(fixture.warnings().back(), "Log code 0x119d: missing traffic demod subpacket.");
  fixture.take(record(0x119D, "00 02 0000 01 00 0400 0B 00 0400"));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "0.00%");
}

Bytes frame(bool isError) {
  return with(record(0x119D, "00 01 0000 0B 00 1900", 42), 41, isError ? "01" : "00");
}

TEST(TrafficFER, SixtyFourErrorsInARowGive63Point50Percent) {
  C2KFixture fixture({"k1xTrafficFER"});
  fixture.state.set("TrafficFER", 0.0);
  for (int count = 0; count < 64; ++count) fixture.take(frame(true));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "63.50%");
}

TEST(TrafficFER, IsAFirstOrderAverageOfWeightOneIn64) {
  C2KFixture fixture({"k1xTrafficFER"});
  fixture.take(frame(true));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "1.56%");
  fixture.take(frame(false));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "1.54%");
  EXPECT_EQ(*fixture.state.find("TrafficFER")->real(), 0.015380859375);
}

TEST(TrafficFER, IsComputedInSinglePrecision) {
  C2KFixture fixture({"k1xTrafficFER"});
  for (int count = 0; count < 5; ++count) fixture.take(frame(true));
  // In double precision it would be 0.07572144363075495.
  EXPECT_EQ(*fixture.state.find("TrafficFER")->real(), 0.07572144269943237);
}

// 9.8349995911 as a double of the stored rate; in single precision the product would be 9.835.
TEST(TrafficFER, TheStoredRatePrintsTheSameDuringTheCallAndAfterIt) {
  auto fixture = deviceFixture();
  for (const char each : std::string_view("10100101101100")) fixture.take(frame(each == '1'));
  EXPECT_EQ(*fixture.state.find("TrafficFER")->real(), 0.098349995911121368);
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "9.83%");
  fixture.take(deviceStatus("06", noPilots));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "9.83% (old)");
}

TEST(TrafficFER, AnIntegerInTheStateCountsAsARate) {
  auto fixture = deviceFixture();
  fixture.state.set("TrafficFER", 1);
  fixture.take(frame(false));
  EXPECT_EQ(*fixture.state.find("TrafficFER")->real(), 0.984375);
  fixture.state.set("TrafficFER", 1);
  fixture.take(deviceStatus("06", noPilots));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "100.00% (old)");
  EXPECT_EQ(fixture.state.find("TrafficFER"), nullptr);
}

TEST(TrafficFER, WhatIsNoNumberCountsAsNoRate) {
  auto fixture = deviceFixture();
  fixture.state.set("TrafficFER", "0.5");
  fixture.take(deviceStatus("06", noPilots));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "");
  fixture.take(frame(true));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "1.56%");
}

TEST(TrafficFER, IsShownOnceMoreAsOldWhenTheCallHasEnded) {
  auto fixture = deviceFixture();
  fixture.take(frame(true));
  fixture.take(deviceStatus("08", noPilots));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "1.56%");
  fixture.take(deviceStatus("06", noPilots));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "1.56% (old)");
  EXPECT_EQ(fixture.state.find("TrafficFER"), nullptr);
  fixture.take(frame(false));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "0.00%");
}

TEST(TrafficFER, ADeviceStatusThatIsNotWholeKeepsIt) {
  auto fixture = deviceFixture();
  fixture.take(frame(true));
  fixture.take(record(0x119C, "00 01 0000 01 00 0500 06"));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "1.56%");
  EXPECT_NE(fixture.state.find("TrafficFER"), nullptr);
}

// Too short, without sub-packets, and with one that claims to end past the record.
TEST(RefusedRecords, KeepEveryRowOf1x) {
  auto fixture = deviceFixture();
  fixture.take(deviceStatus("08", noPilots));
  fixture.take(frame(true));
  const std::string before = fixture.display();
  ASSERT_THAT(before, testing::Not(testing::HasSubstr("=\n")));
  for (const LogCode code : {0x119CU, 0x119DU}) {
    for (const Bytes& refused :
         {record(code, "", 16), record(code, "", 17), record(code, "00 04 0000 01 00 0500 06 02 00 FFFF"),
          record(code, "00 01 0000 01 00 0500 06", 200)}) {
      fixture.take(refused);
      EXPECT_EQ(fixture.display(), before) << code << " of " << refused.size();
    }
  }
  EXPECT_EQ(*fixture.state.find("TrafficFER")->real(), 0.015625);
}

TEST(TrafficFER, WithoutACallBeforeTheRowStays) {
  auto fixture = deviceFixture();
  fixture.take(deviceStatus("06", noPilots));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "");
}

TEST(TrafficFER, AnyNonZeroByteIsAnError) {
  C2KFixture fixture({"k1xTrafficFER"});
  fixture.take(with(frame(false), 41, "80"));
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "1.56%");
}

TEST(TrafficFER, NeedsAtLeast17BytesAndItsSubPacket) {
  C2KFixture fixture({"k1xTrafficFER"});
  fixture.take(record(0x119D, "", 16));
  EXPECT_THAT(fixture.errors(),
              ElementsAre("Log code 0x119d is 16 bytes long but must be at least 17 bytes."));
  fixture.take(record(0x119D, "", 17));
  EXPECT_EQ(fixture.warnings().back(), "Log code 0x119d: missing traffic demod subpacket.");
  EXPECT_EQ(fixture.text("k1xTrafficFER"), "");
}

C2KFixture systemFixture() {
  return C2KFixture(
      {"k1xRoamingHome", "kSystemId", "kNetworkId", "kPacketZoneId", "kBaseId", "kProtocolRevision"});
}

// Version 2, roaming as given, a CDMA system 4139 of network 7, packet zone 9, revision 6, base 513.
Bytes system(std::string_view roaming, std::size_t length = 186) {
  Bytes bytes = with(with(record(0x134F, "02", 186), 42, roaming), 46, "02000000 2B10 0700");
  bytes[131] = 9;
  bytes[133] = 6;
  bytes[184] = 1;
  bytes[185] = 2;
  bytes.resize(length);
  return bytes;
}

TEST(SystemParameters, ShowsTheIdentities) {
  auto fixture = systemFixture();
  fixture.take(system("00000000"));
  EXPECT_EQ(fixture.display(),
            "k1xRoamingHome=OFF [0]\n"
            "kSystemId=4139\n"
            "kNetworkId=7\n"
            "kPacketZoneId=9\n"
            "kBaseId=513\n"
            "kProtocolRevision=6\n");
}

TEST(SystemParameters, AnotherSystemTypeIsNamedInPlaceOfTheIdentities) {
  auto fixture = systemFixture();
  fixture.take(with(system("00000000"), 46, "FFFFFFFF"));
  EXPECT_EQ(fixture.text("kSystemId"), "(unknown system type -1)");
  EXPECT_EQ(fixture.text("kNetworkId"), "(unknown system type -1)");
}

TEST(SystemParameters, HasATextForEachRoamingIndicator) {
  const char* texts[] = {"OFF [0]",
                         "ON [1]",
                         "Flashing [2]",
                         "Out of Neighborhood [3]",
                         "Out of Building [4]",
                         "Preferred system [5]",
                         "Available system [6]",
                         "Alliance partner [7]",
                         "Premium partner [8]",
                         "Full service functionality [9]",
                         "Partial service functionality [10]",
                         "Banner ON [11]",
                         "Banner OFF [12]",
                         "ERI - 13"};
  for (std::uint8_t value = 0; value < 14; ++value) {
    auto fixture = systemFixture();
    Bytes bytes = system("00000000");
    bytes[42] = value;
    fixture.take(bytes);
    EXPECT_EQ(fixture.text("k1xRoamingHome"), texts[value]);
  }
}

TEST(SystemParameters, OtherRoamingIndicatorsShowTheirNumber) {
  auto fixture = systemFixture();
  fixture.take(system("40000000"));
  EXPECT_EQ(fixture.text("k1xRoamingHome"), "ERI - 64");
  fixture.take(system("FEFFFFFF"));
  EXPECT_EQ(fixture.text("k1xRoamingHome"), "ERI - -2");
}

TEST(SystemParameters, ABaseIdentityPastTheEndReadsAsZero) {
  auto fixture = systemFixture();
  fixture.take(system("00000000", 171));
  EXPECT_EQ(fixture.text("kBaseId"), "0");
  fixture.take(system("00000000", 185));
  EXPECT_EQ(fixture.text("kBaseId"), "1");
}

TEST(SystemParameters, NeedsAtLeast171BytesAndVersion2) {
  auto fixture = systemFixture();
  fixture.take(system("00000000", 170));
  fixture.take(with(system("00000000"), 13, "01"));
  EXPECT_EQ(fixture.text("kSystemId"), "");
  EXPECT_THAT(fixture.errors(),
              ElementsAre("Log code 0x134f is 170 bytes long but must be at least 171 bytes.",
                          "Log code 0x134f has version=1; only version 2 or higher expected; dropping."));
}

}  // namespace
}  // namespace kelvasi
