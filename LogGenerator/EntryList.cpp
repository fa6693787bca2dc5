// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/EntryList.h"

#include "LogGenerator/Exceptions.h"

namespace kelvasi {

RecordView entryOf(RecordView record, const EntryList& list, std::size_t place) {
  const auto bound = static_cast<std::size_t>(valueOf(record, list.count)) + list.uncounted;
  if (place >= bound) throw ArrayOutOfBoundsException();
  const auto before = static_cast<std::size_t>(valueOf(record, list.countBefore));
  return record.from(list.start + list.bytesPerEntryBefore * before + list.stride * place);
}

}  // namespace kelvasi
