// SPDX-License-Identifier: Apache-2.0
// The readings of one message. A generator that is given one gathers into it; without one, decoding costs
// nothing more than a test for null.
//
//   Readings readings;
//   generator->gatherInto(&readings);
//   for each message:
//     generator->setArrival(arrival);
//     generator->updateState(state, bytes);
//     for (const Reading& reading : readings.all()) ...
//
// They stand in the order of writing; the entries of a list that is written anew are removed before, the last
// one first. Setting and removing by them, beginning at the display that the template gives, makes the
// display.
#pragma once

#include <deque>
#include <span>
#include <vector>

#include "LogGenerator/Arrival.h"
#include "LogGenerator/LogCode.h"
#include "LogGenerator/Reading.h"
#include "LogGenerator/ServingCells.h"

namespace kelvasi {

class Readings {
 public:
  // Of the message taken in last.
  std::span<const Reading> all() const { return readings_; }
  Arrival arrival() const { return arrival_; }
  LogCode logCode() const { return logCode_; }

  // For those who gather.
  void begin(Arrival arrival, LogCode logCode);
  std::span<Reading> all() { return readings_; }
  std::size_t count() const { return readings_.size(); }
  void add(const Reading& reading) { readings_.push_back(reading); }
  void addRemovalOfEverything() { add({.kind = Reading::Kind::removal}); }
  // Of the entries of a list, the last one first. `list` is empty where the section itself is the list.
  void addRemovals(const ReadingSection& section, std::string_view list, std::size_t entries);
  // A property-list value that a row comes to hold, and after it what is in it. `isNew`: nothing stood there,
  // so that a group with something in it needs no reading of its own.
  void addValue(const ReadingSection& section, std::string_view row, const PlistValue& value, bool isNew);
  // The same for an entry behind the last one of a section that is a list.
  void addEntry(const ReadingSection& section, std::size_t entry, const PlistValue& value);
  // A display in place of the whole one before. What stands at its top are its sections, whose names, the
  // sort prefix left out, tell their role.
  void addDisplay(
      const PlistValue& display,
      CellRole (*roleOf)(std::string_view section) = [](std::string_view) { return CellRole::none; });

  // Gives all readings from this one on their cell.
  void identify(std::size_t from, const CellIdentity& cell);
  // The cells from this reading on that have no channel are on the serving cell's where it is among them.
  void takeChannel(std::size_t from, const CellIdentity& serving);
  ServingCells& servingCells() { return servingCells_; }

 private:
  void addLeaves(const Reading& place, const std::string& path, std::string_view row, const PlistValue& value,
                 bool isNew);

  Arrival arrival_{0};
  LogCode logCode_ = 0;
  std::vector<Reading> readings_;
  std::deque<PlistValue> values_;  // what readings refer to, and so on
  std::deque<std::string> texts_;
  std::deque<ReadingSection> sections_;
  ServingCells servingCells_;
};

}  // namespace kelvasi
