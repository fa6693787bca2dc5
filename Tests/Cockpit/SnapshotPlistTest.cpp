// SPDX-License-Identifier: Apache-2.0
#include <gtest/gtest.h>

#include "Plist/Description.h"
#include "Tests/Cockpit/Fed.h"

namespace kelvasi::cockpit {
namespace {

const PlistValue& at(const PlistValue& value, std::string_view key) {
  static const PlistValue nothing;
  const auto* entries = value.dictionary();
  const PlistValue* found = entries ? entries->find(key) : nullptr;
  return found ? *found : nothing;
}

TEST(SnapshotPlist, HoldsAllThatIsShown) {
  Fed fed;
  Message message = served(0s, cell404, -95);
  message.neighbour(cell362, quantity::rsrp, -105);
  fed.take(message);
  fed.take(served(1s, cell362, -90));
  fed.cockpit.pin("/Serving/rsrp");
  fed.cockpit.addAlarm("rsrp < -115");
  fed.cockpit.mark(noon + 1s, "bridge");
  const PlistValue state = plistOf(fed.at(1s));
  EXPECT_EQ(at(at(state, "link"), "state"), PlistValue("live"));
  EXPECT_EQ(at(at(state, "serving"), "cell"), PlistValue("lte:3350/362"));
  const PlistValue level = at(at(state, "serving"), "levels").array()->at(0);
  EXPECT_EQ(at(level, "name"), PlistValue("RSRP"));
  EXPECT_EQ(at(level, "text"), PlistValue("-90"));
  EXPECT_EQ(at(level, "value"), PlistValue(-90.0));
  EXPECT_EQ(at(level, "verdict"), PlistValue("good"));
  EXPECT_EQ(at(level, "seconds_with_values"), PlistValue(2));
  EXPECT_EQ(at(at(state, "cells").array()->at(0), "cell"), PlistValue("lte:3350/404"));
  EXPECT_EQ(at(at(state, "carriers").array()->at(0), "cells"), PlistValue(2));
  EXPECT_EQ(at(at(state, "events").array()->at(0), "words"), PlistValue("cell change PCI 404 to 362"));
  EXPECT_EQ(at(at(state, "pins").array()->at(0), "value"), PlistValue("-90"));
  EXPECT_EQ(at(at(state, "alarms").array()->at(0), "rule"), PlistValue("rsrp < -115"));
  EXPECT_EQ(at(at(state, "marks").array()->at(0), "note"), PlistValue("bridge"));
}

TEST(SnapshotPlist, SaysWhyItIsEmpty) {
  Fed fed;
  const PlistValue state = plistOf(fed.at(0s));
  EXPECT_EQ(at(at(state, "serving"), "why"), PlistValue("Nothing received yet"));
  EXPECT_TRUE(at(state, "cells").array()->empty());
  EXPECT_EQ(at(state, "cells_why"), PlistValue("Nothing received yet"));
  EXPECT_TRUE(at(state, "second").isAbsent());
}

}  // namespace
}  // namespace kelvasi::cockpit
