// SPDX-License-Identifier: Apache-2.0
#include "Simulator/LTE/World.h"

#include <algorithm>
#include <cmath>

#include "Simulator/LTE/CellLayout.h"

namespace kelvasi::sim::lte {

namespace {

constexpr double averageSeconds = 1.5;
constexpr double drxCycle = 1.28;       // seconds
constexpr unsigned mostDrxCycles = 63;  // that the record has room for

constexpr double weakestLevel = -126;        // dBm
constexpr double weakestRsrq = -19.5;        // dB
constexpr double weakestMeasuredRsrq = -17;  // dB: what is weaker is detected and no more
constexpr double weakestGsm = -108;          // dBm
constexpr double weakestEcNo = -20;          // dB

// A tunnel without radio, a quarter that LTE does not reach, and one that UMTS does not reach either.
std::vector<Shadow> shadowsAlong(const Route& route) {
  return {{.middle = route.corners()[4], .radius = 300, .loss = {75, 75, 75}},
          {.middle = route.corners()[8], .radius = 650, .loss = {0, 0, 45}},
          {.middle = route.corners()[11], .radius = 650, .loss = {0, 50, 50}}};
}

}  // namespace

World::World(Random random)
    : random_(random),
      cells_(layOutCells(random_.split())),
      route_(random_.split()),
      radio_(cells_, shadowsAlong(route_), random_.split()),
      reselection_(cells_),
      attachment_(random_.split()) {}

void World::pass(double seconds) {
  seconds_ += seconds;
  route_.drive(seconds);
  radio_.receive(route_.position(), seconds);
  averageReceptions(seconds);
  reselection_.look(averages_, isConnected(), seconds);
  const auto found = reselection_.serving();
  attachment_.pass(found ? &cells_[*found] : nullptr, seconds);
  serving_ = attachment_.isCamped() ? found : std::nullopt;
  followRules(seconds);
  findNeighbours();
}

void World::averageReceptions(double seconds) {
  if (averages_.empty()) averages_ = radio_.receptions();
  const double weight = 1 - std::exp(-seconds / averageSeconds);
  for (std::size_t place = 0; place < cells_.size(); ++place) {
    averages_[place].level += weight * (reception(place).level - averages_[place].level);
    averages_[place].ecNo += weight * (reception(place).ecNo - averages_[place].ecNo);
  }
}

void World::followRules(double seconds) {
  const unsigned before = measurementRules_;
  measurementRules_ = 0;
  const bool isBelow = isOnLte() && srxlev(*serving_) < 0;
  belowFor_ = isBelow ? belowFor_ + seconds : 0;
  if (isOnLte()) {
    const bool isConnectedNow = isConnected();
    const double criterion = srxlev(*serving_);
    if (isConnectedNow || criterion <= intraSearch) measurementRules_ |= looksForIntra;
    if (criterion <= nonIntraSearch) measurementRules_ |= looksForLower;
    if (!isConnectedNow && layerOf(cell(*serving_)).priority < layers.front().priority)
      measurementRules_ |= looksForHigher;
  }
  hasNewMeasurementRules_ = measurementRules_ != before;
}

unsigned World::drxCyclesBelow() const {
  return std::min(mostDrxCycles, static_cast<unsigned>(belowFor_ / drxCycle));
}

bool World::isHeard(std::size_t place) const {
  const Reception& heard = average(place);
  switch (cell(place).technology) {
    case Technology::gsm:
      return heard.level > weakestGsm;
    case Technology::umts:
      return heard.ecNo > weakestEcNo;
    default:
      return heard.level > weakestLevel && heard.ecNo > weakestRsrq;
  }
}

// Away from LTE everything is.
bool World::isLookedFor(std::size_t place) const {
  if (!isOnLte()) return true;
  const Layer& there = layerOf(cell(place));
  const Layer& here = layerOf(cell(*serving_));
  if (&there == &here) return (measurementRules_ & looksForIntra) != 0;
  return (measurementRules_ & (there.priority > here.priority ? looksForHigher : looksForLower)) != 0;
}

void World::findNeighbours() {
  neighbours_.clear();
  detected_.clear();
  otherLayers_.clear();
  if (!serving_) return;
  for (std::size_t place = 0; place < cells_.size(); ++place) {
    if (place == serving_ || !isHeard(place) || !isLookedFor(place)) continue;
    if (&layerOf(cell(place)) != &layerOf(cell(*serving_))) {
      otherLayers_.push_back(place);
    } else {
      const bool isMeasured = !isOnLte() || average(place).ecNo > weakestMeasuredRsrq;
      (isMeasured ? neighbours_ : detected_).push_back(place);
    }
  }
  if (isOnLte() && !isConnected() && neighbours_.empty()) keepOneNeighbour();
  for (auto* places : {&neighbours_, &detected_, &otherLayers_}) {
    std::ranges::sort(*places, std::ranges::greater(),
                      [this](std::size_t place) { return average(place).level; });
    if (places->size() > mostNeighbours) places->resize(mostNeighbours);
  }
}

void World::keepOneNeighbour() {
  std::optional<std::size_t> strongest;
  for (std::size_t place = 0; place < cells_.size(); ++place) {
    if (place == serving_ || &layerOf(cell(place)) != &layerOf(cell(*serving_))) continue;
    if (!strongest || average(place).level > average(*strongest).level) strongest = place;
  }
  if (!strongest) return;
  neighbours_.push_back(*strongest);
  std::erase(detected_, *strongest);
}

TrueCells World::truth() const {
  TrueCells cells;
  for (std::size_t place = 0; place < cells_.size(); ++place)
    cells.push_back({.identity = identityOf(cells_[place]),
                     .isServing = serving_ == place,
                     .now = levelsOf(reception(place)),
                     .average = levelsOf(average(place))});
  return cells;
}

double World::rssi(std::size_t place) const {
  const Reception& heard = reception(place);
  return heard.level - heard.ecNo + 10 * std::log10(layerOf(cell(place)).resourceBlocks);
}

}  // namespace kelvasi::sim::lte
