// Records of every length and with every count field at its most, for the sanitizers to watch.
#include <gtest/gtest.h>

#include "LogGenerator/GSM/Orvane_GSMClassIndex.h"
#include "Tests/LogGenerator/SectionSweep.h"

namespace kelvasi {
namespace {

using Sweep = test::SectionSweep<Orvane_GSMClassIndex>;

const std::vector<test::SweptRecord> swept{
    {0x4005, 15}, {0x4031, 16}, {0x4116, 16}, {0x4125, 14}, {0x4127, 29}, {0x4157, 19},
    {0x4221, 18}, {0x5072, 20}, {0x5076, 17}, {0x512C, 17}, {0x5134, 26}, {0x5137, 29},
    {0x51F4, 15}, {0x51F5, 18}, {0x51F6, 24}, {0x51F8, 15}, {0x51FB, 34}, {0x51FD, 35},
    {0x7130, 16}, {0x7131, 16}, {0x7132, 16}, {0x7135, 32}, {0x7150, 17}};

TEST(GSMRecordSweep, RecordsShorterThanTheirMinimumChangeNothing) {
  for (const auto& each : swept) Sweep().expectNoChangeBelowMinimum(each);
  Sweep().expectNoChangeBelowMinimum({0x417A, 16});
  Sweep().expectNoChangeBelowMinimum({0x51FF, 15});
}

TEST(GSMRecordSweep, RecordsOfTheirMinimumShowRows) {
  for (const auto& each : swept) Sweep().expectChangeFromMinimumOn(each);
}

// Counts of 255 over records that end inside the first entries, inside later ones, and behind the last.
TEST(GSMRecordSweep, ListsAreReadWhereverTheRecordEnds) {
  for (const LogCode logCode : {0x4005U, 0x4031U, 0x4116U, 0x417AU, 0x4221U, 0x5137U, 0x51F8U, 0x51FFU, 0x7150U}) {
    Sweep sweep;
    sweep.bind(logCode);
    for (std::size_t length = 13; length <= 13 + 40; ++length) sweep.take(logCode, length, 0xFF);
    for (const std::size_t length : {300U, 2000U, 4000U, 16000U, 45000U}) sweep.take(logCode, length, 0xFF);
  }
}

// 31 cells, all of them of the active set, cut inside identities and energies.
TEST(GSMRecordSweep, AnActiveSetIsReadWhereverTheRecordEnds) {
  Sweep sweep;
  sweep.bind(0x417A);
  for (std::size_t length = 13; length < 16000; length += 997) sweep.take(0x417A, length, 0x1F);
  EXPECT_NE(sweep.shown(), "");
}

// Every record, whatever its length, without a display to write into.
TEST(GSMRecordSweep, UnboundSectionsTakeEveryRecord) {
  Sweep sweep;
  for (const auto& each : swept) {
    for (std::size_t length = 0; length <= each.minimumLength + 2; ++length) {
      sweep.take(each.logCode, length, 0xFF);
    }
  }
  sweep.take(0x417A, 16, 0xFF);
  EXPECT_EQ(sweep.shown(), "");
}

}  // namespace
}  // namespace kelvasi
