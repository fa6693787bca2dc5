// SPDX-License-Identifier: Apache-2.0
#include "Telvon/TechnologyName.h"

#include <algorithm>
#include <array>

#include "Telvon/Technology.h"

namespace kelvasi {

namespace {

constexpr std::string_view prefix = "kTelvonLogChannelTechnology_";

constexpr std::array technologies{kTelvonLogChannelTechnology_IFX, kTelvonLogChannelTechnology_Orvane_GSM,
                                  kTelvonLogChannelTechnology_Orvane_CDMA,
                                  kTelvonLogChannelTechnology_Orvane_LTE,
                                  kTelvonLogChannelTechnology_Orvane_UTRAN2};

}  // namespace

std::span<const std::string_view> technologyIds() {
  return technologies;
}

std::optional<std::string_view> technologyId(std::string_view name) {
  const auto known = std::ranges::find_if(
      technologies, [&](std::string_view id) { return id == name || shortTechnologyName(id) == name; });
  return known == technologies.end() ? std::nullopt : std::optional(*known);
}

std::string_view shortTechnologyName(std::string_view id) {
  if (id.starts_with(prefix)) id.remove_prefix(prefix.size());
  return id;
}

}  // namespace kelvasi
