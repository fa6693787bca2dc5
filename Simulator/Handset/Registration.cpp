// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Handset/Registration.h"

#include "LogGenerator/GSM/RegisteredPLMN.h"
#include "LogGenerator/GSM/RegistrationState.h"
#include "Simulator/Handset/CellLayout.h"

namespace kelvasi::sim::gsm {

namespace {

consteval std::uint8_t registration(std::string_view text) {
  return numberOf(registrationState::states, text);
}
consteval std::uint8_t service(std::string_view text) {
  return numberOf(registeredPlmn::serviceTypes, text);
}
constexpr std::uint8_t automaticMode = 0;
constexpr std::uint8_t limitedMode = 2;

// Seconds.
constexpr double firstSwitchOn = 1;
constexpr double shortestOff = 3;
constexpr double longestOff = 8;
constexpr double shortestOn = 400;
constexpr double longestOn = 1200;

}  // namespace

Registration::Registration(Random random)
    : random_(random),
      circuitSwitched_(random_.split()),
      packetSwitched_(random_.split()),
      untilPowerTurns_(firstSwitchOn) {
  lastCell_.locationArea.plmn = homePlmn;
}

void Registration::pass(const Cell* cell, double seconds) {
  untilPowerTurns_ -= seconds;
  if (untilPowerTurns_ <= 0) turnPower();
  circuitSwitched_.pass(cell, seconds);
  packetSwitched_.pass(isSearching() ? nullptr : cell, circuitSwitched_.need(), seconds);
  isCamped_ = cell && needsCell() && !isSearching();
  if (isCamped_) lastCell_ = *cell;
}

// A call is not cut off.
void Registration::turnPower() {
  if (isOn_ && circuitSwitched_.isBusy()) return;
  isOn_ = !isOn_;
  untilPowerTurns_ =
      isOn_ ? random_.between(shortestOn, longestOn) : random_.between(shortestOff, longestOff);
  if (isOn_) {
    circuitSwitched_.switchOn();
    packetSwitched_.switchOn();
  } else {
    circuitSwitched_.switchOff();
    packetSwitched_.switchOff();
  }
}

Registration::Situation Registration::situation() const {
  return {.circuitSwitched = circuitSwitched_.phase(),
          .circuitSwitchedStatus = circuitSwitched_.updateStatus(),
          .packetSwitched = packetSwitched_.phase(),
          .packetSwitchedStatus = packetSwitched_.updateStatus(),
          .contexts = packetSwitched_.contexts().size(),
          .isOn = isOn_,
          .isCamped = isCamped_,
          .cellId = lastCell_.id};
}

bool Registration::isRegistering() const {
  using Cs = CircuitSwitched::Phase;
  using Ps = PacketSwitched::Phase;
  const Cs cs = circuitSwitched_.phase();
  const Ps ps = packetSwitched_.phase();
  return cs == Cs::updateNeeded || cs == Cs::connectingToUpdate || cs == Cs::updating || cs == Cs::rejected ||
         ps == Ps::attachNeeded || ps == Ps::attaching;
}

bool Registration::isLimited() const {
  return circuitSwitched_.phase() == CircuitSwitched::Phase::limited &&
         packetSwitched_.phase() == PacketSwitched::Phase::limited;
}

std::uint8_t Registration::registrationState() const {
  if (!needsCell()) return registration("REG_STATE_INACTIVE");
  if (!isOn_) return registration("REG_STATE_DEREGISTERING");
  if (!isCamped_) return registration("REG_STATE_AUTOMATIC_SEARCH");
  return isRegistering() ? registration("REG_STATE_REGISTERING") : registration("REG_STATE_IDLE");
}

std::uint8_t Registration::selectionMode() const {
  return isLimited() ? limitedMode : automaticMode;
}

std::uint8_t Registration::serviceType() const {
  if (!isCamped_) return service("NO_SERVICE");
  if (circuitSwitched_.isRegistered())
    return packetSwitched_.isRegistered() ? service("CS_PS_SERVICE") : service("CS_ONLY");
  return packetSwitched_.isRegistered() ? service("PS_ONLY") : service("LIMITED_SERVICE");
}

}  // namespace kelvasi::sim::gsm
