// SPDX-License-Identifier: Apache-2.0
#include "Bench/LogGenerator/C2K/C2KSamples.h"

#include "LogGenerator/C2K/EvdoActiveSet.h"
#include "LogGenerator/C2K/EvdoRates.h"
#include "LogGenerator/C2K/EvdoStatus.h"
#include "LogGenerator/C2K/Fingers.h"
#include "LogGenerator/C2K/SystemParameters.h"
#include "Simulator/C2K/OneXRecords.h"

namespace kelvasi::bench {

namespace {

constexpr EntryList pilots{.count = fieldIn(evdoActiveSet::layout, "count"),
                           .start = evdoActiveSet::firstPilot,
                           .stride = evdoActiveSet::pilotSize,
                           .layout = evdoActiveSet::pilotLayout};
constexpr EntryList allFingers{.count = fieldIn(fingers::layout, "count"),
                               .start = fingers::firstFinger,
                               .stride = fingers::fingerSize,
                               .layout = fingers::fingerLayout};

// A drive of up to two minutes: now in a call, now without a system.
Bytes deviceStatus(Random& random) {
  sim::c2k::World world{sim::Random(random.below(1000))};
  for (std::uint64_t seconds = random.below(120); seconds > 0; --seconds) world.pass(1);
  return *sim::c2k::deviceStatusRecord(world);
}

Bytes trafficFrame(Random& random) {
  return sim::c2k::trafficFrameRecord(random.below(64) == 0);
}

}  // namespace

std::span<const Sample> c2kSamples() {
  static constexpr std::array samples{
      Sample{"0x1183 EV-DO status", evdoStatus::logCode, evdoStatus::length, evdoStatus::layout, 6},
      Sample{"0x1192 EV-DO forward rate", evdoForwardRate::logCode, evdoForwardRate::minimumLength,
             evdoForwardRate::layout},
      Sample{"0x127E EV-DO reverse rate", evdoReverseRate::logCode, evdoReverseRate::minimumLength,
             evdoReverseRate::layout},
      Sample{.name = "0x12B6 6 EV-DO pilots",
             .logCode = evdoActiveSet::logCode,
             .length = evdoActiveSet::minimumLength,
             .layout = evdoActiveSet::layout,
             .lists = {{{pilots, 6}}}},
      Sample{.name = "0x108A 6 fingers",
             .logCode = fingers::logCode,
             .length = fingers::minimumLength,
             .layout = fingers::layout,
             .lists = {{{allFingers, 6}}}},
      Sample{.name = "0x119C 1x device status", .record = deviceStatus},
      Sample{.name = "0x119D 1x traffic frame", .record = trafficFrame},
      Sample{.name = "0x134F 1x system parameters",
             .logCode = systemParameters::logCode,
             .length = systemParameters::minimumLength,
             .layout = systemParameters::layout,
             .fixed = {{{"version", systemParameters::minimumVersion},
                        {"system type", systemParameters::cdmaSystem}}}},
  };
  return samples;
}

}  // namespace kelvasi::bench
