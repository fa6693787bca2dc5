// SPDX-License-Identifier: Apache-2.0
#include "Capture/CaptureReader.h"

#include <algorithm>
#include <array>
#include <string_view>
#include <utility>

#include "Capture/DlfReader.h"
#include "Capture/InputBytes.h"
#include "Capture/PcapReader.h"
#include "Capture/PlistBeginning.h"
#include "Capture/SnapshotReader.h"

namespace kelvasi {

namespace {

constexpr std::array<std::uint8_t, 4> versionReportStart{0xA1, 0x00, 0xFD, 0x1F};

// Without what says how a file is packed.
std::string_view bareName(std::string_view path) {
  for (const std::string_view ending : {".gz", ".zst"}) {
    if (path.ends_with(ending)) path.remove_suffix(ending.size());
  }
  return path;
}

bool isDlf(std::string_view path, InputBytes& input) {
  return path.ends_with(".dlf") ||
         std::ranges::equal(input.firstBytes(versionReportStart.size()), versionReportStart);
}

bool isSnapshot(std::string_view path, InputBytes& input) {
  return path.ends_with(".kelvasi") || beginsAsPlist(input);
}

}  // namespace

std::string CaptureFault::text() const {
  const std::string place = offset ? ": byte " + std::to_string(*offset) : "";
  return file + place + ": " + reason;
}

std::vector<std::string> CaptureReader::complaints() const {
  std::vector<std::string> lines;
  for (const CaptureFault& message : skipped_) lines.push_back(message.text());
  if (const std::uint64_t more = skippedCount_ - skipped_.size(); more > 0)
    lines.push_back(skipped_.front().file + ": " + std::to_string(more) +
                    " more messages are skipped for the same reason");
  if (fault_) lines.push_back(fault_->text());
  return lines;
}

void CaptureReader::skip(CaptureFault message) {
  constexpr std::size_t mostNamed = 5;
  if (++skippedCount_ <= mostNamed) skipped_.push_back(std::move(message));
}

std::unique_ptr<CaptureReader> openCapture(const std::string& path, const PlistSerialiser& plists) {
  auto input = std::make_unique<InputBytes>(path);
  if (isDlf(bareName(path), *input)) return std::make_unique<DlfReader>(std::move(input));
  if (isSnapshot(bareName(path), *input)) return std::make_unique<SnapshotReader>(*input, plists);
  return std::make_unique<PcapReader>(std::move(input));
}

}  // namespace kelvasi
