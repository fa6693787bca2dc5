// SPDX-License-Identifier: Apache-2.0
// When the program was built.
#pragma once

namespace kelvasi {

// As in "Jun  6 2017 22:20:30": when BuildTime.cpp was compiled.
const char* compiledAt();

}  // namespace kelvasi
