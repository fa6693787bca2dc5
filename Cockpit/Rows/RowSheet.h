// SPDX-License-Identifier: Apache-2.0
// All that is known of one row.
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Cockpit/Rows/RowBook.h"
#include "Cockpit/Words/Age.h"
#include "Cockpit/Words/TextStyle.h"

namespace kelvasi::cockpit {

struct RowSheet {
  std::string path;      // the row's, an RFC 6901 pointer
  std::string nodePath;  // in the display tree
  std::string name;
  std::string place;  // "Serving Cell, Serving Cell Measurements"
  bool isPresent = true;
  CellIdentity cell;     // none for a row of no cell
  std::string cellText;  // "LTE 3350/404"
  std::string value;     // whole, as the pane shows it
  std::optional<double> number;
  std::string decimal;  // of the raw value; empty where there is none
  std::string hexadecimal;
  std::string_view quantity;  // "rsrp"; empty for a text
  std::string quantityName;   // "RSRP"
  std::string meaning;        // a sentence
  std::string_view unit;      // the quantity's
  std::string_view source;    // the clause that defines it
  Age age;
  std::string minimum;  // with unit; empty where there is no number
  std::string maximum;
  std::string sinceText;    // since when these count, "21:40:13"
  std::string changedText;  // last change, "2 min ago, 21:55:10"
  std::uint64_t writings = 0;
  bool canChart = false;
  std::string ruleBegin;  // what an alarm on it begins with, "rsrp"; empty where rules know no such value

  // All of it as lines of a caption and a text, those without a text left out.
  std::vector<std::pair<std::string, std::string>> lines() const;
};

RowSheet sheetOf(const std::string& path, const BookedRow& row, Arrival now, const TextStyle& style);

}  // namespace kelvasi::cockpit
