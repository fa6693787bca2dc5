// SPDX-License-Identifier: Apache-2.0
// The world of the drive: a town's cells, what the radio does to them, and one handset that drives through.
// All records are encoded from it, so that what they tell of one moment agrees.
#pragma once

#include <vector>

#include "Simulator/Handset/ActiveSet.h"
#include "Simulator/Handset/CellLayout.h"
#include "Simulator/Handset/CellSelection.h"
#include "Simulator/Handset/RadioConnection.h"
#include "Simulator/Handset/Registration.h"
#include "Simulator/Handset/Traffic.h"
#include "Simulator/Radio/RadioModel.h"
#include "Simulator/Radio/Route.h"
#include "Simulator/Radio/TrueCell.h"

namespace kelvasi::sim::gsm {

class World {
 public:
  static constexpr std::size_t mostNeighbours = 6;

  // What several records tell of, in short.
  struct Situation {
    Registration::Situation registration;
    RadioConnection::Rrc rrc;
    bool isConnected;
    bool isDedicated;
    bool hasChangedCell;
    std::vector<std::size_t> activeSet;
    std::vector<std::size_t> neighbours;  // ascending: which they are, whatever their order
    bool operator==(const Situation&) const = default;
  };

  using Layout = std::vector<Cell> (*)(Random random);

  explicit World(Random random, Layout layOut = layOutCells);
  World(const World&) = delete;
  World& operator=(const World&) = delete;

  void pass(double seconds);

  // Of the cell that the handset camps on or is connected to; nothing while it has none.
  std::optional<std::size_t> serving() const {
    return registration_.isCamped() ? selection_.serving() : std::nullopt;
  }
  bool isOn(Technology technology) const { return serving() && cell(*serving()).technology == technology; }
  // Whether the handset has just come to its serving cell; from the other technology.
  bool hasChangedCell() const { return hasChangedCell_; }

  const Cell& cell(std::size_t place) const { return cells_[place]; }
  const Reception& reception(std::size_t place) const { return radio_.receptions()[place]; }
  // Places of the strongest other cells that can be told apart: those of the active set first, then the
  // strongest. Empty without service, and of GSM while a serving UMTS cell is too good to look for it.
  const std::vector<std::size_t>& gsmNeighbours() const { return gsmNeighbours_; }
  const std::vector<std::size_t>& umtsNeighbours() const { return umtsNeighbours_; }

  const ActiveSet& activeSet() const { return activeSet_; }
  const RadioConnection& connection() const { return connection_; }
  const Registration& registration() const { return registration_; }
  const Traffic& traffic() const { return traffic_; }
  // All that is received in the serving UMTS carrier, or in the home network's; dBm.
  double carrierPower() const;
  // dBm, in UMTS.
  double transmitPower() const;
  Point position() const { return route_.position(); }
  Situation situation() const;
  TrueCells truth() const;

 private:
  bool isInSoftHandover() const;
  CellSelection::Tie tie() const;
  void findNeighbours();
  std::vector<std::size_t> strongest(Technology technology) const;
  Use use() const;

  Random random_;
  std::vector<Cell> cells_;
  Route route_;
  RadioModel radio_;
  CellSelection selection_;
  ActiveSet activeSet_;
  Registration registration_;
  RadioConnection connection_;
  Traffic traffic_;
  std::vector<std::size_t> gsmNeighbours_;
  std::vector<std::size_t> umtsNeighbours_;
  bool hasChangedCell_ = false;
};

}  // namespace kelvasi::sim::gsm
