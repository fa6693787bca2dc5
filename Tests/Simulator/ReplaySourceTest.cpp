// SPDX-License-Identifier: Apache-2.0
#include "Simulator/ReplaySource.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tests/Support/HexBytes.h"

namespace kelvasi::sim {
namespace {

using kelvasi::test::record;
using namespace std::chrono_literals;
using testing::ElementsAre;

// Messages that arrived at these times, and a fault after them where one is given.
class FakeCapture : public CaptureReader {
 public:
  FakeCapture(std::vector<std::chrono::nanoseconds> arrivals, std::string fault)
      : arrivals_(std::move(arrivals)), faultAtEnd_(std::move(fault)) {}

  std::optional<CapturedMessage> next() override {
    if (place_ < arrivals_.size()) {
      bytes_ = record(0x7130, "");
      bytes_.push_back(static_cast<std::uint8_t>(place_));
      return CapturedMessage{.bytes = bytes_, .arrival = arrivals_[place_++]};
    }
    bytes_.clear();
    if (!faultAtEnd_.empty()) fault_ = CaptureFault{.file = "a.pcap", .offset = 24, .reason = faultAtEnd_};
    return std::nullopt;
  }

 private:
  std::vector<std::chrono::nanoseconds> arrivals_;
  std::string faultAtEnd_;
  std::size_t place_ = 0;
  Bytes bytes_;
};

class Replay : public testing::Test {
 protected:
  void play(std::vector<std::chrono::nanoseconds> arrivals, bool isLooping = false, std::string fault = "") {
    source.emplace([=] { return std::make_unique<FakeCapture>(arrivals, fault); }, isLooping,
                   [this](const CaptureReader& capture) {
                     ++ends;
                     if (capture.fault()) faults.push_back(capture.fault()->text());
                   });
  }
  // The times at which the next `count` messages are due, in ms, each with its number.
  std::vector<std::pair<long, int>> next(int count) {
    std::vector<std::pair<long, int>> found;
    for (Messages messages; count > 0 && source->nextAt(); --count) {
      const auto due = std::chrono::duration_cast<std::chrono::milliseconds>(*source->nextAt()).count();
      messages.clear();
      source->take(messages);
      EXPECT_EQ(messages.size(), 1u);
      EXPECT_EQ(messages.at(0).logCode, LogCode{0x7130});
      found.emplace_back(due, messages.at(0).bytes.back());
    }
    return found;
  }

  std::optional<ReplaySource> source;
  std::vector<std::string> faults;
  int ends = 0;
};

using testing::Pair;

TEST_F(Replay, KeepsTheTimingOfTheCapture) {
  play({1700000000s, 1700000000s + 20ms, 1700000003s});
  EXPECT_THAT(next(10), ElementsAre(Pair(0, 0), Pair(20, 1), Pair(3000, 2)));
  EXPECT_EQ(source->nextAt(), std::nullopt);
}

TEST_F(Replay, TimeNeverGoesBack) {
  play({10s, 12s, 11s, 5s, 13s});
  EXPECT_THAT(next(10), ElementsAre(Pair(0, 0), Pair(2000, 1), Pair(2000, 2), Pair(2000, 3), Pair(3000, 4)));
}

TEST_F(Replay, LoopsWithAPauseOfASecond) {
  play({10s, 12s}, true);
  EXPECT_THAT(next(5), ElementsAre(Pair(0, 0), Pair(2000, 1), Pair(3000, 0), Pair(5000, 1), Pair(6000, 0)));
  EXPECT_EQ(ends, 2);
}

TEST_F(Replay, BeginsAnew) {
  play({10s, 12s});
  next(2);
  source->rewind();
  EXPECT_THAT(next(10), ElementsAre(Pair(0, 0), Pair(2000, 1)));
}

TEST_F(Replay, AnEmptyCaptureHasEndedEvenWhenItLoops) {
  play({}, true);
  EXPECT_EQ(source->nextAt(), std::nullopt);
}

TEST_F(Replay, PlaysWhatStandsBeforeAFaultAndReportsIt) {
  play({10s}, false, "truncated");
  EXPECT_THAT(next(10), ElementsAre(Pair(0, 0)));
  EXPECT_THAT(faults, ElementsAre("a.pcap: byte 24: truncated"));
}

}  // namespace
}  // namespace kelvasi::sim
