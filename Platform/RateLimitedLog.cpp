// SPDX-License-Identifier: Apache-2.0
#include "Platform/RateLimitedLog.h"

#include <utility>

namespace kelvasi {

namespace {

void tellHeld(SystemLog& log, LogPriority priority, std::uint64_t held, const std::string& whatKind) {
  if (held > 0) log.write(priority, std::to_string(held) + " more " + whatKind);
}

}  // namespace

RateLimitedLog::~RateLimitedLog() {
  end();
}

void RateLimitedLog::write(LogPriority priority, std::string_view text) {
  if (!interval_) begin();
  auto known = counts_.find(text);
  if (known == counts_.end() && counts_.size() < linesInAll)
    known = counts_.emplace(text, Count{.priority = priority}).first;
  Count& count = known == counts_.end() ? others_ : known->second;
  if (&count == &others_ || count.passed == linesOfOneText || passed_ == linesInAll) {
    ++count.held;
    return;
  }
  ++count.passed;
  ++passed_;
  log_.write(priority, text);
}

void RateLimitedLog::begin() {
  interval_ = std::make_shared<const bool>(true);
  queue_.postAfter(interval, [this, running = std::weak_ptr(interval_)] {
    if (!running.expired()) end();
  });
}

void RateLimitedLog::end() {
  interval_.reset();
  passed_ = 0;
  for (const auto& [text, count] : std::exchange(counts_, {}))
    tellHeld(log_, count.priority, count.held, "like this: " + text);
  tellHeld(log_, LogPriority::error, std::exchange(others_, {}).held, "lines of other kinds");
}

}  // namespace kelvasi
