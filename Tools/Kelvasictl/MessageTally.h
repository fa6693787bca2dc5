// SPDX-License-Identifier: Apache-2.0
// How many messages a verb took in, and how many of them it could not show.
#pragma once

#include <cstdint>
#include <string>

#include "LogGenerator/Intake.h"

namespace kelvasi {

class MessageTally {
 public:
  void add(const Intake& intake) {
    messages_ += intake.messages();
    shown_ += intake.messages(Outcome::shown);
  }
  // "12 % of 8,812 messages were not shown"; empty when all were.
  std::string text() const;

 private:
  std::uint64_t messages_ = 0;
  std::uint64_t shown_ = 0;
};

}  // namespace kelvasi
