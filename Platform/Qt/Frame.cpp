// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/Frame.h"

namespace kelvasi {

namespace {

constexpr std::size_t lengthAt = 0;
constexpr std::size_t versionAt = 4;
constexpr std::size_t kindAt = 5;
constexpr std::size_t reservedAt = 6;
constexpr std::size_t idAt = 8;
constexpr std::size_t tokenAt = 12;

bool isKnownKind(std::uint8_t kind) {
  return kind >= static_cast<std::uint8_t>(FrameKind::message) &&
         kind <= static_cast<std::uint8_t>(FrameKind::notification);
}

}  // namespace

std::uint32_t littleEndian32(std::span<const std::uint8_t, 4> bytes) {
  return std::uint32_t{bytes[0]} | std::uint32_t{bytes[1]} << 8 | std::uint32_t{bytes[2]} << 16 |
         std::uint32_t{bytes[3]} << 24;
}

void putLittleEndian32(std::span<std::uint8_t, 4> bytes, std::uint32_t value) {
  for (std::uint8_t& byte : bytes) {
    byte = static_cast<std::uint8_t>(value & 0xFF);
    value >>= 8;
  }
}

FrameHeaderBytes encodeHeader(const FrameHeader& header) {
  FrameHeaderBytes bytes{};
  const std::span<std::uint8_t, frameHeaderSize> all(bytes);
  putLittleEndian32(all.subspan<lengthAt, 4>(), header.length);
  bytes[versionAt] = frameVersion;
  bytes[kindAt] = static_cast<std::uint8_t>(header.kind);
  putLittleEndian32(all.subspan<idAt, 4>(), header.id);
  putLittleEndian32(all.subspan<tokenAt, 4>(), header.token);
  return bytes;
}

const char* faultOfHeader(std::span<const std::uint8_t, frameHeaderSize> bytes) {
  if (bytes[versionAt] != frameVersion) return "of an unknown version";
  if (!isKnownKind(bytes[kindAt])) return "of an unknown kind";
  if (bytes[reservedAt] != 0 || bytes[reservedAt + 1] != 0) return "with reserved bytes in use";
  if (littleEndian32(bytes.subspan<lengthAt, 4>()) > maximumFrameData) return "of more than 16 MiB";
  return nullptr;
}

FrameHeader decodeHeader(std::span<const std::uint8_t, frameHeaderSize> bytes) {
  return {.length = littleEndian32(bytes.subspan<lengthAt, 4>()),
          .kind = static_cast<FrameKind>(bytes[kindAt]),
          .id = littleEndian32(bytes.subspan<idAt, 4>()),
          .token = littleEndian32(bytes.subspan<tokenAt, 4>())};
}

}  // namespace kelvasi
