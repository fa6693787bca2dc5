// SPDX-License-Identifier: Apache-2.0
// The EV-DO side of the handset: its air-interface states and its session (3GPP2 C.S0024), simplified. It
// shares one radio with 1x, and is off while 1x registers or is in a call.
#pragma once

#include <cstdint>
#include <optional>
#include <span>

#include "Simulator/C2K/PilotSets.h"
#include "Simulator/Random.h"

namespace kelvasi::sim::c2k {

class Evdo {
 public:
  // Numbers of the status record's states.
  enum class State : std::uint8_t { inactive, acquisition, sync, idle, access, connected };
  enum class Session : std::uint8_t { closed, ampSetup, terminalNegotiates, networkNegotiates, open };

  struct Situation {
    std::span<const double> ratios;            // of the pilots of every cell, dB
    std::span<const std::uint8_t> colorCodes;  // of every cell
    bool isRadioTaken = false;                 // by 1x
    bool wantsData = false;
  };

  Evdo(std::size_t cellCount, Random random) : random_(random), pilots_(cellCount) {}

  void pass(const Situation& situation, double seconds);

  State state() const { return state_; }
  Session session() const { return session_; }
  bool isConnected() const { return state_ == State::connected; }
  bool isTransferring() const { return isConnected() && session_ == Session::open; }
  const PilotSets& pilots() const { return pilots_; }
  // The cell whose forward link is received; nothing before there is one.
  std::optional<std::size_t> serving() const { return serving_; }
  std::uint32_t uati24() const { return uati24_; }
  std::uint8_t colorCode() const { return colorCode_; }

 private:
  void enter(State state);
  void close();
  void search(const Situation& situation);
  void passIdle(const Situation& situation, double seconds);
  void passConnected(const Situation& situation, double seconds);
  void negotiate();
  void follow(const Situation& situation);
  bool needsAddress(const Situation& situation) const;

  Random random_;
  PilotSets pilots_;
  std::optional<std::size_t> serving_;
  State state_ = State::inactive;
  Session session_ = Session::closed;
  bool hasConfiguration_ = false;  // agreed on once, kept when the address changes
  double inState_ = 0;             // seconds
  double inSession_ = 0;           // seconds in the session's state
  double lostFor_ = 0;             // seconds
  double idleFor_ = 0;             // seconds without data in a connection
  std::uint32_t uati24_ = 0;
  std::uint8_t colorCode_ = 0;
};

}  // namespace kelvasi::sim::c2k
