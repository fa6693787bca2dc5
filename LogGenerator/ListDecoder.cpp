// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ListDecoder.h"

namespace kelvasi {

Outcome ListDecoder::updateWithData(RecordView record, LogCode logCode) {
  trace(section_.trace, section_.tracePriority);
  if (logCode == section_.logCode) return showList(record);
  if (logCode == cellInfoLogCode && section_.cells) return showCells(record);
  return decodeOther(record, logCode);
}

void ListDecoder::addEntry(RecordView record, std::size_t place) {
  RowWriter row = addRows();
  show(entry(record, place), section_.list.layout, section_.rows, row);
}

Outcome ListDecoder::decodeOther(RecordView, LogCode logCode) {
  if (!section_.isSilent) logUnknownMessage(logCode);
  return Outcome::notAskedFor;
}

void ListDecoder::describe(RowCatalog& catalog) const {
  catalog.add(section_.name, {.logCode = section_.logCode,
                              .layout = section_.list.layout,
                              .rows = section_.staysEmpty ? std::span<const Row>() : section_.rows,
                              .of = "entry",
                              .minimumLength = section_.minimumLength,
                              .entries = &section_.list});
  for (const RecordPart& part : section_.others) catalog.add(section_.name, whole(part));
  if (section_.cells) section_.cells->describe(section_.name, catalog);
}

// A part of the list's own record says no more than what it has of its own.
RecordPart ListDecoder::whole(const RecordPart& part) const {
  RecordPart whole = part;
  if (part.logCode != section_.logCode) return whole;
  whole.minimumLength = section_.minimumLength;
  if (part.of == "entry" && !part.entries) whole.entries = &section_.list;
  return whole;
}

CellIdentity ListDecoder::cellOf(RecordView record, std::size_t place) const {
  return kelvasi::cellOf(section_.cell, record, entry(record, place));
}

Outcome ListDecoder::showList(RecordView record) {
  if (record.size() < section_.minimumLength) return Outcome::tooShort;
  clearList();
  const std::size_t count = countOf(record, section_.list);
  if (count == 0) return listOutcome();
  startList();
  Readings* const listeners = listReadings();
  const std::size_t first = listeners ? listeners->count() : 0;
  for (std::size_t place = 0; place < count; ++place) {
    const std::size_t before = listeners ? listeners->count() : 0;
    addEntry(record, place);
    if (listeners) listeners->identify(before, cellOf(record, place));
  }
  if (listeners && section_.cell.takesServingChannel)
    listeners->takeChannel(first, listeners->servingCells().certain(section_.cell.family));
  if (sectionList() && !section_.staysEmpty) replaceArrayWith(*sectionList(), list_.entries());
  return listOutcome();
}

Outcome ListDecoder::showCells(RecordView record) {
  const CellInfoArray cellInfo(platform(), record.payload());
  clearList();
  const PlistArray* cells = cellsOf(cellInfo, log());
  if (!cells) return Outcome::propertyListRefused;
  startList();
  for (const PlistValue& cell : *cells) {
    if (!section_.cells->takes(cell)) continue;
    RowWriter row = addRows();
    showCell(*cell.dictionary(), *section_.cells, row, log());
  }
  if (sectionList()) replaceArrayWith(*sectionList(), list_.entries());
  return listOutcome();
}

// The section lets go of the entries first, so that their dictionaries can be used again.
void ListDecoder::clearList() {
  if (!sectionList()) return;
  if (readings()) readings()->addRemovals(*place().section, {}, sectionList()->size());
  clearElementsInArray(*sectionList());
}

void ListDecoder::startList() {
  ReadingPlace own = place();
  own.readings = listReadings();
  list_.startAgain(own);
}

}  // namespace kelvasi
