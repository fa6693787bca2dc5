#include "LogGenerator/Row.h"

#include <algorithm>
#include <charconv>
#include <cstdio>

namespace kelvasi {

namespace {

// Long enough for any number with its unit: a double of "%4.2f" stays below 24 characters for 32-bit fields.
using Buffer = std::array<char, 96>;

std::string_view enumerated(const Row& row, std::int64_t raw) {
  const auto place = static_cast<std::uint64_t>(row.isFlag && raw != 0 ? 1 : raw);
  return place < row.texts.size() ? row.texts[place] : row.otherwise;
}

std::string_view withUnit(Buffer& buffer, char* end, std::string_view unit) {
  end = std::ranges::copy(unit, end).out;
  return {buffer.data(), static_cast<std::size_t>(end - buffer.data())};
}

char* printed(Buffer& buffer, const char* format, double value) {
  // The formats are the constants of the decoders' tables.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat-nonliteral"
  const int length = std::snprintf(buffer.data(), buffer.size() / 2, format, value);
#pragma GCC diagnostic pop
  return buffer.data() + std::clamp(length, 0, static_cast<int>(buffer.size() / 2) - 1);
}

std::string_view measured(Buffer& buffer, const Row& row, std::int64_t raw) {
  const double value = row.scale->of(raw);
  char* end = row.scale->format == hundredths ? writeHundredths(buffer.data(), value) : nullptr;
  if (!end) end = printed(buffer, row.scale->format, value);
  return withUnit(buffer, end, row.unit);
}

std::string_view whole(Buffer& buffer, const Row& row, std::int64_t raw) {
  const std::int64_t value = raw * row.factor + row.offset;
  const std::int64_t shown = row.isUnsigned ? value : static_cast<std::int32_t>(value);
  return withUnit(buffer, std::to_chars(buffer.data(), buffer.data() + buffer.size() / 2, shown).ptr,
                  row.unit);
}

std::string_view textOf(Buffer& buffer, const Row& row, std::int64_t raw) {
  if (row.special && row.special->value == raw) return row.special->text;
  if (!row.texts.empty()) return enumerated(row, raw);
  if (row.scale) return measured(buffer, row, raw);
  return whole(buffer, row, raw);
}

std::int64_t rawOf(RecordView record, const Field& field, unsigned lowBits) {
  const std::int64_t value = valueOf(record, field);
  return lowBits < field.width ? value & ((std::int64_t{1} << lowBits) - 1) : value;
}

}  // namespace

void show(RecordView record, std::span<const Field> layout, std::span<const Row> rows, RowWriter& writer) {
  Buffer buffer;
  for (const Row& row : rows) {
    writer.text(row.key, textOf(buffer, row, rawOf(record, layout[row.field], row.lowBits)));
  }
}

}  // namespace kelvasi
