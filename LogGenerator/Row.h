// A display row of a record: which field it shows, and how.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

#include "LogGenerator/FixedPoint.h"
#include "LogGenerator/RecordLayout.h"
#include "LogGenerator/RowWriter.h"

namespace kelvasi {

inline constexpr std::string_view unknownText = "Unknown";

// One value that shows a text of its own instead of what the row's other rules say.
struct ValueText {
  std::int64_t value = 0;
  std::string_view text;
};

// A measurement: raw * factor + offset, in double precision.
struct Scale {
  double factor = 1;
  double offset = 0;
  const char* format = hundredths;

  constexpr double of(std::int64_t raw) const { return static_cast<double>(raw) * factor + offset; }
};

// The first rule that applies decides: `special`, `texts`, `scale`, else the whole number raw * factor +
// offset.
struct Row {
  std::string_view key;
  std::size_t field = 0;       // its place in the layout
  unsigned lowBits = 32;       // how many of the value's bits count; fewer only for unsigned fields
  std::string_view unit = {};  // stands right after a number, its blank included
  std::optional<ValueText> special = {};
  std::span<const std::string_view> texts = {};  // by value
  std::string_view otherwise = unknownText;      // a value past the texts
  bool isFlag = false;                           // every value but 0 shows the second text
  std::optional<Scale> scale = {};
  std::int32_t factor = 1;
  std::int32_t offset = 0;
  bool isUnsigned = false;  // "%u" instead of "%d" for 32-bit fields
};

// Writes the rows of one record, in order.
void show(RecordView record, std::span<const Field> layout, std::span<const Row> rows, RowWriter& writer);

}  // namespace kelvasi
