// SPDX-License-Identifier: Apache-2.0
// Effective log codes: the 16-bit code of a baseband record, or 0xFF0000 and above for the extra records that
// the telephony daemon itself supplies.
#pragma once

#include <cstdint>

namespace kelvasi {

using LogCode = std::uint32_t;

inline constexpr LogCode extraLogCodes = 0xFF0000;

inline constexpr LogCode simFilesLogCode = 0xFF0000;
inline constexpr LogCode cellInfoLogCode = 0xFF0001;
inline constexpr LogCode pdpContextLogCode = 0xFF0002;

}  // namespace kelvasi
