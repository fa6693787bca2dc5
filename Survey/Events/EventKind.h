// SPDX-License-Identifier: Apache-2.0
// What can happen in a drive.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

namespace kelvasi::survey {

enum class EventKind : std::uint8_t {
  cellChange,
  ratChange,
  stateChange,
  reject,
  serviceLost,
  serviceBack,
  linkLost,
  linkBack,
  unknownRecord,
};

inline constexpr std::array<std::string_view, 9> eventKindNames{
    "cell_change",  "rat_change", "state_change", "reject",        "service_lost",
    "service_back", "link_lost",  "link_back",    "unknown_record"};

constexpr std::string_view nameOf(EventKind kind) {
  return eventKindNames[static_cast<std::size_t>(kind)];
}

constexpr std::optional<EventKind> eventKindOf(std::string_view name) {
  const auto found = std::ranges::find(eventKindNames, name);
  if (found == eventKindNames.end()) return std::nullopt;
  return static_cast<EventKind>(found - eventKindNames.begin());
}

}  // namespace kelvasi::survey
