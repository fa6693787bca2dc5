// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/EvdoStatus.h"

#include "LogGenerator/C2K/C2KUpdate.h"
#include "LogGenerator/C2K/NoPilot.h"
#include "LogGenerator/C2K/ValueTexts.h"
#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

namespace {

using evdoStatus::layout;

constexpr std::array radioRows{
    Row{.key = "kChannel", .quantity = quantity::cdmaChannel, .field = indexIn(layout, "channel")},
    Row{.key = "k1xEVDODeviceState",
        .quantity = quantity::evdoState,
        .field = indexIn(layout, "device state"),
        .texts = evdoDeviceStates,
        .otherwise = reservedValue},
    Row{.key = "kBandClass",
        .quantity = quantity::bandClass,
        .field = indexIn(layout, "band class"),
        .texts = bandClasses,
        .otherwise = badValue},
    Row{.key = "kRxAGC0",
        .quantity = quantity::rxPower,
        .field = indexIn(layout, "Rx AGC 0"),
        .unit = " dBm",
        .scale = signedWhole},
};
constexpr std::array connectedRows{
    Row{.key = "kRxAGC1",
        .quantity = quantity::rxPower,
        .field = indexIn(layout, "Rx AGC 1"),
        .unit = " dBm",
        .absent = notAvailableText,
        .scale = signedWhole},
    Row{.key = "kTxAGC",
        .quantity = quantity::txPower,
        .field = indexIn(layout, "Tx AGC"),
        .unit = " dBm",
        .absent = notAvailableText,
        .scale = signedWhole},
};
constexpr std::array sessionRows{
    Row{.key = "kServingPNOffset",
        .quantity = quantity::pnOffset,
        .field = indexIn(layout, "serving PN offset"),
        .unit = " × 64chips",
        .special = ValueText{noPilot, "Invalid Value"}},
    Row{.key = "kSessionState",
        .quantity = quantity::evdoSession,
        .field = indexIn(layout, "session state"),
        .texts = evdoSessionStates,
        .otherwise = reservedValue},
    Row{.key = "kUATI24", .quantity = quantity::uati24, .field = indexIn(layout, "UATI24"), .hexDigits = 6},
    Row{.key = "kColorCode", .quantity = quantity::colorCode, .field = indexIn(layout, "color code")},
};

CellIdentity servingCell(RecordView record) {
  const std::int64_t pilot = valueOf(record, fieldIn(layout, "serving PN offset"));
  if (pilot == noPilot) return {};
  return {RadioFamily::evdo, valueOf(record, fieldIn(layout, "channel")), pilot};
}

}  // namespace

std::span<const RecordPart> evdoStatus::parts() {
  static constexpr std::array shown{
      RecordPart{evdoStatus::logCode, layout, radioRows},
      RecordPart{evdoStatus::logCode, layout, connectedRows},
      RecordPart{evdoStatus::logCode, layout, sessionRows},
  };
  return shown;
}

Outcome evdoStatus::parse(const C2KUpdate& update) {
  if (update.record.size() != evdoStatus::length) {
    update.log.print(LogPriority::error, "Log code 0x1183 is %u bytes long but should be %lu bytes.",
                     update.length(), static_cast<unsigned long>(evdoStatus::length));
    return update.record.size() < evdoStatus::length ? Outcome::tooShort : Outcome::notUnderstood;
  }
  const CellIdentity serving = servingCell(update.record);
  if (update.readings && serving) update.readings->servingCells().say(evdoStatus::logCode, {.cell = serving});
  show(update, update.record, layout, radioRows, serving);
  if (valueOf(update.record, fieldIn(layout, "device state")) < evdoStatus::accessState) {
    showAbsent(update, connectedRows);
  } else {
    show(update, update.record, layout, connectedRows, serving);
  }
  show(update, update.record, layout, sessionRows, serving);
  return Outcome::shown;
}

}  // namespace kelvasi
