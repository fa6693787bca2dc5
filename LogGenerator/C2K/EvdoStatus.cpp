#include "LogGenerator/C2K/EvdoStatus.h"

#include "LogGenerator/C2K/C2KRecords.h"
#include "LogGenerator/C2K/NoPilot.h"
#include "LogGenerator/C2K/ValueTexts.h"

namespace kelvasi {

namespace {

using evdoStatus::layout;

FormattedText powerText(std::int64_t value) {
  return FormattedText("%+d dBm", static_cast<int>(value));
}

FormattedText pilotText(std::int64_t value) {
  if (value == noPilot) return FormattedText("Invalid Value");
  return FormattedText("%d × 64chips", static_cast<int>(value));
}

FormattedText addressText(std::int64_t value) {
  return FormattedText("0x%06x", static_cast<unsigned>(value));
}

constexpr std::array radioRows{
    C2KRow{"kChannel", indexIn(layout, "channel"), decimalText},
    C2KRow{"k1xEVDODeviceState", indexIn(layout, "device state"), evdoDeviceStateText},
    C2KRow{"kBandClass", indexIn(layout, "band class"), bandClassText},
    C2KRow{"kRxAGC0", indexIn(layout, "Rx AGC 0"), powerText},
};
constexpr std::array connectedRows{
    C2KRow{"kRxAGC1", indexIn(layout, "Rx AGC 1"), powerText},
    C2KRow{"kTxAGC", indexIn(layout, "Tx AGC"), powerText},
};
constexpr std::array sessionRows{
    C2KRow{"kServingPNOffset", indexIn(layout, "serving PN offset"), pilotText},
    C2KRow{"kSessionState", indexIn(layout, "session state"), evdoSessionStateText},
    C2KRow{"kUATI24", indexIn(layout, "UATI24"), addressText},
    C2KRow{"kColorCode", indexIn(layout, "color code"), decimalText},
};

}  // namespace

void parseEvdoStatus(const C2KUpdate& update) {
  if (update.record.size() != evdoStatus::length) {
    update.log.print(LogPriority::error, "Log code 0x1183 is %u bytes long but should be %lu bytes.",
                     update.length(), static_cast<unsigned long>(evdoStatus::length));
    return;
  }
  show(update, update.record, layout, radioRows);
  if (valueOf(update.record, fieldIn(layout, "device state")) < evdoStatus::accessState) {
    showNotAvailable(update, connectedRows);
  } else {
    show(update, update.record, layout, connectedRows);
  }
  show(update, update.record, layout, sessionRows);
}

}  // namespace kelvasi
