// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Handset/World.h"

#include <algorithm>
#include <utility>

namespace kelvasi::sim::gsm {

namespace {

constexpr double weakestGsm = -110;   // dBm
constexpr double weakestRscp = -114;  // dBm
constexpr double weakestEcNo = -20;   // dB
// On UMTS a better serving cell makes a search for GSM needless; on GSM a search for UMTS is always due.
constexpr double contentEcNo = -11;  // dB

// Open-loop power control (3GPP TS 25.331, 8.5.3 for the preamble), simplified to these terms.
constexpr double pilotPower = 33;            // dBm
constexpr double uplinkInterference = -103;  // dBm
constexpr double requiredRatio = -20;        // dB
constexpr double leastPower = -50;           // dBm
constexpr double mostPower = 24;             // dBm, power class 3

constexpr double umtsLoss = 29;  // dB: UMTS can be heard but hardly be used

// Along a leg of the way, from corner to corner.
void addUmtsShadows(const Route& route, std::size_t leg, std::vector<Shadow>& shadows) {
  constexpr int steps = 4;
  const Point from = route.corners()[leg];
  const Point to = route.corners()[leg + 1];
  for (int step = 0; step <= steps; ++step) {
    const double share = static_cast<double>(step) / steps;
    const Point middle{from.x + share * (to.x - from.x), from.y + share * (to.y - from.y)};
    shadows.push_back({.middle = middle, .radius = 450, .loss = {0, umtsLoss, 0}});
  }
}

// A tunnel without radio, and stretches that UMTS hardly reaches: around the beginning of the way, and later.
std::vector<Shadow> shadowsAlong(const Route& route) {
  const auto& corners = route.corners();
  std::vector<Shadow> shadows{{.middle = corners[4], .radius = 320, .loss = {75, 75, 75}},
                              {.middle = corners[0], .radius = 650, .loss = {0, umtsLoss, 0}}};
  for (const std::size_t leg : {6U, 7U, 10U, 11U}) addUmtsShadows(route, leg, shadows);
  return shadows;
}

}  // namespace

World::World(Random random, Layout layOut)
    : random_(random),
      cells_(layOut(random_.split())),
      route_(random_.split()),
      radio_(cells_, shadowsAlong(route_), random_.split()),
      selection_(cells_),
      activeSet_(cells_),
      registration_(random_.split()),
      connection_(random_.split()),
      traffic_(random_.split()) {}

void World::pass(double seconds) {
  const auto before = serving();
  route_.drive(seconds);
  radio_.receive(route_.position(), seconds);
  selection_.look(radio_.receptions(), tie(), seconds);
  const auto found = selection_.serving();
  registration_.pass(found ? &cells_[*found] : nullptr, seconds);
  const auto now = serving();
  connection_.pass(now ? &cells_[*now] : nullptr, registration_.circuitSwitched().need(),
                   registration_.packetSwitched().need(), seconds);
  activeSet_.update(now, radio_.receptions(), isInSoftHandover());
  traffic_.pass(use(), seconds);
  findNeighbours();
  hasChangedCell_ = now != before;
}

// UTRA TDD hands over hard.
bool World::isInSoftHandover() const {
  return isOn(Technology::umts) && !cell(*serving()).isTdd && connection_.rrc() == RadioConnection::Rrc::dch;
}

CellSelection::Tie World::tie() const {
  CellSelection::Tie tie{.isConnected = connection_.isConnected() || connection_.isReleasing(),
                         .softSet = {}};
  if (isInSoftHandover()) tie.softSet = activeSet_.cells();
  return tie;
}

double World::carrierPower() const {
  const std::uint16_t home = umtsFrequencyOf(homePlmn);
  return radio_.carrierPower(Technology::umts, isOn(Technology::umts) ? cell(*serving()).frequency : home);
}

World::Situation World::situation() const {
  std::vector<std::size_t> neighbours = gsmNeighbours_;
  neighbours.insert(neighbours.end(), umtsNeighbours_.begin(), umtsNeighbours_.end());
  std::ranges::sort(neighbours);
  return {.registration = registration_.situation(),
          .rrc = connection_.rrc(),
          .isConnected = connection_.isConnected(),
          .isDedicated = connection_.isDedicated(),
          .hasChangedCell = hasChangedCell_,
          .activeSet = activeSet_.cells(),
          .neighbours = std::move(neighbours)};
}

Use World::use() const {
  if (!isOn(Technology::umts)) return {};
  const auto rrc = connection_.rrc();
  return {.hasDch = rrc == RadioConnection::Rrc::dch,
          .hasFach = rrc == RadioConnection::Rrc::fach,
          .hasSpeech = connection_.hasSpeech(),
          .hasHsdpa = rrc == RadioConnection::Rrc::dch && connection_.isTransferring(),
          .hasTwoCarriers = cell(*serving()).hasTwoCarriers,
          .ecNo = reception(*serving()).ecNo};
}

void World::findNeighbours() {
  gsmNeighbours_.clear();
  umtsNeighbours_.clear();
  if (!serving()) return;
  if (isOn(Technology::gsm) || reception(*serving()).ecNo < contentEcNo)
    gsmNeighbours_ = strongest(Technology::gsm);
  umtsNeighbours_ = strongest(Technology::umts);
}

std::vector<std::size_t> World::strongest(Technology technology) const {
  std::vector<std::size_t> places;
  for (std::size_t place = 0; place < cells_.size(); ++place) {
    const Reception& heard = reception(place);
    const bool isHeard = technology == Technology::gsm
                             ? heard.level > weakestGsm
                             : heard.level > weakestRscp && heard.ecNo > weakestEcNo;
    const bool isWanted = isHeard || activeSet_.contains(place);
    if (cells_[place].technology == technology && isWanted && place != serving()) places.push_back(place);
  }
  std::ranges::sort(places, std::ranges::greater(), [this](std::size_t place) {
    return std::pair(activeSet_.contains(place), reception(place).level);
  });
  if (places.size() > mostNeighbours) places.resize(mostNeighbours);
  return places;
}

TrueCells World::truth() const {
  TrueCells cells;
  for (std::size_t place = 0; place < cells_.size(); ++place)
    cells.push_back({.identity = identityOf(cells_[place]),
                     .isServing = serving() == place,
                     .now = levelsOf(reception(place))});
  return cells;
}

double World::transmitPower() const {
  const double level = serving() ? reception(*serving()).level : 0;
  return std::clamp(pilotPower - level + uplinkInterference + requiredRatio, leastPower, mostPower);
}

}  // namespace kelvasi::sim::gsm
