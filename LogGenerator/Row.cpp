// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Row.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdio>

namespace kelvasi {

namespace {

// Long enough for any number with its unit: a double of "%4.2f" stays below 24 characters for 32-bit fields.
using Buffer = std::array<char, 96>;

std::string textPastTexts(const Row& row, std::int64_t raw) {
  std::string text(row.otherwise);
  if (const std::size_t at = text.find("%d"); at != std::string::npos)
    text.replace(at, 2, std::to_string(static_cast<std::int32_t>(raw)));
  return text;
}

std::string enumerated(const Row& row, std::int64_t raw) {
  const auto place = static_cast<std::uint64_t>(row.isFlag && raw != 0 ? 1 : raw);
  return place < row.texts.size() ? std::string(row.texts[place]) : textPastTexts(row, raw);
}

char* printed(char* to, std::size_t room, const char* format, double value) {
  // The formats are the constants of the decoders' tables.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat-nonliteral"
  const int length = std::snprintf(to, room, format, value);
#pragma GCC diagnostic pop
  return to + std::clamp(length, 0, static_cast<int>(room) - 1);
}

char* measured(char* to, std::size_t room, const Row& row, std::int64_t raw) {
  const double value = row.scale->of(raw);
  char* end = row.scale->format == hundredths ? writeHundredths(to, value) : nullptr;
  return end ? end : printed(to, room, row.scale->format, value);
}

std::int64_t whole(const Row& row, std::int64_t raw) {
  const std::int64_t value = raw * row.factor + row.offset;
  return row.isUnsigned ? value : static_cast<std::int32_t>(value);
}

unsigned digitAt(std::int64_t raw, unsigned place) {
  return static_cast<unsigned>(static_cast<std::uint64_t>(raw) >> (4 * place)) & 15;
}

char* decimalDigits(char* to, const Row& row, std::int64_t raw) {
  for (unsigned place = 0; place < row.digits; ++place) {
    const unsigned digit = digitAt(raw, place);
    *to++ = digit < 10 ? static_cast<char>('0' + digit) : ' ';
  }
  return to;
}

char* hexadecimal(char* to, const Row& row, std::int64_t raw) {
  return to + std::snprintf(to, 16, "0x%0*x", static_cast<int>(row.hexDigits), static_cast<unsigned>(raw));
}

// The number without what stands around it.
char* numeral(char* to, std::size_t room, const Row& row, std::int64_t raw) {
  if (row.scale) return measured(to, room, row, raw);
  if (row.digits != 0) return decimalDigits(to, row, raw);
  if (row.hexDigits != 0) return hexadecimal(to, row, raw);
  return std::to_chars(to, to + room, whole(row, raw)).ptr;
}

std::optional<double> numberOfDigits(const Row& row, std::int64_t raw) {
  double number = 0;
  unsigned count = 0;
  for (unsigned place = 0; place < row.digits; ++place) {
    if (digitAt(raw, place) > 9) continue;
    number = number * 10 + digitAt(raw, place);
    ++count;
  }
  return count == 0 ? std::nullopt : std::optional(number);
}

std::int64_t signExtended(std::int64_t raw, unsigned bits) {
  const std::int64_t span = std::int64_t{1} << bits;
  return raw < span / 2 ? raw : raw - span;
}

std::string makeText(const void* row, std::int64_t raw) {
  return textOf(*static_cast<const Row*>(row), raw);
}

}  // namespace

std::string textOf(const Row& row, std::int64_t raw) {
  if (row.special && row.special->value == raw) return std::string(row.special->text);
  if (raw == noValue) return std::string(row.absent);
  if (!row.texts.empty()) return enumerated(row, raw);
  Buffer buffer;
  char* end = std::ranges::copy(row.before, buffer.data()).out;
  end = numeral(end, buffer.size() / 2, row, raw);
  end = std::ranges::copy(row.unit, end).out;
  return {buffer.data(), end};
}

DeferredText deferredText(const Row& row, std::int64_t raw) {
  return {makeText, &row, raw};
}

std::optional<double> numberOf(const Row& row, std::int64_t raw) {
  if (!row.hasNumber || raw == noValue || (row.special && row.special->value == raw)) return std::nullopt;
  if (row.scale) {
    const double number = row.scale->of(raw);
    return std::isfinite(number) ? std::optional(number) : std::nullopt;
  }
  if (row.digits != 0) return numberOfDigits(row, raw);
  if (!row.texts.empty() || row.hexDigits != 0) return static_cast<double>(raw);
  if (row.isSignedNumber) return static_cast<double>(signExtended(raw, row.lowBits));
  return static_cast<double>(whole(row, raw));
}

std::int64_t rawOf(RecordView record, std::span<const Field> layout, const Row& row) {
  const Field& field = layout[row.field];
  const std::int64_t value = valueOf(record, field);
  return row.lowBits < field.width ? value & ((std::int64_t{1} << row.lowBits) - 1) : value;
}

}  // namespace kelvasi
