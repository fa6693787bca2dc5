// SPDX-License-Identifier: Apache-2.0
// Records of every length and with every count field at its most, for the sanitizers to watch.
#include <gtest/gtest.h>

#include "LogGenerator/Exceptions.h"
#include "LogGenerator/GSM/Orvane_GSMClassIndex.h"
#include "Tests/LogGenerator/SectionSweep.h"

namespace kelvasi {
namespace {

using Sweep = test::SectionSweep<Orvane_GSMClassIndex>;

const std::vector<test::SweptRecord> swept{
    {0x4005, 15},       {0x4031, 16}, {0x4116, 16}, {0x4125, 14}, {0x4127, 29}, {0x4157, 19},
    {0x417A, 16, 0x01}, {0x4221, 18}, {0x5072, 20}, {0x5076, 17}, {0x512C, 17}, {0x5134, 26},
    {0x5137, 29},       {0x51F4, 15}, {0x51F5, 18}, {0x51F6, 24}, {0x51F8, 15}, {0x51FB, 34},
    {0x51FD, 35},       {0x7130, 16}, {0x7131, 16}, {0x7132, 16}, {0x7135, 32}, {0x7150, 17}};

TEST(GSMRecordSweep, RecordsShorterThanTheirMinimumChangeNothing) {
  for (const auto& each : swept) Sweep().expectNoChangeBelowMinimum(each);
}

TEST(GSMRecordSweep, RecordsOfTheirMinimumShowRows) {
  for (const auto& each : swept) Sweep().expectChangeFromMinimumOn(each);
}

// Its entries are past the end, so its one code is 0 for ARFCN 0, and the neighbours' ARFCNs are 0 as well.
TEST(GSMRecordSweep, ABsicListOfItsMinimumIsKeptForTheNextMeasurements) {
  for (std::size_t length = 0; length <= 17; ++length) {
    Sweep sweep;
    sweep.bind(0x5137);
    sweep.take(0x51FF, length, 0xFF);
    sweep.take(0x5137, 29, 0xFF);
    EXPECT_EQ(sweep.shown().find("BSIC=0\n") != std::string::npos, length >= 15) << length;
  }
}

// What is no property list shows nothing; lists let go of the cells of before.
TEST(GSMRecordSweep, PropertyListRecordsOfEveryLengthAreTaken) {
  for (const LogCode logCode : {0xFF0001U, 0xFF0002U}) {
    Sweep sweep;
    sweep.bind(logCode);
    for (std::size_t length = 0; length <= 15; ++length) sweep.take(logCode, length, 0xFF);
    EXPECT_EQ(sweep.shown(), "") << logCode;
  }
  Sweep sweep;
  sweep.bind(0xFF0000);
  for (std::size_t length = 0; length <= 15; ++length) {
    EXPECT_THROW(sweep.take(0xFF0000, length, 0xFF), LogCode_0xFF000020::UnknownDataException) << length;
  }
}

// Counts of 255 over records that end inside the first entries, inside later ones, and behind the last.
TEST(GSMRecordSweep, ListsAreReadWhereverTheRecordEnds) {
  for (const LogCode logCode : {0x4005U, 0x4031U, 0x4116U, 0x4221U, 0x5137U, 0x51F8U, 0x7150U}) {
    Sweep().takeEveryCut(logCode);
  }
}

// 31 cells, all of them of the active set, cut inside every identity and every energy.
TEST(GSMRecordSweep, AnActiveSetIsReadWhereverTheRecordEnds) {
  Sweep sweep;
  sweep.bind(0x417A);
  for (std::size_t length = 13; length <= 16 + 31 * (15 + 44) + 2; length += 7)
    sweep.take(0x417A, length, 0x1F);
  EXPECT_NE(sweep.shown(), "");
}

// Without a display to write into; with one, the decoders then show rows as ever.
TEST(GSMRecordSweep, UnboundSectionsTakeEveryRecord) {
  for (const auto& each : swept) {
    Sweep sweep;
    for (std::size_t length = 0; length <= each.minimumLength + 2; ++length) {
      sweep.take(each.logCode, length, 0xFF);
    }
    sweep.expectChangeFromMinimumOn(each);
  }
}

}  // namespace
}  // namespace kelvasi
