// SPDX-License-Identifier: Apache-2.0
#include "Radio/CellCarriers.h"

#include <limits>

#include "Radio/Channels.h"

namespace kelvasi {

namespace {

constexpr bool isNumber(std::int64_t value) {
  return value >= 0 && value <= std::numeric_limits<std::uint32_t>::max();
}

}  // namespace

Carriers carriersOf(const CellIdentity& cell) {
  if (!isNumber(cell.channel)) return {};
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

Carriers carriersOf(const CellIdentity& cell, std::optional<std::int64_t> bandClass) {
  const bool isCdma = cell.family == RadioFamily::cdma || cell.family == RadioFamily::evdo;
  if (!isCdma || !bandClass) return carriersOf(cell);
  if (!isNumber(cell.channel) || !isNumber(*bandClass)) return {};
  return cdmaCarriers(static_cast<std::uint32_t>(cell.channel), static_cast<std::uint32_t>(*bandClass));
}

}  // namespace kelvasi
