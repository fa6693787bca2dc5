// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Events/CoverageBook.h"

#include <algorithm>

namespace kelvasi::cockpit {

namespace {

bool isSame(const IntakeCount& one, const IntakeCount& other) {
  return one.logCode == other.logCode && one.outcome == other.outcome;
}

void add(std::vector<IntakeCount>& to, const IntakeCount& later) {
  const auto found = std::ranges::find_if(to, [&](const IntakeCount& each) { return isSame(each, later); });
  if (found == to.end()) {
    to.push_back(later);
    return;
  }
  const std::uint64_t messages = found->messages + later.messages;
  const Arrival first = found->first;
  *found = later;
  found->messages = messages;
  found->first = first;
}

}  // namespace

void CoverageBook::take(const Intake& intake) {
  if (intake.messages() < messages_) keepEarlier();
  const std::uint64_t shown = intake.messages(Outcome::shown);
  const bool hasMoreNotShown = intake.messages() - shown != messages_ - shown_;
  messages_ = intake.messages();
  shown_ = shown;
  if (hasMoreNotShown) keep(intake.counts());
}

void CoverageBook::keep(std::span<const IntakeCount> counts) {
  counts_.resize(counts.size());
  for (std::size_t place = 0; place < counts.size(); ++place) {
    const bool isShown = counts[place].outcome == Outcome::shown;
    if (!isShown && counts_[place].messages != counts[place].messages) counts_[place] = counts[place];
  }
}

void CoverageBook::keepEarlier() {
  for (const IntakeCount& count : counts_)
    if (count.messages > 0) add(earlier_, count);
  earlierMessages_ += messages_;
  earlierShown_ += shown_;
  counts_.clear();
  messages_ = shown_ = 0;
}

Coverage CoverageBook::at(Arrival now) const {
  std::vector<IntakeCount> all = earlier_;
  for (const IntakeCount& count : counts_)
    if (count.messages > 0) add(all, count);
  const std::uint64_t messages = earlierMessages_ + messages_;
  return coverageOf(all, messages, messages - earlierShown_ - shown_, now);
}

}  // namespace kelvasi::cockpit
