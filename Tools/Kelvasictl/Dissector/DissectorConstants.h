// SPDX-License-Identifier: Apache-2.0
// What decoders calculate with beside their tables, for the rules of the dissector that calculate the same.
#pragma once

#include <string>

namespace kelvasi {

// Defines `tables.constants`.
std::string dissectorConstants();

}  // namespace kelvasi
