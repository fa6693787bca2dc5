// SPDX-License-Identifier: Apache-2.0
// The cell that serves, as a card shows it.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "Cockpit/Levels/Level.h"
#include "Cockpit/Words/Age.h"
#include "Radio/CellIdentity.h"

namespace kelvasi::cockpit {

// A word of the field and what it is for this cell: "TAC" "4517".
struct NamedValue {
  std::string name;
  std::string value;
  bool operator==(const NamedValue&) const = default;
};

struct ServingCell {
  bool isKnown = false;
  std::string why;           // where it is not: "Nothing received yet"
  std::uint32_t number = 0;  // of the survey's record of the cell
  CellIdentity identity;
  std::string technology;     // "LTE"
  std::string network;        // the number, always, and what is known: "262-01 Telekom (Germany)"
  std::string networkNumber;  // "262-01", "SID 4206"; empty when not reported
  std::string networkName;    // empty when nobody knows
  std::string country;
  std::string bands;             // "B7"
  std::string frequency;         // "2680 MHz", of the downlink
  NamedValue channel;            // "E-ARFCN" "3350"
  NamedValue code;               // "PCI" "362"
  std::vector<NamedValue> area;  // "TAC" "4517"; "LAC", "RAC"
  std::vector<NamedValue> ids;   // "eNB" "5121/3", "Cell" "27582721"
  std::string title;             // "LTE 999-02 Test Network (test)"
  std::string subtitle;          // "B7 2680 MHz  PCI 362  TAC 4517  eNB 5121/3"
  std::vector<Level> levels;     // those of the technology, also what is not reported
  Age age;                       // since a message spoke of it
};

}  // namespace kelvasi::cockpit
