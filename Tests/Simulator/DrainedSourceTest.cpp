// SPDX-License-Identifier: Apache-2.0
#include "Simulator/DrainedSource.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <utility>

#include "Simulator/Scenario.h"

namespace kelvasi::sim {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pair;

// Tells its number of each step, twice in step 2, and its last one to a new stream.
class Counting : public Scenario {
 public:
  WorldTime stepLength() const override { return 200ms; }
  void step(Messages& messages) override {
    ++count_;
    greet(messages);
    if (count_ == 2) greet(messages);
  }
  void greet(Messages& messages) override { messages.push_back({.bytes = {count_}, .logCode = {}}); }

 private:
  std::uint8_t count_ = 0;
};

// Has three messages.
class Ending : public MessageSource {
 public:
  std::optional<WorldTime> nextAt() const override {
    return given_ < 3 ? std::optional<WorldTime>(1s * given_) : std::nullopt;
  }
  void take(Messages& messages) override { messages.push_back({.bytes = {given_++}, .logCode = {}}); }
  void rewind() override {}

 private:
  std::uint8_t given_ = 0;
};

using Taken = std::vector<std::pair<int, WorldTime>>;

Taken drained(MessageSource& source, std::uint64_t count, const Faults& faults = {}) {
  Taken taken;
  const auto number = drain(source, faults, count, [&](const Message& message, WorldTime at) {
    taken.emplace_back(message.bytes.at(0), at);
    return true;
  });
  EXPECT_EQ(number, taken.size());
  return taken;
}

ScenarioSource counting(WorldTime skipped = 0s) {
  return ScenarioSource([skipped] {
    auto scenario = std::make_unique<Counting>();
    skip(*scenario, skipped);
    return scenario;
  });
}

TEST(DrainedSource, GivesThePresentStateAndThenEachStepAtItsTime) {
  auto source = counting();
  EXPECT_THAT(drained(source, 5),
              ElementsAre(Pair(0, 0ms), Pair(1, 200ms), Pair(2, 400ms), Pair(2, 400ms), Pair(3, 600ms)));
}

TEST(DrainedSource, EndsInTheMiddleOfAStep) {
  auto source = counting();
  EXPECT_THAT(drained(source, 3), ElementsAre(Pair(0, 0ms), Pair(1, 200ms), Pair(2, 400ms)));
}

TEST(DrainedSource, BeginsWhereTheScenarioStands) {
  auto source = counting(1s);
  EXPECT_THAT(drained(source, 2), ElementsAre(Pair(5, 0ms), Pair(6, 200ms)));
}

TEST(DrainedSource, EndsWithItsSource) {
  Ending source;
  EXPECT_THAT(drained(source, 9), ElementsAre(Pair(0, 0s), Pair(1, 1s), Pair(2, 2s)));
}

TEST(DrainedSource, NothingIsTakenOfNoMessages) {
  auto source = counting();
  EXPECT_THAT(drained(source, 0), IsEmpty());
}

TEST(DrainedSource, EndsWhenNoMoreIsWanted) {
  auto source = counting();
  int offered = 0;
  EXPECT_EQ(drain(source, {}, 9, [&](const Message&, WorldTime) { return ++offered < 3; }), 2u);
  EXPECT_EQ(offered, 3);
}

TEST(DrainedSource, DamagesWhatIsAskedForAndLeavesOutOtherIds) {
  Faults faults;
  ASSERT_EQ(faults.add("prefix=2"), "");
  ASSERT_EQ(faults.add("other-id=1"), "");
  auto source = counting();
  EXPECT_THAT(drained(source, 4, faults),
              ElementsAre(Pair(0, 0ms), Pair(0x81, 200ms), Pair(2, 400ms), Pair(0x81, 400ms)));
}

}  // namespace
}  // namespace kelvasi::sim
