// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/FieldList.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <vector>

#include "Tools/Kelvasictl/FieldStates.h"
#include "Tools/Kelvasictl/LogCodeText.h"

namespace kelvasi {

namespace {

std::string numeral(double number) {
  std::array<char, 32> digits;
  return {digits.data(), std::to_chars(digits.data(), digits.data() + digits.size(), number).ptr};
}

// Characters that a table would take for its own.
std::string cell(std::string_view text) {
  std::string escaped;
  for (const char each : text) {
    if (each == '|' || each == '<') escaped += '\\';
    escaped += each;
  }
  return escaped;
}

std::string placeOf(const CatalogRow& row) {
  if (!row.source.empty()) return "`" + row.source + "`";
  if (!row.field && row.section.empty()) return "by its name";
  if (!row.field) return row.of.empty() ? "calculated" : "from " + row.of;
  const Field& field = *row.field;
  std::string place = "byte " + std::to_string(field.byte);
  if (field.bit != 0) place += ", bit " + std::to_string(field.bit);
  place += ", " + std::to_string(field.width) + (field.width == 1 ? " bit" : " bits");
  if (field.isSigned) place += ", signed";
  if (!row.of.empty()) place += " of " + row.of;
  return row.digits == 0 ? place : place + ", the first of " + std::to_string(row.digits) + " digits";
}

std::string statesText(const Row& row) {
  std::string text(row.reason);
  for (const FieldState& state : statesOf(row)) {
    if (!text.empty()) text += "; ";
    text += std::to_string(state.value) + " " + (state.text.empty() ? "(empty)" : state.text);
  }
  return text;
}

std::string rowLine(const CatalogRow& row) {
  const Quantity& quantity = row.row->quantity;
  const std::string key = row.list.empty() || row.list == row.key ? row.key : row.list + " / " + row.key;
  return "| " + cell(key) + " | " + (row.section.empty() ? "" : logCodeText(row.logCode)) + " | " +
         cell(placeOf(row)) + " | `" + std::string(quantity.id) + "` | " + std::string(quantity.unit) +
         " | " + cell(statesText(*row.row)) + " |\n";
}

std::string quantityLine(const Quantity& quantity) {
  const bool hasRange = quantity.least < quantity.most;
  return "| `" + std::string(quantity.id) + "` | " + std::string(quantity.unit) + " | " +
         std::string(nameOf(quantity.kind)) + " | " +
         (hasRange ? numeral(quantity.least) + " to " + numeral(quantity.most) : "") + " | " +
         std::string(quantity.source) + " |\n";
}

constexpr std::string_view beginning = R"(# Fields

Every row that a display can have: the log code of the record that it comes from, the bits that it is, and what they
mean. Made by `kelvasictl fields --format markdown`.

Bytes count from the start of the record, or of what is named, the header of 13 bytes included; bits from the least
significant one. The unit is the quantity's own, whatever the display shows. `*` is any key that a property list has.
)";

constexpr std::string_view quantitiesHeading = R"(
## Quantities

A range is what the source allows; a record may hold any number that fits its bits.

| Quantity | Unit | Kind | Range | Source |
| --- | --- | --- | --- | --- |
)";

constexpr std::string_view rowHeading =
    "\n| Row | Code | Where | Quantity | Unit | States |\n| --- | --- | --- | --- | --- | --- |\n";

std::vector<std::string> sectionsOf(const RowCatalog& catalog) {
  std::vector<std::string> sections;
  for (const CatalogRow& row : catalog.rows()) {
    if (std::ranges::find(sections, row.section) == sections.end()) sections.push_back(row.section);
  }
  return sections;
}

void appendSections(std::string& page, const RowCatalog& catalog) {
  for (const std::string& section : sectionsOf(catalog)) {
    page += "\n### " + (section.empty() ? "Any section" : section) + "\n";
    page += rowHeading;
    for (const CatalogRow& row : catalog.rows()) {
      if (row.section == section) page += rowLine(row);
    }
  }
}

}  // namespace

std::string fieldsMarkdown(std::span<const TechnologyFields> fields) {
  std::string page(beginning);
  for (const auto& [technology, catalog] : fields) {
    page += "\n## " + technology + "\n";
    appendSections(page, catalog);
  }
  page += quantitiesHeading;
  for (const Quantity* quantity : quantity::all) page += quantityLine(*quantity);
  return page;
}

}  // namespace kelvasi
