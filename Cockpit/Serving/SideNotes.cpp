// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Serving/SideNotes.h"

#include <string_view>

namespace kelvasi::cockpit {

namespace {

// The first number of the quantity that stands in the section; in any where none is named.
std::optional<std::int64_t> first(const Readings& readings, const Quantity& quantity,
                                  const ReadingSection* section = nullptr) {
  for (const Reading& reading : readings.all()) {
    if (quantityOf(reading) != &quantity || (section && reading.section != section)) continue;
    if (const auto number = numberOf(reading)) return static_cast<std::int64_t>(*number);
  }
  return std::nullopt;
}

const ReadingSection* sectionWith(const Readings& readings, const Quantity& quantity) {
  for (const Reading& reading : readings.all()) {
    if (quantityOf(reading) == &quantity) return reading.section;
  }
  return nullptr;
}

}  // namespace

void SideNotes::take(const Readings& readings) {
  if (const auto routing = first(readings, quantity::rac)) {
    routingArea_ = routing;
    area_ = first(readings, quantity::lac);
  }
  const ReadingSection* section = sectionWith(readings, quantity::bandClass);
  if (!section) return;
  const auto channel = first(readings, quantity::cdmaChannel, section);
  const auto bandClass = first(readings, quantity::bandClass, section);
  if (!channel || !bandClass) return;
  if (bandClasses_.size() == mostChannels) bandClasses_.clear();
  bandClasses_[*channel] = *bandClass;
}

std::optional<std::int64_t> SideNotes::routingArea(std::int64_t locationArea) const {
  return area_ == locationArea ? routingArea_ : std::nullopt;
}

std::optional<std::int64_t> SideNotes::bandClass(std::int64_t cdmaChannel) const {
  const auto found = bandClasses_.find(cdmaChannel);
  return found == bandClasses_.end() ? std::nullopt : std::optional(found->second);
}

}  // namespace kelvasi::cockpit
