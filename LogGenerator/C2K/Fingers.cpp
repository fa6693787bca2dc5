#include "LogGenerator/C2K/Fingers.h"

#include "LogGenerator/C2K/C2KRecords.h"
#include "LogGenerator/C2K/NoPilot.h"
#include "LogGenerator/C2K/PilotList.h"
#include "LogGenerator/C2K/ValueTexts.h"

namespace kelvasi {

void parseFingers(const C2KUpdate& update) {
  using namespace fingers;
  if (!isLongEnough(update, minimumLength,
                    "Log code 0x108a is %u bytes long but must be at least %lu bytes."))
    return;
  const auto count = static_cast<std::size_t>(valueOf(update.record, fieldIn(layout, "count")));
  if (update.record.size() != firstFinger + fingerSize * count) {
    update.log.print(LogPriority::error,
                     "Log code 0x108a has bad length of %u bytes, but has %d substructs (size=%lu).",
                     update.length(), static_cast<int>(count), static_cast<unsigned long>(minimumLength));
    return;
  }
  PilotList pilots;
  for (std::size_t place = 0; place < count; ++place) {
    const RecordView finger = update.record.from(firstFinger + fingerSize * place);
    const std::int64_t pilot = valueOf(finger, fieldIn(fingerLayout, "PN offset"));
    if (pilot == noPilot) continue;
    pilots.add(place, pilot, strengthText(valueOf(finger, fieldIn(fingerLayout, "C/I"))));
  }
  update.set("kFingerC2I", pilots.listOrNone());
}

}  // namespace kelvasi
