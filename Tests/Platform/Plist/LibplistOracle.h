// SPDX-License-Identifier: Apache-2.0
// Property lists as another implementation reads them, to hold ours against.
#pragma once

#include <cstdint>
#include <optional>
#include <span>

#include "Plist/PlistValue.h"

namespace kelvasi::testing {

// For documents that our readers accept: the library is more generous, and unsafe with some that they refuse.
// It knows no byte order mark, no padding and no empty tag for a key.
std::optional<PlistValue> readWithLibplist(std::span<const std::uint8_t> document);

}  // namespace kelvasi::testing
