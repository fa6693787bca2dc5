// SPDX-License-Identifier: Apache-2.0
// Mobility management of the circuit-switched domain (3GPP TS 24.008, 4.1.2.1), with calls.
#pragma once

#include <optional>
#include <string_view>

#include "Simulator/Handset/Phase.h"
#include "Simulator/Radio/Cell.h"

namespace kelvasi::sim::gsm {

class CircuitSwitched {
 public:
  enum class Phase {
    off,
    searching,
    updateNeeded,
    connectingToUpdate,
    updating,
    rejected,
    limited,
    idle,
    connectingToCall,
    requestingCall,
    inCall,
    releasingCall,
    noCell,
    detaching,
  };
  enum class UpdateStatus : std::uint8_t { updated, notUpdated, roamingNotAllowed, locationAreaNotAllowed };

  explicit CircuitSwitched(Random random);

  void switchOn();
  void switchOff();
  // Camping on a cell, or on none, for so many seconds.
  void pass(const Cell* cell, double seconds);

  Phase phase() const { return clock_.phase(); }
  bool isOff() const { return phase() == Phase::off; }
  bool isRegistered() const { return registeredIn_.has_value(); }
  bool isBusy() const { return need() != Need::none; }
  std::uint8_t state() const { return clock_.row().state; }
  std::string_view stateName() const;
  std::uint8_t subState() const { return clock_.row().subState; }
  UpdateStatus updateStatus() const { return updateStatus_; }
  Need need() const { return clock_.row().need; }

 private:
  void enter(Phase phase) { clock_.enter(phase, random_); }
  void loseCell();
  void follow(const Cell& cell);
  void finishPhase(const Cell* cell);
  void finishUpdate(const Cell& cell);
  void beginSomething();

  Random random_;
  PhaseClock<Phase> clock_;
  UpdateStatus updateStatus_ = UpdateStatus::notUpdated;
  std::optional<LocationArea> registeredIn_;
  std::optional<LocationArea> rejectedBy_;
};

}  // namespace kelvasi::sim::gsm
