// SPDX-License-Identifier: Apache-2.0
// What became of the messages of every generator since the beginning.
#pragma once

#include <vector>

#include "Cockpit/Events/Coverage.h"
#include "LogGenerator/Intake.h"

namespace kelvasi::cockpit {

class CoverageBook {
 public:
  // After each message. An intake that has counted fewer messages than the one before is another
  // generator's; what was counted so far is kept beside it.
  void take(const Intake& intake);
  Coverage at(Arrival now) const;

 private:
  void keep(std::span<const IntakeCount> counts);
  void keepEarlier();

  // Of this generator what was not shown, by the place in its intake.
  std::vector<IntakeCount> counts_;
  std::uint64_t messages_ = 0;
  std::uint64_t shown_ = 0;
  // Of those before it.
  std::vector<IntakeCount> earlier_;
  std::uint64_t earlierMessages_ = 0;
  std::uint64_t earlierShown_ = 0;
};

}  // namespace kelvasi::cockpit
