#include "LogGenerator/StateDecoder.h"

#include <algorithm>

namespace kelvasi {

void StateDecoder::updateWithData(RecordView record, LogCode logCode) {
  trace(section_.trace);
  if (logCode == cellInfoLogCode && section_.cells) return showCell(record);
  const auto rows = std::ranges::find(section_.records, logCode, &RecordRows::logCode);
  if (rows == section_.records.end()) {
    decodeOther(record, logCode);
  } else if (record.size() >= rows->minimumLength && sectionRows()) {
    RowWriter writer(*sectionRows());
    show(record, rows->layout, rows->rows, writer);
  }
}

// An unbound section gets the same lines into the system log.
void StateDecoder::showCell(RecordView record) {
  PlistDictionary nowhere;
  showFirstCell(platform(), record, *section_.cells, sectionRows() ? *sectionRows() : nowhere);
}

void StateDecoder::decodeOther(RecordView, LogCode logCode) {
  logUnknownMessage(logCode);
}

}  // namespace kelvasi
