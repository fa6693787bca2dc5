#include "Simulator/GSM/RadioModel.h"

#include <algorithm>
#include <cmath>

#include "Simulator/GSM/Route.h"

namespace kelvasi::sim::gsm {

namespace {

// Macro-cell propagation, 3GPP TR 36.942, 4.5.2: loss in dB over kilometres at 900 MHz and 2 GHz.
struct Propagation {
  double power;  // dBm towards the handset, losses of a car taken off; of the pilot in UMTS
  double atOneKilometre;
  double perDecade = 37.6;
};
constexpr Propagation gsmPropagation{.power = 38, .atOneKilometre = 120.9};
constexpr Propagation umtsPropagation{.power = 27, .atOneKilometre = 128.1};
constexpr double nearest = 0.035;  // kilometres

constexpr double shadowingDeviation = 7;    // dB
constexpr double decorrelationMetres = 60;  // after Gudmundson, 1991
constexpr double fadingDeviation = 1.2;     // dB left of fast fading after averaging
constexpr double filterSeconds = 0.6;

constexpr double loadOverPilot = 6.5;  // dB: what a cell sends in all
constexpr double thermalNoise = -100;  // dBm in the carrier, the receiver's own included

double milliwatts(double dBm) {
  return std::pow(10, dBm / 10);
}
double dBm(double power) {
  return 10 * std::log10(power);
}

double additionalLoss(const Shadow& shadow, Technology technology, Point at) {
  // Full in the inner half, nothing outside.
  const double depth = std::clamp(2 - 2 * distance(shadow.middle, at) / shadow.radius, 0.0, 1.0);
  return depth * (technology == Technology::gsm ? shadow.gsmLoss : shadow.umtsLoss);
}

}  // namespace

RadioModel::RadioModel(std::span<const Cell> cells, std::vector<Shadow> shadows, Random random)
    : cells_(cells), shadows_(std::move(shadows)), random_(random), receptions_(cells.size()) {
  for (std::size_t cell = 0; cell < cells.size(); ++cell)
    shadowing_.push_back(shadowingDeviation * random_.normal());
}

void RadioModel::receive(Point at, double seconds) {
  if (!isFirst_) moveShadowing(distance(last_, at));
  const double weight = isFirst_ ? 1 : 1 - std::exp(-seconds / filterSeconds);
  last_ = at;
  isFirst_ = false;
  double carrier = milliwatts(thermalNoise);
  for (std::size_t cell = 0; cell < cells_.size(); ++cell) {
    double& level = receptions_[cell].level;
    level += weight * (levelOf(cell, at) + fadingDeviation * random_.normal() - level);
    if (cells_[cell].technology == Technology::umts) carrier += milliwatts(level + loadOverPilot);
  }
  carrierPower_ = dBm(carrier);
  for (std::size_t cell = 0; cell < cells_.size(); ++cell) {
    if (cells_[cell].technology == Technology::umts)
      receptions_[cell].ecNo = receptions_[cell].level - carrierPower_;
  }
}

void RadioModel::moveShadowing(double metres) {
  const double kept = std::exp(-metres / decorrelationMetres);
  const double added = shadowingDeviation * std::sqrt(1 - kept * kept);
  for (double& loss : shadowing_) loss = kept * loss + added * random_.normal();
}

double RadioModel::levelOf(std::size_t cell, Point at) const {
  const Technology technology = cells_[cell].technology;
  const Propagation& propagation = technology == Technology::gsm ? gsmPropagation : umtsPropagation;
  const double kilometres = std::max(nearest, distance(cells_[cell].site, at) / 1000);
  double loss =
      propagation.atOneKilometre + propagation.perDecade * std::log10(kilometres) + shadowing_[cell];
  for (const Shadow& shadow : shadows_) loss += additionalLoss(shadow, technology, at);
  return propagation.power - loss;
}

}  // namespace kelvasi::sim::gsm
