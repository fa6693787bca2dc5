// SPDX-License-Identifier: Apache-2.0
// A window on one log record. Every byte past the record's end reads as zero, so no read leaves the record
// whatever its counts say.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <utility>

namespace kelvasi {

class RecordView {
 public:
  static constexpr std::size_t headerSize = 13;

  constexpr explicit RecordView(std::span<const std::uint8_t> bytes) : bytes_(bytes) {}

  constexpr std::size_t size() const { return bytes_.size(); }
  constexpr std::span<const std::uint8_t> bytes() const { return bytes_; }
  // What follows the header; empty in a record that ends before it.
  constexpr std::span<const std::uint8_t> payload() const {
    return bytes_.subspan(bytes_.size() < headerSize ? bytes_.size() : headerSize);
  }

  constexpr std::uint8_t byteAt(std::size_t at) const {
    return at < bytes_.size() ? bytes_[at] : std::uint8_t{0};
  }

  // `width` bits (1 to 32), least significant first, from bit `bit` (0 to 7) of byte `byte` on into later
  // bytes.
  constexpr std::uint32_t bits(std::size_t byte, unsigned bit, unsigned width) const {
    const std::uint64_t window =
        hasWhole(byte) ? wholeWindow(bytes_.subspan(byte), WindowBytes{}) : cutWindow(byte);
    return static_cast<std::uint32_t>((window >> bit) & ((std::uint64_t{1} << width) - 1));
  }
  constexpr std::uint16_t u16(std::size_t at) const { return static_cast<std::uint16_t>(bits(at, 0, 16)); }
  constexpr std::uint32_t u32(std::size_t at) const { return bits(at, 0, 32); }

  // The record from byte `at` on, for entries whose offsets count from their own start.
  constexpr RecordView from(std::size_t at) const {
    return RecordView(bytes_.subspan(at < bytes_.size() ? at : bytes_.size()));
  }

 private:
  // Eight bytes, little-endian: more than any field reaches.
  using WindowBytes = std::make_index_sequence<8>;

  constexpr bool hasWhole(std::size_t at) const {
    return at < bytes_.size() && bytes_.size() - at >= WindowBytes::size();
  }
  // Written out byte by byte, which compilers read as one load.
  template <std::size_t... At>
  static constexpr std::uint64_t wholeWindow(std::span<const std::uint8_t> bytes,
                                             std::index_sequence<At...>) {
    return ((std::uint64_t{bytes[At]} << (8 * At)) | ...);
  }
  constexpr std::uint64_t cutWindow(std::size_t byte) const {
    std::uint64_t window = 0;
    for (std::size_t at = 0; at < WindowBytes::size(); ++at)
      window |= std::uint64_t{byteAt(byte + at)} << (8 * at);
    return window;
  }

  std::span<const std::uint8_t> bytes_;
};

}  // namespace kelvasi
