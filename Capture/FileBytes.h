// SPDX-License-Identifier: Apache-2.0
// The bytes of a file or of the standard input.
#pragma once

#include <string>

#include "Capture/ByteSource.h"
#include "Platform/Posix/InputFile.h"

namespace kelvasi {

class FileBytes : public ByteSource {
 public:
  // "-" is the standard input. A failure is kept in fault().
  explicit FileBytes(const std::string& path);

  std::ptrdiff_t read(std::span<std::uint8_t> block) override;

  const std::string& name() const { return file_.name(); }
  std::uint64_t position() const { return file_.position(); }

 private:
  InputFile file_;
};

}  // namespace kelvasi
