// SPDX-License-Identifier: Apache-2.0
// Texts of records for programs.
#pragma once

#include <chrono>
#include <string>
#include <string_view>

namespace kelvasi {

// RFC 3339 in UTC with microseconds: "2024-03-05T14:07:09.250000Z".
std::string rfc3339(std::chrono::nanoseconds sinceEpoch);

// A field of RFC 4180, in quotation marks where it needs them.
std::string csvField(std::string_view text);

}  // namespace kelvasi
