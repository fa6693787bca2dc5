// SPDX-License-Identifier: Apache-2.0
// The cells of a drive, over all kinds of records and technologies.
//
// A value belongs to the cell that its reading names. A reading that names a part of an identity only (an
// ARFCN without a BSIC) belongs to the one cell heard of in the last ten seconds that it can be, and to a
// record of its own when there are several or none. What networks call a cell is learnt from the records of a
// serving cell and stays with it; a cell that comes under another name is another cell.
//
// Bounded: past the most cells the one that was heard of longest ago makes way and is counted.
#pragma once

#include <array>
#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <vector>

#include "LogGenerator/Readings.h"
#include "Survey/Cells/BandClasses.h"
#include "Survey/Cells/SeenCell.h"

namespace kelvasi::survey {

class Cells {
 public:
  static constexpr std::size_t mostCells = 1024;
  static constexpr std::chrono::seconds freshness{10};

  // Gets each measurement of a message with the cell that it belongs to, null for a value of no cell.
  using OnMeasured = std::function<void(const SeenCell* cell, const Reading& reading, double value)>;
  // Gets each change of the serving cell; `from` is null for the first.
  using OnServing = std::function<void(const SeenCell* from, const SeenCell& to, Arrival time)>;

  explicit Cells(OnMeasured onMeasured = {}, OnServing onServing = {}, std::size_t most = mostCells);

  // The readings of one message.
  void take(const Readings& readings);

  // The cell that records named as the serving one last; when they did is for the asker to weigh. A CDMA
  // handset may have two, one for each air interface: this is the one that was named last.
  const SeenCell* serving() const;
  // Of the air interface that this family is of.
  const SeenCell* serving(RadioFamily family) const;
  Arrival servingTime() const { return servings_[lastServing_].time; }
  // Whether it is a serving cell, of whichever air interface.
  bool isServing(const SeenCell& cell) const;
  const SeenCell* find(std::uint32_t number) const;

  // In no order.
  const std::vector<SeenCell>& all() const { return cells_; }
  std::uint64_t dropped() const { return dropped_; }

  // Adds the cells of another drive. `onMerged` gets the number that each had there and the one it has here.
  using OnMerged = std::function<void(std::uint32_t there, std::uint32_t here)>;
  void merge(const Cells& other, const OnMerged& onMerged = {});

 private:
  struct Place {
    CellIdentity identity;
    std::size_t cell;
  };
  // What a message says of the serving cell.
  struct Naming {
    CellIdentity cell;
    CellNames names;
  };

  static Naming namingIn(const Readings& readings);
  void learn(const Naming& naming, Arrival time);
  void serve(std::size_t cell, Arrival time);
  void measure(const Reading& reading, Arrival time);
  void mention(std::size_t cell, CellRole role, Arrival time);

  std::size_t cellFor(const CellIdentity& identity, Arrival time);
  std::size_t lookFor(const CellIdentity& identity, Arrival time);
  std::vector<Place>::iterator placeOf(const CellIdentity& identity);
  std::optional<std::size_t> known(const CellIdentity& identity);
  std::optional<std::size_t> onlyWhole(const CellIdentity& part, Arrival time) const;
  std::optional<std::size_t> onlyPart(const CellIdentity& whole, Arrival time) const;
  std::size_t add(const CellIdentity& identity, Arrival time);
  std::size_t room();
  void setIdentity(std::size_t cell, const CellIdentity& identity);
  void takeServing(const Cells& other, const SeenCell& there, std::size_t here);
  std::optional<std::size_t> sameAs(const SeenCell& other) const;
  bool isFresh(std::size_t cell, Arrival time) const;

  OnMeasured onMeasured_;
  OnServing onServing_;
  std::size_t most_;
  std::vector<SeenCell> cells_;
  BandClasses bandClasses_;
  std::vector<std::uint64_t> mentioned_;  // by cell: the message that spoke of it last
  std::vector<Place> index_;              // by identity; the latest cell of each
  struct Serving {
    std::size_t cell = 0;
    std::uint32_t number = 0;  // 0: none
    Arrival time{0};           // when it was named last
  };
  const SeenCell* cellOf(const Serving& serving) const;

  std::array<Serving, 3> servings_;  // of 3GPP's technologies together, of 1x and of EV-DO
  std::size_t lastServing_ = 0;      // the one that was named last
  CellIdentity lastAsked_;           // in the message at hand; most readings ask for the same cell again
  std::size_t lastFound_ = 0;
  std::uint64_t message_ = 0;
  std::uint32_t lastNumber_ = 0;
  std::uint64_t dropped_ = 0;
};

}  // namespace kelvasi::survey
