// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/DeviceStatus.h"

#include "LogGenerator/C2K/ActiveSet1x.h"
#include "LogGenerator/C2K/C2KUpdate.h"
#include "LogGenerator/C2K/SubPackets.h"
#include "LogGenerator/C2K/TrafficFER.h"
#include "LogGenerator/C2K/ValueTexts.h"
#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

namespace {

using namespace deviceStatus;

double receivePower(std::int64_t raw) {
  return static_cast<double>(raw) * 334 / 1000 - 63.248;
}
double transmitPower(std::int64_t raw) {
  return static_cast<double>(raw) / 10;
}
constexpr Scale receiveScale{
    .format = "%+.2f", .curve = receivePower, .formula = "raw * 334 / 1000 - 63.248"};
constexpr Scale transmitScale{.format = "%+.2f", .curve = transmitPower, .formula = "raw / 10"};

constexpr std::array stateRows{
    Row{.key = "k1xDeviceState",
        .quantity = quantity::oneXState,
        .field = indexIn(stateLayout, "state"),
        .texts = deviceStates,
        .otherwise = badValue},
};
constexpr std::array receiverRows{
    Row{.key = "k1xRx0BandClass",
        .quantity = quantity::bandClass,
        .field = indexIn(radioLayout, "Rx 0 band class"),
        .texts = bandClasses,
        .otherwise = badValue},
    Row{.key = "k1xRx0ChanNum",
        .quantity = quantity::cdmaChannel,
        .field = indexIn(radioLayout, "Rx 0 channel")},
    Row{.key = "k1xRxAGC0",
        .quantity = quantity::rxPower,
        .field = indexIn(radioLayout, "Rx 0 AGC"),
        .unit = " dBm",
        .scale = receiveScale},
};
constexpr std::array trafficRows{
    Row{.key = "k1xRx1BandClass",
        .quantity = quantity::bandClass,
        .field = indexIn(radioLayout, "Rx 1 band class"),
        .absent = notAvailableText,
        .texts = bandClasses,
        .otherwise = badValue},
    Row{.key = "k1xRx1ChanNum",
        .quantity = quantity::cdmaChannel,
        .field = indexIn(radioLayout, "Rx 1 channel"),
        .absent = notAvailableText},
    Row{.key = "k1xRxAGC1",
        .quantity = quantity::rxPower,
        .field = indexIn(radioLayout, "Rx 1 AGC"),
        .unit = " dBm",
        .absent = notAvailableText,
        .scale = receiveScale},
    Row{.key = "k1xTxAGC",
        .quantity = quantity::txPower,
        .field = indexIn(radioLayout, "Tx AGC"),
        .unit = " dBm",
        .absent = notAvailableText,
        .scale = transmitScale},
};
void showRadio(const C2KUpdate& update, RecordView radio, bool isTraffic, const CellIdentity& serving) {
  show(update, radio, radioLayout, receiverRows, serving);
  if (isTraffic) return show(update, radio, radioLayout, trafficRows);
  showAbsent(update, trafficRows);
}

// The error rate of a call that has ended is shown once more.
void showOldErrorRate(const C2KUpdate& update) {
  const auto rate = trafficFER::rateOf(update.state);
  if (!rate) return;
  update.write(trafficFER::oldRateRow, rawOf(trafficFER::percent(*rate)));
  update.state.remove("TrafficFER");
}

}  // namespace

std::span<const RecordPart> deviceStatus::parts() {
  static constexpr std::array shown{
      RecordPart{logCode, stateLayout, stateRows, "sub-packet 1"},
      RecordPart{logCode, radioLayout, receiverRows, "sub-packet 2"},
      RecordPart{logCode, radioLayout, trafficRows, "sub-packet 2"},
      RecordPart{.logCode = logCode, .rows = std::span(activeSet1xRows).first(1), .list = "pilots"},
      RecordPart{.logCode = logCode, .rows = std::span(&trafficFER::oldRateRow, 1)},
      RecordPart{logCode, subPackets::layout},
      RecordPart{.logCode = logCode, .layout = activeSetLayout, .of = "sub-packet 3"},
      RecordPart{.logCode = logCode, .layout = pilotLayout, .of = "pilot"},
  };
  return shown;
}

Outcome deviceStatus::parse(const C2KUpdate& update) {
  if (!isLongEnough(update, subPackets::minimumLength,
                    "Log code 0x119c is %u bytes long but must be at least %lu bytes."))
    return Outcome::tooShort;
  const auto state = subPackets::find(update.record, stateId, update.log);
  const auto radio = subPackets::find(update.record, radioId, update.log);
  const auto activeSet = subPackets::find(update.record, activeSetId, update.log);
  const auto fingers = subPackets::find(update.record, fingersId, update.log);
  if (!state || !radio || !activeSet || !fingers) {
    update.log.print(LogPriority::warning, "Log code 0x119c: missing subpacket (ss=%d,rf=%d,ai=%d,fi=%d).",
                     state.has_value(), radio.has_value(), activeSet.has_value(), fingers.has_value());
    return Outcome::notUnderstood;
  }
  const bool isTraffic = valueOf(*state, fieldIn(stateLayout, "state")) == trafficState;
  const std::int64_t channel = valueOf(*radio, fieldIn(radioLayout, "Rx 0 channel"));
  const CellIdentity serving = referenceCell(*activeSet, channel);
  if (update.readings && serving) update.readings->servingCells().say(logCode, {.cell = serving});
  show(update, *state, stateLayout, stateRows);
  showRadio(update, *radio, isTraffic, serving);
  gatherActiveSet1x(*activeSet, channel, update.pilots);
  update.writePilots(activeSet1xRows.front());  // without pilots an empty list, never "(none)"
  if (!isTraffic) showOldErrorRate(update);
  return Outcome::shown;
}

}  // namespace kelvasi
