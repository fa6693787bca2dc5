// SPDX-License-Identifier: Apache-2.0
#include "Capture/DlfRecords.h"

#include <algorithm>
#include <array>
#include <vector>

#include "LogGenerator/RecordView.h"

namespace kelvasi {

namespace {

constexpr std::size_t mostHeld = std::size_t{8} << 20;
constexpr std::size_t mostSteps = 500'000;

bool isLogType(std::uint8_t byte) {
  return byte == 0x01 || byte == 0xFF;
}

// What may stand before a record: its size, and whether the bytes at a place can be it.
struct Lead {
  std::uint8_t size;
  bool (*fits)(RecordView at);
};

constexpr std::array leads{
    Lead{1, [](RecordView at) { return isLogType(at.byteAt(0)); }},
    Lead{3, [](RecordView at) { return at.byteAt(0) == 0x81 && isLogType(at.byteAt(2)); }},
    Lead{0, [](RecordView) { return true; }},
    Lead{2, [](RecordView at) { return isLogType(at.byteAt(1)); }},
};
constexpr std::size_t longestRecord = 3 + 65535;  // with what stands before it
// No record holds as many others, so a long one is never given up for what it only holds.
constexpr std::uint64_t mostBehind = 6000;

}  // namespace

DlfRecordFinder::DlfRecordFinder(ByteSource& bytes, std::size_t blockSize)
    : bytes_(bytes), blockSize_(blockSize) {
  ways_[0] = {};
}

bool DlfRecordFinder::findMore() {
  const std::size_t before = found_.size();
  while (true) {
    while (step()) {
    }
    if (isWorthSettling()) settle(nextToSettle());
    if (found_.size() > before) return true;
    if (ways_.empty()) return false;
    read();
  }
}

DlfRecordPlace DlfRecordFinder::take() {
  const DlfRecordPlace first = found_.front();
  found_.pop_front();
  return first;
}

std::span<const std::uint8_t> DlfRecordFinder::bytes(std::uint64_t begin, std::uint64_t end) const {
  return std::span(held_).subspan(static_cast<std::size_t>(begin - begin_),
                                  static_cast<std::size_t>(end - begin));
}

// Takes up the next place, once enough bytes are there to know every record that may begin at it. Places come
// in ascending order, so the way to this one cannot improve any more.
bool DlfRecordFinder::step() {
  if (ways_.empty()) return false;
  const auto [place, way] = *ways_.begin();
  if (!isAtEnd_ && bytesRead() < place + longestRecord) return false;
  ways_.erase(ways_.begin());
  const std::uint64_t number = root_ + steps_.size();
  steps_.push_back({place, way});
  if (way.records >= stepAt(best_).way.records) best_ = number;
  followLeads(steps_.back(), number);
  return true;
}

void DlfRecordFinder::followLeads(const Step& here, std::uint64_t number) {
  const RecordView view = RecordView(held_).from(static_cast<std::size_t>(here.place - begin_));
  const std::uint64_t left = bytesRead() - here.place;
  for (const Lead& lead : leads) {
    if (left < lead.size + dlfRecordHeaderSize || !lead.fits(view)) continue;
    const std::uint64_t length = view.u16(lead.size);
    if (length < dlfRecordHeaderSize || left - lead.size < length) continue;
    Way& further = ways_[here.place + lead.size + length];
    if (further.records > here.way.records) continue;
    further = {.records = here.way.records + 1, .from = number, .lead = lead.size};
  }
}

// To see what all readings agree on, all their steps have to be gone through: not before there are a quarter
// more.
bool DlfRecordFinder::isWorthSettling() const {
  return !steps_.empty() &&
         (ways_.empty() || steps_.size() >= worthSettling_ || bytesRead() - end_ > mostHeld);
}

std::uint64_t DlfRecordFinder::nextToSettle() {
  if (ways_.empty()) return best_;
  const std::uint64_t mostRecords = stepAt(best_).way.records;
  std::erase_if(ways_, [=](const auto& entry) { return entry.second.records + mostBehind < mostRecords; });
  const std::uint64_t common = agreed();
  if (!isTooMuch(common)) return common;
  const std::uint64_t chosen = halfOfBest();
  dropOthersThan(chosen);
  return chosen;
}

// The last step that all readings have in common: those that go on, and the best one that has ended.
std::uint64_t DlfRecordFinder::agreed() const {
  std::vector<bool> isPassed(steps_.size());
  std::size_t count = 0;
  const auto pass = [&](std::uint64_t number) {
    if (!isPassed[number - root_]) ++count;
    isPassed[number - root_] = true;
  };
  pass(best_);
  for (const auto& [place, way] : ways_) pass(way.from);
  std::uint64_t last = root_ + steps_.size() - 1;
  for (; count > 1 || !isPassed[last - root_]; --last) {
    if (!isPassed[last - root_]) continue;
    --count;
    pass(stepAt(last).way.from);
  }
  return last;
}

bool DlfRecordFinder::isTooMuch(std::uint64_t agreedStep) const {
  const std::uint64_t unsettled = bytesRead() - stepAt(agreedStep).place;
  return unsettled > mostHeld || root_ + steps_.size() - agreedStep > mostSteps;
}

std::uint64_t DlfRecordFinder::halfOfBest() const {
  const std::uint64_t half = steps_.front().place + (stepAt(best_).place - steps_.front().place) / 2;
  std::uint64_t number = best_;
  while (stepAt(number).place > half && stepAt(number).way.from != root_) number = stepAt(number).way.from;
  return number;
}

// Readings that do not pass this step are given up.
void DlfRecordFinder::dropOthersThan(std::uint64_t number) {
  std::vector<bool> passes(steps_.size());
  for (std::uint64_t later = number; later < root_ + steps_.size(); ++later) {
    const std::uint64_t from = stepAt(later).way.from;
    passes[later - root_] = later == number || (from >= number && passes[from - root_]);
  }
  std::erase_if(ways_, [&](const auto& entry) { return !passes[entry.second.from - root_]; });
}

void DlfRecordFinder::settle(std::uint64_t number) {
  const std::size_t before = found_.size();
  for (std::uint64_t at = number; at != root_; at = stepAt(at).way.from) {
    const Step& step = stepAt(at);
    const std::uint64_t begin = stepAt(step.way.from).place;
    found_.push_back({.begin = begin, .record = begin + step.way.lead, .end = step.place});
  }
  std::reverse(found_.begin() + static_cast<std::ptrdiff_t>(before), found_.end());
  steps_.erase(steps_.begin(), steps_.begin() + static_cast<std::ptrdiff_t>(number - root_));
  root_ = number;
  end_ = steps_.front().place;
  worthSettling_ = steps_.size() + steps_.size() / 4 + 1000;
}

void DlfRecordFinder::read() {
  const std::uint64_t needed = found_.empty() ? end_ : found_.front().begin;
  held_.erase(held_.begin(), held_.begin() + static_cast<std::ptrdiff_t>(needed - begin_));
  begin_ = needed;
  std::size_t size = held_.size();
  held_.reserve(size + blockSize_);  // and no more
  held_.resize(size + blockSize_);
  while (!isAtEnd_ && size < held_.size()) {
    const std::ptrdiff_t count = bytes_.read(std::span(held_).subspan(size));
    isAtEnd_ = count <= 0;
    if (count > 0) size += static_cast<std::size_t>(count);
  }
  held_.resize(size);
}

}  // namespace kelvasi
