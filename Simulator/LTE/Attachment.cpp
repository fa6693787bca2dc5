// SPDX-License-Identifier: Apache-2.0
#include "Simulator/LTE/Attachment.h"

#include <array>

namespace kelvasi::sim::lte {

namespace {

using gsm::Need;
using gsm::PhaseRow;

constexpr double forEver = 1e9;

constexpr PhaseRow row(Emm emm, double shortest, double longest, Need need = Need::none) {
  return {static_cast<std::uint8_t>(emm), 0, shortest, longest, need};
}

constexpr std::array rows{
    /* off */ row(Emm::null, forEver, forEver),
    /* searching */ row(Emm::deregistered, 2, 6),
    /* attaching */ row(Emm::registeredInitiated, 0.6, 2, Need::signalling),
    /* idle */ row(Emm::registered, 8, 40),
    /* updating */ row(Emm::trackingAreaUpdatingInitiated, 0.6, 1.6, Need::signalling),
    /* requestingService */ row(Emm::serviceRequestInitiated, 0.2, 0.6, Need::connecting),
    /* transferring */ row(Emm::registered, 8, 40, Need::data),
    /* inactive */ row(Emm::registered, 4, 10, Need::signalling),
    /* elsewhere */ row(Emm::registered, forEver, forEver),
    /* detaching */ row(Emm::deregisteredInitiated, 0.3, 1, Need::signalling),
};
static_assert(rows.size() == static_cast<std::size_t>(Attachment::Phase::detaching) + 1);

constexpr double shortestOn = 400;  // seconds
constexpr double longestOn = 900;
constexpr double shortestOff = 6;
constexpr double longestOff = 20;

}  // namespace

Attachment::Attachment(Random random)
    : random_(random), clock_(rows, Phase::off), untilPowerTurns_(random_.between(1, 3)) {}

void Attachment::pass(const Cell* cell, double seconds) {
  untilPowerTurns_ -= seconds;
  if (untilPowerTurns_ <= 0) turnPower();
  if (!isOn()) return;
  follow(cell);
  const bool isOver = clock_.pass(seconds);
  if (phase() == Phase::detaching && (isOver || !cell)) return enter(Phase::off);
  if (isOver && cell) finishPhase(*cell);
}

void Attachment::turnPower() {
  const bool wasOn = isOn();
  untilPowerTurns_ =
      wasOn ? random_.between(shortestOff, longestOff) : random_.between(shortestOn, longestOn);
  if (!wasOn) return enter(Phase::searching);
  registeredIn_.reset();
  contexts_.clear();
  enter(phase() == Phase::searching || phase() == Phase::elsewhere ? Phase::off : Phase::detaching);
}

// Without an LTE cell there is nothing to do but to wait; GSM and UMTS keep the registration alive.
void Attachment::follow(const Cell* cell) {
  if (phase() == Phase::searching || phase() == Phase::detaching) return;
  const bool isOnLte = cell && cell->technology == Technology::lte;
  if (!isOnLte && phase() != Phase::elsewhere) return enter(Phase::elsewhere);
  if (isOnLte && phase() == Phase::elsewhere)
    return enter(registeredIn_ ? Phase::updating : Phase::attaching);
  if (isOnLte && phase() == Phase::idle && registeredIn_ != cell->locationArea) enter(Phase::updating);
}

void Attachment::finishPhase(const Cell& cell) {
  switch (phase()) {
    case Phase::searching:
      return enter(Phase::attaching);
    case Phase::attaching:
      return attach(cell);
    case Phase::updating:
      registeredIn_ = cell.locationArea;
      return enter(Phase::idle);
    case Phase::idle:
      return enter(Phase::requestingService);
    case Phase::requestingService:
      return enter(Phase::transferring);
    case Phase::transferring:
      return enter(Phase::inactive);
    default:
      return enter(Phase::idle);
  }
}

void Attachment::attach(const Cell& cell) {
  registeredIn_ = cell.locationArea;
  contexts_ = {
      {.nsapi = 5, .accessPoint = "internet", .address = "10.0.0." + std::to_string(random_.among(2, 254))},
      {.nsapi = 6, .accessPoint = "ims", .address = "10.1.0." + std::to_string(random_.among(2, 254))}};
  enter(Phase::inactive);
}

}  // namespace kelvasi::sim::lte
