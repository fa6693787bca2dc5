// SPDX-License-Identifier: Apache-2.0
// The values of a row that have names.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "LogGenerator/Row.h"

namespace kelvasi {

struct FieldState {
  std::int64_t value;
  std::string text;
};

// The texts that stand for a value, and after them the one that is not a value of the texts.
std::vector<FieldState> statesOf(const Row& row);

}  // namespace kelvasi
