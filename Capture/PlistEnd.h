// SPDX-License-Identifier: Apache-2.0
// How a property list that cannot be read may have lost its end.
#pragma once

#include <cstdint>
#include <span>

namespace kelvasi {

// Whether a document that no parser takes is the beginning of a property list, XML or binary, whose end is
// missing.
bool endsTooEarly(std::span<const std::uint8_t> document);

}  // namespace kelvasi
