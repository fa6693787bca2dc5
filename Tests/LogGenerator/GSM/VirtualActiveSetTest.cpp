// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/GSM/GSMTables.h"

#include "Tests/LogGenerator/GSM/HollowSetTest.h"

namespace kelvasi {
namespace {

TEST(VirtualActiveSet, EveryRecordEmptiesItAndNoneFillsIt) {
  test::expectHollow<VirtualActiveSet>();
}

TEST(VirtualActiveSet, ARecordOf15BytesLeavesItAsItWas) {
  test::expectShortRecordsIgnored<VirtualActiveSet>();
}

}  // namespace
}  // namespace kelvasi
