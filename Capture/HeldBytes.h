// SPDX-License-Identifier: Apache-2.0
// Bytes in memory.
#pragma once

#include <algorithm>
#include <utility>

#include "Capture/ByteSource.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class HeldBytes : public ByteSource {
 public:
  explicit HeldBytes(Bytes bytes) : bytes_(std::move(bytes)) {}

  std::ptrdiff_t read(std::span<std::uint8_t> block) override {
    const auto taken =
        std::span(bytes_).subspan(taken_).first(std::min(block.size(), bytes_.size() - taken_));
    std::ranges::copy(taken, block.begin());
    taken_ += taken.size();
    return static_cast<std::ptrdiff_t>(taken.size());
  }

 private:
  Bytes bytes_;
  std::size_t taken_ = 0;
};

}  // namespace kelvasi
