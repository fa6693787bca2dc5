// SPDX-License-Identifier: Apache-2.0
// Rows by what a user types: over names, places and values, whatever their case.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "Cockpit/Rows/RowBook.h"
#include "Cockpit/Words/Age.h"
#include "Cockpit/Words/TextStyle.h"

namespace kelvasi::cockpit {

struct Found {
  std::string path;      // RFC 6901
  std::string nodePath;  // in the display tree
  std::string name;
  std::string place;
  std::string value;     // live
  std::string cellText;  // empty for a row of no cell
  Age age;
};

struct SearchResult {
  std::vector<Found> rows;
  std::size_t matches = 0;  // all; `rows` holds the first ones
  std::string words;        // "12 rows", "50 of 312 rows", "No row with this name or value"
};

// Every word of the text has to be in the name, the place, the cell or the value of a row on the display.
// First the rows whose name is the text, then whose name begins with it, has it, whose place has it, whose
// value has it; in each the order of the display's paths. Nothing for an empty text.
SearchResult search(const RowBook& book, std::string_view text, Arrival now, std::size_t most = 50);

}  // namespace kelvasi::cockpit
