// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Cells/CellOrder.h"

#include <algorithm>

namespace kelvasi::cockpit {

namespace {

using Candidate = CellOrder::Candidate;

const Candidate* find(const std::vector<Candidate>& candidates, std::uint32_t number) {
  const auto found = std::ranges::find(candidates, number, &Candidate::number);
  return found == candidates.end() ? nullptr : &*found;
}

bool standsAbove(const Candidate& one, const Candidate& other) {
  return one.group != other.group ? one.group < other.group : one.level > other.level;
}

}  // namespace

const std::vector<std::uint32_t>& CellOrder::arrange(const std::vector<Candidate>& candidates, Arrival now) {
  if (isHeld_) {
    for (const Candidate& each : candidates) {
      if (std::ranges::find(order_, each.number) == order_.end()) order_.push_back(each.number);
    }
    return order_;
  }
  std::erase_if(order_, [&](std::uint32_t number) { return !find(candidates, number); });
  std::erase_if(betterSince_, [&](const auto& each) {
    const Candidate* upper = find(candidates, each.first.first);
    const Candidate* lower = find(candidates, each.first.second);
    return !upper || !lower || !standsAbove(*lower, *upper);
  });
  for (const Candidate& each : candidates) {
    if (std::ranges::find(order_, each.number) == order_.end()) enter(each, candidates);
  }
  for (std::size_t round = 0; round < order_.size(); ++round) {
    for (std::size_t at = 1; at < order_.size(); ++at) {
      if (!changesPlaces(*find(candidates, order_[at - 1]), *find(candidates, order_[at]), now)) continue;
      betterSince_.erase({order_[at - 1], order_[at]});
      std::swap(order_[at - 1], order_[at]);
    }
  }
  return order_;
}

// A new one moves nobody but those that it is better than.
void CellOrder::enter(const Candidate& candidate, const std::vector<Candidate>& candidates) {
  const auto place = std::ranges::find_if(
      order_, [&](std::uint32_t number) { return standsAbove(candidate, *find(candidates, number)); });
  order_.insert(place, candidate.number);
}

bool CellOrder::changesPlaces(const Candidate& upper, const Candidate& lower, Arrival now) {
  if (!standsAbove(lower, upper)) return false;
  if (lower.group != upper.group || lower.level - upper.level >= margin) return true;
  const auto since = betterSince_.try_emplace({upper.number, lower.number}, now).first->second;
  return now - since >= patience || now < since;
}

}  // namespace kelvasi::cockpit
