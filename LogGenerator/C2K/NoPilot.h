// SPDX-License-Identifier: Apache-2.0
// What the records hold in place of a PN offset where there is no pilot.
#pragma once

#include <cstdint>

namespace kelvasi {

inline constexpr std::int64_t noPilot = 65535;

}  // namespace kelvasi
