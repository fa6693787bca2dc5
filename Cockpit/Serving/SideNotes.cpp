// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Serving/SideNotes.h"

namespace kelvasi::cockpit {

namespace {

std::optional<std::int64_t> first(const Readings& readings, const Quantity& quantity) {
  for (const Reading& reading : readings.all()) {
    if (quantityOf(reading) != &quantity) continue;
    if (const auto number = numberOf(reading)) return static_cast<std::int64_t>(*number);
  }
  return std::nullopt;
}

}  // namespace

void SideNotes::take(const Readings& readings) {
  if (const auto routing = first(readings, quantity::rac)) {
    routingArea_ = routing;
    area_ = first(readings, quantity::lac);
  }
  bandClasses_.take(readings);
}

std::optional<std::int64_t> SideNotes::routingArea(std::int64_t locationArea) const {
  return area_ == locationArea ? routingArea_ : std::nullopt;
}

std::optional<std::int64_t> SideNotes::bandClass(std::int64_t cdmaChannel) const {
  return bandClasses_.of(cdmaChannel);
}

}  // namespace kelvasi::cockpit
