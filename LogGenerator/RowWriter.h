// Writes the rows of a display dictionary in place: a row that stands is overwritten where it stands.
//
// `Rows::kept` leaves every row that is not written as it is; `Rows::anew` ends with exactly the rows that
// were written, in the order of writing, yet uses the strings that stand there again.
#pragma once

#include <algorithm>
#include <array>
#include <charconv>
#include <concepts>
#include <cstddef>
#include <string_view>

#include "Plist/PlistValue.h"

namespace kelvasi {

enum class Rows { kept, anew };

class RowWriter {
 public:
  explicit RowWriter(PlistDictionary& rows, Rows mode = Rows::kept) : rows_(rows), mode_(mode) {}
  ~RowWriter() {
    if (mode_ == Rows::anew) rows_.truncate(place_);
  }
  RowWriter(const RowWriter&) = delete;
  RowWriter& operator=(const RowWriter&) = delete;

  void text(std::string_view key, std::string_view text) {
    place_ = mode_ == Rows::anew ? rows_.rewriteText(key, text, place_) : rows_.setText(key, text, place_);
  }

  void text(std::string_view key, DeferredText text) {
    place_ = mode_ == Rows::anew ? rows_.rewriteText(key, text, place_) : rows_.setText(key, text, place_);
  }
  // As "%d" of a 32-bit integer, the unit (at most 16 characters) right after it.
  template <std::integral Integer>
  void number(std::string_view key, Integer value, std::string_view unit = {}) {
    std::array<char, 32> shown;
    char* end = std::to_chars(shown.data(), shown.data() + 16, static_cast<std::int32_t>(value)).ptr;
    end = std::ranges::copy(unit.substr(0, 16), end).out;
    text(key, {shown.data(), static_cast<std::size_t>(end - shown.data())});
  }

  // A row that is no text. Setting the absent value removes the row.
  void value(std::string_view key, PlistValue value) {
    if (mode_ == Rows::anew) text(key, std::string_view());
    rows_.set(key, std::move(value));
  }

 private:
  PlistDictionary& rows_;
  Rows mode_;
  std::size_t place_ = 0;  // where the next row is expected
};

}  // namespace kelvasi
