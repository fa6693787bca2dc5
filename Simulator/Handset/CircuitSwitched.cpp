// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Handset/CircuitSwitched.h"

#include <array>

#include "LogGenerator/GSM/MMState.h"

namespace kelvasi::sim::gsm {

namespace {

consteval std::uint8_t state(std::string_view text) {
  return numberOf(mmState::states, text);
}
consteval std::uint8_t subState(std::string_view text) {
  return numberOf(mmState::subStates, text);
}
constexpr std::uint8_t noSubState = subState("MM_NULL_SUBSTATE");
constexpr double forEver = 1e9;

constexpr std::array rows{
    /* off */ PhaseRow{state("MM_NULL"), noSubState, forEver, forEver},
    /* searching */ PhaseRow{state("MM_IDLE"), subState("MM_PLMN_SEARCH"), 2, 6},
    /* updateNeeded */ PhaseRow{state("MM_IDLE"), subState("MM_LOCATION_UPDATE_NEEDED"), 0.4, 1.2},
    /* connectingToUpdate */
    PhaseRow{state("MM_WAIT_FOR_RR_CONNECTION_LU"), noSubState, 1.2, 2, Need::connecting},
    /* updating */ PhaseRow{state("MM_LOCATION_UPDATE_INITIATED"), noSubState, 0.8, 2.5, Need::signalling},
    /* rejected */ PhaseRow{state("MM_LOCATION_UPDATE_REJECTED"), noSubState, 0.5, 1, Need::signalling},
    /* limited */ PhaseRow{state("MM_IDLE"), subState("MM_LIMITED_SERVICE"), forEver, forEver},
    /* idle */ PhaseRow{state("MM_IDLE"), subState("MM_NORMAL_SERVICE"), 10, 60},
    /* connectingToCall */
    PhaseRow{state("MM_WAIT_FOR_RR_CONNECTION_MM"), noSubState, 1.2, 2, Need::connecting},
    /* requestingCall */
    PhaseRow{state("MM_WAIT_FOR_OUTGOING_MM_CONNECTION"), noSubState, 0.6, 2, Need::signalling},
    /* inCall */ PhaseRow{state("MM_CONNECTION_ACTIVE"), noSubState, 10, 60, Need::speech},
    /* releasingCall */
    PhaseRow{state("MM_WAIT_FOR_NETWORK_COMMAND"), noSubState, 0.4, 1.5, Need::signalling},
    /* noCell */ PhaseRow{state("MM_IDLE"), subState("MM_NO_CELL_AVAILABLE"), forEver, forEver},
    /* detaching */ PhaseRow{state("MM_IMSI_DETACH_INITIATED"), noSubState, 0.4, 1, Need::signalling},
};
static_assert(rows.size() == static_cast<std::size_t>(CircuitSwitched::Phase::detaching) + 1);

constexpr double shareOfCalls = 0.6;  // of what ends an idle time; the rest are periodic updates
constexpr double shareOfFailures = 0.04;

}  // namespace

CircuitSwitched::CircuitSwitched(Random random) : random_(random), clock_(rows, Phase::off) {}

std::string_view CircuitSwitched::stateName() const {
  return mmState::states.at(state());
}

void CircuitSwitched::switchOn() {
  if (isOff()) enter(Phase::searching);
}

void CircuitSwitched::switchOff() {
  enter(registeredIn_ && phase() != Phase::noCell ? Phase::detaching : Phase::off);
  registeredIn_.reset();
  rejectedBy_.reset();
}

void CircuitSwitched::pass(const Cell* cell, double seconds) {
  if (isOff()) return;
  if (!cell) loseCell();
  if (cell) follow(*cell);
  if (clock_.pass(seconds)) finishPhase(cell);
}

void CircuitSwitched::loseCell() {
  if (phase() == Phase::searching || phase() == Phase::noCell) return;
  if (phase() == Phase::detaching) return enter(Phase::off);
  enter(registeredIn_ ? Phase::noCell : Phase::searching);
}

void CircuitSwitched::follow(const Cell& cell) {
  const bool isElsewhere = registeredIn_ != cell.locationArea;
  switch (phase()) {
    case Phase::noCell:
      return enter(isElsewhere ? Phase::updateNeeded : Phase::idle);
    case Phase::idle:
      if (isElsewhere) enter(Phase::updateNeeded);
      return;
    case Phase::limited:
      if (rejectedBy_ != cell.locationArea) enter(Phase::updateNeeded);
      return;
    default:
      return;
  }
}

void CircuitSwitched::finishPhase(const Cell* cell) {
  switch (phase()) {
    case Phase::searching:
      return enter(cell ? Phase::updateNeeded : Phase::searching);
    case Phase::updateNeeded:
      return enter(Phase::connectingToUpdate);
    case Phase::connectingToUpdate:
      return enter(Phase::updating);
    case Phase::updating:
      if (cell) finishUpdate(*cell);
      return;
    case Phase::rejected:
      return enter(Phase::limited);
    case Phase::idle:
      return beginSomething();
    case Phase::connectingToCall:
      return enter(Phase::requestingCall);
    case Phase::requestingCall:
      return enter(random_.happens(shareOfFailures) ? Phase::releasingCall : Phase::inCall);
    case Phase::inCall:
      return enter(Phase::releasingCall);
    case Phase::releasingCall:
      return enter(Phase::idle);
    case Phase::detaching:
      return enter(Phase::off);
    default:
      return;
  }
}

void CircuitSwitched::finishUpdate(const Cell& cell) {
  if (cell.isForbidden) {
    updateStatus_ = UpdateStatus::locationAreaNotAllowed;
    registeredIn_.reset();
    rejectedBy_ = cell.locationArea;
    return enter(Phase::rejected);
  }
  if (random_.happens(shareOfFailures)) {
    updateStatus_ = UpdateStatus::notUpdated;
    return enter(Phase::updateNeeded);
  }
  updateStatus_ = UpdateStatus::updated;
  registeredIn_ = cell.locationArea;
  rejectedBy_.reset();
  enter(Phase::idle);
}

void CircuitSwitched::beginSomething() {
  enter(random_.happens(shareOfCalls) ? Phase::connectingToCall : Phase::connectingToUpdate);
}

}  // namespace kelvasi::sim::gsm
