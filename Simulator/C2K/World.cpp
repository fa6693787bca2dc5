// SPDX-License-Identifier: Apache-2.0
#include "Simulator/C2K/World.h"

#include <algorithm>
#include <cmath>

namespace kelvasi::sim::c2k {

namespace {

constexpr double totalOverPilot = 6.5;       // dB: what a 1x carrier sends in all
constexpr double strongestEvdoPilot = -0.1;  // dB
constexpr double secondReceiverLoss = 2;     // dB

// Open-loop power control of band class 0 (3GPP2 C.S0002): what is sent and what is received add up to this.
constexpr double turnaround = -73;  // dBm
constexpr double dataPower = 9;     // dB over the pilot in a data connection
constexpr double leastPower = -50;  // dBm
constexpr double mostPower = 23;    // dBm

Shadow shadowAt(Point middle, double radius, double loss) {
  Shadow shadow{.middle = middle, .radius = radius};
  shadow.loss[static_cast<std::size_t>(Technology::cdma)] = loss;
  return shadow;
}

// A tunnel without radio, and at every other corner an underpass that lets some of it in.
std::vector<Shadow> shadowsAlong(const Route& route, Random random) {
  constexpr std::size_t tunnel = 4;
  std::vector<Shadow> shadows{shadowAt(route.corners()[tunnel], 320, 75)};
  for (std::size_t corner = 1; corner < route.corners().size(); corner += 2)
    shadows.push_back(shadowAt(route.corners()[corner], random.between(120, 240), random.between(36, 54)));
  return shadows;
}

std::vector<std::uint8_t> colorCodesOf(std::span<const Cell> cells) {
  std::vector<std::uint8_t> codes;
  for (const Cell& cell : cells) codes.push_back(systemOf(cell).colorCode);
  return codes;
}

}  // namespace

World::World(Random random)
    : random_(random),
      cells_(layOutCells(random_.split())),
      colorCodes_(colorCodesOf(cells_)),
      route_(random_.split()),
      radio_{cells_, shadowsAlong(route_, random_.split()), random_.split()},
      user_(random_.split()),
      oneX_(cells_.size(), random_.split()),
      evdo_(cells_.size(), random_.split()),
      dataLink_(random_.split()),
      oneXRatios_(cells_.size()),
      evdoRatios_(cells_.size()) {
  radio_.receive(route_.position(), 0);
  measure();
}

void World::pass(double seconds) {
  route_.drive(seconds);
  radio_.receive(route_.position(), seconds);
  measure();
  user_.pass(seconds);
  oneX_.pass(oneXRatios_, user_.wish() == User::Wish::call, seconds);
  if (oneX_.hasDroppedCall()) user_.giveUp();
  evdo_.pass({.ratios = evdoRatios_,
              .colorCodes = colorCodes_,
              .isRadioTaken = oneX_.takesRadio(),
              .wantsData = user_.wish() == User::Wish::data},
             seconds);
  const bool isTransferring = evdo_.isTransferring();
  dataLink_.pass(isTransferring, isTransferring ? carrierToInterference() : 0,
                 mostPower - evdoTransmitPower(), seconds);
  assignFingers();
}

void World::measure() {
  for (std::size_t place = 0; place < cells_.size(); ++place) {
    oneXRatios_[place] = radio_.receptions()[place].ecNo;
    evdoRatios_[place] = std::min(oneXRatios_[place] + totalOverPilot, strongestEvdoPilot);
  }
}

double World::carrierToInterference() const {
  const double share = std::pow(10, evdoRatios_[*evdo_.serving()] / 10);
  return 10 * std::log10(share / (1 - share));
}

// The strongest paths of the active pilots: of each a direct one, and an echo.
void World::assignFingers() {
  constexpr double directLoss = 1;  // dB
  constexpr double echoLoss = 7;
  constexpr double weakestPath = -20;
  std::vector<Finger> paths;
  for (const std::size_t pilot : oneX_.pilots().active()) {
    paths.push_back({pilot, oneXRatios_[pilot] - directLoss});
    paths.push_back({pilot, oneXRatios_[pilot] - echoLoss});
  }
  std::erase_if(paths, [](const Finger& path) { return path.ratio < weakestPath; });
  std::ranges::sort(paths, std::ranges::greater(), &Finger::ratio);
  paths.resize(fingerCount);
  std::ranges::copy(paths, fingers_.begin());
}

double World::receivedPower(std::size_t receiver) const {
  return radio_.carrierPower(Technology::cdma, oneXChannel) - (receiver == 0 ? 0 : secondReceiverLoss);
}

double World::oneXTransmitPower() const {
  return std::clamp(turnaround - receivedPower(0), leastPower, mostPower);
}

double World::evdoTransmitPower() const {
  const double data = evdo_.isTransferring() ? dataPower : 0;
  return std::clamp(turnaround - receivedPower(0) + data, leastPower, mostPower);
}

TrueCells World::truth() const {
  TrueCells cells;
  const auto& active = oneX_.pilots().active();
  for (std::size_t place = 0; place < cells_.size(); ++place) {
    cells.push_back({.identity = {RadioFamily::cdma, oneXChannel, cells_[place].code},
                     .isServing = !active.empty() && active.front() == place,
                     .now = {.level = {}, .quality = oneXRatios_[place]}});
    cells.push_back({.identity = {RadioFamily::evdo, evdoChannel, cells_[place].code},
                     .isServing = evdo_.serving() == place,
                     .now = {.level = {}, .quality = evdoRatios_[place]}});
  }
  return cells;
}

World::Situation World::situation() const {
  return {.oneXState = oneX_.state(),
          .oneXActive = oneX_.pilots().active(),
          .evdoState = evdo_.state(),
          .session = evdo_.session(),
          .evdoActive = evdo_.pilots().active(),
          .evdoServing = evdo_.serving()};
}

}  // namespace kelvasi::sim::c2k
