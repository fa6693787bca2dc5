// SPDX-License-Identifier: Apache-2.0
// Every row that the display has or had: its value, when it came and changed, and how far it went. Texts are
// made when somebody asks.
//
// A row stands under its path in the display, an RFC 6901 pointer. What it says of its past is about one
// cell: when another one comes to stand there, the count begins anew. Bounded; rows past the most are
// counted.
#pragma once

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>

#include "LogGenerator/Readings.h"
#include "Plist/PlistValue.h"

namespace kelvasi::cockpit {

struct BookedRow {
  std::uint32_t id = 0;      // from 1
  bool isPresent = true;     // on the display
  bool isInList = false;     // at a place in a list, which may be another thing's the next time
  const Row* row = nullptr;  // as in the reading that came last
  std::int64_t raw = 0;
  PlistValue value;  // of a reading that is a value
  CellIdentity cell;
  Arrival since{0};    // of this cell
  Arrival last{0};     // written
  Arrival changed{0};  // to what it is
  std::uint64_t writings = 0;
  std::optional<double> minimum;
  std::optional<double> maximum;

  const Quantity* quantity() const;
  std::optional<double> number() const;
  std::string text() const;
};

class RowBook {
 public:
  static constexpr std::size_t mostRows = 8192;
  using Rows = std::map<std::string, BookedRow, std::less<>>;

  // Gets each row that was written, once it is booked.
  template <typename OnWritten>
  void take(const Readings& readings, OnWritten&& onWritten) {
    for (const Reading& reading : readings.all()) {
      path_.clear();
      appendPath(path_, reading);
      if (reading.kind == Reading::Kind::removal) {
        remove(path_);
      } else if (BookedRow* row = write(path_, reading, readings.arrival())) {
        onWritten(path_, *row);
      }
    }
  }

  const BookedRow* find(std::string_view path) const;
  const BookedRow* find(std::uint32_t id) const;
  // By path, also those that are not on the display.
  const Rows& all() const { return rows_; }
  std::uint64_t dropped() const { return dropped_; }

 private:
  BookedRow* write(const std::string& path, const Reading& reading, Arrival time);
  void remove(const std::string& path);

  Rows rows_;
  std::string path_;
  std::uint64_t dropped_ = 0;
};

}  // namespace kelvasi::cockpit
