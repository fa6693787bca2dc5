// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include "Tests/LogGenerator/GSM/HollowSetTest.h"

namespace kelvasi {
namespace {

TEST(MonitoredSet, EveryRecordEmptiesItAndNoneFillsIt) {
  test::expectHollow<MonitoredSet>();
}

TEST(MonitoredSet, ARecordOf15BytesLeavesItAsItWas) {
  test::expectShortRecordsIgnored<MonitoredSet>();
}

}  // namespace
}  // namespace kelvasi
