// SPDX-License-Identifier: Apache-2.0
#include "Simulator/ReplaySource.h"

#include <algorithm>
#include <utility>

namespace kelvasi::sim {

namespace {
constexpr WorldTime pauseBetweenRounds = std::chrono::seconds(1);
}

ReplaySource::ReplaySource(Opener open, bool isLooping, EndHandler onEnd)
    : open_(std::move(open)), isLooping_(isLooping), onEnd_(std::move(onEnd)) {
  readFirst();
}

void ReplaySource::take(Messages& messages) {
  messages.push_back(logMessage(std::move(next_)));
  readNext();
}

void ReplaySource::rewind() {
  begin_ = WorldTime(0);
  readFirst();
}

void ReplaySource::readFirst() {
  capture_ = open_();
  due_.reset();
  const auto message = capture_->next();
  if (!message) return onEnd_(*capture_);
  firstArrival_ = message->arrival;
  due_ = begin_;
  keep(*message);
}

void ReplaySource::readNext() {
  if (const auto message = capture_->next()) return keep(*message);
  onEnd_(*capture_);
  begin_ = *due_ + pauseBetweenRounds;
  if (isLooping_) {
    readFirst();
  } else {
    due_.reset();
  }
}

// Time never goes back, whatever the capture's stamps say.
void ReplaySource::keep(const CapturedMessage& message) {
  next_.assign(message.bytes.begin(), message.bytes.end());
  const auto sinceFirst = std::chrono::duration_cast<WorldTime>(message.arrival - firstArrival_);
  due_ = std::max(*due_, begin_ + sinceFirst);
}

}  // namespace kelvasi::sim
