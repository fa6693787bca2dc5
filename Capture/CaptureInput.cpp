#include "Capture/CaptureInput.h"

#include <utility>

namespace kelvasi {

CaptureInput::CaptureInput(std::vector<std::string> paths, const PlistSerialiser& plists, Tell tell)
    : paths_(std::move(paths)), plists_(plists), tell_(std::move(tell)) {}

std::optional<CapturedMessage> CaptureInput::next() {
  while (capture_ || nextPath_ < paths_.size()) {
    if (!capture_) capture_ = openCapture(paths_[nextPath_++], plists_);
    if (const auto message = capture_->next()) return message;
    endCapture();
  }
  return std::nullopt;
}

void CaptureInput::endCapture() {
  for (const std::string& line : capture_->complaints()) {
    hasFault_ = true;
    tell_(line);
  }
  capture_.reset();
}

}  // namespace kelvasi
