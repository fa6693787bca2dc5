// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/Evdo.h"

#include <algorithm>
#include <iterator>

namespace kelvasi::sim::c2k {

namespace {

constexpr double acquirable = -10;     // dB
constexpr double bearable = -13;       // dB
constexpr double servingMargin = 2.5;  // dB
// Seconds.
constexpr double acquisitionTime = 0.8;
constexpr double syncTime = 0.6;
constexpr double accessTime = 0.6;
constexpr double setupTime = 0.6;
constexpr double negotiationTime = 0.8;
constexpr double lossTime = 3;
constexpr double dormancyTime = 2;

}  // namespace

void Evdo::enter(State state) {
  state_ = state;
  inState_ = 0;
  lostFor_ = 0;
  idleFor_ = 0;
  if (state >= State::sync) return;
  pilots_.clear();
  serving_.reset();
  if (session_ != Session::open) close();
}

// What was not agreed on to the end is begun anew.
void Evdo::close() {
  session_ = Session::closed;
  uati24_ = 0;
  colorCode_ = 0;
}

void Evdo::pass(const Situation& situation, double seconds) {
  inState_ += seconds;
  inSession_ += seconds;
  if (situation.isRadioTaken) {
    if (state_ != State::inactive) enter(State::inactive);
    return;
  }
  if (state_ < State::idle) return search(situation);
  if (state_ == State::connected) return passConnected(situation, seconds);
  passIdle(situation, seconds);
}

void Evdo::search(const Situation& situation) {
  if (state_ == State::inactive) return enter(State::acquisition);
  if (state_ == State::sync && inState_ >= syncTime) return enter(State::idle);
  if (state_ != State::acquisition || inState_ < acquisitionTime) return;
  const auto best = std::max_element(situation.ratios.begin(), situation.ratios.end());
  if (*best <= acquirable) return enter(State::acquisition);
  enter(State::sync);
  serving_ = static_cast<std::size_t>(std::distance(situation.ratios.begin(), best));
  pilots_.acquire(*serving_);
}

// Without a session, or in another subnet than the one that gave the address.
bool Evdo::needsAddress(const Situation& situation) const {
  return session_ == Session::closed || situation.colorCodes[*serving_] != colorCode_;
}

void Evdo::passIdle(const Situation& situation, double seconds) {
  if (state_ == State::access) {
    if (inState_ < accessTime) return;
    enter(State::connected);
    if (!needsAddress(situation)) return;
    session_ = Session::ampSetup;
    inSession_ = 0;
    return;
  }
  pilots_.passIdle(situation.ratios, seconds);
  serving_ = pilots_.active().front();
  lostFor_ = situation.ratios[*serving_] < bearable ? lostFor_ + seconds : 0;
  if (lostFor_ >= lossTime) return enter(State::acquisition);
  if (situation.wantsData || needsAddress(situation)) enter(State::access);
}

void Evdo::passConnected(const Situation& situation, double seconds) {
  pilots_.passConnected(situation.ratios, seconds);
  follow(situation);
  lostFor_ = situation.ratios[*serving_] < bearable ? lostFor_ + seconds : 0;
  if (lostFor_ >= lossTime) return enter(State::acquisition);
  if (session_ != Session::open) {
    if (session_ == Session::ampSetup && inSession_ >= setupTime) {
      colorCode_ = situation.colorCodes[*serving_];
      uati24_ = random_.below(1U << 24);
    }
    return negotiate();
  }
  idleFor_ = situation.wantsData ? 0 : idleFor_ + seconds;
  if (idleFor_ < dormancyTime) return;
  pilots_.endHandOff(situation.ratios);
  serving_ = pilots_.active().front();
  enter(State::idle);
}

void Evdo::negotiate() {
  const double time = session_ == Session::ampSetup ? setupTime : negotiationTime;
  if (inSession_ < time) return;
  inSession_ = 0;
  if (session_ == Session::ampSetup) {
    session_ = hasConfiguration_ ? Session::open : Session::terminalNegotiates;
  } else if (session_ == Session::terminalNegotiates) {
    session_ = Session::networkNegotiates;
  } else {
    session_ = Session::open;
  }
  hasConfiguration_ = hasConfiguration_ || session_ == Session::open;
}

// The forward link comes from one sector of the active set, which the handset points at.
void Evdo::follow(const Situation& situation) {
  const auto best = *std::ranges::max_element(pilots_.active(), {},
                                              [&](std::size_t pilot) { return situation.ratios[pilot]; });
  if (!pilots_.isActive(*serving_) || situation.ratios[best] > situation.ratios[*serving_] + servingMargin)
    serving_ = best;
}

}  // namespace kelvasi::sim::c2k
