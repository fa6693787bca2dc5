// SPDX-License-Identifier: Apache-2.0
// The telephony daemon's cell list: the serving cell and its neighbours as the handset measured them last.
#pragma once

#include <optional>
#include <vector>

#include "Platform/PlistSerialiser.h"
#include "Simulator/Radio/Cell.h"
#include "Simulator/Radio/RadioModel.h"

namespace kelvasi::sim {

struct MeasuredCell {
  Cell cell;
  // Whole dBm: received level of a GSM cell, RSCP of a UMTS cell; nothing when it has not been measured.
  std::optional<int> level;
  std::optional<int> ecNo;  // whole dB, of a UMTS cell
};

// As a handset reports it.
MeasuredCell measuredCell(const Cell& cell, const Reception& heard);

struct CellList {
  std::optional<MeasuredCell> serving;
  std::vector<MeasuredCell> neighbours;
};

// Record 0xFF0001; nothing when the list cannot be serialised.
std::optional<Bytes> cellInfoRecord(const CellList& cells, const PlistSerialiser& plists);

}  // namespace kelvasi::sim
