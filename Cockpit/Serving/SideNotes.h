// SPDX-License-Identifier: Apache-2.0
// What records say beside the cells they name, and what it belongs to: the routing area of a location area,
// the band class of a CDMA channel.
#pragma once

#include <cstdint>
#include <optional>

#include "LogGenerator/Readings.h"
#include "Survey/Cells/BandClasses.h"

namespace kelvasi::cockpit {

class SideNotes {
 public:
  void take(const Readings& readings);

  // Nothing unless the last record that named a routing area named this location area.
  std::optional<std::int64_t> routingArea(std::int64_t locationArea) const;
  std::optional<std::int64_t> bandClass(std::int64_t cdmaChannel) const;

 private:
  std::optional<std::int64_t> area_;
  std::optional<std::int64_t> routingArea_;
  survey::BandClasses bandClasses_;
};

}  // namespace kelvasi::cockpit
