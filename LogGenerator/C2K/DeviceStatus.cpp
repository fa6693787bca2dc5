#include "LogGenerator/C2K/DeviceStatus.h"

#include "LogGenerator/C2K/ActiveSet1x.h"
#include "LogGenerator/C2K/C2KRecords.h"
#include "LogGenerator/C2K/SubPackets.h"
#include "LogGenerator/C2K/TrafficFER.h"
#include "LogGenerator/C2K/ValueTexts.h"

namespace kelvasi {

namespace {

using namespace deviceStatus;

FormattedText receivePowerText(std::int64_t value) {
  return FormattedText("%+.2f dBm", static_cast<double>(value) * 334 / 1000 - 63.248);
}

FormattedText transmitPowerText(std::int64_t value) {
  return FormattedText("%+.2f dBm", static_cast<double>(value) / 10);
}

constexpr std::array receiverRows{
    C2KRow{"k1xRx0BandClass", indexIn(radioLayout, "Rx 0 band class"), bandClassText},
    C2KRow{"k1xRx0ChanNum", indexIn(radioLayout, "Rx 0 channel"), decimalText},
    C2KRow{"k1xRxAGC0", indexIn(radioLayout, "Rx 0 AGC"), receivePowerText},
};
constexpr std::array trafficRows{
    C2KRow{"k1xRx1BandClass", indexIn(radioLayout, "Rx 1 band class"), bandClassText},
    C2KRow{"k1xRx1ChanNum", indexIn(radioLayout, "Rx 1 channel"), decimalText},
    C2KRow{"k1xRxAGC1", indexIn(radioLayout, "Rx 1 AGC"), receivePowerText},
    C2KRow{"k1xTxAGC", indexIn(radioLayout, "Tx AGC"), transmitPowerText},
};

void showRadio(const C2KUpdate& update, RecordView radio, bool isTraffic) {
  show(update, radio, radioLayout, receiverRows);
  if (isTraffic) return show(update, radio, radioLayout, trafficRows);
  showNotAvailable(update, trafficRows);
}

// The error rate of a call that has ended is shown once more.
void showOldErrorRate(const C2KUpdate& update) {
  const auto rate = trafficFER::rateOf(update.state);
  if (!rate) return;
  update.set("k1xTrafficFER", FormattedText("%.02f%% (old)", trafficFER::percent(*rate)));
  update.state.remove("TrafficFER");
}

}  // namespace

void parseDeviceStatus(const C2KUpdate& update) {
  if (!isLongEnough(update, subPackets::minimumLength,
                    "Log code 0x119c is %u bytes long but must be at least %lu bytes."))
    return;
  const auto state = subPackets::find(update.record, stateId, update.log);
  const auto radio = subPackets::find(update.record, radioId, update.log);
  const auto activeSet = subPackets::find(update.record, activeSetId, update.log);
  const auto fingers = subPackets::find(update.record, fingersId, update.log);
  if (!state || !radio || !activeSet || !fingers) {
    update.log.print(LogPriority::warning, "Log code 0x119c: missing subpacket (ss=%d,rf=%d,ai=%d,fi=%d).",
                     state.has_value(), radio.has_value(), activeSet.has_value(), fingers.has_value());
    return;
  }
  const std::int64_t deviceState = valueOf(*state, fieldIn(stateLayout, "state"));
  update.set("k1xDeviceState", deviceStateText(deviceState));
  showRadio(update, *radio, deviceState == trafficState);
  update.set("k1xActiveSetInfo", activeSet1x(*activeSet));
  if (deviceState != trafficState) showOldErrorRate(update);
}

}  // namespace kelvasi
