// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Simulation.h"

#include <gtest/gtest.h>

#include "Telvon/Technology.h"
#include "Tests/Simulator/FakeApplication.h"

namespace kelvasi::sim {
namespace {

using namespace std::chrono_literals;

// Never ends.
class Silence : public MessageSource {
 public:
  std::optional<WorldTime> nextAt() const override { return WorldTime(1000h); }
  void take(Messages&) override {}
  void rewind() override {}
};

class Simulating : public testing::Test {
 protected:
  Simulating() { simulation.serve(ports); }

  kelvasi::test::TestPlatform surroundings;
  test::FakeMainQueue queue;
  test::FakePorts ports{queue};
  LibplistSerialiser plists;
  int leavings = 0;
  Simulation simulation{
      {{surroundings.log, ports, plists}, queue, surroundings.clock},
      kTelvonLogChannelTechnology_Orvane_GSM,
      {},
      std::make_unique<Silence>(),
      {},
      {.die = {}, .stall = {}, .sourceEnded = {}, .lastApplicationLeft = [this] { ++leavings; }}};
  test::FakeApplication viewer{ports, "KelvasiApp.1"};
};

TEST_F(Simulating, TellsWithinASecondThatTheLastApplicationHasLeft) {
  viewer.connect();
  viewer.startEverything();
  queue.advance(10s);
  EXPECT_EQ(leavings, 0);
  viewer.leave();
  queue.advance(1s);
  EXPECT_EQ(leavings, 1);
  queue.advance(10s);
  EXPECT_EQ(leavings, 1);
}

TEST_F(Simulating, TellsItOfOneThatWasThereBetweenTwoLooksOnly) {
  queue.advance(1s);
  viewer.connect();
  viewer.startEverything();
  viewer.hangUp();
  queue.advance(1s);
  EXPECT_EQ(leavings, 1);
}

TEST_F(Simulating, SaysNothingWhileAnotherApplicationIsThere) {
  test::FakeApplication other{ports, "KelvasiApp.2"};
  for (auto* application : {&viewer, &other}) {
    application->connect();
    application->startEverything();
  }
  viewer.leave();
  queue.advance(10s);
  EXPECT_EQ(leavings, 0);
  other.hangUp();
  queue.advance(1s);
  EXPECT_EQ(leavings, 1);
}

TEST_F(Simulating, AnApplicationThatOnlyStoppedItsStreamHasNotLeft) {
  viewer.connect();
  viewer.startEverything();
  viewer.ask(PlistDictionary::make({{"SetState", "Idle"}}));
  queue.advance(10s);
  EXPECT_EQ(leavings, 0);
}

TEST_F(Simulating, WaitsForTheFirstStream) {
  viewer.connect();
  viewer.leave();
  queue.advance(10s);
  EXPECT_EQ(leavings, 0);
}

}  // namespace
}  // namespace kelvasi::sim
