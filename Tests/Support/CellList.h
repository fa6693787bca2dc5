// SPDX-License-Identifier: Apache-2.0
// Cells of the telephony daemon's cell list.
#pragma once

#include <initializer_list>
#include <string>
#include <string_view>
#include <utility>

#include "Plist/PlistValue.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi::test {

// `entries` by their keys without "kTelvonCellMonitor": {"ARFCN", 12}.
inline PlistValue::Dictionary cell(std::string_view technology, std::string_view type,
                                   std::initializer_list<std::pair<const char*, PlistValue>> entries = {}) {
  auto made = PlistDictionary::make(
      {{"kTelvonCellMonitorCellRadioAccessTechnology", technology}, {"kTelvonCellMonitorCellType", type}});
  for (const auto& [key, value] : entries) made->set(std::string("kTelvonCellMonitor") + key, value);
  return made;
}

inline constexpr std::string_view gsm = kTelvonCellMonitorRadioAccessTechnologyGSM;
inline constexpr std::string_view umts = kTelvonCellMonitorRadioAccessTechnologyUMTS;
inline constexpr std::string_view lte = kTelvonCellMonitorRadioAccessTechnologyLTE;
inline constexpr std::string_view serving = kTelvonCellMonitorCellTypeServing;
inline constexpr std::string_view neighbour = kTelvonCellMonitorCellTypeNeighbor;

}  // namespace kelvasi::test
