#include "LogGenerator/C2K/EvdoActiveSet.h"

#include "LogGenerator/C2K/C2KRecords.h"
#include "LogGenerator/C2K/C2KTexts.h"
#include "LogGenerator/C2K/PilotList.h"

namespace kelvasi {

void parseEvdoActiveSet(const C2KUpdate& update) {
  using namespace evdoActiveSet;
  if (update.record.size() < minimumLength) {
    update.log.print(LogPriority::error, "Log code 0x12b6 is %u bytes long but must be at least %lu bytes.",
                     update.length(), static_cast<unsigned long>(minimumLength));
    return;
  }
  const auto count = static_cast<std::size_t>(valueOf(update.record, layout[indexIn(layout, "count")]));
  if (update.record.size() < firstPilot + pilotSize * count) {
    update.log.print(LogPriority::error, "Log code 0x12b6 is %u bytes long, but has %d substructs.",
                     update.length(), static_cast<int>(count));
    return;
  }
  PilotList pilots;
  for (std::size_t place = 0; place < count; ++place) {
    const RecordView pilot = update.record.from(firstPilot + pilotSize * place);
    pilots.add(place, valueOf(pilot, pilotLayout[indexIn(pilotLayout, "PN offset")]),
               strengthText(valueOf(pilot, pilotLayout[indexIn(pilotLayout, "strength")])));
  }
  update.set("kActiveSetPilots", pilots.listOrNone());
}

}  // namespace kelvasi
