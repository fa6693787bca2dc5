// SPDX-License-Identifier: Apache-2.0
// A display row of a record: which field it shows, what that is, and how it is shown. Text, number and unit
// are functions of the row and the field's value, the raw value.
#pragma once

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <limits>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "LogGenerator/FixedPoint.h"
#include "LogGenerator/RecordLayout.h"
#include "Plist/PlistValue.h"
#include "Radio/Quantity.h"

namespace kelvasi {

inline constexpr std::string_view unknownText = "Unknown";

// The raw value of a row that shows its text for "no value".
inline constexpr std::int64_t noValue = std::numeric_limits<std::int64_t>::max();

// One value that shows a text of its own instead of what the row's other rules say, and is no number.
struct ValueText {
  std::int64_t value = 0;
  std::string_view text;
};

// A measurement: raw * factor + offset, in double precision, or a curve's value.
struct Scale {
  double factor = 1;
  double offset = 0;
  const char* format = hundredths;
  double (*curve)(std::int64_t raw) = nullptr;
  std::string_view formula = {};  // the curve in writing, for those who cannot call it; empty: raw itself

  constexpr double of(std::int64_t raw) const {
    return curve ? curve(raw) : static_cast<double>(raw) * factor + offset;
  }
};

// A number that no field holds as it is goes through the raw value bit by bit.
constexpr std::int64_t rawOf(double number) {
  return std::bit_cast<std::int64_t>(number);
}
constexpr double fromRaw(std::int64_t raw) {
  return std::bit_cast<double>(raw);
}

// The first rule that applies decides: `special` and `absent`, `texts`, `scale`, `digits`, `hexDigits`, else
// the whole number raw * factor + offset.
struct Row {
  std::string_view key;
  std::reference_wrapper<const Quantity> quantity;  // without one a row does not compile
  std::size_t field = 0;                            // its place in the layout
  unsigned lowBits = 32;         // how many of the value's bits count; fewer only for unsigned fields
  std::string_view before = {};  // stands right before a number
  std::string_view unit = {};    // stands right after a number, its blank included
  std::optional<ValueText> special = {};
  std::string_view absent = {};                  // shown for noValue
  std::span<const std::string_view> texts = {};  // by value
  std::string_view otherwise = unknownText;      // a value past the texts; "%d" in it is the value
  bool isFlag = false;                           // every value but 0 shows the second text
  std::optional<Scale> scale = {};
  unsigned digits = 0;     // so many decimal digits, four bits each, the first one lowest; 10 to 15 are blank
  unsigned hexDigits = 0;  // at least as many, after "0x"
  std::int32_t factor = 1;
  std::int32_t offset = 0;
  bool isUnsigned = false;       // "%u" instead of "%d" for 32-bit fields
  bool isSignedNumber = false;   // shown without a sign, and yet a number of `lowBits` bits with one
  bool hasNumber = true;         // else what is shown is no number of the quantity, whatever its digits
  std::string_view reason = {};  // for quantity::none: why it is none of the others
};

// What the display shows.
std::string textOf(const Row& row, std::int64_t raw);
// The same as a text that is made when somebody looks. The row lasts as long as the process.
DeferredText deferredText(const Row& row, std::int64_t raw);
// In the quantity's unit; a state's raw value. Nothing for a special text and for what is not finite.
std::optional<double> numberOf(const Row& row, std::int64_t raw);
// The value of the row's field.
std::int64_t rawOf(RecordView record, std::span<const Field> layout, const Row& row);

}  // namespace kelvasi
