// SPDX-License-Identifier: Apache-2.0
// One object of a binary property list.
#pragma once

#include <cstdint>
#include <optional>
#include <span>

#include "Plist/PlistValue.h"

namespace kelvasi {

struct BinaryObject {
  enum Kind : unsigned {
    simple = 0x0,
    integer = 0x1,
    real = 0x2,
    date = 0x3,
    data = 0x4,
    ascii = 0x5,
    utf16 = 0x6,
    array = 0xa,
    dictionary = 0xd
  };

  Kind kind;                              // the upper half of the first byte; may be none of these
  std::uint64_t count;                    // the lower half, or the integer that follows in its place
  std::span<const std::uint8_t> content;  // from there on to the end of all objects

  bool isString() const { return kind == ascii || kind == utf16; }
  // Whether `count` is one of bytes, 16-bit units, elements or entries.
  bool isCounted() const { return kind >= data; }
};

// The object that begins with the first of `bytes`; nothing when its count is not all there.
std::optional<BinaryObject> binaryObjectIn(std::span<const std::uint8_t> bytes);

// The value of an object that is not counted; absent when it is none or not all there. Integers fit 64 bits,
// dates are finite.
PlistValue scalarOf(const BinaryObject& object);

// The string or data that has this content; absent for text that is not clean, and for other kinds.
PlistValue contentOf(BinaryObject::Kind kind, std::span<const std::uint8_t> content);

}  // namespace kelvasi
