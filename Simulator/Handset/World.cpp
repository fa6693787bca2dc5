#include "Simulator/Handset/World.h"

#include <algorithm>
#include <utility>

namespace kelvasi::sim::gsm {

namespace {

constexpr double weakestGsm = -110;   // dBm
constexpr double weakestRscp = -114;  // dBm
constexpr double weakestEcNo = -20;   // dB
// A better serving cell makes a search for the other technology needless.
constexpr double contentEcNo = -11;  // dB
constexpr double contentC1 = 40;     // dB

// Open-loop power control (3GPP TS 25.331, 8.5.3 for the preamble), simplified to these terms.
constexpr double pilotPower = 33;            // dBm
constexpr double uplinkInterference = -103;  // dBm
constexpr double requiredRatio = -20;        // dB
constexpr double leastPower = -50;           // dBm
constexpr double mostPower = 24;             // dBm, power class 3

// A tunnel without radio, and a quarter that UMTS does not reach, both on the way.
std::vector<Shadow> shadowsAlong(const Route& route) {
  return {{.middle = route.corners()[4], .radius = 320, .loss = {75, 75, 75}},
          {.middle = route.corners()[9], .radius = 600, .loss = {0, 40, 0}}};
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
  selection_.look(radio_.receptions(), connection_.isConnected(), seconds);
  const auto found = selection_.serving();
  registration_.pass(found ? &cells_[*found] : nullptr, seconds);
  const auto now = serving();
  connection_.pass(now ? &cells_[*now] : nullptr, registration_.circuitSwitched().need(),
                   registration_.packetSwitched().need(), seconds);
  activeSet_.update(now, radio_.receptions(), connection_.rrc() == RadioConnection::Rrc::dch);
  traffic_.pass(use(), seconds);
  findNeighbours();
  hasChangedCell_ = now != before;
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
  const bool isUmts = isOn(Technology::umts);
  const Reception& here = reception(*serving());
  if (!isUmts || here.ecNo < contentEcNo) gsmNeighbours_ = strongest(Technology::gsm);
  if (isUmts || criterionC1(here) < contentC1) umtsNeighbours_ = strongest(Technology::umts);
}

std::vector<std::size_t> World::strongest(Technology technology) const {
  std::vector<std::size_t> places;
  for (std::size_t place = 0; place < cells_.size(); ++place) {
    const Reception& heard = reception(place);
    const bool isHeard = technology == Technology::gsm
                             ? heard.level > weakestGsm
                             : heard.level > weakestRscp && heard.ecNo > weakestEcNo;
    if (cells_[place].technology == technology && isHeard && place != serving()) places.push_back(place);
  }
  std::ranges::sort(places, std::ranges::greater(),
                    [this](std::size_t place) { return reception(place).level; });
  if (places.size() > mostNeighbours) places.resize(mostNeighbours);
  return places;
}

double World::transmitPower() const {
  const double level = serving() ? reception(*serving()).level : 0;
  return std::clamp(pilotPower - level + uplinkInterference + requiredRatio, leastPower, mostPower);
}

}  // namespace kelvasi::sim::gsm
