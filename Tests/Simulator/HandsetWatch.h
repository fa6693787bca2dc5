// SPDX-License-Identifier: Apache-2.0
// What holds of the connection of every UMTS handset, whichever mode the radio has.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <optional>
#include <set>
#include <utility>
#include <vector>

#include "Simulator/Handset/World.h"

namespace kelvasi::sim::gsm {

using Rrc = RadioConnection::Rrc;

// Of one step to the next: a connection is set up and released by what 3GPP TS 25.331, 7.1, has messages for.
class TransitionWatch {
 public:
  void see(const World& world) {
    static const std::set<std::pair<Rrc, Rrc>> possible{
        {Rrc::disconnected, Rrc::connecting},
        {Rrc::connecting, Rrc::disconnected},
        {Rrc::connecting, Rrc::dch},
        {Rrc::connecting, Rrc::fach},
        {Rrc::dch, Rrc::fach},
        {Rrc::fach, Rrc::dch},
        {Rrc::fach, Rrc::uraPch},
        {Rrc::uraPch, Rrc::fach},
        {Rrc::dch, Rrc::disconnected},
        {Rrc::fach, Rrc::disconnected},
        {Rrc::uraPch, Rrc::disconnected},
    };
    const Rrc now = world.connection().rrc();
    if (now != before_) {
      ASSERT_TRUE(possible.contains({before_, now}))
          << static_cast<int>(before_) << " to " << static_cast<int>(now);
    }
    ASSERT_FALSE(wasReleasing_ && now == Rrc::dch && !world.connection().isReleasing());
    wasReleasing_ = now == Rrc::dch && world.connection().isReleasing();
    before_ = now;
  }

 private:
  Rrc before_ = Rrc::disconnected;
  bool wasReleasing_ = false;
};

// From one dedicated channel to the next only within the active set, that is by soft handover.
class DedicatedChannelWatch {
 public:
  void see(const World& world) {
    const Rrc now = world.connection().rrc();
    if (before_ == Rrc::dch && now == Rrc::dch) {
      ASSERT_THAT(active_, testing::Contains(*world.serving()));
    }
    before_ = now;
    active_ = world.activeSet().cells();
  }

 private:
  std::vector<std::size_t> active_;
  Rrc before_ = Rrc::disconnected;
};

// Of one connection, from its set-up to its release: soon after the set-up ciphering is on, whatever state it
// is in, and without a connection it is off.
class CipheringWatch {
 public:
  void see(const World& world, bool isCiphered) {
    const Rrc rrc = world.connection().rrc();
    const bool isAlive = rrc == Rrc::fach || rrc == Rrc::dch || rrc == Rrc::uraPch;
    establishedFor_ = isAlive ? establishedFor_ + 1 : 0;
    if (establishedFor_ > 5) {
      ASSERT_TRUE(isCiphered) << static_cast<int>(rrc);
      states_.insert(rrc);
    }
    if (!isAlive) {
      ASSERT_FALSE(isCiphered);
    }
  }
  // In which it was on.
  const std::set<Rrc>& states() const { return states_; }

 private:
  int establishedFor_ = 0;  // steps
  std::set<Rrc> states_;
};

}  // namespace kelvasi::sim::gsm
