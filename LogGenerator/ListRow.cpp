// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/ListRow.h"

#include "LogGenerator/Base.h"

namespace kelvasi {

namespace {

// A list takes the place of what stands there, if that is no list, and else of its entries.
void gatherRemoval(const PlistValue* standing, std::string_view key, const ReadingPlace& place) {
  if (standing && standing->array()) {
    place.readings->addRemovals(*place.section, key, standing->array()->size());
  } else {
    place.readings->add(place.written(emptyList, 0, key));
  }
}

}  // namespace

void ListRow::show(RecordView record, const ListColumn& column, PlistDictionary& section,
                   const ReadingPlace& place) {
  if (column.staysWithoutEntries && countOf(record, column.list) == 0) return;
  PlistArray& shown = emptied(column.key, section, place);
  ReadingPlace own = place;
  own.list = column.key;
  const PlistArray& entries =
      column.element ? elementsOf(record, column, own) : entriesOf(record, column, own);
  Base::replaceArrayWith(shown, entries);
}

const PlistArray& ListRow::entriesOf(RecordView record, const ListColumn& column, const ReadingPlace& list) {
  list_.startAgain(list);
  for (std::size_t at = 0; at < countOf(record, column.list); ++at) {
    RowWriter row = list_.add();
    kelvasi::show(entryOf(record, column.list, at), column.list.layout, column.rows, row);
  }
  return list_.entries();
}

const PlistArray& ListRow::elementsOf(RecordView record, const ListColumn& column, ReadingPlace list) {
  elements_.removeAll();
  for (std::size_t at = 0; at < countOf(record, column.list); ++at) {
    const std::int64_t raw = rawOf(entryOf(record, column.list, at), column.list.layout, *column.element);
    list.element = static_cast<std::int32_t>(at);
    elements_.append(deferredText(*column.element, raw));
    if (list.readings) list.readings->add(list.written(*column.element, raw, {}));
  }
  return elements_;
}

// The row's array, empty, so that the dictionaries in it are free to be used again.
PlistArray& ListRow::emptied(std::string_view key, PlistDictionary& section, const ReadingPlace& place) {
  constexpr long ownHolders = 2;  // this object and the row
  const PlistValue* standing = section.find(key);
  if (place.readings) gatherRemoval(standing, key, place);
  const bool isOwn = shown_ && standing && standing->array() == shown_.get();
  if (isOwn && shown_.use_count() == ownHolders) {
    Base::clearElementsInArray(*shown_);
  } else {
    shown_ = PlistArray::make();
    section.set(key, shown_);
  }
  return *shown_;
}

}  // namespace kelvasi
