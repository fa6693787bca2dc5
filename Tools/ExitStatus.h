// SPDX-License-Identifier: Apache-2.0
// How the programs tell what became of their work.
#pragma once

namespace kelvasi {

inline constexpr int exitSuccess = 0;
inline constexpr int exitFault = 1;
inline constexpr int exitWrongUsage = 2;

}  // namespace kelvasi
