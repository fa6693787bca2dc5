// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Faults.h"

#include <gtest/gtest.h>

#include <set>

namespace kelvasi::sim {
namespace {

TEST(Faults, AreOffUnlessRequested) {
  const Faults faults;
  for (const FaultKind& kind : faultKinds()) EXPECT_FALSE(faults.has(kind.fault)) << kind.name;
}

TEST(Faults, EveryKindCanBeRequestedByNameAndIsExplained) {
  std::set<Fault> seen;
  for (const FaultKind& kind : faultKinds()) {
    Faults faults;
    const bool needsValue = kind.value == FaultKind::Value::required;
    EXPECT_EQ(faults.add(std::string(kind.name) + (needsValue ? "=1" : "")), "");
    EXPECT_TRUE(faults.has(kind.fault)) << kind.name;
    EXPECT_FALSE(kind.help.empty()) << kind.name;
    EXPECT_TRUE(seen.insert(kind.fault).second) << kind.name;
  }
  EXPECT_EQ(seen.size(), static_cast<std::size_t>(Fault::shortRecords) + 1);
}

TEST(Faults, SeveralAtOnce) {
  Faults faults;
  EXPECT_EQ(faults.add("prefix"), "");
  EXPECT_EQ(faults.add("death=2.5"), "");
  EXPECT_EQ(faults.value(Fault::prefix), 3);
  EXPECT_EQ(faults.value(Fault::death), 2.5);
}

TEST(Faults, TheLastValueCounts) {
  Faults faults;
  faults.add("error-pair=35");
  faults.add("error-pair=-7");
  EXPECT_EQ(faults.value(Fault::errorPair), -7);
}

TEST(Faults, SayWhatIsWrongWithARequest) {
  Faults faults;
  EXPECT_EQ(faults.add("bad-mood"), "there is no fault \"bad-mood\"");
  EXPECT_EQ(faults.add(""), "there is no fault \"\"");
  EXPECT_EQ(faults.add("death"), "death needs a value: death=SECONDS");
  EXPECT_EQ(faults.add("null-port=1"), "null-port takes no value");
  EXPECT_EQ(faults.add("prefix="), "\"\" is no value for prefix=N");
  EXPECT_EQ(faults.add("prefix=0"), "\"0\" is no value for prefix=N");
  EXPECT_EQ(faults.add("stall=-1"), "\"-1\" is no value for stall=SECONDS");
  EXPECT_EQ(faults.add("stall=2s"), "\"2s\" is no value for stall=SECONDS");
  EXPECT_EQ(faults.add("error-pair=1e12"), "\"1e12\" is no value for error-pair=CODE");
  EXPECT_EQ(faults.add("death=nan"), "\"nan\" is no value for death=SECONDS");
  EXPECT_FALSE(faults.has(Fault::death));
}

}  // namespace
}  // namespace kelvasi::sim
