// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Channel.h"

#include <utility>

namespace kelvasi::sim {

Channel::Channel(std::string name, std::unique_ptr<RemotePort> application)
    : name_(std::move(name)), application_(std::move(application)) {}

bool Channel::handOver(const Message& message) {
  if (!application_->sendNow(message.id, message.bytes)) return false;
  isStalled_ = false;
  return true;
}

void Channel::send(const Message& message) {
  if (subscription_ && subscription_->wants(message) && !handOver(message)) ++dropped_;
}

void Channel::sendOrHold(const Message& message) {
  if (!subscription_ || !subscription_->wants(message)) return;
  if (held_.empty() && handOver(message)) return;
  if (isStalled_ || !isValid()) {
    ++dropped_;
  } else {
    held_.push_back(message);
  }
}

bool Channel::flush() {
  bool isProgress = false;
  while (!held_.empty() && handOver(held_.front())) {
    held_.pop_front();
    isProgress = true;
  }
  return isProgress;
}

void Channel::giveUp() {
  dropped_ += held_.size();
  held_.clear();
  isStalled_ = true;
}

std::uint64_t Channel::takeDropped() {
  return std::exchange(dropped_, 0);
}

}  // namespace kelvasi::sim
