// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/Fingers.h"

#include "LogGenerator/C2K/C2KRecords.h"
#include "LogGenerator/C2K/NoPilot.h"
#include "LogGenerator/C2K/ValueTexts.h"

namespace kelvasi {

namespace {

constexpr Row fingerRow{.key = "kFingerC2I",
                        .quantity = quantity::carrierToInterference,
                        .field = indexIn(fingers::fingerLayout, "C/I"),
                        .unit = " dB",
                        .absent = "(none)",
                        .scale = strengthScale};

}  // namespace

std::span<const RecordPart> fingersParts() {
  static constexpr std::array parts{
      RecordPart{fingers::logCode, fingers::fingerLayout, std::span(&fingerRow, 1), "finger", "fingers"}};
  return parts;
}

Outcome parseFingers(const C2KUpdate& update) {
  using namespace fingers;
  if (!isLongEnough(update, minimumLength,
                    "Log code 0x108a is %u bytes long but must be at least %lu bytes."))
    return Outcome::tooShort;
  const auto count = static_cast<std::size_t>(valueOf(update.record, fieldIn(layout, "count")));
  if (update.record.size() != firstFinger + fingerSize * count) {
    update.log.print(LogPriority::error,
                     "Log code 0x108a has bad length of %u bytes, but has %d substructs (size=%lu).",
                     update.length(), static_cast<int>(count), static_cast<unsigned long>(minimumLength));
    return Outcome::notUnderstood;
  }
  update.pilots.begin(RadioFamily::cdma);
  for (std::size_t place = 0; place < count; ++place) {
    const RecordView finger = update.record.from(firstFinger + fingerSize * place);
    const std::int64_t pilot = valueOf(finger, fieldIn(fingerLayout, "PN offset"));
    if (pilot == noPilot) continue;
    update.pilots.add(place, pilot, fingerRow, rawOf(finger, fingerLayout, fingerRow));
  }
  update.writePilotsOrNone(fingerRow);
  return Outcome::shown;
}

}  // namespace kelvasi
