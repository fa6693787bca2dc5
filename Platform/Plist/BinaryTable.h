// SPDX-License-Identifier: Apache-2.0
// Where a binary property list keeps its objects: the trailer and the table of offsets.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

namespace kelvasi {

class BinaryTable {
 public:
  // Nothing when the trailer contradicts itself or the document's size.
  static std::optional<BinaryTable> read(std::span<const std::uint8_t> document);

  std::uint64_t top() const { return top_; }
  std::size_t referenceSize() const { return referenceSize_; }
  // The bytes from an object's first on to the end of all objects; empty when there is no such object.
  std::span<const std::uint8_t> objectAt(std::uint64_t number) const;

 private:
  std::span<const std::uint8_t> objects_;  // with the magic in front of them
  std::span<const std::uint8_t> offsets_;
  std::size_t offsetSize_ = 1;
  std::size_t referenceSize_ = 1;
  std::uint64_t count_ = 0;
  std::uint64_t top_ = 0;
};

// A big-endian number of up to eight bytes.
std::uint64_t bigEndian(std::span<const std::uint8_t> bytes);

}  // namespace kelvasi
