// SPDX-License-Identifier: Apache-2.0
// The log codes that an application asked for in its start command.
#pragma once

#include <unordered_set>

#include "Plist/PlistValue.h"
#include "Simulator/Message.h"

namespace kelvasi::sim {

class Subscription {
 public:
  // A command without any list of codes asks for everything, as an object-stream application does. Elements
  // that are no code are left out.
  static Subscription fromStartCommand(const PlistDictionary& command);

  // What is no log record is held back from nobody.
  bool wants(const Message& message) const {
    return everything_ || !message.logCode || codes_.contains(*message.logCode);
  }
  std::size_t size() const { return codes_.size(); }
  bool isForEverything() const { return everything_; }

 private:
  bool everything_ = false;
  std::unordered_set<LogCode> codes_;
};

}  // namespace kelvasi::sim
