// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/EvdoActiveSet.h"

#include "LogGenerator/C2K/PilotEntries.h"
#include "LogGenerator/C2K/ValueTexts.h"
#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

namespace {

constexpr Row pilotRow{.key = "kActiveSetPilots",
                       .quantity = quantity::ecio,
                       .field = indexIn(evdoActiveSet::pilotLayout, "strength"),
                       .unit = " dB",
                       .absent = "(none)",
                       .scale = strengthScale};
constexpr PilotEntries entries{.family = RadioFamily::evdo,
                               .first = evdoActiveSet::firstPilot,
                               .size = evdoActiveSet::pilotSize,
                               .layout = evdoActiveSet::pilotLayout,
                               .pilot = fieldIn(evdoActiveSet::pilotLayout, "PN offset"),
                               .row = pilotRow};

}  // namespace

std::span<const RecordPart> evdoActiveSet::parts() {
  static constexpr std::array shown{RecordPart{.logCode = evdoActiveSet::logCode,
                                               .layout = evdoActiveSet::pilotLayout,
                                               .rows = std::span(&pilotRow, 1),
                                               .of = "pilot",
                                               .list = "pilots",
                                               .entries = &evdoActiveSet::pilots}};
  return shown;
}

Outcome evdoActiveSet::parse(const C2KUpdate& update) {
  if (!isLongEnough(update, minimumLength,
                    "Log code 0x12b6 is %u bytes long but must be at least %lu bytes."))
    return Outcome::tooShort;
  const auto count = static_cast<std::size_t>(valueOf(update.record, fieldIn(layout, "count")));
  if (update.record.size() < entries.lengthOf(count)) {
    update.log.print(LogPriority::error, "Log code 0x12b6 is %u bytes long, but has %d substructs.",
                     update.length(), static_cast<int>(count));
    return Outcome::tooShort;
  }
  entries.show(update, count);
  return Outcome::shown;
}

}  // namespace kelvasi
