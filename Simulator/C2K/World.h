// SPDX-License-Identifier: Apache-2.0
// The world of the CDMA drive: a town's base stations, what the radio does to them, and one handset with both
// air interfaces. All records are encoded from it, so that what they tell of one moment agrees.
#pragma once

#include <array>
#include <optional>
#include <vector>

#include "Simulator/C2K/CellLayout.h"
#include "Simulator/C2K/DataLink.h"
#include "Simulator/C2K/Evdo.h"
#include "Simulator/C2K/OneX.h"
#include "Simulator/C2K/User.h"
#include "Simulator/Radio/RadioModel.h"
#include "Simulator/Radio/Route.h"
#include "Simulator/Radio/TrueCell.h"

namespace kelvasi::sim::c2k {

// One of the rake receiver's correlators, on a path of a pilot.
struct Finger {
  std::optional<std::size_t> cell;  // nothing while it is not assigned
  double ratio = 0;                 // dB
};

class World {
 public:
  static constexpr std::size_t fingerCount = 4;

  // What several records tell of, in short.
  struct Situation {
    OneX::State oneXState;
    std::vector<std::size_t> oneXActive;
    Evdo::State evdoState;
    Evdo::Session session;
    std::vector<std::size_t> evdoActive;
    std::optional<std::size_t> evdoServing;
    bool operator==(const Situation&) const = default;
  };

  explicit World(Random random);
  World(const World&) = delete;
  World& operator=(const World&) = delete;

  void pass(double seconds);

  const Cell& cell(std::size_t place) const { return cells_[place]; }
  const OneX& oneX() const { return oneX_; }
  const Evdo& evdo() const { return evdo_; }
  const DataLink& dataLink() const { return dataLink_; }
  const std::array<Finger, fingerCount>& fingers() const { return fingers_; }

  // Ec/Io of every cell's pilot, dB. In EV-DO pilots are sent in bursts of the full power.
  std::span<const double> oneXRatios() const { return oneXRatios_; }
  std::span<const double> evdoRatios() const { return evdoRatios_; }
  // dBm, of one of the two receivers.
  double receivedPower(std::size_t receiver) const;
  // dBm: open loop, closed in so far as a fast connection asks for more.
  double oneXTransmitPower() const;
  double evdoTransmitPower() const;
  Point position() const { return route_.position(); }
  Situation situation() const;
  // Each pilot twice, on either air interface's channel.
  TrueCells truth() const;

 private:
  void measure();
  void assignFingers();
  double carrierToInterference() const;

  Random random_;
  std::vector<Cell> cells_;
  std::vector<std::uint8_t> colorCodes_;
  Route route_;
  RadioModel radio_;
  User user_;
  OneX oneX_;
  Evdo evdo_;
  DataLink dataLink_;
  std::vector<double> oneXRatios_;
  std::vector<double> evdoRatios_;
  std::array<Finger, fingerCount> fingers_;
};

}  // namespace kelvasi::sim::c2k
