// SPDX-License-Identifier: Apache-2.0
// The cockpit's face as blocks: how the radio is, and whether what is seen is true now.
#pragma once

#include <cstdint>
#include <functional>
#include <string>

#include "Cockpit/Snapshot.h"
#include "Tools/Kelvasi/Cockpit/Block.h"

namespace kelvasi {

// What the face leads to. Each may be empty.
struct FaceActions {
  std::function<void(const std::string& path)> openRow;  // of a pin
  std::function<void(std::size_t place)> openLevel;      // of the serving cell, the place among its levels
  std::function<void(std::uint32_t cell)> openCell;
  std::function<void(std::uint64_t event)> openEvent;
  std::function<void()> openEvents;
  std::function<void()> openCoverage;
  std::function<void()> openAlarms;
};

// In a page this wide.
Blocks faceBlocks(const cockpit::Snapshot& snapshot, const FaceActions& actions, double width);

// The face in a height: whole blocks only, from the top on.
Blocks cardBlocks(const cockpit::Snapshot& snapshot, double width, double height);

}  // namespace kelvasi
