// SPDX-License-Identifier: Apache-2.0
// One frame of the log channel's sockets, as Docs/log-channel.md lays it out: a header of 16 bytes, then
// data.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>

namespace kelvasi {

inline constexpr std::size_t frameHeaderSize = 16;
inline constexpr std::size_t maximumFrameData = std::size_t{16} << 20;
inline constexpr std::uint8_t frameVersion = 1;

enum class FrameKind : std::uint8_t {
  message = 1,     // no reply awaited
  request = 2,     // reply awaited under the frame's token
  reply = 3,       // with data, which may be empty
  emptyReply = 4,  // the request was taken, and there is no data to reply with
  logChannelRequest = 5,
  logChannelAnswer = 6,
  notification = 7,
};

struct FrameHeader {
  std::uint32_t length = 0;  // of the data
  FrameKind kind = FrameKind::message;
  std::uint32_t id = 0;     // message id
  std::uint32_t token = 0;  // joins a request and its reply; 0 in the other kinds
};

// The data last until the next frame is taken.
struct Frame {
  FrameHeader header;
  std::span<const std::uint8_t> data;
};

using FrameHeaderBytes = std::array<std::uint8_t, frameHeaderSize>;

FrameHeaderBytes encodeHeader(const FrameHeader& header);

// Why a header cannot be one, in words; null when it can.
const char* faultOfHeader(std::span<const std::uint8_t, frameHeaderSize> bytes);
// Of a header without a fault.
FrameHeader decodeHeader(std::span<const std::uint8_t, frameHeaderSize> bytes);

std::uint32_t littleEndian32(std::span<const std::uint8_t, 4> bytes);
void putLittleEndian32(std::span<std::uint8_t, 4> bytes, std::uint32_t value);

}  // namespace kelvasi
