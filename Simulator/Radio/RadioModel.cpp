// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Radio/RadioModel.h"

#include <algorithm>
#include <cmath>

#include "Simulator/Radio/Route.h"

namespace kelvasi::sim {

namespace {

struct Transmission {
  double power;  // dBm towards the handset, losses of a car taken off: of the pilot or reference signal
  double loadOverPilot = 0;  // dB: what a cell sends in all; in LTE in a resource block
  double noise = 0;          // dBm, thermal, the receiver's own included
  bool sharesCarrier = true;
};
// In the order of the technologies. Of the twelve subcarriers of an LTE resource block four in ten are busy.
constexpr std::array<Transmission, technologyCount> transmissions{
    Transmission{.power = 38, .sharesCarrier = false},
    Transmission{.power = 27, .loadOverPilot = 6.5, .noise = -97},
    Transmission{.power = 20, .loadOverPilot = 6.8, .noise = -114},
    Transmission{.power = 30, .loadOverPilot = 6.5, .noise = -105},
};

// Macro-cell propagation, 3GPP TR 36.942, 4.5.2: loss in dB over kilometres.
constexpr double lossAtOneKilometre = 128.1;  // at 2 GHz
constexpr double lossPerDecade = 37.6;
constexpr double lossPerDecadeOfFrequency = 21;
constexpr double nearest = 0.035;  // kilometres
// However near an antenna and however clear the way; a car's body is part of it.
constexpr double leastLoss = 80;  // dB

constexpr double shadowingDeviation = 7;    // dB
constexpr double decorrelationMetres = 60;  // after Gudmundson, 1991
constexpr double fadingDeviation = 1.2;     // dB left of fast fading after averaging
constexpr double filterSeconds = 0.6;

double milliwatts(double dBm) {
  return std::pow(10, dBm / 10);
}
double dBm(double power) {
  return 10 * std::log10(power);
}

double additionalLoss(const Shadow& shadow, Technology technology, Point at) {
  // Full in the inner half, nothing outside.
  const double depth = std::clamp(2 - 2 * distance(shadow.middle, at) / shadow.radius, 0.0, 1.0);
  return depth * shadow.loss[static_cast<std::size_t>(technology)];
}

const Transmission& transmissionOf(Technology technology) {
  return transmissions[static_cast<std::size_t>(technology)];
}

}  // namespace

RadioModel::RadioModel(std::span<const Cell> cells, std::vector<Shadow> shadows, Random random)
    : cells_(cells), shadows_(std::move(shadows)), random_(random), receptions_(cells.size()) {
  for (std::size_t cell = 0; cell < cells.size(); ++cell) {
    shadowing_.push_back(shadowingDeviation * random_.normal());
    if (transmissionOf(cells[cell].technology).sharesCarrier) addToCarrier(cell);
  }
}

void RadioModel::addToCarrier(std::size_t cell) {
  const Technology technology = cells_[cell].technology;
  const std::uint16_t frequency = cells_[cell].frequency;
  auto carrier = std::ranges::find_if(carriers_, [&](const Carrier& known) {
    return known.technology == technology && known.frequency == frequency;
  });
  if (carrier == carriers_.end())
    carrier = carriers_.insert(carrier, {.technology = technology, .frequency = frequency, .cells = {}});
  carrier->cells.push_back(cell);
}

double RadioModel::carrierPower(Technology technology, std::uint16_t frequency) const {
  for (const Carrier& carrier : carriers_) {
    if (carrier.technology == technology && carrier.frequency == frequency) return carrier.power;
  }
  return transmissionOf(technology).noise;
}

void RadioModel::receive(Point at, double seconds) {
  if (!isFirst_) moveShadowing(distance(last_, at));
  const double weight = isFirst_ ? 1 : 1 - std::exp(-seconds / filterSeconds);
  last_ = at;
  isFirst_ = false;
  for (std::size_t cell = 0; cell < cells_.size(); ++cell) {
    double& level = receptions_[cell].level;
    level += weight * (levelOf(cell, at) + fadingDeviation * random_.normal() - level);
  }
  for (Carrier& carrier : carriers_) receiveCarrier(carrier);
}

void RadioModel::receiveCarrier(Carrier& carrier) {
  const Transmission& transmission = transmissionOf(carrier.technology);
  double power = milliwatts(transmission.noise);
  for (const std::size_t cell : carrier.cells)
    power += milliwatts(receptions_[cell].level + transmission.loadOverPilot);
  carrier.power = dBm(power);
  for (const std::size_t cell : carrier.cells)
    receptions_[cell].ecNo = receptions_[cell].level - carrier.power;
}

void RadioModel::moveShadowing(double metres) {
  const double kept = std::exp(-metres / decorrelationMetres);
  const double added = shadowingDeviation * std::sqrt(1 - kept * kept);
  for (double& loss : shadowing_) loss = kept * loss + added * random_.normal();
}

double RadioModel::levelOf(std::size_t cell, Point at) const {
  const Cell& sender = cells_[cell];
  const double kilometres = std::max(nearest, distance(sender.site, at) / 1000);
  double loss = lossAtOneKilometre + lossPerDecade * std::log10(kilometres) +
                lossPerDecadeOfFrequency * std::log10(sender.megahertz / 2000) + shadowing_[cell];
  double deepest = 0;
  for (const Shadow& shadow : shadows_)
    deepest = std::max(deepest, additionalLoss(shadow, sender.technology, at));
  loss += deepest;
  return transmissionOf(sender.technology).power - std::max(loss, leastLoss);
}

}  // namespace kelvasi::sim
