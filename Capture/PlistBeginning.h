// SPDX-License-Identifier: Apache-2.0
// How a property list begins.
#pragma once

#include <cstdint>
#include <span>

#include "Capture/InputBytes.h"

namespace kelvasi {

// Whether these bytes begin as an XML or binary property list does.
bool beginsAsPlist(std::span<const std::uint8_t> bytes);

// The same of an input of which nothing was read yet; a byte order mark and blank space may come first.
bool beginsAsPlist(InputBytes& input);

}  // namespace kelvasi
