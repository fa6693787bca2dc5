// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Events/Marks.h"

#include <algorithm>
#include <utility>

namespace kelvasi::cockpit {

std::uint64_t Marks::set(Arrival time, std::string note, const TextStyle& style) {
  if (marks_.size() == mostMarks) marks_.erase(marks_.begin());
  marks_.push_back({next_, time, clockText(time, style), std::move(note)});
  return next_++;
}

bool Marks::note(std::uint64_t mark, std::string text) {
  const auto found = std::ranges::find(marks_, mark, &MarkLine::number);
  if (found == marks_.end()) return false;
  found->note = std::move(text);
  return true;
}

std::vector<MarkLine> Marks::newestFirst(std::size_t most) const {
  return {marks_.rbegin(), marks_.rbegin() + static_cast<std::ptrdiff_t>(std::min(most, marks_.size()))};
}

}  // namespace kelvasi::cockpit
