// SPDX-License-Identifier: Apache-2.0
// Rows that a user wants on top. A row of a cell is kept by the cell: wherever a list shows it next.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Cockpit/Rows/RowBook.h"
#include "Cockpit/Words/Age.h"

namespace kelvasi::cockpit {

struct PinLine {
  std::string key;   // says which pin, from look to look and from session to session
  std::string path;  // of the row now; the last one known where it is not on the display
  std::string nodePath;
  std::string name;
  std::string place;
  std::string cellText;
  bool isPresent = false;
  std::string value;  // or why there is none: "not reported"
  Age age;
};

class Pins {
 public:
  static constexpr std::size_t mostPins = 32;

  // False for a path that no row has, and past the most. Pinning again does nothing.
  bool pin(const RowBook& book, std::string_view path);
  void unpin(std::string_view key);
  // The key of the pin that keeps this row; empty when none does.
  std::string keyOf(const RowBook& book, std::string_view path) const;

  // One text a pin, for preferences. Those that are no keys are left out.
  std::vector<std::string> keys() const;
  void restore(const std::vector<std::string>& keys);

  std::vector<PinLine> at(const RowBook& book, Arrival now);

 private:
  struct Pin {
    std::string key;
    std::string shape;  // of the path
    std::string cell;   // as textOf() writes it; empty: the row is kept by its path
    std::string lastPath;
    std::string lastValue;
    std::optional<Arrival> last;
  };
  static std::optional<Pin> read(const std::string& key);
  const std::string* placeOf(const RowBook& book, const Pin& pin) const;

  std::vector<Pin> pins_;
};

}  // namespace kelvasi::cockpit
