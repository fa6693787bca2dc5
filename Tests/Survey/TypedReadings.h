// SPDX-License-Identifier: Apache-2.0
// Readings of a message, typed in a test.
#pragma once

#include <deque>
#include <initializer_list>
#include <memory>

#include "LogGenerator/Readings.h"
#include "LogGenerator/Row.h"

namespace kelvasi::test {

using namespace std::chrono_literals;

inline constexpr Arrival noon = std::chrono::hours(480000);

inline const ReadingSection servingSection{.name = "Serving", .path = "/Serving", .role = CellRole::serving};
inline const ReadingSection neighbourSection{
    .name = "Neighbours", .path = "/Neighbours", .role = CellRole::neighbour};
inline const ReadingSection activeSection{.name = "Active", .path = "/Active", .role = CellRole::active};
inline const ReadingSection plainSection{.name = "Plain", .path = "/Plain", .role = CellRole::none};

class Message {
 public:
  explicit Message(Arrival after, LogCode logCode = 0xB0C2) { readings_.begin(noon + after, logCode); }

  Message& serving(const CellIdentity& cell, const Quantity& quantity, std::int64_t raw) {
    return add(servingSection, cell, quantity, raw, Reading::notInList);
  }
  Message& neighbour(const CellIdentity& cell, const Quantity& quantity, std::int64_t raw) {
    return add(neighbourSection, cell, quantity, raw, entry_++);
  }
  // That a list of so many neighbours is written anew.
  Message& removeNeighbours(std::size_t entries) {
    readings_.addRemovals(neighbourSection, {}, entries);
    return *this;
  }
  Message& active(const CellIdentity& cell, const Quantity& quantity, std::int64_t raw) {
    return add(activeSection, cell, quantity, raw, entry_++);
  }
  // A value that is no whole number.
  Message& level(const CellIdentity& cell, const Quantity& quantity, double value) {
    add(servingSection, cell, quantity, rawOf(value), Reading::notInList);
    rows_->back().scale = Scale{.curve = fromRaw};
    return *this;
  }
  Message& plain(const Quantity& quantity, std::int64_t raw, std::span<const std::string_view> texts = {}) {
    return add(plainSection, {}, quantity, raw, Reading::notInList, texts);
  }

  operator const Readings&() const { return readings_; }  // NOLINT: a message is its readings

 private:
  Message& add(const ReadingSection& section, const CellIdentity& cell, const Quantity& quantity,
               std::int64_t raw, std::int32_t entry, std::span<const std::string_view> texts = {}) {
    const Row& row = rows_->emplace_back(Row{.key = quantity.id, .quantity = quantity, .texts = texts});
    Reading reading;
    reading.entry = entry;
    reading.section = &section;
    reading.row = &row;
    reading.raw = raw;
    reading.key = row.key;
    reading.cell = cell;
    readings_.add(reading);
    return *this;
  }

  Readings readings_;
  // Shared with copies, whose readings refer to the same rows.
  std::shared_ptr<std::deque<Row>> rows_ = std::make_shared<std::deque<Row>>();
  std::int32_t entry_ = 0;
};

}  // namespace kelvasi::test
