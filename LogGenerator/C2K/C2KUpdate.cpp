#include "LogGenerator/C2K/C2KUpdate.h"

namespace kelvasi {

bool isLongEnough(const C2KUpdate& update, std::size_t minimumLength, const char* complaint) {
  if (update.record.size() >= minimumLength) return true;
  update.log.print(LogPriority::error, complaint, update.length(), static_cast<unsigned long>(minimumLength));
  return false;
}

void show(const C2KUpdate& update, RecordView record, std::span<const Field> layout,
          std::span<const C2KRow> rows) {
  for (const C2KRow& row : rows) update.set(row.name, row.text(valueOf(record, layout[row.field])));
}

void showNotAvailable(const C2KUpdate& update, std::span<const C2KRow> rows) {
  for (const C2KRow& row : rows) update.set(row.name, "N/A");
}

}  // namespace kelvasi
