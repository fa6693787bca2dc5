// SPDX-License-Identifier: Apache-2.0
// A file or the standard input, read piece by piece.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <system_error>

#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

class InputFile {
 public:
  // "-" is the standard input. error() is set where it cannot be opened.
  explicit InputFile(const std::string& path);

  // How many bytes were read: none at the end only. -1, and error() set, on failure; nothing is read after
  // that.
  std::ptrdiff_t read(std::span<std::uint8_t> block);

  const std::string& name() const { return name_; }  // for people
  std::uint64_t position() const { return position_; }
  std::error_code error() const { return error_; }
  // For those who wait until there is something to read.
  int descriptor() const { return file_.number(); }

 private:
  std::string name_;
  FileDescriptor file_;
  std::uint64_t position_ = 0;
  std::error_code error_;
};

}  // namespace kelvasi
