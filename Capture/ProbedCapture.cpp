// SPDX-License-Identifier: Apache-2.0
#include "Capture/ProbedCapture.h"

#include <utility>

namespace kelvasi {

ProbedCapture::ProbedCapture(std::unique_ptr<CaptureReader> capture, const TechnologyCodes& codes)
    : capture_(std::move(capture)), count_(codes) {}

std::optional<std::string_view> ProbedCapture::findTechnology() {
  while (!isClear() && ahead_.size() < mostMessages && aheadBytes_ < mostBytes) {
    const auto message = read();
    if (!message) break;
    ahead_.push_back({Bytes(message->bytes.begin(), message->bytes.end()), message->arrival});
    aheadBytes_ += message->bytes.size();
  }
  const auto ranking = count_.ranking();
  if (ranking.empty()) return std::nullopt;
  if (ranking.size() > 1 && count_.of(ranking[0]) == count_.of(ranking[1])) return std::nullopt;
  return ranking.front();
}

std::optional<CapturedMessage> ProbedCapture::next() {
  if (ahead_.empty()) return read();
  current_ = std::move(ahead_.front());
  ahead_.pop_front();
  return CapturedMessage{.bytes = current_.bytes, .arrival = current_.arrival};
}

std::optional<CapturedMessage> ProbedCapture::read() {
  auto message = capture_->next();
  if (message) count_.count(message->bytes);
  return message;
}

bool ProbedCapture::isClear() const {
  const auto ranking = count_.ranking();
  return ranking.size() == 1 && count_.of(ranking.front()) >= enough;
}

}  // namespace kelvasi
