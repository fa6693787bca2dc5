// A file or the standard input, read from its beginning to its end. The first bytes can be looked at before
// anybody reads them, and the place that was read up to is known for pipes too.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <memory>
#include <optional>
#include <span>
#include <string>

#include "Capture/CaptureReader.h"
#include "Platform/Posix/FileDescriptor.h"

namespace kelvasi {

class InputBytes {
 public:
  // "-" is the standard input. A failure is kept in fault().
  explicit InputBytes(const std::string& path);
  InputBytes(const InputBytes&) = delete;
  InputBytes& operator=(const InputBytes&) = delete;

  const std::string& name() const { return name_; }
  const std::optional<CaptureFault>& fault() const { return fault_; }
  // At most four; less when the file is shorter. They are read all the same.
  std::span<const std::uint8_t> firstBytes() const { return std::span(first_).first(firstCount_); }
  std::uint64_t position() const { return position_; }

  // The number of bytes read, 0 at the end, negative with errno set on failure.
  std::ptrdiff_t read(std::span<std::uint8_t> block);

  struct Close {
    void operator()(std::FILE* stream) const { std::fclose(stream); }
  };
  // These bytes as a stream, which must not outlive them. ftello() tells its place. Null when the system
  // gives none.
  std::unique_ptr<std::FILE, Close> stream();

 private:
  std::ptrdiff_t readDescriptor(std::span<std::uint8_t> block);

  std::string name_;
  FileDescriptor file_;
  std::optional<CaptureFault> fault_;
  std::array<std::uint8_t, 4> first_{};
  std::size_t firstCount_ = 0;
  std::uint64_t position_ = 0;
};

}  // namespace kelvasi
