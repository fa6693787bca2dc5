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

void ListRow::show(RecordView record, const EntryList& list, std::span<const Row> rows, std::string_view key,
                   PlistDictionary& section, const ReadingPlace& place) {
  PlistArray& shown = emptied(key, section, place);
  ReadingPlace own = place;
  own.list = key;
  list_.startAgain(own);
  for (std::size_t at = 0; at < countOf(record, list); ++at) {
    RowWriter row = list_.add();
    kelvasi::show(entryOf(record, list, at), list.layout, rows, row);
  }
  Base::replaceArrayWith(shown, list_.entries());
}

void ListRow::show(RecordView record, const EntryList& list, const Row& row, PlistDictionary& section,
                   const ReadingPlace& place) {
  PlistArray& shown = emptied(row.key, section, place);
  ReadingPlace own = place;
  own.list = row.key;
  elements_.removeAll();
  for (std::size_t at = 0; at < countOf(record, list); ++at) {
    const std::int64_t raw = rawOf(entryOf(record, list, at), list.layout, row);
    own.element = static_cast<std::int32_t>(at);
    elements_.append(deferredText(row, raw));
    if (own.readings) own.readings->add(own.written(row, raw, {}));
  }
  Base::replaceArrayWith(shown, elements_);
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
