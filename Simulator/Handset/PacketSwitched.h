// SPDX-License-Identifier: Apache-2.0
// Mobility management of the packet-switched domain (3GPP TS 24.008, 4.1.3.1), with data sessions.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Simulator/Handset/Phase.h"
#include "Simulator/Radio/Cell.h"

namespace kelvasi::sim::gsm {

struct PdpContext {
  int nsapi = 5;
  std::string accessPoint;
  std::string address;
};

class PacketSwitched {
 public:
  enum class Phase {
    off,
    searching,
    attachNeeded,
    attaching,
    limited,
    registered,
    updating,
    requestingService,
    transferring,
    suspended,
    noCell,
    detaching,
  };
  enum class UpdateStatus : std::uint8_t { updated, notUpdated, plmnNotAllowed, routingAreaNotAllowed };

  explicit PacketSwitched(Random random);

  void switchOn();
  void switchOff();
  // Camping on a cell, or on none, for so many seconds. The circuit-switched domain goes first: while it is
  // busy nothing new begins here, and while it has a call in GSM the packet service is suspended.
  void pass(const Cell* cell, Need circuitSwitchedNeed, double seconds);

  Phase phase() const { return clock_.phase(); }
  bool isOff() const { return phase() == Phase::off; }
  bool isRegistered() const { return registeredIn_.has_value(); }
  std::uint8_t state() const { return clock_.row().state; }
  std::string_view stateName() const;
  std::uint8_t subState() const { return clock_.row().subState; }
  UpdateStatus updateStatus() const { return updateStatus_; }
  Need need() const { return clock_.row().need; }
  const std::vector<PdpContext>& contexts() const { return contexts_; }

 private:
  struct RoutingArea {
    LocationArea locationArea;
    std::uint8_t code = 0;
    bool operator==(const RoutingArea&) const = default;
  };
  static RoutingArea areaOf(const Cell& cell) { return {cell.locationArea, cell.routingArea}; }

  void enter(Phase phase) { clock_.enter(phase, random_); }
  void loseCell();
  void follow(const Cell& cell, Need circuitSwitchedNeed);
  void finishPhase(const Cell* cell);
  void finishUpdate(const Cell& cell);
  void beginSomething();
  void activateContext();

  Random random_;
  PhaseClock<Phase> clock_;
  UpdateStatus updateStatus_ = UpdateStatus::notUpdated;
  std::optional<RoutingArea> registeredIn_;
  std::optional<RoutingArea> rejectedBy_;
  std::vector<PdpContext> contexts_;
};

}  // namespace kelvasi::sim::gsm
