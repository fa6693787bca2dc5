// SPDX-License-Identifier: Apache-2.0
// The kinds of captures that redactCapture() writes.
#pragma once

#include "Capture/CaptureRedaction.h"
#include "Capture/InputBytes.h"

namespace kelvasi {

std::optional<CaptureFault> redactPcap(InputBytes& input, MessageRedactor& redactor, const PutBytes& put);
std::optional<CaptureFault> redactPcapng(InputBytes& input, MessageRedactor& redactor, const PutBytes& put);
std::optional<CaptureFault> redactDlf(InputBytes& input, MessageRedactor& redactor, const PutBytes& put);
std::optional<CaptureFault> redactSnapshot(InputBytes& input, MessageRedactor& redactor, const PutBytes& put);

// The messages of a DLF file in memory; what is behind the last whole record becomes zero.
void redactDlfBytes(std::span<std::uint8_t> file, MessageRedactor& redactor);

// Larger ones no reader takes.
inline constexpr std::size_t largestBlock = std::size_t{16} << 20;

// The next bytes of a file, so many or none.
class BlockInput {
 public:
  explicit BlockInput(InputBytes& input) : input_(input) {}

  // Empty at the end, and where fewer are left: isCut() is then true.
  Bytes take(std::size_t size);
  bool isCut() const { return isCut_; }
  CaptureFault fault(std::string reason) const;
  // Why there is nothing more; nothing when that is as it should be.
  std::optional<CaptureFault> ending() const;

 private:
  InputBytes& input_;
  std::uint64_t begin_ = 0;  // of what was last asked for
  bool isCut_ = false;
};

// Numbers of a file, in its own order of bytes.
std::uint32_t numberAt(std::span<const std::uint8_t> bytes, std::size_t at, std::size_t size,
                       bool isBigEndian);

}  // namespace kelvasi
