// SPDX-License-Identifier: Apache-2.0
#include "Capture/CaptureInput.h"

#include <utility>

#include "Telvon/TechnologyName.h"

namespace kelvasi {

namespace {

constexpr std::uint64_t messagesToAdvance = 64;

std::string fitsNone(const TechnologyCount& count) {
  return "fits no technology: none asks for any of its messages (" + std::to_string(count.messages()) + ")";
}

}  // namespace

CaptureInput::CaptureInput(Choice choice, const PlistSerialiser& plists, Tell tell, Advance advance)
    : choice_(std::move(choice)), plists_(plists), tell_(std::move(tell)), advance_(std::move(advance)) {}

std::optional<InputMessage> CaptureInput::next() {
  while (capture_ || nextPath_ < choice_.paths.size()) {
    if (!capture_) openNext();
    if (!technology_.empty()) {
      if (const auto message = capture_->next()) {
        if (++newMessages_ == messagesToAdvance) advance();
        return InputMessage{*message, technology_};
      }
    }
    endCapture();
  }
  return std::nullopt;
}

void CaptureInput::openNext() {
  capture_.emplace(openCapture(choice_.paths[nextPath_++], plists_), codes_);
  technology_ = {};
  if (!choice_.technology) return findTechnology();
  technology_ = technologyId(*choice_.technology).value();
}

void CaptureInput::findTechnology() {
  const auto found = capture_->findTechnology();
  if (!found) return tellWhyNoneWasFound();
  technology_ = *found;
  if (told_ != technology_) tell_(ofCapture(std::string(shortTechnologyName(technology_))));
  told_ = technology_;
}

void CaptureInput::tellWhyNoneWasFound() {
  const TechnologyCount& count = capture_->count();
  if (count.messages() == 0) return;
  const auto ranking = count.ranking();
  std::string why = "fits " + count.text(ranking) + " alike";
  if (ranking.empty()) why = "its messages (" + std::to_string(count.messages()) + ") tell no technology";
  tellFault(ofCapture((count.fitsNone() ? fitsNone(count) : why) + "; --technology says which it is"));
}

void CaptureInput::endCapture() {
  const auto complaints = capture_->reader().complaints();
  for (const std::string& line : complaints) tellFault(line);
  if (complaints.empty() && capture_->count().messages() == 0) tell_(ofCapture("holds no messages"));
  if (!technology_.empty()) tellOfOthers();
  advance();
  advancedPosition_ = 0;
  capture_.reset();
}

void CaptureInput::advance() {
  const std::uint64_t position = capture_->reader().filePosition();
  if (advance_) advance_(newMessages_, position - advancedPosition_);
  newMessages_ = 0;
  advancedPosition_ = position;
}

void CaptureInput::tellOfOthers() {
  const TechnologyCount& count = capture_->count();
  if (count.fitsNone()) return tell_(ofCapture(fitsNone(count)));
  auto ranking = count.ranking();
  std::string_view taken = technology_;
  const bool fitsOther = !ranking.empty() && count.of(ranking.front()) > count.of(taken);
  if (!fitsOther && ranking.size() <= 1) return;
  if (count.of(taken) == 0) ranking.push_back(taken);
  tell_(ofCapture("fits " + count.text(ranking) + "; taken for " + std::string(shortTechnologyName(taken))));
}

void CaptureInput::tellFault(const std::string& line) {
  hasFault_ = true;
  tell_(line);
}

std::string CaptureInput::ofCapture(const std::string& text) const {
  const std::string& path = choice_.paths[nextPath_ - 1];
  return (path == "-" ? "standard input" : path) + ": " + text;
}

}  // namespace kelvasi
