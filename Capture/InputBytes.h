// SPDX-License-Identifier: Apache-2.0
// A file or the standard input, read from its beginning to its end, unpacked where it is packed (gzip, zstd).
// The first bytes can be looked at before anybody reads them, and the place that was read up to is known for
// pipes too.
#pragma once

#include <cstdio>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

#include "Capture/FileBytes.h"
#include "Capture/PeekedBytes.h"
#include "Capture/UnpackedBytes.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class InputBytes {
 public:
  // "-" is the standard input. A failure is kept in fault().
  explicit InputBytes(const std::string& path);
  InputBytes(const InputBytes&) = delete;
  InputBytes& operator=(const InputBytes&) = delete;

  // For the places in what the input holds: "drive.pcap", of a packed file "drive.pcap.gz, unpacked".
  std::string name() const;
  const std::optional<CaptureFault>& fault() const { return fault_ ? fault_ : content().fault(); }
  ByteSource& bytes() { return content(); }
  // As PeekedBytes has it.
  std::span<const std::uint8_t> firstBytes(std::size_t count) { return content().firstBytes(count); }
  // In what the input holds.
  std::uint64_t position() const { return content().position(); }
  // In the file itself.
  std::uint64_t filePosition() const { return file_.position(); }

  // The number of bytes read, 0 at the end, negative on failure.
  std::ptrdiff_t read(std::span<std::uint8_t> block) { return content().read(block); }

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
  PeekedBytes& content() { return unpackedFirst_ ? *unpackedFirst_ : fileFirst_; }
  const PeekedBytes& content() const { return unpackedFirst_ ? *unpackedFirst_ : fileFirst_; }
  void fail(std::uint64_t offset, std::string reason);

  FileBytes file_;
  PeekedBytes fileFirst_;
  std::optional<UnpackedBytes> unpacked_;
  std::optional<PeekedBytes> unpackedFirst_;
  std::optional<CaptureFault> fault_;
};

}  // namespace kelvasi
