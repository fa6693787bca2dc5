// SPDX-License-Identifier: Apache-2.0
// A hash that nobody can make, or try out, without the key.
#pragma once

#include <array>
#include <cstdint>
#include <span>

namespace kelvasi {

class KeyedHash {
 public:
  using Digest = std::array<std::uint8_t, 32>;

  virtual ~KeyedHash() = default;

  // The same bytes give the same digest.
  virtual Digest of(std::span<const std::uint8_t> bytes) const = 0;
};

}  // namespace kelvasi
