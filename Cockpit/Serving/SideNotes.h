// SPDX-License-Identifier: Apache-2.0
// What records say beside the cells they name, and what it belongs to: the routing area of a location area,
// the band class of a CDMA channel.
#pragma once

#include <cstdint>
#include <map>
#include <optional>

#include "LogGenerator/Readings.h"

namespace kelvasi::cockpit {

class SideNotes {
 public:
  void take(const Readings& readings);

  // Nothing unless the last record that named a routing area named this location area.
  std::optional<std::int64_t> routingArea(std::int64_t locationArea) const;
  std::optional<std::int64_t> bandClass(std::int64_t cdmaChannel) const;

 private:
  static constexpr std::size_t mostChannels = 256;

  std::optional<std::int64_t> area_;
  std::optional<std::int64_t> routingArea_;
  std::map<std::int64_t, std::int64_t> bandClasses_;  // by channel
};

}  // namespace kelvasi::cockpit
