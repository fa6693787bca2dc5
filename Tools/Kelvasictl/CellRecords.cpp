// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/CellRecords.h"

#include <algorithm>
#include <array>

#include "Radio/CellCarriers.h"
#include "Tools/Kelvasictl/RecordText.h"

namespace kelvasi {

namespace {

using survey::CellLevel;
using survey::SeenCell;

constexpr std::array roles{CellRole::serving, CellRole::active, CellRole::neighbour, CellRole::candidate};

constexpr std::array levelsOfTables{&quantity::rsrp,  &quantity::rsrq,    &quantity::rssi,
                                    &quantity::rscp,  &quantity::ecno,    &quantity::ecio,
                                    &quantity::rxlev, &quantity::rxPower, &quantity::carrierToInterference};

constexpr std::array columns{
    Column{.key = "cell", .width = 14},
    Column{.key = "bands", .width = 8},
    Column{.key = "mhz", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "network", .width = 20},
    Column{.key = "area", .width = 5, .isNumber = true},
    Column{.key = "cell_id", .width = 9, .isNumber = true},
    Column{.key = "sid"},
    Column{.key = "nid"},
    Column{.key = "roles", .width = 9},
    Column{.key = "first", .width = 8, .isTime = true},
    Column{.key = "last", .width = 8, .isTime = true},
    Column{.key = "messages"},
    Column{.key = "quantity", .width = 8},
    Column{.key = "unit", .width = 4},
    Column{.key = "count", .width = 6, .isNumber = true},
    Column{.key = "min", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "mean", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "max", .width = 6, .isNumber = true, .decimals = 1},
    Column{.key = "latest"},
    Column{.key = "latest_time"},
};

template <typename Number>
Json orNull(const std::optional<Number>& number) {
  return number ? Json(*number) : Json();
}

Json known(std::int64_t number) {
  return number == CellIdentity::unknown ? Json() : Json(number);
}

void addCarriers(Json& record, const CellIdentity& cell) {
  Json bands = Json::array();
  Json mhz = Json::array();
  for (const Carrier& carrier : carriersOf(cell)) {
    bands.push_back(carrier.band.name);
    mhz.push_back(carrier.downlink.megahertz());
  }
  record["bands"] = std::move(bands);
  record["mhz"] = std::move(mhz);
}

Json network(const survey::CellNames& names, const Operators& operators) {
  if (!names.mcc || !names.mnc) return {};
  const auto id = networkIdFromNumbers(*names.mcc, *names.mnc);
  return id ? Json(operators.describe(*id)) : Json();
}

Json rolesOf(const SeenCell& cell) {
  Json names = Json::array();
  for (const CellRole role : roles) {
    if (cell.roles.has(role)) names.push_back(nameOf(role));
  }
  return names;
}

void addLevel(Json& record, const CellLevel& level) {
  record["unit"] = level.quantity->unit;
  record["count"] = level.count;
  record["min"] = level.minimum;
  record["mean"] = level.mean;
  record["max"] = level.maximum;
  record["latest"] = level.last;
  record["latest_time"] = rfc3339(level.lastTime);
}

Json recordOf(const SeenCell& cell, const Operators& operators) {
  Json record;
  record["cell"] = textOf(cell.identity);
  record["rat"] = nameOf(cell.identity.family);
  record["channel"] = known(cell.identity.channel);
  record["code"] = known(cell.identity.code);
  addCarriers(record, cell.identity);
  record["network"] = network(cell.names, operators);
  record["area"] = orNull(cell.names.area);
  record["cell_id"] = orNull(cell.names.cellId);
  record["sid"] = orNull(cell.names.sid);
  record["nid"] = orNull(cell.names.nid);
  record["roles"] = rolesOf(cell);
  record["first"] = rfc3339(cell.first);
  record["last"] = rfc3339(cell.last);
  record["messages"] = cell.count;
  return record;
}

std::vector<const SeenCell*> inOrder(const survey::Cells& cells) {
  std::vector<const SeenCell*> order;
  for (const SeenCell& cell : cells.all()) order.push_back(&cell);
  std::ranges::sort(order, {}, [](const SeenCell* cell) { return std::pair(cell->first, cell->number); });
  return order;
}

bool isShown(const CellLevel& level, RecordOutput::Format format) {
  return format != RecordOutput::Format::table ||
         std::ranges::find(levelsOfTables, level.quantity) != levelsOfTables.end();
}

void printLevels(const SeenCell& cell, Json line, RecordOutput& output, RecordOutput::Format format) {
  // A table has room for one role: the one that says most.
  if (format == RecordOutput::Format::table && !line["roles"].empty()) line["roles"] = line["roles"].front();
  bool isFirst = true;
  for (const CellLevel& level : cell.levels()) {
    if (!isShown(level, format)) continue;
    if (!isFirst && format == RecordOutput::Format::table) line = Json::object();
    line["quantity"] = level.quantity->id;
    addLevel(line, level);
    output.print(line);
    isFirst = false;
  }
  if (isFirst) output.print(line);
}

}  // namespace

std::vector<Json> cellRecords(const survey::Cells& cells, const Operators& operators) {
  std::vector<Json> records;
  for (const SeenCell* cell : inOrder(cells)) {
    Json& record = records.emplace_back(recordOf(*cell, operators));
    record["levels"] = Json::object();
    for (const CellLevel& level : cell->levels())
      addLevel(record["levels"][std::string(level.quantity->id)], level);
  }
  return records;
}

void printCells(const survey::Cells& cells, const Operators& operators, RecordOutput::Format format,
                RecordOutput::Print print) {
  RecordOutput output(format, columns, std::move(print));
  output.begin();
  if (format == RecordOutput::Format::ndjson) {
    for (const Json& record : cellRecords(cells, operators)) output.print(record);
  } else {
    for (const SeenCell* cell : inOrder(cells))
      printLevels(*cell, recordOf(*cell, operators), output, format);
  }
}

}  // namespace kelvasi
