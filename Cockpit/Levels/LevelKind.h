// SPDX-License-Identifier: Apache-2.0
// The levels that the cockpit shows large, and what records tell of them.
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

#include "Radio/CellIdentity.h"
#include "Radio/Quantity.h"

namespace kelvasi::cockpit {

enum class LevelKind : std::uint8_t { rsrp, rsrq, sinr, rscp, ecno, gsmLevel, ecio, rssi };
inline constexpr std::size_t levelKinds = 8;

// A quantity that tells a level: level = quantity * factor + offset.
struct LevelSource {
  const Quantity* quantity = nullptr;
  double factor = 1;
  double offset = 0;

  constexpr double of(double value) const { return value * factor + offset; }
};

struct LevelDefinition {
  LevelKind kind = LevelKind::rsrp;
  std::string_view id;    // "rsrp", as scripts and tables of thresholds write it
  std::string_view name;  // "RSRP"
  std::string_view unit;
  int decimals = 0;  // of the large figure
  double least = 0;  // what a chart shows at least
  double most = 0;
  std::span<const LevelSource> sources;  // none: no record tells it
};

const LevelDefinition& definitionOf(LevelKind kind);
std::optional<LevelKind> levelKindOf(std::string_view id);
// The level that a quantity tells of a cell of this family; nothing for the others.
std::optional<LevelKind> levelKindOf(RadioFamily family, const Quantity& quantity);

// What is shown of a cell of the family, the most important first. The first one orders cells.
std::span<const LevelKind> levelsOf(RadioFamily family);
// The row, as a path in the display, that tells a level of the handset's receiver while a cell of the family
// serves; empty for levels that belong to cells.
std::string_view receiverRow(RadioFamily family, LevelKind kind);

}  // namespace kelvasi::cockpit
