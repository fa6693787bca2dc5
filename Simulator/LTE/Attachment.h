// SPDX-License-Identifier: Apache-2.0
// The handset's attachment to the LTE core and its RRC connection (3GPP TS 24.301, 5.1.3.2;
// TS 36.331, 4.2.1), with a user who switches it on and off and sends data now and then.
#pragma once

#include <optional>
#include <vector>

#include "Simulator/Handset/PacketSwitched.h"
#include "Simulator/Handset/Phase.h"
#include "Simulator/Radio/Cell.h"

namespace kelvasi::sim::lte {

enum class Emm : std::uint8_t {
  null,
  deregistered,
  registeredInitiated,
  registered,
  trackingAreaUpdatingInitiated,
  serviceRequestInitiated,
  deregisteredInitiated,
};

class Attachment {
 public:
  enum class Phase {
    off,
    searching,
    attaching,
    idle,
    updating,
    requestingService,
    transferring,
    inactive,
    elsewhere,
    detaching,
  };

  explicit Attachment(Random random);

  // Lets so many seconds pass on this cell of any technology, or on none. The cell lasts for the call only.
  void pass(const Cell* cell, double seconds);

  Phase phase() const { return clock_.phase(); }
  Emm emm() const {
    const bool isUnknown = phase() == Phase::elsewhere && !registeredIn_;
    return isUnknown ? Emm::deregistered : static_cast<Emm>(clock_.row().state);
  }
  bool isOn() const { return phase() != Phase::off; }
  // Whether it is past its search and camps on cells.
  bool isCamped() const { return isOn() && phase() != Phase::searching; }
  // RRC_CONNECTED, otherwise RRC_IDLE.
  bool isConnected() const { return clock_.row().need >= gsm::Need::signalling; }
  // The bearers with an address; none while the handset is not attached.
  const std::vector<gsm::PdpContext>& contexts() const { return contexts_; }

 private:
  void enter(Phase phase) { clock_.enter(phase, random_); }
  void turnPower();
  void follow(const Cell* cell);
  void finishPhase(const Cell& cell);
  void attach(const Cell& cell);

  Random random_;
  gsm::PhaseClock<Phase> clock_;
  double untilPowerTurns_;
  std::optional<LocationArea> registeredIn_;
  std::vector<gsm::PdpContext> contexts_;
};

}  // namespace kelvasi::sim::lte
