// SPDX-License-Identifier: Apache-2.0
// What else could serve: a line for each cell, and for each carrier.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "Cockpit/Levels/Level.h"
#include "LogGenerator/Reading.h"
#include "Radio/CellIdentity.h"

namespace kelvasi::cockpit {

struct CellLine {
  std::uint32_t number = 0;  // of the survey's record of the cell; says which row is which from look to look
  CellIdentity identity;
  std::string technology;  // "LTE"
  std::string name;        // "PCI 404"
  std::string channel;     // "3350"
  std::string bands;       // "B7"
  CellRole role = CellRole::none;
  Level level;                       // what orders cells of its technology; with its line
  std::optional<double> difference;  // to the serving cell in the same level, dB
  std::string differenceText;        // "-10", "+3"; empty where there is none
  Age age;  // since it was last reported, its level where it has one: "live", "6 s", "gone 14 s"
};

struct CarrierLine {
  RadioFamily family = RadioFamily::none;
  std::int64_t channel = CellIdentity::unknown;
  std::string technology;
  std::string channelText;
  std::string bands;
  std::string frequency;   // "2680 MHz"
  std::size_t cells = 0;   // that are not gone, the serving one among them
  bool isServing = false;  // the serving cell's
  std::string bestName;    // of the strongest cell on it
  Level best;              // without a line
};

}  // namespace kelvasi::cockpit
