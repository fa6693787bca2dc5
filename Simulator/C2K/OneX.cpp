// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/OneX.h"

#include <algorithm>
#include <cmath>
#include <iterator>

#include "Simulator/C2K/Frames.h"

namespace kelvasi::sim::c2k {

namespace {

constexpr double acquirable = -14;  // dB
constexpr double bearable = -17;    // dB
// Seconds.
constexpr double determinationTime = 0.4;
constexpr double acquisitionTime = 0.6;
constexpr double synchronizationTime = 0.6;
constexpr double accessTime = 0.8;
constexpr double idleLossTime = 3;
constexpr double fadeTime = 5;  // T5m of C.S0005
constexpr double deepSleepTime = 6;
constexpr double slotCycle = 5.12;  // slot cycle index 2
constexpr double awakeTime = 0.6;   // of each cycle
constexpr std::size_t searchesBeforeSleep = 8;

std::size_t strongest(std::span<const double> ratios) {
  return static_cast<std::size_t>(
      std::distance(ratios.begin(), std::max_element(ratios.begin(), ratios.end())));
}

}  // namespace

OneX::State OneX::state() const {
  switch (stage_) {
    case Stage::outOfService:
      return State::deepSleep;
    case Stage::determining:
      return State::initial;
    case Stage::acquiring:
      return State::acquisition;
    case Stage::synchronizing:
      return State::sync;
    case Stage::idle:
      return std::fmod(inStage_, slotCycle) < awakeTime ? State::paging : State::sleep;
    // An access probe's answer comes on the paging channel.
    case Stage::accessing:
      return State::paging;
    case Stage::inCall:
      return State::traffic;
  }
  return State::initial;
}

void OneX::enter(Stage stage) {
  stage_ = stage;
  inStage_ = 0;
  lostFor_ = 0;
  if (!hasSystem() && stage != Stage::synchronizing) pilots_.clear();
}

void OneX::pass(std::span<const double> ratios, bool wantsCall, double seconds) {
  inStage_ += seconds;
  frames_.clear();
  hasDroppedCall_ = false;
  switch (stage_) {
    case Stage::idle:
      return passIdle(ratios, wantsCall, seconds);
    case Stage::accessing:
      return passAccess(wantsCall);
    case Stage::inCall:
      return passCall(ratios, wantsCall, seconds);
    default:
      return search(ratios);
  }
}

void OneX::search(std::span<const double> ratios) {
  if (stage_ == Stage::outOfService && inStage_ >= deepSleepTime) return enter(Stage::determining);
  if (stage_ == Stage::determining && inStage_ >= determinationTime) return enter(Stage::acquiring);
  if (stage_ == Stage::acquiring && inStage_ >= acquisitionTime) {
    const std::size_t best = strongest(ratios);
    if (ratios[best] > acquirable) {
      searches_ = 0;
      enter(Stage::synchronizing);
      return pilots_.acquire(best);
    }
    if (++searches_ < searchesBeforeSleep) return enter(Stage::determining);
    searches_ = 0;
    return enter(Stage::outOfService);
  }
  if (stage_ == Stage::synchronizing && inStage_ >= synchronizationTime) enter(Stage::idle);
}

// Zone-based registration, with a zone for each base station so that it is seen.
bool OneX::mustRegister() const {
  return pilots_.active().front() != registeredAt_;
}

void OneX::passIdle(std::span<const double> ratios, bool wantsCall, double seconds) {
  pilots_.passIdle(ratios, seconds);
  lostFor_ = ratios[pilots_.active().front()] < bearable ? lostFor_ + seconds : 0;
  if (lostFor_ >= idleLossTime) return enter(Stage::determining);
  if (!wantsCall && !mustRegister()) return;
  isForCall_ = wantsCall;
  enter(Stage::accessing);
}

void OneX::passAccess(bool wantsCall) {
  if (inStage_ < accessTime) return;
  registeredAt_ = pilots_.active().front();
  enter(isForCall_ && wantsCall ? Stage::inCall : Stage::idle);
}

void OneX::passCall(std::span<const double> ratios, bool wantsCall, double seconds) {
  pilots_.passConnected(ratios, seconds);
  // A released handset determines its system anew.
  if (!wantsCall) return enter(Stage::determining);
  frames_ = receiveFrames(combinedRatio(pilots_, ratios), seconds, random_);
  const bool hearsSomething = std::ranges::count(frames_, false) > 1;
  lostFor_ = hearsSomething ? 0 : lostFor_ + seconds;
  hasDroppedCall_ = lostFor_ >= fadeTime;
  if (!hasDroppedCall_) return;
  frames_.clear();
  enter(Stage::determining);
}

}  // namespace kelvasi::sim::c2k
