// SPDX-License-Identifier: Apache-2.0
// Binary property lists, read into values.
#pragma once

#include <cstdint>
#include <optional>
#include <span>

#include "Plist/PlistValue.h"

namespace kelvasi {

constexpr char binaryPlistMagic[] = "bplist00";

// Reads documents within PlistLimits.h of which every object that can be reached from the top one stands
// where the trailer says, refers to objects that exist, and is a dictionary with string keys, an array, a
// string, an integer of 64 bits, a real, a boolean, a finite date or data. Nothing for others, such as those
// with objects that contain themselves, and strings with NUL or, in their 8-bit form, anything but UTF-8.
std::optional<PlistValue> readBinaryPlist(std::span<const std::uint8_t> document);

}  // namespace kelvasi
