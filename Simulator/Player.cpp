// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Player.h"

#include <algorithm>
#include <chrono>

namespace kelvasi::sim {

namespace {

using namespace std::chrono_literals;

constexpr auto tickInterval = 10ms;
// A daemon that was stopped or a clock that was set does not make up for more than this.
constexpr double longestTick = 1;
// At full speed: messages between two looks at the main queue, and how long an application may take nothing.
constexpr std::size_t burstSize = 256;
constexpr auto retryInterval = 1ms;
constexpr double patience = 0.2;

}  // namespace

Player::Player(MainQueue& queue, const Clock& clock, Daemon& daemon, MessageSource& source, Speed speed,
               const Faults& faults, EndHandler onEnd)
    : queue_(queue),
      clock_(clock),
      daemon_(daemon),
      source_(source),
      speed_(speed),
      faults_(faults),
      onEnd_(std::move(onEnd)) {}

void Player::streamBegan(Channel& channel) {
  if (!isPlaying_ && !source_.nextAt()) {
    source_.rewind();
    worldNow_ = WorldTime(0);
  }
  Messages greeting;
  source_.greet(greeting);
  faults_.apply(greeting);
  for (const Message& message : greeting) channel.send(message);
  if (!isPlaying_) play();
}

void Player::play() {
  isPlaying_ = true;
  lastTick_ = lastProgress_ = now();
  if (speed_.isUnlimited()) {
    queue_.post(whileAlive(&Player::burst));
  } else {
    timer_ = queue_.repeat(tickInterval, [this] { tick(); });
  }
}

void Player::stop() {
  isPlaying_ = false;
  timer_.reset();
}

void Player::tick() {
  const double elapsed = std::clamp(now() - lastTick_, 0.0, longestTick);
  lastTick_ = now();
  if (!daemon_.isStreaming()) return stop();
  advance(worldNow_ +
          std::chrono::duration_cast<WorldTime>(std::chrono::duration<double>(elapsed * speed_.factor)));
}

void Player::advance(WorldTime until) {
  worldNow_ = until;
  while (const auto due = source_.nextAt()) {
    if (*due > until) return;
    batch_.clear();
    source_.take(batch_);
    faults_.apply(batch_);
    daemon_.send(batch_);
  }
  stop();
  onEnd_();
}

void Player::burst() {
  if (!daemon_.isStreaming()) return stop();
  if (!daemon_.flush()) return waitForApplications();
  lastProgress_ = now();
  if (!source_.nextAt()) {
    stop();
    return onEnd_();
  }
  for (std::size_t sent = 0; sent < burstSize && source_.nextAt();
       sent += std::max<std::size_t>(batch_.size(), 1)) {
    batch_.clear();
    source_.take(batch_);
    faults_.apply(batch_);
    daemon_.sendOrHold(batch_);
  }
  queue_.post(whileAlive(&Player::burst));
}

void Player::waitForApplications() {
  if (now() - lastProgress_ > patience) {
    daemon_.giveUp();
    lastProgress_ = now();
  }
  queue_.postAfter(retryInterval, whileAlive(&Player::burst));
}

Task Player::whileAlive(void (Player::*step)()) {
  return [this, step, alive = std::weak_ptr(alive_)] {
    if (!alive.expired()) (this->*step)();
  };
}

}  // namespace kelvasi::sim
