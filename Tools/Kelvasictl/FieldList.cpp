// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/FieldList.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdio>
#include <nlohmann/json.hpp>
#include <vector>

#include "Tools/Kelvasictl/LogCodeText.h"

namespace kelvasi {

namespace {

using Json = nlohmann::ordered_json;

struct State {
  std::int64_t value;
  std::string text;
};

// The texts that stand for a value, and after them the one that is not a value of the texts.
std::vector<State> statesOf(const Row& row) {
  std::vector<State> states;
  if (!row.reason.empty()) return states;
  for (std::size_t value = 0; value < row.texts.size(); ++value) {
    if (row.texts[value] != row.otherwise)
      states.push_back({static_cast<std::int64_t>(value), std::string(row.texts[value])});
  }
  if (row.special) states.push_back({row.special->value, std::string(row.special->text)});
  return states;
}

Json orNull(std::string_view text) {
  return text.empty() ? Json() : Json(text);
}

std::string numeral(double number) {
  std::array<char, 32> digits;
  return {digits.data(), std::to_chars(digits.data(), digits.data() + digits.size(), number).ptr};
}

Json quantityJson(const Quantity& quantity) {
  const bool hasRange = quantity.least < quantity.most;
  return {{"id", quantity.id},
          {"unit", orNull(quantity.unit)},
          {"kind", nameOf(quantity.kind)},
          {"least", hasRange ? Json(quantity.least) : Json()},
          {"most", hasRange ? Json(quantity.most) : Json()},
          {"source", orNull(quantity.source)}};
}

Json rowJson(const std::string& technology, const CatalogRow& row) {
  const Quantity& quantity = row.row->quantity;
  const auto fromField = [&](auto member) { return row.field ? Json((*row.field).*member) : Json(); };
  Json states = Json::array();
  for (const State& state : statesOf(*row.row))
    states.push_back({{"value", state.value}, {"text", state.text}});
  return {{"technology", technology},
          {"section", orNull(row.section)},
          {"list", orNull(row.list)},
          {"row", row.key},
          {"code", row.logCode == 0 && row.section.empty() ? Json() : Json(logCodeText(row.logCode))},
          {"key", orNull(row.source)},
          {"of", orNull(row.of)},
          {"byte", fromField(&Field::byte)},
          {"bit", fromField(&Field::bit)},
          {"width", fromField(&Field::width)},
          {"signed", fromField(&Field::isSigned)},
          {"digits", row.digits == 0 ? Json() : Json(row.digits)},
          {"quantity", quantity.id},
          {"unit", orNull(quantity.unit)},
          {"states", std::move(states)},
          {"reason", orNull(row.row->reason)}};
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
  for (const State& state : statesOf(row)) {
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

std::string fieldsJson(std::span<const TechnologyFields> fields) {
  Json document{{"quantities", Json::array()}, {"rows", Json::array()}};
  for (const Quantity* quantity : quantity::all) document["quantities"].push_back(quantityJson(*quantity));
  for (const auto& [technology, catalog] : fields) {
    for (const CatalogRow& row : catalog.rows()) document["rows"].push_back(rowJson(technology, row));
  }
  return document.dump(1) + "\n";
}

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
