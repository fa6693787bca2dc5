// SPDX-License-Identifier: Apache-2.0
// Bytes that come one after the other.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

#include "Capture/CaptureFault.h"

namespace kelvasi {

class ByteSource {
 public:
  virtual ~ByteSource() = default;

  // The number of bytes read, 0 at the end; negative, and fault() set, when no more can be read.
  virtual std::ptrdiff_t read(std::span<std::uint8_t> block) = 0;
  const std::optional<CaptureFault>& fault() const { return fault_; }

 protected:
  std::optional<CaptureFault> fault_;
};

}  // namespace kelvasi
