// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Handset/ActiveSet.h"

#include <algorithm>

#include "Simulator/Handset/CellSelection.h"

namespace kelvasi::sim::gsm {

namespace {
constexpr double addWindow = 3;   // dB below the serving cell
constexpr double dropWindow = 6;  // dB
}  // namespace

bool ActiveSet::contains(std::size_t cell) const {
  return std::ranges::find(members_, cell) != members_.end();
}

void ActiveSet::update(std::optional<std::size_t> serving, const std::vector<Reception>& receptions,
                       bool isSoftHandover) {
  const bool isUmts = serving && cells_[*serving].technology == Technology::umts;
  if (!isUmts || !isSoftHandover) members_.clear();
  if (!isUmts) return;
  keepGoodMembers(*serving, receptions);
  members_.insert(members_.begin(), *serving);
  if (members_.size() > largest) members_.resize(largest);
  if (isSoftHandover) addNewMembers(*serving, receptions);
}

// Without the serving cell, which is put in front afterwards.
void ActiveSet::keepGoodMembers(std::size_t serving, const std::vector<Reception>& receptions) {
  std::erase_if(members_, [&](std::size_t cell) {
    return cell == serving || receptions[cell].ecNo < receptions[serving].ecNo - dropWindow;
  });
}

void ActiveSet::addNewMembers(std::size_t serving, const std::vector<Reception>& receptions) {
  for (std::size_t cell = 0; cell < cells_.size() && members_.size() < largest; ++cell) {
    if (cells_[cell].technology == Technology::umts && cells_[cell].frequency == cells_[serving].frequency &&
        !contains(cell) && isSuitable(cells_[cell], receptions[cell]) &&
        receptions[cell].ecNo > receptions[serving].ecNo - addWindow)
      members_.push_back(cell);
  }
}

}  // namespace kelvasi::sim::gsm
