// SPDX-License-Identifier: Apache-2.0
// Bytes of which the first can be looked at before anybody reads them.
#pragma once

#include <array>

#include "Capture/ByteSource.h"

namespace kelvasi {

class PeekedBytes : public ByteSource {
 public:
  static constexpr std::size_t mostFirstBytes = 256;

  // `bytes` outlives it.
  explicit PeekedBytes(ByteSource& bytes) : bytes_(bytes) { fault_ = bytes.fault(); }

  // At most `mostFirstBytes`; less when there are fewer, and after a fault. Waits for these bytes and no
  // more, and they are read all the same. Not to be called after reading has begun.
  std::span<const std::uint8_t> firstBytes(std::size_t count);

  std::ptrdiff_t read(std::span<std::uint8_t> block) override;
  std::uint64_t position() const { return position_; }

 private:
  std::ptrdiff_t readOn(std::span<std::uint8_t> block);

  ByteSource& bytes_;
  std::array<std::uint8_t, mostFirstBytes> first_{};
  std::size_t firstCount_ = 0;
  bool endsInFirst_ = false;
  std::uint64_t position_ = 0;
};

}  // namespace kelvasi
