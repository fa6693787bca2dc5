// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/Fingers.h"

#include "LogGenerator/C2K/PilotEntries.h"
#include "LogGenerator/C2K/ValueTexts.h"
#include "LogGenerator/RowCatalog.h"

namespace kelvasi {

namespace {

constexpr Row fingerRow{.key = "kFingerC2I",
                        .quantity = quantity::carrierToInterference,
                        .field = indexIn(fingers::fingerLayout, "C/I"),
                        .unit = " dB",
                        .absent = "(none)",
                        .scale = strengthScale};
constexpr PilotEntries entries{.family = RadioFamily::cdma,
                               .first = fingers::firstFinger,
                               .size = fingers::fingerSize,
                               .layout = fingers::fingerLayout,
                               .pilot = fieldIn(fingers::fingerLayout, "PN offset"),
                               .row = fingerRow,
                               .leavesOutNone = true};

}  // namespace

std::span<const RecordPart> fingers::parts() {
  static constexpr std::array shown{RecordPart{.logCode = fingers::logCode,
                                               .layout = fingers::fingerLayout,
                                               .rows = std::span(&fingerRow, 1),
                                               .of = "finger",
                                               .list = "fingers",
                                               .entries = &fingers::all}};
  return shown;
}

Outcome fingers::parse(const C2KUpdate& update) {
  if (!isLongEnough(update, minimumLength,
                    "Log code 0x108a is %u bytes long but must be at least %lu bytes."))
    return Outcome::tooShort;
  const auto count = static_cast<std::size_t>(valueOf(update.record, fieldIn(layout, "count")));
  if (update.record.size() != entries.lengthOf(count)) {
    update.log.print(LogPriority::error,
                     "Log code 0x108a has bad length of %u bytes, but has %d substructs (size=%lu).",
                     update.length(), static_cast<int>(count), static_cast<unsigned long>(minimumLength));
    return Outcome::notUnderstood;
  }
  entries.show(update, count);
  return Outcome::shown;
}

}  // namespace kelvasi
