// SPDX-License-Identifier: Apache-2.0
#include <algorithm>
#include <array>

#include "Capture/RedactedFormats.h"

namespace kelvasi {

namespace {

constexpr std::size_t fileHeader = 24;
constexpr std::size_t packetHeader = 16;
constexpr std::size_t sizeOffset = 8;   // in the packet's header
constexpr std::size_t linkOffset = 20;  // in the file's
constexpr std::uint32_t user0 = 147;
constexpr std::array<std::uint32_t, 2> magics{0xA1B2C3D4, 0xA1B23C4D};

bool isMagic(std::uint32_t number) {
  return std::ranges::find(magics, number) != magics.end();
}

}  // namespace

std::optional<CaptureFault> redactPcap(InputBytes& input, MessageRedactor& redactor, const PutBytes& put) {
  BlockInput blocks(input);
  const Bytes header = blocks.take(fileHeader);
  if (header.empty()) return blocks.ending().value_or(blocks.fault("an empty file"));
  const bool isBigEndian = isMagic(numberAt(header, 0, 4, true));
  if (!isBigEndian && !isMagic(numberAt(header, 0, 4, false)))
    return blocks.fault("unknown file format; pcap, pcapng and DLF files and snapshots are read");
  if (numberAt(header, linkOffset, 4, isBigEndian) != user0)
    return blocks.fault("the link type is not USER0");
  if (!put(header)) return std::nullopt;
  for (Bytes packet = blocks.take(packetHeader); !packet.empty(); packet = blocks.take(packetHeader)) {
    const std::size_t size = numberAt(packet, sizeOffset, 4, isBigEndian);
    if (size > largestBlock) return blocks.fault("a packet is too large; the rest is left out");
    Bytes message = blocks.take(size);
    if (message.size() != size) break;
    redactor.redact(message);
    packet.insert(packet.end(), message.begin(), message.end());
    if (!put(packet)) return std::nullopt;
  }
  return blocks.ending();
}

}  // namespace kelvasi
