// SPDX-License-Identifier: Apache-2.0
// The handset's registration with its network: both domains, and the user who switches it on and off.
#pragma once

#include "Simulator/Handset/CircuitSwitched.h"
#include "Simulator/Handset/PacketSwitched.h"

namespace kelvasi::sim::gsm {

class Registration {
 public:
  // What the records tell of, in short: two equal situations give equal records.
  struct Situation {
    CircuitSwitched::Phase circuitSwitched;
    CircuitSwitched::UpdateStatus circuitSwitchedStatus;
    PacketSwitched::Phase packetSwitched;
    PacketSwitched::UpdateStatus packetSwitchedStatus;
    std::size_t contexts;
    bool isOn;
    bool isCamped;
    std::uint32_t cellId;
    bool operator==(const Situation&) const = default;
  };

  explicit Registration(Random random);

  // Lets so many seconds pass with a cell that could serve, or with none. The cell lasts for the call only.
  void pass(const Cell* cell, double seconds);

  const CircuitSwitched& circuitSwitched() const { return circuitSwitched_; }
  const PacketSwitched& packetSwitched() const { return packetSwitched_; }
  bool isOn() const { return isOn_; }
  // Whether the radio is of any use: the handset is on, or still detaching.
  bool needsCell() const { return !circuitSwitched_.isOff() || !packetSwitched_.isOff(); }
  bool isSearching() const { return circuitSwitched_.phase() == CircuitSwitched::Phase::searching; }

  // Numbers of the tables of the registration and registered-PLMN records.
  std::uint8_t registrationState() const;
  std::uint8_t selectionMode() const;
  std::uint8_t serviceType() const;

  // Whether it is past its PLMN search and has chosen the cell.
  bool isCamped() const { return isCamped_; }
  // The cell it camps on, the last one when it camps on none. Before the first it has the home network's
  // identity and no area.
  const Cell& lastCell() const { return lastCell_; }
  Situation situation() const;

 private:
  void turnPower();
  bool isRegistering() const;
  bool isLimited() const;

  Random random_;
  CircuitSwitched circuitSwitched_;
  PacketSwitched packetSwitched_;
  bool isOn_ = false;
  double untilPowerTurns_;
  Cell lastCell_;
  bool isCamped_ = false;
};

}  // namespace kelvasi::sim::gsm
