// SPDX-License-Identifier: Apache-2.0
// The 1x side of the handset: from the search for a system over idle and access to a call, and back
// (3GPP2 C.S0005: Initialization, Idle, System Access and Control on the Traffic Channel), simplified.
#pragma once

#include <cstdint>
#include <span>
#include <vector>

#include "Simulator/C2K/PilotSets.h"
#include "Simulator/Random.h"

namespace kelvasi::sim::c2k {

class OneX {
 public:
  enum class Stage { outOfService, determining, acquiring, synchronizing, idle, accessing, inCall };

  // Numbers of the device status record's states.
  enum class State : std::uint8_t {
    deepSleep = 1,
    initial = 2,
    acquisition = 3,
    sync = 4,
    paging = 6,
    sleep = 7,
    traffic = 8,
  };

  OneX(std::size_t cellCount, Random random) : random_(random), pilots_(cellCount) {}

  // With the Ec/Io of every cell, dB, for so many seconds.
  void pass(std::span<const double> ratios, bool wantsCall, double seconds);

  Stage stage() const { return stage_; }
  State state() const;
  bool hasSystem() const { return stage_ >= Stage::idle; }
  bool isInCall() const { return stage_ == Stage::inCall; }
  // From EV-DO, to register as well as for a call.
  bool takesRadio() const { return stage_ == Stage::accessing || isInCall(); }
  // Whether the last pass has lost the call.
  bool hasDroppedCall() const { return hasDroppedCall_; }
  const PilotSets& pilots() const { return pilots_; }
  // The frames of the last pass in a call; true is an error.
  const std::vector<bool>& frames() const { return frames_; }

 private:
  void enter(Stage stage);
  void search(std::span<const double> ratios);
  void passIdle(std::span<const double> ratios, bool wantsCall, double seconds);
  void passAccess(bool wantsCall);
  void passCall(std::span<const double> ratios, bool wantsCall, double seconds);
  bool mustRegister() const;

  Random random_;
  PilotSets pilots_;
  Stage stage_ = Stage::determining;
  double inStage_ = 0;  // seconds
  double lostFor_ = 0;  // seconds since the forward link was last heard
  std::size_t registeredAt_ = static_cast<std::size_t>(-1);
  std::size_t searches_ = 0;
  std::vector<bool> frames_;
  bool isForCall_ = false;  // the access, rather than for a registration
  bool hasDroppedCall_ = false;
};

}  // namespace kelvasi::sim::c2k
