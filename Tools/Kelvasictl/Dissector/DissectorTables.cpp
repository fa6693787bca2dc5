// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/Dissector/DissectorTables.h"

#include <algorithm>

#include "LogGenerator/Daemon/CellRows.h"
#include "Radio/Quantity.h"
#include "Telvon/CellMonitor.h"
#include "Tools/Kelvasictl/Dissector/DissectorConstants.h"
#include "Tools/Kelvasictl/Dissector/DissectorRecords.h"
#include "Tools/Kelvasictl/Dissector/DissectorRow.h"

namespace kelvasi {

namespace {

// "lte" of Orvane_LTE: what stands in the names of filters.
std::string filterName(std::string_view technology) {
  std::string name(technology.substr(technology.rfind('_') + 1));
  std::ranges::transform(name, name.begin(), [](char each) {
    return each >= 'A' && each <= 'Z' ? static_cast<char>(each - 'A' + 'a') : each;
  });
  return name;
}

std::string definition(std::string_view name, std::span<const std::string> elements) {
  std::string text = "tables." + std::string(name) + " = {\n";
  for (const std::string& element : elements) text += "  " + element + ",\n";
  return text + "}\n";
}

std::string quantities() {
  std::vector<std::string> written;
  for (const Quantity* quantity : quantity::all) {
    LuaTable table;
    table.setText("id", quantity->id).setText("unit", quantity->unit).setText("kind", nameOf(quantity->kind));
    written.push_back(table.setText("source", quantity->source).written());
  }
  return definition("quantities", written);
}

std::string cellRow(const CatalogRow& row, SharedTables& shared) {
  return dissectorRow(row.key, *row.row, false, shared).setText("source", row.source).written();
}

// Which cells of the daemon's list a section shows.
struct CellSection {
  std::string technology;
  std::string section;
  const CellTable* cells;
  LuaTable rows;
};

std::string written(const CellSection& section) {
  LuaTable radios;
  for (const std::string_view radio : section.cells->technologies) radios.addText(radio);
  LuaTable table;
  table.setText("technology", section.technology).setText("section", section.section);
  table.set("radios", radios.written()).setText("type", section.cells->type);
  return table.setFlag("serving", section.cells->type == kTelvonCellMonitorCellTypeServing)
      .set("rows", section.rows.written())
      .written();
}

std::string cells(std::span<const TechnologyFields> technologies, SharedTables& shared) {
  std::vector<CellSection> sections;
  for (const auto& [technology, catalog] : technologies) {
    for (const CatalogRow& row : catalog.rows()) {
      if (!row.cells) continue;
      if (sections.empty() || sections.back().cells != row.cells)
        sections.push_back({filterName(technology), row.section, row.cells, {}});
      sections.back().rows.add(cellRow(row, shared));
    }
  }
  std::vector<std::string> lines;
  for (const CellSection& section : sections) lines.push_back(written(section));
  return definition("cells", lines);
}

std::string rowsOfCode(std::string_view name, const RowCatalog& catalog, LogCode code, SharedTables& shared) {
  std::vector<std::string> lines;
  for (const CatalogRow& row : catalog.rows()) {
    if (row.logCode == code) lines.push_back(cellRow(row, shared));
  }
  return definition(name, lines);
}

// Of the first technology that has such rows; they are the same in all.
std::string rowsOfCode(std::string_view name, std::span<const TechnologyFields> technologies, LogCode code,
                       SharedTables& shared) {
  const auto has = [&](const TechnologyFields& fields) {
    return std::ranges::any_of(fields.catalog.rows(),
                               [&](const CatalogRow& row) { return row.logCode == code; });
  };
  const auto first = std::ranges::find_if(technologies, has);
  return rowsOfCode(name, first == technologies.end() ? RowCatalog() : first->catalog, code, shared);
}

}  // namespace

std::string dissectorTables(std::span<const TechnologyFields> technologies) {
  SharedTables shared;
  DissectorRecords records(shared);
  for (const auto& [technology, catalog] : technologies) records.add(filterName(technology), catalog);
  const std::string own = cells(technologies, shared) +
                          rowsOfCode("sim_files", technologies, simFilesLogCode, shared) +
                          rowsOfCode("names", technologies, 0, shared);
  const std::string written = records.written();
  return "local tables = {}\nlocal function log10(number) return math.log(number, 10) end\n" + quantities() +
         shared.written() + written + own + dissectorConstants();
}

}  // namespace kelvasi
