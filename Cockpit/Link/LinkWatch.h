// SPDX-License-Identifier: Apache-2.0
// Keeps what the link is told by.
#pragma once

#include "Cockpit/Link/Link.h"
#include "LogGenerator/Intake.h"

namespace kelvasi::cockpit {

class LinkWatch {
 public:
  // Older than that the link is silent; an event says so at the same time.
  static constexpr std::chrono::seconds silence{15};

  void take(Arrival time, const Intake& intake);
  void hear(LinkReport report) { report_ = std::move(report); }
  const LinkReport& report() const { return report_; }

  Link at(Arrival now, const TextStyle& style) const;

 private:
  LinkState stateAt(Arrival now) const;
  void addWords(Link& link, Arrival now, const TextStyle& style) const;

  LinkReport report_;
  std::optional<Arrival> lastMessage_;
  // Of this generator, and of those before it.
  std::uint64_t messages_ = 0;
  std::uint64_t shown_ = 0;
  std::uint64_t earlierMessages_ = 0;
  std::uint64_t earlierShown_ = 0;
};

}  // namespace kelvasi::cockpit
