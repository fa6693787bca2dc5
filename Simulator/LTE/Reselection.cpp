// SPDX-License-Identifier: Apache-2.0
#include "Simulator/LTE/Reselection.h"

namespace kelvasi::sim::lte {

namespace {

constexpr double handoverMargin = 3;  // dB, of event A3
constexpr double poorSrxlev = 8;      // dB, of event A5: below this another LTE layer ...
constexpr double goodSrxlev = 14;     // ... above this will do
// Seconds
constexpr double selectionTime = 0.6;
constexpr double lossTime = 3;
constexpr double reselectionTime = 2;
constexpr double handoverTime = 0.4;

}  // namespace

void Reselection::look(const std::vector<Reception>& receptions, bool isConnected, double seconds) {
  const auto change = wanted(receptions, isConnected);
  if (timer_.pass(change, seconds)) serving_ = change->to;
}

std::optional<CellChange> Reselection::wanted(const std::vector<Reception>& receptions,
                                              bool isConnected) const {
  if (!serving_) {
    const auto found = best(receptions, [](std::size_t) { return true; });
    return found ? std::optional(CellChange{found, selectionTime}) : std::nullopt;
  }
  if (!isSuitable(cells_[*serving_], receptions[*serving_])) return refuge(receptions);
  return isConnected ? handover(receptions) : reselection(receptions);
}

// From an unsuitable cell: one of its own carrier rather than a better layer that is hardly heard.
CellChange Reselection::refuge(const std::vector<Reception>& receptions) const {
  const Layer& here = layerOf(cells_[*serving_]);
  auto found = best(receptions, [&](std::size_t cell) { return &layerOf(cells_[cell]) == &here; });
  if (!found) found = best(receptions, [](std::size_t) { return true; });
  return {found, found ? 0 : lossTime};
}

// A higher priority at once, within the layer by rank, a lower one only where the serving cell is poor.
std::optional<CellChange> Reselection::reselection(const std::vector<Reception>& receptions) const {
  const auto srxlev = [&](std::size_t cell) { return receiveLevelCriterion(cells_[cell], receptions[cell]); };
  const Layer& here = layerOf(cells_[*serving_]);
  const auto found = best(receptions, [&](std::size_t cell) {
    const Layer& there = layerOf(cells_[cell]);
    if (there.priority > here.priority) return srxlev(cell) > there.thresholdHigh;
    if (there.priority == here.priority)
      return receptions[cell].level > receptions[*serving_].level + rankHysteresis;
    return srxlev(*serving_) < leaveThreshold && srxlev(cell) > there.thresholdLow;
  });
  return found ? std::optional(CellChange{found, reselectionTime}) : std::nullopt;
}

std::optional<CellChange> Reselection::handover(const std::vector<Reception>& receptions) const {
  const auto srxlev = [&](std::size_t cell) { return receiveLevelCriterion(cells_[cell], receptions[cell]); };
  const auto found = best(receptions, [&](std::size_t cell) {
    if (cells_[cell].technology != Technology::lte) return false;
    if (cells_[cell].frequency == cells_[*serving_].frequency)
      return receptions[cell].level > receptions[*serving_].level + handoverMargin;
    return srxlev(*serving_) < poorSrxlev && srxlev(cell) > goodSrxlev;
  });
  return found ? std::optional(CellChange{found, handoverTime}) : std::nullopt;
}

template <typename Takes>
std::optional<std::size_t> Reselection::best(const std::vector<Reception>& receptions, Takes takes) const {
  std::optional<std::size_t> found;
  for (std::size_t cell = 0; cell < cells_.size(); ++cell) {
    if (cell == serving_ || !isSuitable(cells_[cell], receptions[cell]) || !takes(cell)) continue;
    if (!found || isPreferred(cell, *found, receptions)) found = cell;
  }
  return found;
}

bool Reselection::isPreferred(std::size_t cell, std::size_t other,
                              const std::vector<Reception>& receptions) const {
  const int priority = layerOf(cells_[cell]).priority;
  const int otherPriority = layerOf(cells_[other]).priority;
  return priority != otherPriority ? priority > otherPriority
                                   : receptions[cell].level > receptions[other].level;
}

}  // namespace kelvasi::sim::lte
