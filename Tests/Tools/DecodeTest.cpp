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

class HeldCapture : public CaptureReader {
 public:
  struct Message {
    Bytes bytes;
    std::chrono::nanoseconds arrival;
  };
  explicit HeldCapture(std::vector<Message> messages) : messages_(std::move(messages)) {}

  std::optional<CapturedMessage> next() override {
    if (next_ == messages_.size()) return std::nullopt;
    const Message& message = messages_[next_++];
    return CapturedMessage{.bytes = message.bytes, .arrival = message.arrival};
  }

 private:
  std::vector<Message> messages_;
  std::size_t next_ = 0;
};

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
  test::TestPlatform surroundings;
  std::vector<std::pair<double, std::int64_t>> ticks;
  Decode decode{std::make_unique<CountingGenerator>(surroundings.platform()),
                [this](TickSchedule::Time time, const PlistValue& display) {
                  ticks.emplace_back(std::chrono::duration<double>(time).count(), *display.integer());
                }};
};

TEST_F(DecodeTest, TicksBetweenMessagesAndAfterTheLast) {
  HeldCapture capture({{hex("01"), 10s}, {hex("01"), 11s}, {hex("01"), 13s}});
  decode.take(capture);
  decode.finish();
  EXPECT_THAT(ticks, ElementsAre(std::pair(12.0, 2), std::pair(13.0, 3)));
  EXPECT_EQ(decode.display(), PlistValue(3));
  EXPECT_EQ(decode.saveContents(), PlistValue("contents"));
}

TEST_F(DecodeTest, GoesOnFromOneCaptureToTheNext) {
  HeldCapture first({{hex("01"), 10s}});
  HeldCapture second({{hex("01"), 11s}, {hex("01"), 60s}});
  decode.take(first);
  decode.take(second);
  decode.finish();
  EXPECT_THAT(ticks, ElementsAre(std::pair(12.0, 2), std::pair(60.0, 3)));
}

TEST_F(DecodeTest, HasNoDisplayWithoutAMessage) {
  decode.finish();
  EXPECT_THAT(ticks, ::testing::IsEmpty());
  EXPECT_TRUE(decode.display().isAbsent());
}

TEST_F(DecodeTest, EndsTheProcessByAnExceptionOfADecoder) {
  HeldCapture capture({{hex("EE"), 10s}});
  EXPECT_EXIT(decode.take(capture), ::testing::KilledBySignal(SIGABRT), "record EE");
}

}  // namespace
}  // namespace kelvasi
