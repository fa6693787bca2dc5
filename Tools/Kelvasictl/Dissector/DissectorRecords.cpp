// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Dissector/DissectorRecords.h"

#include <algorithm>

#include "Tools/Kelvasictl/Dissector/DissectorRow.h"
#include "Tools/Kelvasictl/LogCodeText.h"

namespace kelvasi {

namespace {

void addOnce(std::vector<std::size_t>& numbers, std::size_t number) {
  if (number != 0 && std::ranges::find(numbers, number) == numbers.end()) numbers.push_back(number);
}

std::string written(std::span<const std::size_t> numbers) {
  LuaTable table;
  for (const std::size_t number : numbers) table.addNumber(static_cast<double>(number));
  return table.written();
}

bool isOfBaseband(const CatalogRow& row) {
  return row.part.logCode != 0 && row.part.logCode < extraLogCodes;
}

bool isSamePlace(const RecordPart& one, const RecordPart& other) {
  return one.layout.data() == other.layout.data() && one.entries == other.entries && one.of == other.of &&
         one.digits == other.digits;
}

}  // namespace

void DissectorRecords::add(const std::string& technology, const RowCatalog& catalog) {
  for (const RecordPart& part : catalog.parts()) addFields(technology, part);
  for (const CatalogRow& row : catalog.rows()) {
    if (isOfBaseband(row)) addRow(row);
  }
}

void DissectorRecords::addFields(const std::string& technology, const RecordPart& part) {
  if (part.logCode == 0 || part.logCode >= extraLogCodes) return;
  Record& record = records_[part.logCode];
  record.technology = technology;
  if (part.entries) return addOnce(record.lists, shared_.list(*part.entries));
  const std::size_t layout = shared_.layout(part.layout);
  if (part.of.empty()) return addOnce(record.heads, layout);
  if (layout != 0) record.others.emplace(part.of, layout);
}

void DissectorRecords::addRow(const CatalogRow& row) {
  Record& record = records_[row.logCode];
  auto section = std::ranges::find(record.sections, row.section, &Section::name);
  if (section == record.sections.end())
    section = record.sections.insert(section, Section{.name = row.section, .parts = {}});
  std::vector<Part>& parts = section->parts;
  if (parts.empty() || parts.back().list != row.list || !isSamePlace(parts.back().from, row.part))
    parts.push_back({.from = row.part, .list = row.list, .rows = {}});
  parts.back().rows.add(dissectorRow(row.key, *row.row, row.field.has_value(), shared_).written());
}

std::string DissectorRecords::written(const Part& part) const {
  LuaTable table;
  table.setText("of", part.from.of).setText("list", part.list);
  table.setNumber("layout", static_cast<double>(shared_.layout(part.from.layout)));
  if (part.from.entries) table.setNumber("entries", static_cast<double>(shared_.list(*part.from.entries)));
  table.setNumber("minimum", static_cast<double>(part.from.minimumLength));
  return table.set("rows", part.rows.written()).written();
}

std::string DissectorRecords::written(const Record& record) const {
  std::string text = "{\n    technology = " + luaString(record.technology) +
                     ", heads = " + kelvasi::written(record.heads) +
                     ", lists = " + kelvasi::written(record.lists);
  LuaTable others;
  for (const auto& [of, layout] : record.others) others.setNumber(of, static_cast<double>(layout));
  text += ", others = " + others.written() + ",\n    sections = {\n";
  for (const Section& section : record.sections) {
    text += "      {name = " + luaString(section.name) + ", parts = {\n";
    for (const Part& part : section.parts) text += "        " + written(part) + ",\n";
    text += "      }},\n";
  }
  return text + "    },\n  }";
}

std::string DissectorRecords::written() const {
  std::string text = "tables.records = {\n";
  for (const auto& [code, record] : records_)
    text += "  [" + logCodeText(code) + "] = " + written(record) + ",\n";
  return text + "}\n";
}

}  // namespace kelvasi
