// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ServingCells.h"

#include <algorithm>

namespace kelvasi {

namespace {

bool agree(const ServingCells::Word& one, const ServingCells::Word& other) {
  return canBeSame(one.cell, other.cell) && (!one.cellId || !other.cellId || one.cellId == other.cellId);
}

void add(ServingCells::Word& to, const ServingCells::Word& word) {
  if (to.cell.channel == CellIdentity::unknown) to.cell.channel = word.cell.channel;
  if (to.cell.code == CellIdentity::unknown) to.cell.code = word.cell.code;
  if (!to.cellId) to.cellId = word.cellId;
}

}  // namespace

void ServingCells::say(LogCode source, const Word& word) {
  const auto said = std::ranges::find_if(sayings_, [&](const Saying& each) {
    return each.source == source && each.word.cell.family == word.cell.family;
  });
  if (said == sayings_.end()) {
    sayings_.push_back({source, word});
  } else {
    said->word = word;
  }
}

void ServingCells::deny(const CellIdentity& cell) {
  std::erase_if(sayings_, [&](const Saying& each) { return canBeSame(each.word.cell, cell); });
}

CellIdentity ServingCells::certain(RadioFamily family) const {
  Word certain;
  for (const auto& [source, word] : sayings_) {
    if (word.cell.family != family) continue;
    if (!certain.cell) certain.cell.family = family;
    if (!agree(certain, word)) return {};
    add(certain, word);
  }
  return certain.cell;
}

}  // namespace kelvasi
