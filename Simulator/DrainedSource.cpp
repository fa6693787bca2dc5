// SPDX-License-Identifier: Apache-2.0
#include "Simulator/DrainedSource.h"

#include "Simulator/MessageFaults.h"

namespace kelvasi::sim {

namespace {

class Drain {
 public:
  Drain(std::uint64_t count, const MessageTaker& take) : left_(count), take_(take) {}

  bool wantsMore() const { return wantsMore_ && left_ > 0; }
  std::uint64_t taken() const { return taken_; }

  void takeAll(const Messages& messages, WorldTime at) {
    for (const Message& message : messages) {
      if (message.id != 0) continue;
      if (!wantsMore()) return;
      wantsMore_ = take_(message, at);
      if (!wantsMore_) return;
      ++taken_;
      --left_;
    }
  }

 private:
  std::uint64_t left_;
  const MessageTaker& take_;
  std::uint64_t taken_ = 0;
  bool wantsMore_ = true;
};

}  // namespace

std::uint64_t drain(MessageSource& source, const Faults& faults, std::uint64_t count,
                    const MessageTaker& take) {
  MessageFaults damage(faults);
  Drain drain(count, take);
  Messages messages;
  source.greet(messages);
  damage.apply(messages);
  drain.takeAll(messages, WorldTime(0));
  while (drain.wantsMore()) {
    const auto at = source.nextAt();
    if (!at) break;
    messages.clear();
    source.take(messages);
    damage.apply(messages);
    drain.takeAll(messages, *at);
  }
  return drain.taken();
}

}  // namespace kelvasi::sim
