// SPDX-License-Identifier: Apache-2.0
// The user's own names of operators.
#pragma once

#include <string>
#include <vector>

#include "Radio/Operators.h"

namespace kelvasi {

struct LoadedOperators {
  Operators operators;
  std::vector<std::string> complaints;  // a line each, for people: "/.../operators.csv: line 3 has no name"
};

// The names that are built in, and over them those of operators.csv in the user's settings (Platform/Posix/
// ConfigPath.h), up to 1 MiB, where that is there.
LoadedOperators loadOperators();

}  // namespace kelvasi
