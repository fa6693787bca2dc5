// SPDX-License-Identifier: Apache-2.0
#include "Simulator/GSM/MobilityScenario.h"

#include <algorithm>
#include <array>

#include "Simulator/Daemon/PdpContextRecord.h"
#include "Simulator/GSM/RegistrationRecords.h"
#include "Simulator/Handset/CellLayout.h"

namespace kelvasi::sim::gsm {

namespace {

using Rule = RecordRule<MobilityWorld>;

constexpr auto measuringInterval = std::chrono::seconds(5);

template <Bytes (*encode)(const Registration&)>
std::optional<Bytes> of(const MobilityWorld& world, const PlistSerialiser&) {
  return encode(world.registration);
}
std::optional<Bytes> ofCells(const MobilityWorld& world, const PlistSerialiser& plists) {
  return cellInfoRecord(world.cells, plists);
}
std::optional<Bytes> ofContexts(const MobilityWorld& world, const PlistSerialiser& plists) {
  return pdpContextRecord(world.registration.packetSwitched().contexts(), plists);
}

constexpr std::array rules{
    Rule{.encode = of<registrationStateRecord>},
    Rule{.encode = of<mmStateRecord>},
    Rule{.encode = of<gmmStateRecord>},
    Rule{.encode = of<registeredPlmnRecord>},
    Rule{.encode = of<equivalentPlmnRecord>},
    Rule{.encode = ofCells, .atMostEvery = measuringInterval},
    Rule{.encode = ofContexts, .atMostEvery = measuringInterval},
};

constexpr std::size_t neighbourhood = 3;  // cells to either side in the list
constexpr double shareOfGaps = 0.12;
// Seconds.
constexpr double shortestStay = 15;
constexpr double longestStay = 60;
constexpr double shortestGap = 4;
constexpr double longestGap = 15;

}  // namespace

MobilityScenario::MobilityScenario(std::uint64_t seed, const PlistSerialiser& plists)
    : random_(seed),
      town_(layOutCells(random_.split())),
      world_{.registration = Registration(random_.split()), .cells = {}},
      feed_(rules, plists),
      place_(random_.below(static_cast<std::uint32_t>(town_.size()))),
      untilMove_(random_.between(shortestStay, longestStay)) {}

void MobilityScenario::step(Messages& messages) {
  const double seconds = std::chrono::duration<double>(stepLength()).count();
  now_ += stepLength();
  const auto before = world_.registration.situation();
  wander(seconds);
  world_.registration.pass(isCovered_ ? &town_[place_] : nullptr, seconds);
  if (mustMeasure()) measure();
  feed_.advance(now_, world_, world_.registration.situation() != before, messages);
}

void MobilityScenario::wander(double seconds) {
  untilMove_ -= seconds;
  if (untilMove_ > 0) return;
  isCovered_ = !isCovered_ || !random_.happens(shareOfGaps);
  untilMove_ =
      isCovered_ ? random_.between(shortestStay, longestStay) : random_.between(shortestGap, longestGap);
  place_ = firstNearby() + random_.below(static_cast<std::uint32_t>(lastNearby() - firstNearby() + 1));
}

std::size_t MobilityScenario::firstNearby() const {
  return place_ - std::min(place_, neighbourhood);
}

std::size_t MobilityScenario::lastNearby() const {
  return std::min(place_ + neighbourhood, town_.size() - 1);
}

bool MobilityScenario::mustMeasure() const {
  const bool isCamped = world_.registration.isCamped();
  if (isCamped != world_.cells.serving.has_value()) return true;
  return isCamped &&
         (world_.cells.serving->cell.id != town_[place_].id || now_ - measuredAt_ >= measuringInterval);
}

void MobilityScenario::measure() {
  measuredAt_ = now_;
  world_.cells = {};
  if (!world_.registration.isCamped()) return;
  world_.cells.serving = measured(town_[place_], -95, -60);
  for (std::size_t near = firstNearby(); near <= lastNearby(); ++near) {
    if (near != place_) world_.cells.neighbours.push_back(measured(town_[near], -109, -75));
  }
}

MeasuredCell MobilityScenario::measured(const Cell& cell, int weakest, int strongest) {
  MeasuredCell result{.cell = cell, .level = random_.among(weakest, strongest), .ecNo = std::nullopt};
  if (cell.technology == Technology::umts) result.ecNo = random_.among(-16, -4);
  return result;
}

}  // namespace kelvasi::sim::gsm
