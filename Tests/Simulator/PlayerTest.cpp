// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Player.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Simulator/LoadSource.h"
#include "Telvon/Technology.h"
#include "Tests/Simulator/FakeApplication.h"
#include "Tests/Support/HexBytes.h"

namespace kelvasi::sim {
namespace {

using kelvasi::test::record;
using namespace std::chrono_literals;

// Numbered messages at given times; greets with a message of its own.
class ListSource : public MessageSource {
 public:
  explicit ListSource(std::vector<WorldTime> times) : times_(std::move(times)) {}

  std::optional<WorldTime> nextAt() const override {
    return place_ < times_.size() ? std::optional(times_[place_]) : std::nullopt;
  }
  void take(Messages& messages) override {
    messages.push_back(numbered(static_cast<std::uint8_t>(++place_)));
  }
  void greet(Messages& messages) override { messages.push_back(numbered(0)); }
  void rewind() override { place_ = 0; }

 private:
  static Message numbered(std::uint8_t number) {
    Bytes bytes = record(0x7130, "");
    bytes.push_back(number);
    return logMessage(std::move(bytes));
  }

  std::vector<WorldTime> times_;
  std::size_t place_ = 0;
};

class Playing : public testing::Test {
 protected:
  void play(std::vector<WorldTime> times, double speed = 1) {
    source.emplace(std::move(times));
    player.emplace(queue, surroundings.clock, daemon, *source, Speed{speed}, Faults(), [this] { ++ends; });
  }
  void begin() {
    viewer.use(*daemon.openChannel(viewer.name));
    viewer.startEverything();
  }
  // Lets time pass for queue and clock alike.
  void pass(std::chrono::milliseconds duration) {
    for (; duration > 0ms; duration -= 10ms) {
      surroundings.clock.time.secondsSince1970 += 0.010;
      queue.advance(10ms);
    }
  }
  std::vector<int> numbers() const {
    std::vector<int> found;
    for (const auto& message : viewer.received) found.push_back(message.bytes.back());
    return found;
  }

  kelvasi::test::TestPlatform surroundings;
  test::FakeMainQueue queue;
  test::FakePorts ports{queue};
  LibplistSerialiser plists;
  int ends = 0;
  Daemon daemon{{surroundings.log, ports, plists},
                kTelvonLogChannelTechnology_Orvane_GSM,
                {},
                [this](Channel& channel) { player->streamBegan(channel); }};
  std::optional<ListSource> source;
  std::optional<Player> player;
  test::FakeApplication viewer{ports, "KelvasiApp.1"};
};

using testing::ElementsAre;

TEST_F(Playing, GreetsAnApplicationThenKeepsTheSourcesTime) {
  play({1s, 1s, 3s});
  begin();
  pass(500ms);
  EXPECT_THAT(numbers(), ElementsAre(0));
  pass(600ms);
  EXPECT_THAT(numbers(), ElementsAre(0, 1, 2));
  pass(1800ms);
  EXPECT_EQ(ends, 0);
  pass(200ms);
  EXPECT_THAT(numbers(), ElementsAre(0, 1, 2, 3));
  EXPECT_EQ(ends, 1);
}

TEST_F(Playing, TimeStandsStillWhileNobodyStreams) {
  play({1s, 20s});
  pass(10s);
  begin();
  pass(900ms);
  EXPECT_THAT(numbers(), ElementsAre(0));
  viewer.ask(PlistDictionary::make({{"SetState", "Idle"}}));
  pass(10s);
  viewer.startEverything();
  pass(300ms);
  EXPECT_THAT(numbers(), ElementsAre(0, 0, 1));
}

TEST_F(Playing, SpeedScalesTime) {
  play({10s, 20s, 30s}, 10);
  begin();
  pass(2100ms);
  EXPECT_THAT(numbers(), ElementsAre(0, 1, 2));
}

TEST_F(Playing, ASourceThatEndedBeginsAnewForAnewStream) {
  play({1s});
  begin();
  pass(2s);
  viewer.startEverything();
  pass(2s);
  EXPECT_THAT(numbers(), ElementsAre(0, 1, 0, 1));
  EXPECT_EQ(ends, 2);
}

TEST_F(Playing, AStoppedClockIsNotMadeUpFor) {
  play({2s, 3s, 1h});
  begin();
  pass(10ms);
  surroundings.clock.time.secondsSince1970 += 1000;
  pass(10ms);
  EXPECT_THAT(numbers(), ElementsAre(0));
  surroundings.clock.time.secondsSince1970 -= 5000;
  pass(1100ms);
  EXPECT_THAT(numbers(), ElementsAre(0, 1));
}

TEST_F(Playing, AtFullSpeedNothingIsLostToABacklog) {
  ports.backlog = 10;
  play(std::vector<WorldTime>(1000, 1h), 0);
  begin();
  queue.advance(200ms);
  EXPECT_EQ(viewer.received.size(), 1001u);
  EXPECT_EQ(ends, 1);
}

TEST_F(Playing, AtFullSpeedAStalledApplicationIsWaitedForOnlyShortly) {
  test::FakeApplication recorder{ports, "KelvasiApp.2"};
  play(std::vector<WorldTime>(1000, 1h), 0);
  recorder.use(*daemon.openChannel(recorder.name));
  recorder.startEverything();
  begin();
  ports.stall(viewer.name);
  pass(150ms);
  EXPECT_LT(recorder.received.size(), 500u);
  pass(500ms);
  EXPECT_EQ(recorder.received.size(), 1001u);
  EXPECT_EQ(ends, 1);
}

// Gives two messages a step.
class TwoMessages : public Scenario {
 public:
  WorldTime stepLength() const override { return 1s; }
  void step(Messages& messages) override {
    messages.push_back(logMessage(record(0x7130, "00")));
    messages.push_back(logMessage(record(0x7131, "00")));
  }
  void greet(Messages&) override {}
};

TEST(LoadSource, GivesMessagesAtItsRate) {
  LoadSource load(std::make_unique<TwoMessages>(), 12345);
  Messages messages;
  while (*load.nextAt() <= 2s) load.take(messages);
  EXPECT_EQ(messages.size(), 24690u);
  EXPECT_EQ(messages[0].logCode, LogCode{0x7130});
  EXPECT_EQ(messages[1].logCode, LogCode{0x7131});
}

TEST(LoadSource, BeginsAnew) {
  LoadSource load(std::make_unique<TwoMessages>(), 200);
  Messages messages;
  load.take(messages);
  load.rewind();
  EXPECT_EQ(*load.nextAt(), 5ms);
  load.take(messages);
  EXPECT_EQ(messages.size(), 2u);
}

}  // namespace
}  // namespace kelvasi::sim
