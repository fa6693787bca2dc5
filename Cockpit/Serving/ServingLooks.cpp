// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Serving/ServingLooks.h"

#include <utility>

#include "Cockpit/Levels/LevelLooks.h"
#include "Cockpit/Serving/CellWords.h"
#include "Radio/NetworkId.h"

namespace kelvasi::cockpit {

namespace {

using survey::CellNames;
using survey::SeenCell;

bool isCdma(RadioFamily family) {
  return family == RadioFamily::cdma || family == RadioFamily::evdo;
}

void addNetwork(ServingCell& serving, const CellNames& names, const View& view) {
  serving.network = notReported;
  if (isCdma(serving.identity.family)) {
    if (!names.sid) return;
    serving.networkNumber = "SID " + std::to_string(*names.sid);
    serving.network = serving.networkNumber;
    return;
  }
  if (!names.mcc || !names.mnc) return;
  const auto id = networkIdFromNumbers(*names.mcc, *names.mnc);
  if (!id) return;
  const auto known = view.operators.find(*id);
  serving.networkNumber = textOf(*id);
  serving.networkName = known.name;
  serving.country = known.country;
  serving.network = view.operators.describe(*id);
}

void addArea(ServingCell& serving, const CellNames& names, const View& view) {
  const RadioFamily family = serving.identity.family;
  if (isCdma(family)) {
    if (names.nid) serving.area.push_back({"NID", std::to_string(*names.nid)});
    return;
  }
  const char* word = family == RadioFamily::lte ? "TAC" : "LAC";
  serving.area.push_back({word, names.area ? std::to_string(*names.area) : std::string(notReported)});
  if (!names.area || family == RadioFamily::lte) return;
  if (const auto routing = view.notes.routingArea(*names.area))
    serving.area.push_back({"RAC", std::to_string(*routing)});
}

// The upper bits name what the cell belongs to: 20 bits an eNB (3GPP TS 36.413, 9.2.1.37), 12 an RNC (3GPP
// TS 25.401, 6.1.5); where the RNC did not tell itself, 16 bits are all.
void addIds(ServingCell& serving, const CellNames& names) {
  const RadioFamily family = serving.identity.family;
  if (!names.cellId) {
    if (!isCdma(family)) serving.ids.push_back({"Cell", std::string(notReported)});
    return;
  }
  const auto id = *names.cellId;
  const auto split = [&](const char* word, int bits) {
    const auto lower = std::int64_t{1} << bits;
    serving.ids.push_back({word, std::to_string(id / lower) + "/" + std::to_string(id % lower)});
  };
  if (family == RadioFamily::lte) split("eNB", 8);
  if ((family == RadioFamily::umts || family == RadioFamily::utraTdd) && id > 0xFFFF) split("RNC", 16);
  serving.ids.push_back({isCdma(family) ? "Base" : "Cell", std::to_string(id)});
}

void addCarrier(ServingCell& serving, const View& view) {
  const CellIdentity& cell = serving.identity;
  const CarrierWords words = carrierWords(cell, view.notes.bandClass(cell.channel));
  serving.bands = words.bands;
  serving.frequency = words.frequency;
  const auto text = [](std::int64_t number) {
    return number == CellIdentity::unknown ? std::string(notReported) : std::to_string(number);
  };
  serving.channel = {std::string(channelWord(cell.family)), text(cell.channel)};
  serving.code = {std::string(codeWord(cell.family)), text(cell.code)};
}

void append(std::string& text, const std::string& more, std::string_view between) {
  if (more.empty()) return;
  if (!text.empty()) text += between;
  text += more;
}

std::string titleOf(const ServingCell& serving) {
  std::string title = serving.technology;
  if (serving.networkNumber.empty()) return title + ", operator not reported";
  append(title, serving.network, " ");
  return title;
}

std::string subtitleOf(const ServingCell& serving) {
  std::string text = serving.bands;
  append(text, serving.frequency, " ");
  append(text, serving.code.name + " " + serving.code.value, "  ");
  for (const NamedValue& each : serving.area) append(text, each.name + " " + each.value, "  ");
  if (!serving.ids.empty()) append(text, serving.ids.front().name + " " + serving.ids.front().value, "  ");
  return text;
}

}  // namespace

ServingCells servingCells(const survey::Cells& cells, Arrival now) {
  const SeenCell* last = cells.serving();
  if (!last || !isCdma(last->identity.family)) return {last, nullptr};
  const auto fresh = [&](RadioFamily family) -> const SeenCell* {
    const SeenCell* cell = cells.serving(family);
    return cell && fadeOf(timeSince(cell->last, now)) != Fade::gone ? cell : nullptr;
  };
  const ServingCells both{fresh(RadioFamily::cdma), fresh(RadioFamily::evdo)};
  if (both.first) return both;
  return {both.second ? both.second : last, nullptr};
}

ServingCell servingCellOf(const View& view, const SeenCell& cell, Arrival now) {
  ServingCell serving;
  serving.isKnown = true;
  serving.number = cell.number;
  serving.identity = cell.identity;
  serving.technology = technologyWord(cell.identity.family);
  addNetwork(serving, cell.names, view);
  addCarrier(serving, view);
  addArea(serving, cell.names, view);
  addIds(serving, cell.names);
  serving.title = titleOf(serving);
  serving.subtitle = subtitleOf(serving);
  for (const LevelKind kind : levelsOf(cell.identity.family))
    serving.levels.push_back(levelOf(view, cell, kind, now));
  serving.age = ageOf(cell.last, now);
  return serving;
}

ServingCell noServingCell(std::string why) {
  ServingCell serving;
  serving.title = why;
  serving.why = std::move(why);
  serving.age.fade = Fade::gone;
  return serving;
}

}  // namespace kelvasi::cockpit
