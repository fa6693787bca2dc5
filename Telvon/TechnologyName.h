// SPDX-License-Identifier: Apache-2.0
// Technology identifiers as people write them.
#pragma once

#include <optional>
#include <span>
#include <string_view>

namespace kelvasi {

// All of them, in the order in which a daemon's answer is compared with them.
std::span<const std::string_view> technologyIds();

// The identifier for its short name, "Orvane_GSM", or for itself; nothing for one that does not exist.
std::optional<std::string_view> technologyId(std::string_view name);

// "Orvane_GSM" for kTelvonLogChannelTechnology_Orvane_GSM. Any other text stays as it is.
std::string_view shortTechnologyName(std::string_view id);

}  // namespace kelvasi
