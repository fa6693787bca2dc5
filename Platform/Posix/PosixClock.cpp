// SPDX-License-Identifier: Apache-2.0
#include "Platform/Posix/PosixClock.h"

#include <chrono>
#include <cmath>
#include <ctime>

namespace kelvasi {

PlistDate PosixClock::now() const {
  const auto sinceEpoch = std::chrono::system_clock::now().time_since_epoch();
  return {std::chrono::duration<double>(sinceEpoch).count()};
}

ZoneState PosixClock::localZone(PlistDate at) const {
  constexpr double reach = 1e15;  // seconds; beyond it years no longer fit std::tm
  const double whole = std::floor(at.secondsSince1970);
  if (!(std::abs(whole) < reach)) return {};
  const auto moment = static_cast<std::time_t>(whole);
  std::tm local{};
  ::tzset();
  if (!::localtime_r(&moment, &local)) return {};
  return {static_cast<int>(local.tm_gmtoff), local.tm_isdst > 0};
}

}  // namespace kelvasi
