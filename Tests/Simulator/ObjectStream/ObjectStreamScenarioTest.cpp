// SPDX-License-Identifier: Apache-2.0
#include "Simulator/ObjectStream/ObjectStreamScenario.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <set>
#include <stdexcept>

#include "Simulator/Radio/Reported.h"
#include "Telvon/Technology.h"
#include "Tests/Simulator/PlayedScenario.h"

namespace kelvasi::sim::objectStream {
namespace {

using test::DecodingViewer;
using testing::IsEmpty;
using testing::IsSupersetOf;

constexpr int manySteps = 3000;
constexpr std::array<std::uint64_t, 4> seeds{1, 2, 11, 12345};

// What stands under these keys, one inside the other; absent when one is missing.
PlistValue at(PlistValue value, std::initializer_list<std::string_view> keys) {
  for (const std::string_view key : keys) {
    if (!value.dictionary()) return {};
    value = value.dictionary()->get(key);
  }
  return value;
}

// Says of a value whether it is text, and else what it holds.
std::string kindOf(const PlistValue& value) {
  if (value.string()) return "text";
  if (value.array()) return "list";
  if (!value.dictionary()) return "nothing";
  return "dictionary of " + std::to_string(value.dictionary()->size());
}

class ObjectStream : public testing::TestWithParam<std::uint64_t> {
 protected:
  template <typename Look>
  void play(int steps, Look look) {
    test::play(scenario, steps, [&](const Messages& messages) {
      viewer.take(messages);
      look(messages);
    });
  }
  const gsm::World& world() const { return scenario.world(); }
  PlistValue shown(std::initializer_list<std::string_view> keys) const { return at(viewer.display(), keys); }
  std::string text(std::initializer_list<std::string_view> keys) const {
    const PlistValue value = shown(keys);
    return value.string() ? *value.string() : "(none)";
  }

  void checkServingCell();
  void checkNeighbours();
  void checkList(const PlistValue& list, const std::vector<std::size_t>& places);
  void checkChains(const PlistValue& message);

