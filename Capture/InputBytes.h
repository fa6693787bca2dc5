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
#include <string_view>

#include "Capture/CaptureReader.h"
#include "Platform/Posix/FileDescriptor.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class InputBytes {
 public:
  static constexpr std::size_t mostFirstBytes = 256;

  // "-" is the standard input. A failure is kept in fault().
  explicit InputBytes(const std::string& path);
  InputBytes(const InputBytes&) = delete;
  InputBytes& operator=(const InputBytes&) = delete;

  const std::string& name() const { return name_; }
  const std::optional<CaptureFault>& fault() const { return fault_; }
  // At most `mostFirstBytes`; less when the file is shorter. Waits for these bytes and no more, and they are
  // read all the same. Not to be called after reading has begun. A failure is kept in fault().
  std::span<const std::uint8_t> firstBytes(std::size_t count);
  std::uint64_t position() const { return position_; }

  // The number of bytes read, 0 at the end, negative with errno set on failure.
  std::ptrdiff_t read(std::span<std::uint8_t> block);

  // All bytes from here on. More than `largest`, none at all and a failure are kept in fault(); `kind`, as in
  // "a DLF file", says what may not be as large.
  Bytes readToEnd(std::size_t largest, std::string_view kind);

  struct Close {
    void operator()(std::FILE* stream) const { std::fclose(stream); }
  };
  // These bytes as a stream, which must not outlive them. ftello() tells its place. Null when the system
  // gives none.
  std::unique_ptr<std::FILE, Close> stream();

 private:
  std::ptrdiff_t readDescriptor(std::span<std::uint8_t> block);
  void fail(std::uint64_t offset, std::string reason);

  std::string name_;
  FileDescriptor file_;
  std::optional<CaptureFault> fault_;
  std::array<std::uint8_t, mostFirstBytes> first_{};
  std::size_t firstCount_ = 0;
  bool endsInFirst_ = false;
  std::uint64_t position_ = 0;
};

}  // namespace kelvasi
