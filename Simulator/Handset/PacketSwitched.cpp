// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Handset/PacketSwitched.h"

#include <array>

#include "LogGenerator/GSM/GMMState.h"

namespace kelvasi::sim::gsm {

namespace {

consteval std::uint8_t state(std::string_view text) {
  return numberOf(gmmState::states, text);
}
consteval std::uint8_t subState(std::string_view text) {
  return numberOf(gmmState::subStates, text);
}
constexpr std::uint8_t noSubState = subState("GMM_NULL_SUBSTATE");
constexpr double forEver = 1e9;

constexpr std::array rows{
    /* off */ PhaseRow{state("GMM_NULL"), noSubState, forEver, forEver},
    /* searching */ PhaseRow{state("GMM_DEREGISTERED"), subState("GMM_PLMN_SEARCH"), 2, 6},
    /* attachNeeded */ PhaseRow{state("GMM_DEREGISTERED"), subState("GMM_ATTACH_NEEDED"), 0.5, 1.5},
    /* attaching */ PhaseRow{state("GMM_REGISTERED_INITIATED"), noSubState, 0.6, 2, Need::signalling},
    /* limited */ PhaseRow{state("GMM_DEREGISTERED"), subState("GMM_LIMITED_SERVICE"), forEver, forEver},
    /* registered */ PhaseRow{state("GMM_REGISTERED"), subState("GMM_NORMAL_SERVICE"), 8, 45},
    /* updating */
    PhaseRow{state("GMM_ROUTING_AREA_UPDATE_INITIATED"), noSubState, 0.5, 1.5, Need::signalling},
    /* requestingService */
    PhaseRow{state("GMM_SERVICE_REQUEST_INITIATED"), noSubState, 0.3, 1, Need::signalling},
    /* transferring */ PhaseRow{state("GMM_REGISTERED"), subState("GMM_NORMAL_SERVICE"), 8, 40, Need::data},
    /* suspended */ PhaseRow{state("GMM_REGISTERED"), subState("GMM_SUSPENDED"), forEver, forEver},
    /* noCell */ PhaseRow{state("GMM_REGISTERED"), subState("GMM_NO_CELL_AVAILABLE"), forEver, forEver},
    /* detaching */ PhaseRow{state("GMM_DEREGISTERED_INITIATED"), noSubState, 0.3, 1, Need::signalling},
};
static_assert(rows.size() == static_cast<std::size_t>(PacketSwitched::Phase::detaching) + 1);

constexpr double shareOfSessions = 0.8;  // of what ends a quiet time; the rest are periodic updates
constexpr double shareOfFailures = 0.03;
constexpr double shareOfSecondContexts = 0.2;
constexpr std::array<std::string_view, 2> accessPoints{"internet", "mms"};

}  // namespace

PacketSwitched::PacketSwitched(Random random) : random_(random), clock_(rows, Phase::off) {}

std::string_view PacketSwitched::stateName() const {
  return gmmState::states.at(state());
}

void PacketSwitched::switchOn() {
  if (isOff()) enter(Phase::searching);
}

void PacketSwitched::switchOff() {
  enter(registeredIn_ && phase() != Phase::noCell ? Phase::detaching : Phase::off);
  registeredIn_.reset();
  rejectedBy_.reset();
  contexts_.clear();
}

void PacketSwitched::pass(const Cell* cell, Need circuitSwitchedNeed, double seconds) {
  if (isOff()) return;
  if (!cell) loseCell();
  if (cell) follow(*cell, circuitSwitchedNeed);
  const bool mustWait = circuitSwitchedNeed != Need::none && need() == Need::none;
  if (clock_.pass(mustWait ? 0 : seconds) && !mustWait) finishPhase(cell);
}

void PacketSwitched::loseCell() {
  if (phase() == Phase::searching || phase() == Phase::noCell) return;
  if (phase() == Phase::detaching) return enter(Phase::off);
  enter(registeredIn_ ? Phase::noCell : Phase::searching);
}

void PacketSwitched::follow(const Cell& cell, Need circuitSwitchedNeed) {
  const bool isElsewhere = registeredIn_ != areaOf(cell);
  const bool mustSuspend = cell.technology == Technology::gsm && circuitSwitchedNeed != Need::none;
  switch (phase()) {
    case Phase::registered:
    case Phase::transferring:
    case Phase::requestingService:
      if (mustSuspend) return enter(Phase::suspended);
      if (isElsewhere) enter(Phase::updating);
      return;
    case Phase::suspended:
    case Phase::noCell:
      if (!mustSuspend) enter(isElsewhere ? Phase::updating : Phase::registered);
      return;
    case Phase::limited:
      if (rejectedBy_ != areaOf(cell)) enter(Phase::attachNeeded);
      return;
    default:
      return;
  }
}

void PacketSwitched::finishPhase(const Cell* cell) {
  switch (phase()) {
    case Phase::searching:
      return enter(cell ? Phase::attachNeeded : Phase::searching);
    case Phase::attachNeeded:
      return enter(Phase::attaching);
    case Phase::attaching:
    case Phase::updating:
      if (cell) finishUpdate(*cell);
      return;
    case Phase::registered:
      return beginSomething();
    case Phase::requestingService:
      activateContext();
      return enter(Phase::transferring);
    case Phase::transferring:
      return enter(Phase::registered);
    case Phase::detaching:
      return enter(Phase::off);
    default:
      return;
  }
}

void PacketSwitched::finishUpdate(const Cell& cell) {
  if (cell.isForbidden) {
    updateStatus_ = UpdateStatus::routingAreaNotAllowed;
    registeredIn_.reset();
    rejectedBy_ = areaOf(cell);
    contexts_.clear();
    return enter(Phase::limited);
  }
  if (random_.happens(shareOfFailures)) return enter(phase());
  updateStatus_ = UpdateStatus::updated;
  registeredIn_ = areaOf(cell);
  rejectedBy_.reset();
  enter(Phase::registered);
}

void PacketSwitched::beginSomething() {
  enter(random_.happens(shareOfSessions) ? Phase::requestingService : Phase::updating);
}

void PacketSwitched::activateContext() {
  const std::size_t place = contexts_.size();
  if (place >= accessPoints.size() || (place > 0 && !random_.happens(shareOfSecondContexts))) return;
  contexts_.push_back({.nsapi = 5 + static_cast<int>(place),
                       .accessPoint = std::string(accessPoints[place]),
                       .address = "10.64." + std::to_string(random_.below(256)) + "." +
                                  std::to_string(random_.among(1, 254))});
}

}  // namespace kelvasi::sim::gsm
