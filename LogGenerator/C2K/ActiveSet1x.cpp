// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/ActiveSet1x.h"

#include <algorithm>
#include <cmath>

#include "LogGenerator/C2K/DeviceStatus.h"

namespace kelvasi {

namespace {

using namespace deviceStatus;

constexpr const Row& pilotRow = activeSet1xRows[0];
constexpr const Row& referenceRow = activeSet1xRows[1];

constexpr double leastRatio = 0.00001;  // -50 dB

// Linear Ec/Io of a pilot's energy: energy * power / divisor - noise.
struct EnergyScale {
  explicit EnergyScale(RecordView subPacket) {
    const auto window = static_cast<double>(valueOf(subPacket, fieldIn(activeSetLayout, "window")));
    const auto gain = static_cast<double>(valueOf(subPacket, fieldIn(activeSetLayout, "gain")));
    const auto exponent = static_cast<int>(valueOf(subPacket, fieldIn(activeSetLayout, "energy exponent")));
    power = std::ldexp(1.0, 2 * exponent - 3);
    divisor = gain * 9 * window * window;
    noise = 1 / window;
  }
  double decibels(std::uint16_t energy) const {
    return 10 * std::log10(std::max(power * energy / divisor - noise, leastRatio));
  }

  double power;
  double divisor;
  double noise;
};

}  // namespace

void gatherActiveSet1x(RecordView subPacket, std::int64_t channel, PilotList& pilots) {
  const EnergyScale scale(subPacket);
  const std::int64_t count = valueOf(subPacket, fieldIn(activeSetLayout, "count"));
  const std::int64_t fingers = valueOf(subPacket, fieldIn(activeSetLayout, "fingers"));
  const std::int64_t reference = valueOf(subPacket, fieldIn(activeSetLayout, "reference PN offset"));
  pilots.begin(RadioFamily::cdma);
  for (std::size_t place = 0; place < static_cast<std::size_t>(count); ++place) {
    const RecordView pilot = subPacket.from(pilotStride(fingers) * place);
    const std::int64_t offset = valueOf(pilot, fieldIn(pilotLayout, "PN offset"));
    const double ratio = scale.decibels(pilot.u16(pilotEnergyAt(fingers)));
    pilots.add(place, offset, offset == reference ? referenceRow : pilotRow, rawOf(ratio), channel);
  }
}

CellIdentity referenceCell(RecordView subPacket, std::int64_t channel) {
  if (valueOf(subPacket, fieldIn(activeSetLayout, "count")) == 0) return {};
  return {RadioFamily::cdma, channel, valueOf(subPacket, fieldIn(activeSetLayout, "reference PN offset"))};
}

}  // namespace kelvasi
