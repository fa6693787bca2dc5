// SPDX-License-Identifier: Apache-2.0
// What a packed file holds.
#pragma once

#include <memory>
#include <string>

#include "Capture/ByteSource.h"
#include "Capture/Unpacker.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class UnpackedBytes : public ByteSource {
 public:
  // `packed` outlives it; `name` stands for it in a fault.
  UnpackedBytes(ByteSource& packed, std::string name, std::unique_ptr<Unpacker> unpacker);

  // What precedes damaged or missing packed bytes is delivered first. A fault names its place among the
  // packed bytes.
  std::ptrdiff_t read(std::span<std::uint8_t> block) override;

 private:
  bool fill();
  std::ptrdiff_t fail(std::string reason);

  ByteSource& packed_;
  std::string name_;
  std::unique_ptr<Unpacker> unpacker_;
  Bytes buffer_;
  std::span<const std::uint8_t> waiting_;  // in the buffer
  std::uint64_t taken_ = 0;                // of the packed bytes
  bool isAtEnd_ = false;                   // of the packed bytes
  bool isComplete_ = false;                // as far as they were taken
};

}  // namespace kelvasi
