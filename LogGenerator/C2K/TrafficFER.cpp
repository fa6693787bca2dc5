// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/TrafficFER.h"

#include "LogGenerator/C2K/C2KUpdate.h"
#include "LogGenerator/C2K/SubPackets.h"
#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

std::optional<double> trafficFER::rateOf(const PlistDictionary& state) {
  const PlistValue rate = state.get("TrafficFER");
  if (rate.real()) return *rate.real();
  if (rate.integer()) return static_cast<double>(*rate.integer());
  return std::nullopt;
}

std::span<const RecordPart> trafficFER::parts() {
  static constexpr std::array shown{
      RecordPart{.logCode = trafficFER::logCode, .rows = std::span(&trafficFER::rateRow, 1)},
      RecordPart{trafficFER::logCode, subPackets::layout},
      RecordPart{
          .logCode = trafficFER::logCode, .layout = trafficFER::demodulationLayout, .of = "sub-packet 11"}};
  return shown;
}

Outcome trafficFER::parse(const C2KUpdate& update) {
  if (!isLongEnough(update, subPackets::minimumLength,
                    "Log code 0x119d is %d bytes long but must be at least %ld bytes."))
    return Outcome::tooShort;
  const auto demodulation = subPackets::find(update.record, demodulationId, update.log);
  if (!demodulation) {
    update.log.print(LogPriority::warning, "Log code 0x119d: missing traffic demod subpacket.");
    return Outcome::notUnderstood;
  }
  float rate =
      valueOf(*demodulation, fieldIn(demodulationLayout, "frame error")) != 0 ? newFrameWeight : 0.0F;
  if (const auto before = rateOf(update.state)) rate += static_cast<float>(*before) * oldRateWeight;
  update.state.set("TrafficFER", static_cast<double>(rate));
  update.write(rateRow, rawOf(percent(rate)));
  return Outcome::shown;
}

}  // namespace kelvasi
