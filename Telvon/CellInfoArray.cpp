#include "Telvon/CellInfoArray.h"

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
  return std::nullopt;
}

}  // namespace kelvasi
