// SPDX-License-Identifier: Apache-2.0
#include "Telvon/CellInfoArray.h"

#include <cmath>
#include <limits>
#include <utility>

#include "Platform/PlistSerialiser.h"
#include "Platform/SystemLog.h"
#include "Telvon/CellMonitor.h"

namespace kelvasi {

namespace {

bool holds(const PlistDictionary& cell, std::string_view key, std::string_view text) {
  const PlistValue* value = cell.find(key);
  return value && value->string() && *value->string() == text;
}

std::optional<std::int32_t> wholeNumber(double real) {
  using Limits = std::numeric_limits<std::int32_t>;
  const bool isInRange = real >= Limits::min() && real <= Limits::max();  // false for what is no number
  if (!isInRange || real != std::trunc(real)) return std::nullopt;
  return static_cast<std::int32_t>(real);
}

}  // namespace

CellInfoArray::CellInfoArray(const Platform& platform, std::span<const std::uint8_t> payload) {
  if (auto parsed = platform.plists.parse(payload)) {
    parsed_ = std::move(*parsed);
  } else {
    platform.log.print(LogPriority::error, "Cell Info Array data could not be constructed");
  }
}

bool isCell(const PlistDictionary& cell, std::string_view technology, std::string_view type) {
  return holds(cell, kTelvonCellMonitorCellRadioAccessTechnology, technology) &&
         holds(cell, kTelvonCellMonitorCellType, type);
}

std::optional<std::int32_t> cellNumber(const PlistDictionary& cell, std::string_view key) {
  const PlistValue* value = cell.find(key);
  if (value && value->integer() && std::in_range<std::int32_t>(*value->integer())) {
    return static_cast<std::int32_t>(*value->integer());
  }
  return value && value->real() ? wholeNumber(*value->real()) : std::nullopt;
}

}  // namespace kelvasi
