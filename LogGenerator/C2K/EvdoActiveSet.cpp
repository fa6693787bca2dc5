// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/EvdoActiveSet.h"

#include "LogGenerator/C2K/C2KRecords.h"
#include "LogGenerator/C2K/ValueTexts.h"

namespace kelvasi {

namespace {

constexpr Row pilotRow{.key = "kActiveSetPilots",
                       .quantity = quantity::ecio,
                       .field = indexIn(evdoActiveSet::pilotLayout, "strength"),
                       .unit = " dB",
                       .absent = "(none)",
                       .scale = strengthScale};

}  // namespace

std::span<const RecordPart> evdoActiveSetParts() {
  static constexpr std::array parts{RecordPart{evdoActiveSet::logCode, evdoActiveSet::pilotLayout,
                                               std::span(&pilotRow, 1), "pilot", "pilots"}};
  return parts;
}

Outcome parseEvdoActiveSet(const C2KUpdate& update) {
  using namespace evdoActiveSet;
  if (!isLongEnough(update, minimumLength,
                    "Log code 0x12b6 is %u bytes long but must be at least %lu bytes."))
    return Outcome::tooShort;
  const auto count = static_cast<std::size_t>(valueOf(update.record, fieldIn(layout, "count")));
  if (update.record.size() < firstPilot + pilotSize * count) {
    update.log.print(LogPriority::error, "Log code 0x12b6 is %u bytes long, but has %d substructs.",
                     update.length(), static_cast<int>(count));
    return Outcome::tooShort;
  }
  update.pilots.begin(RadioFamily::evdo);
  for (std::size_t place = 0; place < count; ++place) {
    const RecordView pilot = update.record.from(firstPilot + pilotSize * place);
    update.pilots.add(place, valueOf(pilot, fieldIn(pilotLayout, "PN offset")), pilotRow,
                      rawOf(pilot, pilotLayout, pilotRow));
  }
  update.writePilotsOrNone(pilotRow);
  return Outcome::shown;
}

}  // namespace kelvasi
