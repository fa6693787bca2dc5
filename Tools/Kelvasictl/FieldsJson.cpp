// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/FieldList.h"

#include <nlohmann/json.hpp>

#include "Tools/Kelvasictl/FieldStates.h"
#include "Tools/Kelvasictl/LogCodeText.h"

namespace kelvasi {

namespace {

using Json = nlohmann::ordered_json;

Json orNull(std::string_view text) {
  return text.empty() ? Json() : Json(text);
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
  for (const FieldState& state : statesOf(*row.row))
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

}  // namespace

std::string fieldsJson(std::span<const TechnologyFields> fields) {
  Json document{{"quantities", Json::array()}, {"rows", Json::array()}};
  for (const Quantity* quantity : quantity::all) document["quantities"].push_back(quantityJson(*quantity));
  for (const auto& [technology, catalog] : fields) {
    for (const CatalogRow& row : catalog.rows()) document["rows"].push_back(rowJson(technology, row));
  }
  return document.dump(1) + "\n";
}

}  // namespace kelvasi
