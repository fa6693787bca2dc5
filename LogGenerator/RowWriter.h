// SPDX-License-Identifier: Apache-2.0
// Writes the rows of a display dictionary in place: a row that stands is overwritten where it stands.
//
// `Rows::kept` leaves every row that is not written as it is; `Rows::anew` ends with exactly the rows that
// were written, in the order of writing, yet uses the strings that stand there again.
#pragma once

#include <cstddef>
#include <string_view>

#include "LogGenerator/Readings.h"
#include "LogGenerator/Row.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

enum class Rows { kept, anew };

// Where the rows that are written stand, for those who listen.
struct ReadingPlace {
  Readings* readings = nullptr;  // null: nobody listens
  const ReadingSection* section = nullptr;
  std::int32_t entry = Reading::notInList;
  std::string_view list = {};
  std::int32_t element = Reading::notInList;

  Reading written(const Row& row, std::int64_t raw, std::string_view key) const {
    return {.entry = entry,
            .element = element,
            .section = section,
            .row = &row,
            .raw = raw,
            .list = list,
            .key = key};
  }
  Reading removed(std::string_view key) const {
    return {.kind = Reading::Kind::removal,
            .entry = entry,
            .element = element,
            .section = section,
            .list = list,
            .key = key};
  }
};

// What a list without entries, and an entry without rows, is.
inline constexpr Row emptyList{.key = "", .quantity = quantity::list, .special = ValueText{0, "[]"}};
inline constexpr Row emptyGroup{.key = "", .quantity = quantity::group, .special = ValueText{0, "{}"}};

class RowWriter {
 public:
  explicit RowWriter(PlistDictionary& rows, const ReadingPlace& place = {}, Rows mode = Rows::kept)
      : rows_(rows), place_(place), mode_(mode), before_(place.readings ? place.readings->count() : 0) {}
  ~RowWriter() {
    if (mode_ == Rows::kept) return;
    rows_.truncate(next_);
    if (next_ == 0 && place_.readings) place_.readings->add(place_.written(emptyGroup, 0, {}));
  }
  RowWriter(const RowWriter&) = delete;
  RowWriter& operator=(const RowWriter&) = delete;

  // `row` lasts as long as the process.
  void write(const Row& row, std::int64_t raw) {
    const DeferredText text = deferredText(row, raw);
    next_ =
        mode_ == Rows::anew ? rows_.rewriteText(row.key, text, next_) : rows_.setText(row.key, text, next_);
    if (place_.readings) place_.readings->add(place_.written(row, raw, row.key));
  }
  void remove(std::string_view key) {
    if (rows_.remove(key) && place_.readings) place_.readings->add(place_.removed(key));
  }

  // The cell that the rows written so far are about.
  void identify(const CellIdentity& cell) {
    if (place_.readings) place_.readings->identify(before_, cell);
  }
  Readings* readings() const { return place_.readings; }

  // A row that holds a list, which is empty now, and its elements, each of them shown as `row` says. The
  // array that stands where the row is expected is used again, as long as nobody else holds it.
  PlistArray& list(std::string_view key) {
    const auto* const standing =
        next_ < rows_.size() ? &rows_.begin()[static_cast<std::ptrdiff_t>(next_)] : nullptr;
    auto list = standing && standing->first == key ? standing->second.sharedArray() : nullptr;
    constexpr long rowsAndOurs = 2;
    if (list.use_count() == rowsAndOurs) {
      list->removeAll();
      ++next_;
    } else {
      list = PlistArray::make();
      if (mode_ == Rows::anew) next_ = rows_.rewriteText(key, std::string_view(), next_);
      rows_.set(key, list);
    }
    if (place_.readings) place_.readings->add(place_.written(emptyList, 0, key));
    return *list;
  }
  void element(PlistArray& list, const Row& row, std::int64_t raw) {
    ReadingPlace own = place_;
    own.list = row.key;
    own.element = static_cast<std::int32_t>(list.size());
    list.append(deferredText(row, raw));
    if (own.readings) own.readings->add(own.written(row, raw, {}));
  }

 private:
  PlistDictionary& rows_;
  ReadingPlace place_;
  Rows mode_;
  std::size_t before_;    // readings before the first row
  std::size_t next_ = 0;  // where the next row is expected
};

// Writes the rows of one record, in order.
inline void show(RecordView record, std::span<const Field> layout, std::span<const Row> rows,
                 RowWriter& writer) {
  for (const Row& row : rows) writer.write(row, rawOf(record, layout, row));
}

}  // namespace kelvasi
