// SPDX-License-Identifier: Apache-2.0
// The world of the LTE drive: a town with three LTE carriers above UMTS and GSM, and one handset that drives
// through. All records are encoded from it, so that what they tell of one moment agrees.
#pragma once

#include <vector>

#include "Simulator/LTE/Attachment.h"
#include "Simulator/LTE/Reselection.h"
#include "Simulator/Radio/RadioModel.h"
#include "Simulator/Radio/Route.h"
#include "Simulator/Radio/TrueCell.h"

namespace kelvasi::sim::lte {

class World {
 public:
  static constexpr std::size_t mostNeighbours = 8;

  // What several records tell of, in short.
  struct Situation {
    std::optional<std::size_t> serving;
    std::optional<std::size_t> candidate;
    Attachment::Phase phase;
    unsigned measurementRules;
    bool operator==(const Situation&) const = default;
  };

  // Bits of the measurement rules: which cells the handset looks for (3GPP TS 36.304, 5.2.4.2).
  static constexpr unsigned looksForIntra = 1;
  static constexpr unsigned looksForLower = 2;  // or equal priority
  static constexpr unsigned looksForHigher = 4;

  explicit World(Random random);
  World(const World&) = delete;
  World& operator=(const World&) = delete;

  void pass(double seconds);

  // Of the cell that the handset camps on or is connected to; nothing while it has none.
  std::optional<std::size_t> serving() const { return serving_; }
  bool isOnLte() const { return serving_ && cell(*serving_).technology == Technology::lte; }
  bool isConnected() const { return isOnLte() && attachment_.isConnected(); }

  const std::vector<Cell>& cells() const { return cells_; }
  const Cell& cell(std::size_t place) const { return cells_[place]; }
  // As it is, and averaged by layer-3 filtering.
  const Reception& reception(std::size_t place) const { return radio_.receptions()[place]; }
  const Reception& average(std::size_t place) const { return averages_[place]; }
  // dBm over the whole of an LTE cell's bandwidth.
  double rssi(std::size_t place) const;
  // dB, by a cell's average.
  double srxlev(std::size_t place) const { return receiveLevelCriterion(cell(place), average(place)); }

  // Places of other cells of the serving carrier or, away from LTE, technology; the strongest first. In idle
  // mode on LTE never none, as the record of them has no way to say so: where no search is due or nothing is
  // heard it is the strongest all the same.
  const std::vector<std::size_t>& neighbours() const { return neighbours_; }
  // Those too weak to be measured.
  const std::vector<std::size_t>& detected() const { return detected_; }
  // The strongest of the other layers, as far as they are looked for; the strongest first.
  const std::vector<std::size_t>& otherLayers() const { return otherLayers_; }
  // The cell that idle mode is about to change to.
  std::optional<std::size_t> candidate() const {
    return isOnLte() && !isConnected() ? reselection_.candidate() : std::nullopt;
  }

  unsigned measurementRules() const { return measurementRules_; }
  bool hasNewMeasurementRules() const { return hasNewMeasurementRules_; }
  // That have passed since the serving cell's criterion fell below 0.
  unsigned drxCyclesBelow() const;

  const Attachment& attachment() const { return attachment_; }
  Point position() const { return route_.position(); }
  // Metres a second; negative away from it.
  double speedTowards(Point site) const { return route_.speedTowards(site); }
  double seconds() const { return seconds_; }
  Situation situation() const { return {serving_, candidate(), attachment_.phase(), measurementRules_}; }
  TrueCells truth() const;

 private:
  void averageReceptions(double seconds);
  void followRules(double seconds);
  void findNeighbours();
  void keepOneNeighbour();
  bool isHeard(std::size_t place) const;
  bool isLookedFor(std::size_t place) const;

  Random random_;
  std::vector<Cell> cells_;
  Route route_;
  RadioModel radio_;
  Reselection reselection_;
  Attachment attachment_;
  std::vector<Reception> averages_;
  std::optional<std::size_t> serving_;
  std::vector<std::size_t> neighbours_;
  std::vector<std::size_t> detected_;
  std::vector<std::size_t> otherLayers_;
  unsigned measurementRules_ = 0;
  bool hasNewMeasurementRules_ = false;
  double belowFor_ = 0;  // seconds
  double seconds_ = 0;
};

}  // namespace kelvasi::sim::lte
