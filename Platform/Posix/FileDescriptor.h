// SPDX-License-Identifier: Apache-2.0
// An open file descriptor, owned, and whole transfers over it.
#pragma once

#include <cstdint>
#include <span>
#include <utility>

namespace kelvasi {

class FileDescriptor {
 public:
  FileDescriptor() = default;
  explicit FileDescriptor(int number) : number_(number) {}  // negative: there is none
  ~FileDescriptor() { close(); }
  FileDescriptor(FileDescriptor&& other) noexcept : number_(std::exchange(other.number_, -1)) {}
  FileDescriptor& operator=(FileDescriptor&& other) noexcept;

  explicit operator bool() const { return number_ >= 0; }
  int number() const { return number_; }
  // False, with errno set, when what was written may be lost. True when there is nothing to close.
  bool close();

 private:
  int number_ = -1;
};

// Goes on after signals and short writes until all is written. False, with errno set, on failure.
bool writeAll(int descriptor, std::span<const std::uint8_t> bytes);

// The same, and where it fails on a disk the file ends where it ended before.
bool writeWhole(int descriptor, std::span<const std::uint8_t> bytes);

}  // namespace kelvasi
