// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/DriveScene.h"

#include <algorithm>
#include <filesystem>
#include <system_error>
#include <utility>

namespace kelvasi {

namespace {

constexpr std::size_t slice = 4000;  // messages

std::uint64_t sizeOf(const std::vector<std::string>& paths) {
  std::uint64_t size = 0;
  for (const std::string& path : paths) {
    std::error_code unknown;
    const auto bytes = std::filesystem::file_size(path, unknown);
    size += unknown ? 0 : bytes;
  }
  return size;
}

// What a user set goes along.
void handOver(cockpit::Cockpit& from, cockpit::Cockpit& to) {
  to.restorePins(from.pinKeys());
  for (const cockpit::MarkLine& mark : from.marks()) to.mark(mark.time, mark.note);
}

std::string percent(double share) {
  return std::to_string(static_cast<int>(std::clamp(share, 0.0, 1.0) * 100)) + " %";
}

}  // namespace

DriveScene::DriveScene(const Surroundings& surroundings, CaptureInput::Choice choice,
                       cockpit::TextStyle style, CaptureInput::Tell tell)
    : surroundings_(surroundings),
      choice_(std::move(choice)),
      style_(std::move(style)),
      whole_(std::make_unique<DriveEngine>(surroundings_, choice_, style_, std::move(tell))),
      size_(sizeOf(choice_.paths)) {
  whole_->advance(Arrival::max(), 1);
  from_ = to_ = moment_ = target_ = whole_->begin().value_or(Arrival(0));
}

// What cannot be read is told once, by the first.
std::unique_ptr<DriveEngine> DriveScene::engine() const {
  return std::make_unique<DriveEngine>(surroundings_, choice_, style_, [](const std::string&) {});
}

void DriveScene::work() {
  if (isReading()) return read();
  seek();
}

// From one moment at which the ribbon wants a value to the next.
void DriveScene::read() {
  const std::uint64_t enough = whole_->messages() + slice;
  while (isReading() && whole_->messages() < enough) {
    const bool isThere = whole_->advance(ribbon_.next(), slice);
    to_ = moment_ = target_ = whole_->position().value_or(Arrival(0));
    if (isThere) ribbon_.take(whole_->cockpit().at(to_), whole_->upcoming().value_or(to_));
  }
}

void DriveScene::seek() {
  if (here_) {
    if (here_->advance(target_, slice)) arrive(std::move(here_));
    return;
  }
  hasArrived_ = !shown_ || shown_->advance(target_, slice);
  moment_ = hasArrived_ ? target_ : shown_->position().value_or(from_);
}

void DriveScene::arrive(std::unique_ptr<DriveEngine> engine) {
  handOver(cockpit(), engine->cockpit());
  shown_ = std::move(engine);
  hasArrived_ = true;
  moment_ = target_;
}

// The end is always there; forwards it goes on from where it stands.
void DriveScene::goTo(Arrival moment) {
  if (isReading()) return;
  target_ = std::clamp(moment, from_, to_);
  here_.reset();
  hasArrived_ = false;
  if (target_ == to_) {
    if (shown_) handOver(shown_->cockpit(), whole_->cockpit());
    shown_.reset();
  } else if (!shown_ || shown_->position().value_or(from_) > target_) {
    here_ = engine();
    hasArrived_ = true;  // the one that is shown stays
  }
  seek();
}

void DriveScene::pass() {
  if (!isPlaying_ || isWorking()) return;
  goTo(moment_ + std::chrono::seconds(1));
  isPlaying_ = target_ < to_;
}

std::vector<cockpit::EventLine> DriveScene::events(std::size_t most) const {
  return shown().cockpit().events(most);
}

std::vector<Arrival> DriveScene::eventTimes() const {
  std::vector<Arrival> times;
  for (const cockpit::EventLine& event : whole_->cockpit().events(whole_->cockpit().eventCount()))
    times.push_back(event.time);
  std::ranges::sort(times);
  return times;
}

bool DriveScene::step(int by) {
  const auto times = eventTimes();
  if (by > 0) {
    const auto next = std::ranges::upper_bound(times, target_);
    if (next == times.end()) return false;
    goTo(*next);
  } else {
    const auto here = std::ranges::lower_bound(times, target_);
    if (here == times.begin()) return false;
    goTo(*std::prev(here));
  }
  return true;
}

std::string DriveScene::workWords() const {
  if (isReading())
    return size_ == 0
               ? "reading"
               : "reading, " + percent(static_cast<double>(whole_->bytesRead()) / static_cast<double>(size_));
  if (!isWorking()) return isPlaying_ ? "playing" : "";
  const DriveEngine& engine = here_ ? *here_ : shown();
  const auto length = static_cast<double>((target_ - from_).count());
  const auto done = static_cast<double>((engine.position().value_or(from_) - from_).count());
  return "going there, " + percent(length > 0 ? done / length : 1);
}

std::string DriveScene::status() const {
  const std::string name = std::filesystem::path(choice_.paths.front()).filename().native();
  const std::string more =
      choice_.paths.size() > 1 ? " and " + std::to_string(choice_.paths.size() - 1) + " more" : "";
  return name + more + ", " + cockpit::countText(shown().messages()) + " messages";
}

std::string DriveScene::whyNoSave() const {
  return isWorking() ? "Not while the drive is being read" : "";
}

std::optional<top::Timeline> DriveScene::timeline(std::size_t columns) const {
  top::Timeline timeline{
      .from = from_, .to = to_, .moment = moment_, .level = ribbon_.level(), .work = workWords()};
  if (columns == 0) return timeline;
  timeline.ribbon = ribbon_.stretches(from_, to_, columns);
  timeline.events = eventTimes();
  for (const cockpit::MarkLine& mark : shown().cockpit().marks()) timeline.marks.push_back(mark.time);
  return timeline;
}

}  // namespace kelvasi
