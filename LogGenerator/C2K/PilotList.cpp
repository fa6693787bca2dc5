// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/PilotList.h"

#include <algorithm>
#include <string>

#include "LogGenerator/C2K/NoPilot.h"

namespace kelvasi {

const Row PilotList::emptyRow{.key = "", .quantity = quantity::group, .special = ValueText{0, "{}"}};

void PilotList::begin(RadioFamily family) {
  family_ = family;
  pilots_.clear();
}

void PilotList::add(std::size_t place, std::int64_t pilot, const Row& row, std::int64_t raw,
                    std::int64_t channel) {
  const CellIdentity cell{family_, channel, pilot == noPilot ? CellIdentity::unknown : pilot};
  pilots_.push_back({place, pilot, &row, raw, cell});
}

const PlistDictionary& PilotList::showIn(PlistDictionary& display, std::string_view key) {
  const PlistValue::Dictionary list = unusedDictionary();
  std::size_t next = list->rewriteText(sortedMark, sortedMark, 0);
  for (const Pilot& pilot : pilots_) {
    const std::string name = std::to_string(pilot.place) + ";" + std::to_string(pilot.offset);
    next = list->rewriteText(name, deferredText(*pilot.row, pilot.raw), next);
  }
  list->truncate(next);
  display.set(key, list);
  return *list;
}

PlistValue::Dictionary PilotList::unusedDictionary() {
  const auto isUnused = [](const auto& dictionary) { return dictionary.use_count() == 1; };
  const auto unused = std::ranges::find_if(pool_, isUnused);
  return unused == pool_.end() ? pool_.emplace_back(PlistDictionary::make()) : *unused;
}

}  // namespace kelvasi
