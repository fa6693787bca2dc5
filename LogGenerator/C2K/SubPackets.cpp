// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/C2K/SubPackets.h"

namespace kelvasi::subPackets {

std::optional<RecordView> find(RecordView record, std::int64_t id, SystemLog& log) {
  const std::int64_t count = valueOf(record, fieldIn(layout, "count"));
  std::size_t start = first;
  for (std::int64_t index = 0; index < count; ++index) {
    const RecordView subPacket = record.from(start);
    const std::int64_t size = valueOf(subPacket, fieldIn(headerLayout, "size"));
    const std::size_t end = start + static_cast<std::size_t>(size);
    if (end >= first + record.size()) {
      log.print(LogPriority::error, "Log code error in subpkt#%d: bad size (%d).", static_cast<int>(index),
                static_cast<int>(size));
      return std::nullopt;
    }
    if (valueOf(subPacket, fieldIn(headerLayout, "id")) == id) return subPacket;
    start = end;
  }
  return std::nullopt;
}

}  // namespace kelvasi::subPackets
