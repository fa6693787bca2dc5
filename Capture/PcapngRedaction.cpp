// SPDX-License-Identifier: Apache-2.0
// Blocks and options as the pcapng format has them (draft-ietf-opsawg-pcapng).
#include <algorithm>
#include <array>
#include <vector>

#include "Capture/RedactedFormats.h"

namespace kelvasi {

namespace {

constexpr std::uint32_t sectionBlock = 0x0A0D0D0A;
constexpr std::uint32_t interfaceBlock = 1;
constexpr std::uint32_t packetBlock = 2;
constexpr std::uint32_t simpleBlock = 3;
constexpr std::uint32_t statisticsBlock = 5;
constexpr std::uint32_t enhancedBlock = 6;
constexpr std::uint32_t user0 = 147;
constexpr std::size_t header = 8;  // type and length
constexpr std::size_t smallest = 12;

enum class Treatment { kept, text, blanked };
// What an option holds; one that is not here is blanked.
struct Option {
  std::uint32_t block;
  std::uint32_t code;
  Treatment treatment;
};
constexpr std::array options{
    Option{sectionBlock, 2, Treatment::text},    Option{sectionBlock, 3, Treatment::text},
    Option{sectionBlock, 4, Treatment::text},    Option{interfaceBlock, 2, Treatment::text},
    Option{interfaceBlock, 3, Treatment::text},  Option{interfaceBlock, 8, Treatment::kept},
    Option{interfaceBlock, 9, Treatment::kept},  Option{interfaceBlock, 10, Treatment::kept},
    Option{interfaceBlock, 12, Treatment::text}, Option{interfaceBlock, 13, Treatment::kept},
    Option{interfaceBlock, 14, Treatment::kept}, Option{interfaceBlock, 15, Treatment::text},
    Option{enhancedBlock, 2, Treatment::kept},   Option{enhancedBlock, 4, Treatment::kept},
    Option{packetBlock, 2, Treatment::kept},     Option{statisticsBlock, 2, Treatment::kept},
    Option{statisticsBlock, 3, Treatment::kept}, Option{statisticsBlock, 4, Treatment::kept},
    Option{statisticsBlock, 5, Treatment::kept},
};
constexpr std::uint32_t endOfOptions = 0;
constexpr std::uint32_t comment = 1;

Treatment treatmentOf(std::uint32_t block, std::uint32_t code) {
  if (code == comment) return Treatment::text;
  const auto fits = [&](const Option& each) { return each.block == block && each.code == code; };
  const auto found = std::ranges::find_if(options, fits);
  return found == options.end() ? Treatment::blanked : found->treatment;
}

class Sections {
 public:
  explicit Sections(MessageRedactor& redactor) : redactor_(redactor) {}

  // `block` is whole, from its type on.
  void redact(std::span<std::uint8_t> block);
  std::uint32_t number(std::span<const std::uint8_t> bytes, std::size_t at, std::size_t size = 4) const {
    return numberAt(bytes, at, size, isBigEndian_);
  }
  void begin(bool isBigEndian) {
    isBigEndian_ = isBigEndian;
    linkTypes_.clear();
  }

 private:
  using Body = std::span<std::uint8_t>;

  void redactPacket(Body body, std::uint32_t type);
  void redactOptions(std::uint32_t block, Body options);
  void redactMessage(Body message, std::size_t interface);

  MessageRedactor& redactor_;
  bool isBigEndian_ = false;
  std::vector<std::uint32_t> linkTypes_;  // of the section's interfaces
};

void Sections::redact(std::span<std::uint8_t> block) {
  const std::uint32_t type = number(block, 0);
  const Body body = block.subspan(header, block.size() - smallest);
  const auto optionsFrom = [&](std::size_t at) {
    redactOptions(type, body.subspan(std::min(at, body.size())));
  };
  if (type == sectionBlock) return optionsFrom(16);
  if (type == interfaceBlock && body.size() >= 8) {
    linkTypes_.push_back(number(body, 0, 2));
    return optionsFrom(8);
  }
  if (type == statisticsBlock) return optionsFrom(12);
  if (type == packetBlock || type == enhancedBlock) return redactPacket(body, type);
  if (type == simpleBlock && body.size() >= 4) {
    const std::size_t size = std::min<std::size_t>(number(body, 0), body.size() - 4);
    return redactMessage(body.subspan(4, size), 0);
  }
  redactor_.redactUnknown(body);
}

void Sections::redactPacket(Body body, std::uint32_t type) {
  constexpr std::size_t before = 20;
  if (body.size() < before) return redactor_.blank(body);
  const std::size_t interface = number(body, 0, type == packetBlock ? 2 : 4);
  const std::size_t size = std::min<std::size_t>(number(body, 12), body.size() - before);
  redactMessage(body.subspan(before, size), interface);
  const std::size_t padded = std::min(body.size(), before + (size + 3) / 4 * 4);
  std::ranges::fill(body.subspan(before + size, padded - before - size), std::uint8_t{0});
  redactOptions(type, body.subspan(padded));
}

void Sections::redactMessage(Body message, std::size_t interface) {
  const bool isOurs = interface < linkTypes_.size() && linkTypes_[interface] == user0;
  if (isOurs) {
    redactor_.redact(message);
  } else {
    redactor_.redactUnknown(message);
  }
}

void Sections::redactOptions(std::uint32_t block, Body left) {
  while (left.size() >= 4) {
    const std::uint32_t code = number(left, 0, 2);
    const std::size_t size = number(left, 2, 2);
    if (code == endOfOptions || size > left.size() - 4) break;
    const Body value = left.subspan(4, size);
    const Treatment treatment = treatmentOf(block, code);
    if (treatment == Treatment::text) redactor_.redactText(value);
    if (treatment == Treatment::blanked) redactor_.redactUnknown(value);
    const std::size_t padded = std::min(left.size(), 4 + (size + 3) / 4 * 4);
    std::ranges::fill(left.subspan(4 + size, padded - 4 - size), std::uint8_t{0});
    left = left.subspan(padded);
  }
  std::ranges::fill(left.subspan(std::min<std::size_t>(left.size(), 4)), std::uint8_t{0});
}

}  // namespace

std::optional<CaptureFault> redactPcapng(InputBytes& input, MessageRedactor& redactor, const PutBytes& put) {
  constexpr std::uint32_t byteOrderMagic = 0x1A2B3C4D;
  BlockInput blocks(input);
  Sections sections(redactor);
  for (Bytes block = blocks.take(smallest); !block.empty(); block = blocks.take(smallest)) {
    if (numberAt(block, 0, 4, false) == sectionBlock) {
      const bool isBigEndian = numberAt(block, header, 4, true) == byteOrderMagic;
      if (!isBigEndian && numberAt(block, header, 4, false) != byteOrderMagic)
        return blocks.fault("a section without its byte order; the rest is left out");
      sections.begin(isBigEndian);
    }
    const std::size_t size = sections.number(block, 4);
    if (size < smallest || size % 4 != 0 || size > largestBlock)
      return blocks.fault("a block of an impossible length; the rest is left out");
    const Bytes rest = blocks.take(size - smallest);
    if (rest.size() != size - smallest) break;
    block.insert(block.end(), rest.begin(), rest.end());
    sections.redact(block);
    if (!put(block)) return std::nullopt;
  }
  return blocks.ending();
}

}  // namespace kelvasi
