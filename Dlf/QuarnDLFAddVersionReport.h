// SPDX-License-Identifier: Apache-2.0
// The version report record that every DLF file starts with.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

namespace kelvasi {

inline constexpr std::uint32_t dlfVersionReportSize = 161;

struct DlfCreationTime {
  std::uint32_t seconds = 0;             // since 1 January 1970 UTC
  std::int16_t zoneOffsetInMinutes = 0;  // from GMT, east positive
  std::uint8_t daylightSaving = 0;       // 1 while in force
};

inline constexpr int dlfSuccess = 0;
inline constexpr int dlfBufferTooShort = 3;

// Writes the record into the first 161 bytes of `buffer` and sets `written` to 161. A shorter buffer is left
// untouched, `written` becomes 0 and the result is 3. The texts are cut to 6 (version), 15 (executable) and
// 17 (build) characters.
int QuarnDLFAddVersionReport(std::span<std::uint8_t> buffer, std::uint32_t& written,
                             std::uint16_t firstReport, std::uint16_t secondReport, std::string_view version,
                             std::string_view executable, std::string_view build, DlfCreationTime created);

}  // namespace kelvasi
