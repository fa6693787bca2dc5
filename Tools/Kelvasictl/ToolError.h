// SPDX-License-Identifier: Apache-2.0
// What ends a verb early.
#pragma once

#include <stdexcept>

namespace kelvasi {

inline constexpr int exitSuccess = 0;
inline constexpr int exitFault = 1;
inline constexpr int exitWrongUsage = 2;

// One line for the standard error; the exit status is exitFault.
class ToolError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

}  // namespace kelvasi
