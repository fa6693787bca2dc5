// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/PilotList.h"

#include "LogGenerator/C2K/NoPilot.h"

namespace kelvasi {

namespace {

constexpr Row emptyList{.key = "", .quantity = quantity::group, .special = ValueText{0, "{}"}};

}  // namespace

PilotList::PilotList(RadioFamily family, bool isGathered)
    : family_(family),
      isGathered_(isGathered),
      list_(PlistDictionary::make({{std::string(sortedMark), PlistValue(sortedMark)}})) {}

void PilotList::add(std::size_t place, std::int64_t pilot, const Row& row, std::int64_t raw,
                    std::int64_t channel) {
  list_->set(std::to_string(place) + ";" + std::to_string(pilot), deferredText(row, raw));
  if (!isGathered_) return;
  pilots_.push_back({&row, raw, {family_, channel, pilot == noPilot ? CellIdentity::unknown : pilot}});
}

std::vector<Reading> PilotList::readings() const {
  std::vector<Reading> readings{
      {.keyKind = Reading::Key::element, .row = &emptyList},
      {.keyKind = Reading::Key::element, .row = &sortedRow, .key = sortedRow.key},
  };
  auto entry = list_->begin() + 1;
  for (const Pilot& pilot : pilots_) {
    readings.push_back({.keyKind = Reading::Key::element,
                        .row = pilot.row,
                        .raw = pilot.raw,
                        .key = (entry++)->first,
                        .cell = pilot.cell});
  }
  return readings;
}

}  // namespace kelvasi
