// SPDX-License-Identifier: Apache-2.0
// Records of every length and with every count field at its most, for the sanitizers to watch.
#include <gtest/gtest.h>

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Tests/LogGenerator/SectionSweep.h"

namespace kelvasi {
namespace {

using test::SectionSweep;

const std::vector<test::SweptRecord> swept{{0xD0E2, 26}, {0xD00A, 21}, {0xD00C, 17}};

TEST(UTRANRecordSweep, RecordsShorterThanTheirMinimumChangeNothing) {
  for (const auto& each : swept) SectionSweep<UTRANClassIndex>().expectNoChangeBelowMinimum(each);
}

TEST(UTRANRecordSweep, RecordsOfTheirMinimumShowRows) {
  for (const auto& each : swept) SectionSweep<UTRANClassIndex>().expectChangeFromMinimumOn(each);
}

TEST(UTRANRecordSweep, EveryCutOfAFullRecordIsRead) {
  for (const auto& each : swept) SectionSweep<UTRANClassIndex>().takeEveryCut(each.logCode);
}

TEST(UTRANRecordSweep, RecordsThatShowARowAlwaysOrNeverAreRead) {
  SectionSweep<UTRANClassIndex>().takeEveryCut(0xD0E0);
  SectionSweep<UTRANClassIndex> gsm;
  for (std::size_t length = 0; length <= 400; ++length) gsm.take(0xD00E, length, 0xFF);
  EXPECT_EQ(gsm.shown(), "");
}

}  // namespace
}  // namespace kelvasi
