// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Levels/LevelKind.h"

#include <algorithm>

namespace kelvasi::cockpit {

namespace {

constexpr std::array rsrpSources{LevelSource{&quantity::rsrp}};
constexpr std::array rsrqSources{LevelSource{&quantity::rsrq}};
// The level that UTRA TDD reports goes from 0 to 91, as a part of 256 (3GPP TS 25.123, 9.1.1.1.3).
constexpr std::array rscpSources{LevelSource{&quantity::rscp}, LevelSource{&quantity::rscpLevel, 256, -116}};
constexpr std::array ecnoSources{LevelSource{&quantity::ecno}};
// RXLEV counts from -110 dBm (3GPP TS 45.008, 8.1.4).
constexpr std::array gsmSources{LevelSource{&quantity::rssi}, LevelSource{&quantity::rxlev, 1, -110}};
constexpr std::array ecioSources{LevelSource{&quantity::ecio}};
constexpr std::array rssiSources{LevelSource{&quantity::rssi}, LevelSource{&quantity::rxPower}};

constexpr std::array<LevelDefinition, levelKinds> definitions{{
    {LevelKind::rsrp, "rsrp", "RSRP", "dBm", 0, -140, -44, rsrpSources},
    {LevelKind::rsrq, "rsrq", "RSRQ", "dB", 1, -20, -3, rsrqSources},
    {LevelKind::sinr, "sinr", "SINR", "dB", 0, -10, 30, {}},
    {LevelKind::rscp, "rscp", "RSCP", "dBm", 0, -121, -25, rscpSources},
    {LevelKind::ecno, "ecno", "Ec/No", "dB", 1, -24, 0, ecnoSources},
    {LevelKind::gsmLevel, "gsm_level", "Level", "dBm", 0, -110, -47, gsmSources},
    {LevelKind::ecio, "ecio", "Ec/Io", "dB", 1, -31, 0, ecioSources},
    {LevelKind::rssi, "rssi", "RSSI", "dBm", 0, -120, -30, rssiSources},
}};

struct FamilyLevels {
  RadioFamily family;
  std::span<const LevelKind> kinds;
};

constexpr std::array lteLevels{LevelKind::rsrp, LevelKind::rsrq, LevelKind::sinr, LevelKind::rssi};
constexpr std::array umtsLevels{LevelKind::rscp, LevelKind::ecno};
constexpr std::array tddLevels{LevelKind::rscp};
constexpr std::array gsmLevels{LevelKind::gsmLevel};
constexpr std::array cdmaLevels{LevelKind::ecio, LevelKind::rssi};

constexpr std::array families{
    FamilyLevels{RadioFamily::lte, lteLevels},     FamilyLevels{RadioFamily::umts, umtsLevels},
    FamilyLevels{RadioFamily::utraTdd, tddLevels}, FamilyLevels{RadioFamily::gsm, gsmLevels},
    FamilyLevels{RadioFamily::cdma, cdmaLevels},   FamilyLevels{RadioFamily::evdo, cdmaLevels}};

}  // namespace

const LevelDefinition& definitionOf(LevelKind kind) {
  return definitions[static_cast<std::size_t>(kind)];
}

std::optional<LevelKind> levelKindOf(std::string_view id) {
  const auto found = std::ranges::find(definitions, id, &LevelDefinition::id);
  if (found == definitions.end()) return std::nullopt;
  return found->kind;
}

std::optional<LevelKind> levelKindOf(RadioFamily family, const Quantity& quantity) {
  for (const LevelKind kind : levelsOf(family)) {
    const auto sources = definitionOf(kind).sources;
    const bool tells = std::ranges::find(sources, &quantity, &LevelSource::quantity) != sources.end();
    if (tells && receiverRow(family, kind).empty()) return kind;
  }
  return std::nullopt;
}

std::span<const LevelKind> levelsOf(RadioFamily family) {
  const auto found = std::ranges::find(families, family, &FamilyLevels::family);
  return found == families.end() ? std::span<const LevelKind>() : found->kinds;
}

std::string_view receiverRow(RadioFamily family, LevelKind kind) {
  if (kind != LevelKind::rssi) return {};
  if (family == RadioFamily::cdma) return "/1x/Receiver 0 AGC";
  return family == RadioFamily::evdo ? "/EV-DO/Receiver 0 AGC" : "";
}

}  // namespace kelvasi::cockpit