  LibplistSerialiser plists;
  ObjectStreamScenario scenario{GetParam(), plists};
  DecodingViewer viewer{kTelvonLogChannelTechnology_IFX, "none", PlistDictionary::make()};
};

INSTANTIATE_TEST_SUITE_P(Seeds, ObjectStream, testing::ValuesIn(seeds));

void ObjectStream::checkServingCell() {
  if (!world().serving()) {
    ASSERT_EQ(kindOf(shown({"Serving Cell"})), "dictionary of 0");
    return;
  }
  const Cell& cell = world().cell(*world().serving());
  const bool isGsm = cell.technology == Technology::gsm;
  ASSERT_EQ(text({"Serving Cell", "Cell ID"}), std::to_string(cell.id));
  ASSERT_EQ(text({"Serving Cell", isGsm ? "ARFCN" : "UARFCN"}), std::to_string(cell.frequency));
  ASSERT_EQ(text({"Serving Cell", isGsm ? "BSIC" : "Scrambling Code"}), std::to_string(cell.code));
  ASSERT_EQ(text({"Serving Cell", "Location Area Code"}), std::to_string(cell.locationArea.code));
  ASSERT_EQ(text({"Network", "PLMN", "MCC"}), std::to_string(cell.locationArea.plmn.mcc));
  const auto level = DecodingViewer::leadingNumber(text({"Serving Cell", isGsm ? "Received Level" : "RSCP"}));
  const Reception& heard = world().reception(*world().serving());
  ASSERT_NEAR(level.value(), isGsm ? reportedGsmLevel(heard) : reportedRscp(heard), 0.5);
}

// A technology's list alone among the neighbours collapses into their place.
void ObjectStream::checkNeighbours() {
  const PlistValue lists = shown({"Neighbor Cells"});
  const auto& gsm = world().gsmNeighbours();
  const auto& umts = world().umtsNeighbours();
  if (gsm.empty() && umts.empty()) {
    ASSERT_EQ(kindOf(lists), "dictionary of 0");
  } else if (gsm.empty() || umts.empty()) {
    checkList(lists, gsm.empty() ? umts : gsm);
  } else {
    ASSERT_EQ(kindOf(lists), "dictionary of 2");
    ASSERT_NO_FATAL_FAILURE(checkList(at(lists, {"GSM"}), gsm));
    checkList(at(lists, {"UMTS"}), umts);
  }
}

// What the display shows as one text is sent as dictionaries of one entry each.
void ObjectStream::checkChains(const PlistValue& message) {
  ASSERT_EQ(kindOf(at(message, {"Power"})), "dictionary of 1");
  ASSERT_EQ(kindOf(at(message, {"Power", "Handset"})), "dictionary of 1");
  ASSERT_EQ(at(message, {"Power", "Handset", "State"}), PlistValue(text({"Power"})));
  if (world().connection().isConnected()) return;
  ASSERT_EQ(kindOf(at(message, {"Connection"})), "dictionary of 1");
  ASSERT_EQ(kindOf(at(message, {"Connection", "Radio Resources"})), "dictionary of 1");
  ASSERT_EQ(at(message, {"Connection", "Radio Resources", "State"}), PlistValue(text({"Connection"})));
}

void ObjectStream::checkList(const PlistValue& list, const std::vector<std::size_t>& places) {
  ASSERT_TRUE(list.array());
  ASSERT_EQ(list.array()->size(), places.size());
  for (std::size_t place = 0; place < places.size(); ++place) {
    const Cell& cell = world().cell(places[place]);
    const char* key = cell.technology == Technology::gsm ? "BSIC" : "Scrambling Code";
    ASSERT_EQ(at(list.array()->at(place), {key}), PlistValue(std::to_string(cell.code)));
  }
}

TEST_P(ObjectStream, EveryMomentIsTheWorlds) {
  play(manySteps, [&](const Messages& messages) {
    ASSERT_NO_FATAL_FAILURE(checkServingCell());
    ASSERT_NO_FATAL_FAILURE(checkNeighbours());
    ASSERT_NO_FATAL_FAILURE(checkChains(plists.parse(messages.at(0).bytes).value()));
    ASSERT_EQ(text({"Power"}), world().registration().isOn() ? "On" : "Off");
    ASSERT_EQ(kindOf(shown({"Connection"})) == "text", !world().connection().isConnected());
  });
  EXPECT_THAT(viewer.errors(), IsEmpty());
}

TEST_P(ObjectStream, ShapesChangeFromMessageToMessage) {
  std::set<std::string> seen;
  play(manySteps, [&](const Messages&) {
    for (const auto key : {"Serving Cell", "Neighbor Cells", "Connection"})
      seen.insert(std::string(key) + ": " + kindOf(shown({key})));
    seen.insert("Packet Switched: " + kindOf(shown({"Network", "Packet Switched"})));
    seen.insert("Connection: " + text({"Connection"}));
  });
  EXPECT_THAT(seen, IsSupersetOf({"Serving Cell: dictionary of 0", "Serving Cell: dictionary of 5",
                                  "Serving Cell: dictionary of 6", "Neighbor Cells: dictionary of 0",
                                  "Neighbor Cells: list", "Neighbor Cells: dictionary of 2",
                                  "Connection: dictionary of 3", "Connection: dictionary of 4",
                                  "Packet Switched: text", "Packet Switched: dictionary of 2",
                                  "Connection: Idle", "Connection: Connecting", "Connection: Releasing"}));
}

TEST_P(ObjectStream, TheFormatsTakeTurns) {
  int turn = 0;
  play(20, [&](const Messages& messages) {
    ASSERT_EQ(messages.size(), 1u);
    const std::string begin(messages[0].bytes.begin(), messages[0].bytes.begin() + 6);
    ASSERT_EQ(begin, turn++ % 2 == 0 ? "<?xml " : "bplist");
  });
}

TEST_P(ObjectStream, ANewStreamIsToldThePresentStateAtOnce) {
  play(100, [](const Messages&) {});
  const PlistValue before = viewer.display();
  Messages greeting;
  scenario.greet(greeting);
  viewer.take(greeting);
  EXPECT_EQ(viewer.display(), before);
}

TEST(ObjectStreamFailure, AnObjectThatCannotBeSerialisedIsNotDroppedInSilence) {
  const kelvasi::test::FakeSerialiser serialisesNothing;
  ObjectStreamScenario scenario(1, serialisesNothing);
  Messages messages;
  EXPECT_THROW(scenario.greet(messages), std::logic_error);
}

TEST(ObjectStreamSeed, TheSameGivesTheSameMessages) {
  test::expectTheSeedToDecide<ObjectStreamScenario>();
}

}  // namespace
}  // namespace kelvasi::sim::objectStream
