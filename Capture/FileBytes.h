// SPDX-License-Identifier: Apache-2.0
// The bytes of a file or of the standard input.
#pragma once

#include <string>

#include "Capture/ByteSource.h"
#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

class FileBytes : public ByteSource {
 public:
  // "-" is the standard input. A failure is kept in fault().
  explicit FileBytes(const std::string& path);

  std::ptrdiff_t read(std::span<std::uint8_t> block) override;

  const std::string& name() const { return name_; }
  std::uint64_t position() const { return position_; }

 private:
  std::string name_;
  FileDescriptor file_;
  std::uint64_t position_ = 0;
};

}  // namespace kelvasi
