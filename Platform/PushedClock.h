// SPDX-License-Identifier: Apache-2.0
// A clock that somebody sets: offline, whoever reads the capture.
#pragma once

#include <chrono>

#include "Platform/Clock.h"

namespace kelvasi {

class PushedClock : public Clock {
 public:
  // `zones` knows the time zone.
  explicit PushedClock(const Clock& zones) : zones_(zones) {}

  // Since 1970 UTC, where it stands at first.
  void set(std::chrono::nanoseconds now) { now_ = {std::chrono::duration<double>(now).count()}; }
  PlistDate now() const override { return now_; }
  ZoneState localZone(PlistDate at) const override { return zones_.localZone(at); }

 private:
  const Clock& zones_;
  PlistDate now_;
};

}  // namespace kelvasi
