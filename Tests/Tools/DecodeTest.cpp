// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Decode.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"
#include "Tests/Support/TestPlatform.h"

namespace kelvasi {
namespace {

using ::testing::ElementsAre;
using namespace std::chrono_literals;
using test::hex;

// Shows how many messages came before each tick.
class CountingGenerator : public LogGenerator {
 public:
  using LogGenerator::LogGenerator;
  void updateState(PlistDictionary&, std::span<const std::uint8_t> data) override {
    if (!data.empty() && data[0] == 0xEE) throw std::runtime_error("record EE");
    ++messages_;
  }
  PlistValue generateLogUsingState(PlistDictionary&) override { return messages_; }
  PlistValue getSaveContentsFromState(const PlistDictionary&) const override { return "contents"; }

 private:
  int messages_ = 0;
};

struct DecodeTest : ::testing::Test {
  void take(const Bytes& message, std::chrono::nanoseconds arrival) { decode.take({message, arrival}); }

  test::TestPlatform surroundings;
  PushedClock clock{surroundings.clock};
  std::vector<std::pair<double, std::int64_t>> ticks;
  std::vector<double> tickClocks;
  Decode decode{std::make_unique<CountingGenerator>(surroundings.platform()), clock,
                [this](TickSchedule::Time time, const PlistValue& display) {
                  ticks.emplace_back(std::chrono::duration<double>(time).count(), *display.integer());
                  tickClocks.push_back(clock.now().secondsSince1970);
                }};
};

TEST_F(DecodeTest, TicksBetweenMessagesAndAfterTheLast) {
  for (const auto arrival : {10s, 11s, 13s}) take(hex("01"), arrival);
  decode.finish();
  EXPECT_THAT(ticks, ElementsAre(std::pair(12.0, 2), std::pair(13.0, 3)));
  EXPECT_EQ(decode.display(), PlistValue(3));
  EXPECT_EQ(decode.saveContents(), PlistValue("contents"));
}

TEST_F(DecodeTest, TheClockFollowsMessagesAndTicks) {
  take(hex("01"), 10s + 250ms);
  EXPECT_EQ(clock.now().secondsSince1970, 10.25);
  take(hex("01"), 60s);
  EXPECT_THAT(tickClocks, ElementsAre(12.25));
  EXPECT_EQ(clock.now().secondsSince1970, 60);
  decode.finish();
  EXPECT_THAT(tickClocks, ElementsAre(12.25, 60));
}

TEST_F(DecodeTest, HasNoDisplayWithoutAMessage) {
  decode.finish();
  EXPECT_THAT(ticks, ::testing::IsEmpty());
  EXPECT_TRUE(decode.display().isAbsent());
}

TEST_F(DecodeTest, EndsTheProcessByAnExceptionOfADecoder) {
  EXPECT_EXIT(take(hex("EE"), 10s), ::testing::KilledBySignal(SIGABRT), "record EE");
}

}  // namespace
}  // namespace kelvasi
