// SPDX-License-Identifier: Apache-2.0
// One line of comma-separated values (RFC 4180; a quoted field ends with its line).
#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace kelvasi {

// The fields of a line without its end; nothing where a quote is not closed or followed by more than a comma.
std::optional<std::vector<std::string>> csvFields(std::string_view line);

}  // namespace kelvasi
