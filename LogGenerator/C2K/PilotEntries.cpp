// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/PilotEntries.h"

#include "LogGenerator/C2K/NoPilot.h"

namespace kelvasi {

void PilotEntries::show(const C2KUpdate& update, std::size_t count) const {
  update.pilots.begin(family);
  for (std::size_t place = 0; place < count; ++place) {
    const RecordView entry = update.record.from(lengthOf(place));
    const std::int64_t offset = valueOf(entry, pilot);
    if (leavesOutNone && offset == noPilot) continue;
    update.pilots.add(place, offset, row, rawOf(entry, layout, row));
  }
  update.writePilotsOrNone(row);
}

}  // namespace kelvasi
