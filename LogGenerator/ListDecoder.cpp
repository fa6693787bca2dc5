#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

void ListDecoder::updateWithData(RecordView record, LogCode logCode) {
  trace(section_.trace, section_.tracePriority);
  if (logCode == section_.logCode) {
    showList(record);
  } else if (logCode == cellInfoLogCode && section_.cells) {
    showCells(record);
  } else {
    decodeOther(record, logCode);
  }
}

void ListDecoder::addEntry(RecordView record, std::size_t place) {
  RowWriter row = addRows();
  show(entry(record, place), section_.list.layout, section_.rows, row);
}

void ListDecoder::decodeOther(RecordView, LogCode logCode) {
  logUnknownMessage(logCode);
}

void ListDecoder::showList(RecordView record) {
  if (record.size() < section_.minimumLength) return;
  // The section lets go of the entries first, so that their dictionaries can be used again.
  if (sectionList()) clearElementsInArray(*sectionList());
  const std::size_t count = countOf(record, section_.list);
  if (count == 0) return;
  list_.startAgain();
  for (std::size_t place = 0; place < count; ++place) addEntry(record, place);
  if (sectionList() && !section_.staysEmpty) replaceArrayWith(*sectionList(), list_.entries());
}

void ListDecoder::showCells(RecordView record) {
  const CellInfoArray cellInfo(platform(), record.payload());
  if (sectionList()) clearElementsInArray(*sectionList());
  const PlistArray* cells = cellsOf(cellInfo, log());
  if (!cells) return;
  list_.startAgain();
  for (const PlistValue& cell : *cells) {
    if (!section_.cells->takes(cell)) continue;
    RowWriter row = addRows();
    showCell(*cell.dictionary(), section_.cells->rows, row, log());
  }
  if (sectionList()) replaceArrayWith(*sectionList(), list_.entries());
}

}  // namespace kelvasi
