// SPDX-License-Identifier: Apache-2.0
#include "Simulator/MessageFaults.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <utility>

namespace kelvasi::sim {

namespace {

constexpr std::array<std::uint8_t, 2> prefix{0x81, 0x00};
constexpr std::array<std::uint8_t, 4> invalidTypes{0x00, 0x02, 0x7F, 0xFE};
constexpr std::array<MessageId, 4> otherIds{1, 2, 0x80000000, 0xFFFFFFFF};

bool carriesPropertyList(const Message& message) {
  return !message.logCode || *message.logCode >= extraLogCodes;
}

template <typename Choices>
auto choice(const Choices& choices, std::uint64_t turn) {
  return choices[turn % choices.size()];
}

Message withInvalidType(Message message, std::uint64_t turn) {
  if (!message.bytes.empty()) message.bytes.front() = choice(invalidTypes, turn);
  return message;
}

Message underOtherId(Message message, std::uint64_t turn) {
  message.id = choice(otherIds, turn);
  std::ranges::reverse(message.bytes);
  return message;
}

}  // namespace

MessageFaults::MessageFaults(const Faults& faults) {
  const auto period = [&](Fault fault) { return static_cast<Period>(faults.value(fault).value_or(0)); };
  prefixEvery_ = period(Fault::prefix);
  shortEvery_ = period(Fault::shortRecords);
  invalidTypeEvery_ = period(Fault::invalidType);
  otherIdEvery_ = period(Fault::otherId);
}

void MessageFaults::apply(Messages& messages) {
  if (isIdle()) return;
  Messages damaged;
  for (Message& message : messages) {
    ++count_;
    Messages companions;
    if (strikes(invalidTypeEvery_))
      companions.push_back(withInvalidType(message, count_ / invalidTypeEvery_));
    if (strikes(otherIdEvery_)) companions.push_back(underOtherId(message, count_ / otherIdEvery_));
    damage(message);
    damaged.push_back(std::move(message));
    std::ranges::move(companions, std::back_inserter(damaged));
  }
  messages = std::move(damaged);
}

// The length runs through all that are too short, so that in time every minimum is undercut by every amount.
void MessageFaults::damage(Message& message) const {
  if (strikes(shortEvery_) && !carriesPropertyList(message) && !message.bytes.empty())
    message.bytes.resize(count_ / shortEvery_ % message.bytes.size());
  if (strikes(prefixEvery_)) message.bytes.insert(message.bytes.begin(), prefix.begin(), prefix.end());
}

}  // namespace kelvasi::sim
