// SPDX-License-Identifier: Apache-2.0
// Binary property lists put together object by object, right or wrong.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi::testing {

class BinaryDocument {
 public:
  BinaryDocument();

  // Adds an object as its bytes stand; objects are numbered from 0.
  BinaryDocument& add(const Bytes& object);
  BinaryDocument& addText(std::string_view text);  // up to 14 bytes, in the 8-bit form
  // Objects are numbered in two bytes, offsets in four.
  BinaryDocument& addArray(std::initializer_list<std::uint16_t> elements);
  BinaryDocument& addDictionary(std::initializer_list<std::uint16_t> keysThenValues);

  // The document whose top object is number `top`.
  Bytes bytes(std::uint64_t top = 0) const;

 private:
  BinaryDocument& addReferences(std::uint8_t kind, std::size_t count,
                                std::initializer_list<std::uint16_t> numbers);

  Bytes objects_;  // with the magic in front of them
  std::vector<std::size_t> offsets_;
};

}  // namespace kelvasi::testing
