// SPDX-License-Identifier: Apache-2.0
// A cell as it truly is in a world: what a display of it can be held against.
#pragma once

#include <optional>
#include <vector>

#include "Radio/CellIdentity.h"
#include "Simulator/Radio/Cell.h"
#include "Simulator/Radio/RadioModel.h"

namespace kelvasi::sim {

struct TrueLevels {
  std::optional<double> level;  // dBm: received level, RSCP, RSRP; nothing in CDMA
  double quality = 0;           // dB: Ec/No, RSRQ, Ec/Io
};

struct TrueCell {
  CellIdentity identity;
  bool isServing = false;
  TrueLevels now;
  std::optional<TrueLevels> average = {};  // where the handset averages
};

using TrueCells = std::vector<TrueCell>;

// Of a cell of GSM, UMTS or LTE.
CellIdentity identityOf(const Cell& cell);
TrueLevels levelsOf(const Reception& heard);

}  // namespace kelvasi::sim
