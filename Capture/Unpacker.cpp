// SPDX-License-Identifier: Apache-2.0
#include "Capture/Unpacker.h"

#include <algorithm>
#include <array>

#include "Capture/GzipUnpacker.h"
#include "Capture/ZstdUnpacker.h"

namespace kelvasi {

namespace {

constexpr std::array<std::uint8_t, 3> gzipMagic{0x1F, 0x8B, 0x08};
constexpr std::array<std::uint8_t, 4> zstdMagic{0x28, 0xB5, 0x2F, 0xFD};

bool beginsWith(std::span<const std::uint8_t> bytes, std::span<const std::uint8_t> magic) {
  return bytes.size() >= magic.size() && std::ranges::equal(bytes.first(magic.size()), magic);
}

// Of a frame that holds no data of the file, which other programs put in front: 50 to 5F, then 2A 4D 18.
bool isSkippable(std::span<const std::uint8_t> bytes) {
  return bytes.size() >= 4 && (bytes[0] & 0xF0) == 0x50 && bytes[1] == 0x2A && bytes[2] == 0x4D &&
         bytes[3] == 0x18;
}

}  // namespace

std::unique_ptr<Unpacker> unpackerFor(std::span<const std::uint8_t> beginning) {
  if (beginsWith(beginning, gzipMagic)) return std::make_unique<GzipUnpacker>();
  if (beginsWith(beginning, zstdMagic) || isSkippable(beginning)) return std::make_unique<ZstdUnpacker>();
  return nullptr;
}

}  // namespace kelvasi
