#include "Capture/CaptureReader.h"

#include <algorithm>
#include <array>
#include <utility>

#include "Capture/DlfReader.h"
#include "Capture/InputBytes.h"
#include "Capture/PcapReader.h"
#include "Capture/PlistBeginning.h"
#include "Capture/SnapshotReader.h"

namespace kelvasi {

namespace {

constexpr std::array<std::uint8_t, 4> versionReportStart{0xA1, 0x00, 0xFD, 0x1F};

bool isDlf(const std::string& path, InputBytes& input) {
  return path.ends_with(".dlf") ||
         std::ranges::equal(input.firstBytes(versionReportStart.size()), versionReportStart);
}

bool isSnapshot(const std::string& path, InputBytes& input) {
  return path.ends_with(".kelvasi") || beginsAsPlist(input);
}

}  // namespace

std::string CaptureFault::text() const {
  const std::string place = offset ? ": byte " + std::to_string(*offset) : "";
  return file + place + ": " + reason;
}

std::unique_ptr<CaptureReader> openCapture(const std::string& path, const PlistSerialiser& plists) {
  auto input = std::make_unique<InputBytes>(path);
  if (isDlf(path, *input)) return std::make_unique<DlfReader>(*input);
  if (isSnapshot(path, *input)) return std::make_unique<SnapshotReader>(*input, plists);
  return std::make_unique<PcapReader>(std::move(input));
}

}  // namespace kelvasi
