// SPDX-License-Identifier: Apache-2.0
#include "Radio/CellCarriers.h"

#include <limits>

#include "Radio/Channels.h"

namespace kelvasi {

Carriers carriersOf(const CellIdentity& cell) {
  if (cell.channel < 0 || cell.channel > std::numeric_limits<std::uint32_t>::max()) return {};
  const auto channel = static_cast<std::uint32_t>(cell.channel);
  switch (cell.family) {
    case RadioFamily::none:
      return {};
    case RadioFamily::gsm:
      return gsmCarriers(channel);
    case RadioFamily::umts:
      return utraFddCarriers(channel);
    case RadioFamily::utraTdd:
      return utraTddCarriers(channel);
    case RadioFamily::lte:
      return eutraCarriers(channel);
    case RadioFamily::cdma:
    case RadioFamily::evdo:
      return cdmaCarriers(channel);
  }
  return {};
}

}  // namespace kelvasi
