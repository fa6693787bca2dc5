// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include "Tests/LogGenerator/GSM/HollowSetTest.h"

namespace kelvasi {
namespace {

TEST(DetectedSet, EveryRecordEmptiesItAndNoneFillsIt) {
  test::expectHollow<DetectedSet>();
}

TEST(DetectedSet, ARecordOf15BytesLeavesItAsItWas) {
  test::expectShortRecordsIgnored<DetectedSet>();
}

}  // namespace
}  // namespace kelvasi
