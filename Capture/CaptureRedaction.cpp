// SPDX-License-Identifier: Apache-2.0
#include "Capture/CaptureRedaction.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "Capture/PlistBeginning.h"
#include "Capture/RedactedFormats.h"

namespace kelvasi {

namespace {

constexpr std::array<std::uint8_t, 4> versionReportStart{0xA1, 0x00, 0xFD, 0x1F};
constexpr std::array<std::uint8_t, 4> sectionStart{0x0A, 0x0D, 0x0D, 0x0A};

bool isNamed(std::string_view path, std::string_view ending) {
  for (const std::string_view packing : {".gz", ".zst"}) {
    if (path.ends_with(packing)) path.remove_suffix(packing.size());
  }
  return path.ends_with(ending);
}

bool begins(InputBytes& input, std::span<const std::uint8_t> beginning) {
  return std::ranges::equal(input.firstBytes(beginning.size()), beginning);
}

}  // namespace

std::optional<CaptureFault> redactCapture(const std::string& path, MessageRedactor& redactor,
                                          const PutBytes& put) {
  InputBytes input(path);
  if (input.fault()) return input.fault();
  if (isNamed(path, ".dlf") || begins(input, versionReportStart)) return redactDlf(input, redactor, put);
  if (isNamed(path, ".kelvasi") || beginsAsPlist(input)) return redactSnapshot(input, redactor, put);
  if (begins(input, sectionStart)) return redactPcapng(input, redactor, put);
  return redactPcap(input, redactor, put);
}

Bytes BlockInput::take(std::size_t size) {
  begin_ = input_.position();
  Bytes bytes(size);
  std::size_t filled = 0;
  while (filled < size) {
    const std::ptrdiff_t count = input_.read(std::span(bytes).subspan(filled));
    if (count <= 0) break;
    filled += static_cast<std::size_t>(count);
  }
  if (filled == size) return bytes;
  isCut_ = filled > 0;
  return {};
}

CaptureFault BlockInput::fault(std::string reason) const {
  return {input_.name(), begin_, std::move(reason)};
}

std::optional<CaptureFault> BlockInput::ending() const {
  if (input_.fault()) return input_.fault();
  return isCut_ ? std::optional(fault("the file ends too early; what is cut is left out")) : std::nullopt;
}

std::uint32_t numberAt(std::span<const std::uint8_t> bytes, std::size_t at, std::size_t size,
                       bool isBigEndian) {
  std::uint32_t number = 0;
  for (std::size_t byte = 0; byte < size; ++byte)
    number = number << 8 | bytes[at + (isBigEndian ? byte : size - 1 - byte)];
  return number;
}

}  // namespace kelvasi
