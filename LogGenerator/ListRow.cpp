#include "LogGenerator/ListRow.h"

#include "LogGenerator/Base.h"

namespace kelvasi {

void ListRow::show(RecordView record, const EntryList& list, std::span<const Row> rows, std::string_view key,
                   PlistDictionary& section) {
  PlistArray& shown = emptied(key, section);
  list_.startAgain();
  for (std::size_t place = 0; place < countOf(record, list); ++place) {
    RowWriter row = list_.add();
    kelvasi::show(entryOf(record, list, place), list.layout, rows, row);
  }
  Base::replaceArrayWith(shown, list_.entries());
}

void ListRow::show(const PlistArray& elements, std::string_view key, PlistDictionary& section) {
  Base::replaceArrayWith(emptied(key, section), elements);
}

// The row's array, empty, so that the dictionaries in it are free to be used again.
PlistArray& ListRow::emptied(std::string_view key, PlistDictionary& section) {
  constexpr long ownHolders = 2;  // this object and the row
  const PlistValue* standing = section.find(key);
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
