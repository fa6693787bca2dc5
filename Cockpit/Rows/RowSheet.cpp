// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/RowSheet.h"

#include <array>
#include <charconv>

#include "Cockpit/Rows/QuantityWords.h"
#include "Cockpit/Rows/RowPath.h"
#include "Cockpit/Serving/CellWords.h"
#include "LogGenerator/Row.h"
#include "Survey/Alarms/AlarmRule.h"

namespace kelvasi::cockpit {

namespace {

bool isMeasured(const Quantity& quantity) {
  return quantity.kind == QuantityKind::measurement;
}

bool hasCourse(const Quantity& quantity) {
  return isMeasured(quantity) || quantity.kind == QuantityKind::count ||
         quantity.kind == QuantityKind::parameter || quantity.kind == QuantityKind::state ||
         &quantity == &quantity::integer || &quantity == &quantity::real;
}

// A curve's number goes through the raw value bit by bit and is no field's.
bool hasRawField(const BookedRow& row) {
  return row.row && row.value.isAbsent() && row.raw != noValue && !(row.row->scale && row.row->scale->curve);
}

std::string hexOf(std::int64_t raw) {
  // As wide as records have fields: a negative number as its 32 bits.
  const bool isWide = raw > UINT32_MAX || raw < INT32_MIN;
  const std::uint64_t bits = isWide ? static_cast<std::uint64_t>(raw) : static_cast<std::uint32_t>(raw);
  std::array<char, 16> digits;
  const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), bits, 16).ptr;
  std::string text = "0x";
  for (const char* at = digits.data(); at != end; ++at)
    text += *at >= 'a' ? static_cast<char>(*at - 'a' + 'A') : *at;
  return text;
}

void addRaw(RowSheet& sheet, const BookedRow& row, const TextStyle& style) {
  std::optional<std::int64_t> raw;
  if (hasRawField(row)) raw = row.raw;
  if (const auto* integer = row.value.integer()) raw = *integer;
  if (!raw) return;
  sheet.decimal = (*raw < 0 ? style.minus : "") + std::to_string(*raw).substr(*raw < 0 ? 1 : 0);
  sheet.hexadecimal = hexOf(*raw);
}

void addQuantity(RowSheet& sheet, const Quantity& quantity) {
  const QuantityWords words = wordsOf(quantity);
  sheet.quantity = quantity.kind == QuantityKind::text ? std::string_view() : quantity.id;
  sheet.quantityName = words.name;
  sheet.meaning = words.meaning;
  sheet.unit = quantity.unit;
  sheet.source = quantity.source;
  if (isMeasured(quantity)) sheet.ruleBegin = quantity.id;
}

std::string withUnit(double number, const RowSheet& sheet, const TextStyle& style) {
  std::string text = shortNumberText(number, 2, style);
  if (!sheet.unit.empty()) text += " " + std::string(sheet.unit);
  return text;
}

std::string changedText(const BookedRow& row, Arrival now, const TextStyle& style) {
  if (row.changed == row.since) return "not since " + clockText(row.since, style);
  return durationText(timeSince(row.changed, now)) + " ago, " + clockText(row.changed, style);
}

}  // namespace

RowSheet sheetOf(const std::string& path, const BookedRow& row, Arrival now, const TextStyle& style) {
  RowSheet sheet;
  sheet.path = path;
  sheet.nodePath = nodePathOf(path);
  sheet.name = rowNameOf(path);
  sheet.place = placeTextOf(path);
  sheet.isPresent = row.isPresent;
  sheet.cell = row.cell;
  sheet.cellText = fullCellName(row.cell);
  sheet.value = row.text();
  sheet.number = row.number();
  addRaw(sheet, row, style);
  const Quantity* quantity = row.quantity();
  if (quantity) addQuantity(sheet, *quantity);
  sheet.age = ageOf(row.last, now, !row.isPresent);
  if (row.minimum && row.maximum && quantity && hasCourse(*quantity)) {
    sheet.minimum = withUnit(*row.minimum, sheet, style);
    sheet.maximum = withUnit(*row.maximum, sheet, style);
    sheet.canChart = true;
  }
  sheet.sinceText = clockText(row.since, style);
  sheet.changedText = changedText(row, now, style);
  sheet.writings = row.writings;
  return sheet;
}

std::vector<std::pair<std::string, std::string>> RowSheet::lines() const {
  std::vector<std::pair<std::string, std::string>> lines;
  const auto add = [&](const char* caption, std::string text) {
    if (!text.empty()) lines.emplace_back(caption, std::move(text));
  };
  add("Value", value);
  add("Decimal", decimal);
  add("Hexadecimal", hexadecimal);
  add("Cell", cellText);
  add("Quantity", unit.empty() ? quantityName : quantityName + ", " + std::string(unit));
  add("Meaning", meaning);
  add("Defined in", std::string(source));
  add("Age", isPresent ? age.text : "no longer shown, " + age.text);
  add("Minimum", minimum);
  add("Maximum", maximum);
  if (!minimum.empty()) add("Both since", sinceText);
  add("Last change", changedText);
  add("Written", countText(writings) + (writings == 1 ? " time" : " times"));
  add("Path", nodePath);
  return lines;
}

}  // namespace kelvasi::cockpit
