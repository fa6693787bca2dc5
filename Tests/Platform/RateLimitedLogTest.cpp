// SPDX-License-Identifier: Apache-2.0
#include "Platform/RateLimitedLog.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <optional>

#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/RecordingLog.h"

namespace kelvasi {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using namespace std::chrono_literals;

class RateLimited : public testing::Test {
 protected:
  void write(int times, const std::string& text) {
    while (times-- > 0) limited->write(LogPriority::error, text);
  }
  // What came since the last look.
  std::vector<std::string> lines() {
    const auto found = log.errors();
    log.clear();
    return found;
  }

  test::RecordingLog log;
  test::FakeMainQueue queue;
  std::optional<RateLimitedLog> limited{std::in_place, log, queue};
};

TEST_F(RateLimited, AtTheLimitEveryLinePassesAndNothingIsAdded) {
  write(10, "bad");
  EXPECT_EQ(lines().size(), 10u);
  queue.advance(10s);
  EXPECT_THAT(lines(), IsEmpty());
}

TEST_F(RateLimited, OneMoreIsHeldAndCounted) {
  write(11, "bad");
  EXPECT_EQ(lines().size(), 10u);
  queue.advance(9999ms);
  EXPECT_THAT(lines(), IsEmpty());
  queue.advance(1ms);
  EXPECT_THAT(lines(), ElementsAre("1 more like this: bad"));
}

TEST_F(RateLimited, AFloodGivesElevenLinesAnInterval) {
  for (int interval = 0; interval < 3; ++interval) {
    write(500'000, "bad");
    queue.advance(10s);
    const auto found = lines();
    ASSERT_EQ(found.size(), 11u);
    EXPECT_EQ(found.back(), "499990 more like this: bad");
  }
}

TEST_F(RateLimited, AnotherTextPassesMeanwhile) {
  write(20, "bad");
  lines();
  write(1, "other");
  EXPECT_THAT(lines(), ElementsAre("other"));
  queue.advance(10s);
  EXPECT_THAT(lines(), ElementsAre("10 more like this: bad"));
}

TEST_F(RateLimited, AHundredTextsPassAndOneMoreIsCounted) {
  for (int number = 0; number < 100; ++number) write(1, std::to_string(number));
  EXPECT_EQ(lines().size(), 100u);
  write(1, "new");
  write(1, "newer");
  write(1, "7");
  EXPECT_THAT(lines(), IsEmpty());
  queue.advance(10s);
  EXPECT_THAT(lines(), ElementsAre("1 more like this: 7", "2 more lines of other kinds"));
  write(1, "new");
  EXPECT_THAT(lines(), ElementsAre("new"));
}

TEST_F(RateLimited, LinesFarApartAllPass) {
  for (int times = 0; times < 100; ++times) {
    write(10, "bad");
    queue.advance(10s);
  }
  EXPECT_EQ(lines().size(), 1000u);
}

TEST_F(RateLimited, KeepsPrioritiesAndAsksTheLogBehindItWhichItWants) {
  for (int times = 0; times < 12; ++times) limited->write(LogPriority::notice, "note");
  queue.advance(10s);
  EXPECT_EQ(log.lines(LogPriority::notice).size(), 11u);
  log.isMasked = true;
  EXPECT_FALSE(limited->wants(LogPriority::notice));
}

TEST_F(RateLimited, ItsEndSaysWhatWasHeldAndNothingComesLater) {
  write(12, "bad");
  lines();
  limited.reset();
  EXPECT_THAT(lines(), ElementsAre("2 more like this: bad"));
  queue.advance(60s);
  EXPECT_THAT(lines(), IsEmpty());
}

}  // namespace
}  // namespace kelvasi
