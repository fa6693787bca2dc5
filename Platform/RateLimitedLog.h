// SPDX-License-Identifier: Apache-2.0
// A system log for what others can cause: a peer that errs without end shall not fill the disk.
#pragma once

#include <chrono>
#include <cstdint>
#include <map>
#include <memory>
#include <string>

#include "Platform/MainQueue.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

// Passes lines on as they come, but within an interval only so many of one text and so many in all. The
// others are counted, and the interval's end says how many they were. An interval begins with the first line
// after the one before.
class RateLimitedLog : public SystemLog {
 public:
  static constexpr std::chrono::milliseconds interval{10'000};
  static constexpr std::uint64_t linesOfOneText = 10;
  static constexpr std::uint64_t linesInAll = 100;  // not counting those that say how many there were more

  // Both outlive this object.
  RateLimitedLog(SystemLog& log, MainQueue& queue) : log_(log), queue_(queue) {}
  // What was counted is said.
  ~RateLimitedLog() override;
  RateLimitedLog(const RateLimitedLog&) = delete;
  RateLimitedLog& operator=(const RateLimitedLog&) = delete;

  bool wants(LogPriority priority) const override { return log_.wants(priority); }
  void write(LogPriority priority, std::string_view text) override;

 private:
  struct Count {
    LogPriority priority{};
    std::uint64_t passed = 0;
    std::uint64_t held = 0;
  };

  void begin();
  void end();

  SystemLog& log_;
  MainQueue& queue_;
  std::map<std::string, Count, std::less<>> counts_;  // of this interval, by text
  Count others_;                                      // texts that came when there were too many
  std::uint64_t passed_ = 0;
  std::shared_ptr<const bool> interval_;  // null between two
};

}  // namespace kelvasi
