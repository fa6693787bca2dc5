// SPDX-License-Identifier: Apache-2.0
// Records of every length and with every count field at its most, for the sanitizers to watch.
#include <gtest/gtest.h>

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "Tests/LogGenerator/SectionSweep.h"

namespace kelvasi {
namespace {

using test::SectionSweep;

const std::vector<test::SweptRecord> swept{{0xB0C1, 22}, {0xB0C2, 38}, {0xB179, 29},
                                           {0xB17F, 33}, {0xB180, 21}, {0xB186, 21}};

TEST(LTERecordSweep, RecordsShorterThanTheirMinimumChangeNothing) {
  for (const auto& each : swept) SectionSweep<LTEClassIndex>().expectNoChangeBelowMinimum(each);
}

TEST(LTERecordSweep, RecordsOfTheirMinimumShowRows) {
  for (const auto& each : swept) SectionSweep<LTEClassIndex>().expectChangeFromMinimumOn(each);
}

TEST(LTERecordSweep, EveryCutOfAFullRecordIsRead) {
  for (const auto& each : swept) SectionSweep<LTEClassIndex>().takeEveryCut(each.logCode);
}

}  // namespace
}  // namespace kelvasi
