#include "Simulator/Handset/RadioConnection.h"

#include <algorithm>

namespace kelvasi::sim::gsm {

namespace {
// Seconds.
constexpr double setUpTime = 0.4;
constexpr double releaseTime = 0.4;
constexpr double standbyInFach = 3;
constexpr double standbyInUraPch = 6;
constexpr double shortestBurst = 2;
constexpr double longestBurst = 8;
constexpr double shortestPause = 1;
constexpr double longestPause = 4;
}  // namespace

void RadioConnection::pass(const Cell* serving, Need circuitSwitched, Need packetSwitched, double seconds) {
  const auto technology = serving ? std::optional(serving->technology) : std::nullopt;
  hasChangedTechnology_ = technology && technology_ && technology != technology_;
  if (technology) technology_ = technology;
  circuitSwitched_ = circuitSwitched;
  packetSwitched_ = packetSwitched;
  if (!serving) {
    technology_.reset();
    standby_ = 0;
    return enter(Stage::none);
  }
  inStage_ += seconds;
  follow(std::max(circuitSwitched, packetSwitched), seconds);
  connectedFor_ = isConnected() ? connectedFor_ + seconds : 0;
  passBursts(seconds);
}

void RadioConnection::enter(Stage stage) {
  if (stage_ != stage) inStage_ = 0;
  stage_ = stage;
}

void RadioConnection::follow(Need need, double seconds) {
  if (need == Need::none) return release(seconds);
  if (isConnected()) return;
  const bool isSetUp = isConnecting() && need > Need::connecting &&
                       (circuitSwitched_ > Need::connecting || inStage_ >= setUpTime);
  // What is kept in standby is at hand at once.
  const bool isKept = standby_ > 0 && need > Need::connecting;
  enter(isSetUp || isKept ? Stage::connected : Stage::connecting);
}

void RadioConnection::release(double seconds) {
  standby_ = std::max(0.0, standby_ - seconds);
  if (stage_ == Stage::connecting) return enter(Stage::none);
  if (stage_ == Stage::connected) return enter(Stage::releasing);
  if (stage_ == Stage::releasing && inStage_ >= releaseTime) enter(Stage::none);
}

void RadioConnection::passBursts(double seconds) {
  if (packetSwitched_ != Need::data) {
    isBurst_ = false;
    untilBurstTurns_ = 0;
    return;
  }
  standby_ = standbyInFach + standbyInUraPch;
  untilBurstTurns_ -= seconds;
  if (untilBurstTurns_ > 0) return;
  isBurst_ = !isBurst_;
  untilBurstTurns_ =
      isBurst_ ? random_.between(shortestBurst, longestBurst) : random_.between(shortestPause, longestPause);
}

RadioConnection::Rrc RadioConnection::rrc() const {
  if (technology_ != Technology::umts) return Rrc::disconnected;
  if (stage_ == Stage::connecting) return Rrc::connecting;
  if (isConnected())
    return circuitSwitched_ <= Need::connecting && packetSwitched_ == Need::data && !isBurst_ ? Rrc::fach
                                                                                              : Rrc::dch;
  if (standby_ > standbyInUraPch) return Rrc::fach;
  if (standby_ > 0) return Rrc::uraPch;
  return isReleasing() ? Rrc::dch : Rrc::disconnected;
}

}  // namespace kelvasi::sim::gsm
