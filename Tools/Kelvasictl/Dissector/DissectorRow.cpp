// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Dissector/DissectorRow.h"

namespace kelvasi {

namespace {

std::string written(const ValueText& special) {
  return LuaTable().addNumber(static_cast<double>(special.value)).addText(special.text).written();
}

std::string written(const Scale& scale) {
  LuaTable table;
  table.setText("format", scale.format);
  const std::string_view formula = scale.formula.empty() ? std::string_view("raw") : scale.formula;
  if (scale.curve)
    return table.set("curve", "function(raw) return " + std::string(formula) + " end").written();
  table.set("factor", luaNumber(scale.factor)).set("offset", luaNumber(scale.offset));
  return table.written();
}

void addTexts(LuaTable& table, const Row& row, SharedTables& shared) {
  if (row.special) table.set("special", written(*row.special));
  table.setText("absent", row.absent);
  if (row.texts.empty()) return;
  table.setNumber("texts", static_cast<double>(shared.texts(row.texts)));
  table.setText("otherwise", row.otherwise).setFlag("flag", row.isFlag);
}

void addNumber(LuaTable& table, const Row& row) {
  table.setText("before", row.before).setText("unit", row.unit);
  if (row.scale) table.set("scale", written(*row.scale));
  table.setNumber("digits", row.digits).setNumber("hex_digits", row.hexDigits);
  if (row.factor != 1) table.set("factor", luaNumber(row.factor));
  table.setNumber("offset", row.offset);
  table.setFlag("unsigned", row.isUnsigned).setFlag("signed", row.isSignedNumber);
  table.setFlag("no_number", !row.hasNumber);
}

}  // namespace

LuaTable dissectorRow(std::string_view key, const Row& row, bool hasField, SharedTables& shared) {
  LuaTable table;
  table.set("key", luaString(key)).setText("quantity", row.quantity.get().id);
  if (hasField) table.setNumber("field", static_cast<double>(row.field + 1));
  if (row.lowBits < 32) table.setNumber("low_bits", row.lowBits);
  addTexts(table, row, shared);
  addNumber(table, row);
  return table;
}

}  // namespace kelvasi
