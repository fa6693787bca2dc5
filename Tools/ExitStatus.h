// SPDX-License-Identifier: Apache-2.0
// How the programs tell what became of their work.
#pragma once

namespace kelvasi {

inline constexpr int exitSuccess = 0;
inline constexpr int exitFault = 1;
inline constexpr int exitWrongUsage = 2;
// Nobody reads the output any more; as shells tell of a program that SIGPIPE has ended.
inline constexpr int exitOutputClosed = 141;

}  // namespace kelvasi
