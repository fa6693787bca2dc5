// Technology identifiers as people write them.
#pragma once

#include <optional>
#include <string_view>

namespace kelvasi {

// The identifier for its short name, "Orvane_GSM", or for itself; nothing for one that does not exist.
std::optional<std::string_view> technologyId(std::string_view name);

// "Orvane_GSM" for kTelvonLogChannelTechnology_Orvane_GSM. Any other text stays as it is.
std::string_view shortTechnologyName(std::string_view id);

}  // namespace kelvasi
