// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Dissector/SharedTables.h"

#include <algorithm>

namespace kelvasi {

namespace {

std::string definition(std::string_view name, std::span<const std::string> tables) {
  std::string text = "tables." + std::string(name) + " = {\n";
  for (const std::string& table : tables) text += "  " + table + ",\n";
  return text + "}\n";
}

}  // namespace

std::string luaField(const Field& field) {
  LuaTable table;
  table.addText(field.name).addNumber(static_cast<double>(field.byte)).addNumber(field.bit);
  table.addNumber(field.width).add(field.isSigned ? "true" : "false");
  return table.add(field.isBigEndian ? "true" : "false").written();
}

std::size_t SharedTables::numberOf(Kind& kind, const LuaTable& table) {
  if (table.empty()) return 0;
  const auto known = std::ranges::find(kind, table.written());
  if (known == kind.end()) kind.push_back(table.written());
  return static_cast<std::size_t>(std::ranges::find(kind, table.written()) - kind.begin()) + 1;
}

std::size_t SharedTables::texts(std::span<const std::string_view> texts) {
  LuaTable table;
  for (const std::string_view text : texts) table.addText(text);
  return numberOf(texts_, table);
}

std::size_t SharedTables::layout(std::span<const Field> layout) {
  LuaTable table;
  for (const Field& field : layout) table.add(luaField(field));
  return numberOf(layouts_, table);
}

std::size_t SharedTables::list(const EntryList& list) {
  LuaTable table;
  table.set("count", luaField(list.count)).setNumber("layout", static_cast<double>(layout(list.layout)));
  table.set("low_bits", luaNumber(list.lowBits));
  table.set("uncounted", luaNumber(static_cast<double>(list.uncounted)));
  table.set("start", luaNumber(static_cast<double>(list.start)));
  table.set("stride", luaNumber(static_cast<double>(list.stride)));
  if (list.bytesPerEntryBefore == 0) return numberOf(lists_, table);
  table.set("count_before", luaField(list.countBefore));
  table.set("bytes_before", luaNumber(static_cast<double>(list.bytesPerEntryBefore)));
  return numberOf(lists_, table);
}

std::string SharedTables::written() const {
  return definition("texts", texts_) + definition("layouts", layouts_) + definition("lists", lists_);
}

}  // namespace kelvasi
