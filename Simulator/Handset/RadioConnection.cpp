// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Handset/RadioConnection.h"

#include <algorithm>

namespace kelvasi::sim::gsm {

namespace {
// Seconds.
constexpr double setUpTime = 0.4;
constexpr double releaseTime = 0.4;
constexpr double keptInFachTime = 3;
constexpr double keptInUraPchTime = 6;
constexpr double shortestBurst = 2;
constexpr double longestBurst = 8;
constexpr double shortestPause = 1;
constexpr double longestPause = 4;
}  // namespace

void RadioConnection::pass(const Cell* serving, Need circuitSwitched, Need packetSwitched, double seconds) {
  noteNeeds(circuitSwitched, packetSwitched);
  if (!serving) {
    technology_.reset();
    hasChangedTechnology_ = false;
    return enter(Stage::none);
  }
  const bool isLost = isLeftBehind(*serving);
  noteCell(*serving);
  inStage_ += seconds;
  enter(isLost ? Stage::none : next());
  if (isConnected() && packetSwitched_ == Need::data) hasSession_ = true;
  establishedFor_ = isEstablished() ? establishedFor_ + seconds : 0;
  passBursts(seconds);
}

void RadioConnection::noteNeeds(Need circuitSwitched, Need packetSwitched) {
  isHeld_ = (circuitSwitched != Need::none && circuitSwitched_ != Need::none) ||
            (packetSwitched != Need::none && packetSwitched_ != Need::none);
  circuitSwitched_ = circuitSwitched;
  packetSwitched_ = packetSwitched;
}

// What is kept without a use, when the handset goes to another technology or network.
bool RadioConnection::isLeftBehind(const Cell& serving) const {
  return isKept() && (technology_ != serving.technology || plmn_ != serving.locationArea.plmn);
}

void RadioConnection::noteCell(const Cell& serving) {
  hasChangedTechnology_ = technology_ && technology_ != serving.technology;
  technology_ = serving.technology;
  plmn_ = serving.locationArea.plmn;
}

void RadioConnection::enter(Stage stage) {
  if (stage == stage_) return;
  inStage_ = 0;
  stage_ = stage;
  if (!isEstablished()) hasSession_ = false;
}

Need RadioConnection::need() const {
  return std::max(circuitSwitched_, packetSwitched_);
}

RadioConnection::Stage RadioConnection::next() const {
  switch (stage_) {
    case Stage::none:
      return need() == Need::none ? Stage::none : Stage::connecting;
    case Stage::connecting:
      return afterConnecting();
    case Stage::connected:
      return afterConnected();
    case Stage::keptInFach:
      if (need() > Need::connecting) return Stage::connected;
      return need() == Need::none && inStage_ >= keptInFachTime ? Stage::keptInUraPch : stage_;
    case Stage::keptInUraPch:
      if (need() != Need::none) return Stage::keptInFach;  // a cell update
      return inStage_ >= keptInUraPchTime ? Stage::none : stage_;
    case Stage::releasing:
      return inStage_ >= releaseTime ? Stage::none : stage_;
  }
  return stage_;
}

RadioConnection::Stage RadioConnection::afterConnecting() const {
  if (need() == Need::none) return Stage::none;
  const bool isSetUp =
      need() > Need::connecting && (circuitSwitched_ > Need::connecting || inStage_ >= setUpTime);
  return isSetUp ? Stage::connected : stage_;
}

// A domain that begins when the other one ends sets up a connection of its own.
RadioConnection::Stage RadioConnection::afterConnected() const {
  if (isHeld_) return stage_;
  if (hasSession_ && technology_ == Technology::umts) return Stage::keptInFach;
  return Stage::releasing;
}

void RadioConnection::passBursts(double seconds) {
  if (packetSwitched_ != Need::data) {
    isBurst_ = false;
    untilBurstTurns_ = 0;
    return;
  }
  untilBurstTurns_ -= seconds;
  if (untilBurstTurns_ > 0) return;
  isBurst_ = !isBurst_;
  untilBurstTurns_ =
      isBurst_ ? random_.between(shortestBurst, longestBurst) : random_.between(shortestPause, longestPause);
}

RadioConnection::Rrc RadioConnection::rrc() const {
  if (technology_ != Technology::umts) return Rrc::disconnected;
  switch (stage_) {
    case Stage::none:
      return Rrc::disconnected;
    case Stage::connecting:
      return Rrc::connecting;
    case Stage::connected: {
      const bool isPause = circuitSwitched_ <= Need::connecting && packetSwitched_ == Need::data && !isBurst_;
      return isPause ? Rrc::fach : Rrc::dch;
    }
    case Stage::keptInFach:
      return Rrc::fach;
    case Stage::keptInUraPch:
      return Rrc::uraPch;
    case Stage::releasing:
      return Rrc::dch;
  }
  return Rrc::disconnected;
}

}  // namespace kelvasi::sim::gsm
