// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Cells/CellLooks.h"

#include <algorithm>
#include <map>
#include <utility>

#include "Cockpit/Levels/LevelLooks.h"
#include "Cockpit/Serving/CellWords.h"

namespace kelvasi::cockpit {

namespace {

using survey::SeenCell;
using Channel = std::pair<RadioFamily, std::int64_t>;

// When the cells of a channel were listed last.
using Lists = std::map<Channel, Arrival>;

constexpr int gone = 100;  // what is gone stands below all that is not

Channel channelOf(const SeenCell& cell) {
  return {cell.identity.family, cell.identity.channel};
}

bool serves(const ServingCells& serving, const SeenCell& cell) {
  return (serving.first && cell.number == serving.first->number) ||
         (serving.second && cell.number == serving.second->number);
}

const SeenCell* servingOf(const ServingCells& serving, RadioFamily family) {
  for (const SeenCell* cell : {serving.first, serving.second}) {
    if (cell && cell->identity.family == family) return cell;
  }
  return nullptr;
}

Lists listsOf(const survey::Cells& cells) {
  Lists lists;
  for (const SeenCell& cell : cells.all()) {
    if (cell.role == CellRole::none || cell.role == CellRole::serving) continue;
    Arrival& last = lists[channelOf(cell)];
    last = std::max(last, cell.last);
  }
  return lists;
}

// Newer lists came without it.
bool isGone(const SeenCell& cell, const Lists& lists, Arrival now) {
  const auto age = timeSince(cell.last, now);
  if (age >= goneAge) return true;
  const auto list = lists.find(channelOf(cell));
  return age >= fadedAge && list != lists.end() && list->second - cell.last > liveAge;
}

std::optional<LevelKind> mainLevel(RadioFamily family) {
  const auto kinds = levelsOf(family);
  return kinds.empty() ? std::nullopt : std::optional(kinds.front());
}

int groupOf(const ServingCells& serving, RadioFamily family) {
  if (serving.first && serving.first->identity.family == family) return 0;
  return serving.second && serving.second->identity.family == family ? 1 : 2 + static_cast<int>(family);
}

std::vector<CellOrder::Candidate> candidatesOf(const View& view, const ServingCells& serving,
                                               const Lists& lists, Arrival now) {
  std::vector<CellOrder::Candidate> candidates;
  for (const SeenCell& cell : view.survey.cells().all()) {
    const auto kind = mainLevel(cell.identity.family);
    if (!kind || serves(serving, cell) || timeSince(cell.last, now) >= forgottenAge) continue;
    const auto level = latest(view, cell, *kind);
    // A cell that is spoken of without its level is no newer for it.
    if (!level || timeSince(level->time, now) >= forgottenAge) continue;
    const bool isOut = isGone(cell, lists, now) || timeSince(level->time, now) >= goneAge;
    const int group = groupOf(serving, cell.identity.family) + (isOut ? gone : 0);
    candidates.push_back({cell.number, group, level->value});
  }
  return candidates;
}

// Many more than a screen has room for need no order among themselves.
void keepBest(std::vector<CellOrder::Candidate>& candidates, std::size_t most) {
  if (candidates.size() <= most) return;
  std::ranges::sort(candidates, [](const auto& one, const auto& other) {
    return one.group != other.group ? one.group < other.group : one.level > other.level;
  });
  candidates.resize(most);
}

CellLine lineOf(const View& view, const SeenCell& cell, const ServingCells& serving, bool isGone,
                Arrival now) {
  const RadioFamily family = cell.identity.family;
  CellLine line;
  line.number = cell.number;
  line.identity = cell.identity;
  line.technology = technologyWord(family);
  line.name = cellName(cell.identity);
  if (cell.identity.channel != CellIdentity::unknown) line.channel = std::to_string(cell.identity.channel);
  line.bands = carrierWords(cell.identity, view.notes.bandClass(cell.identity.channel)).bands;
  line.role = cell.role;
  line.age = ageOf(cell.last, now, isGone);
  const auto kind = mainLevel(family);
  if (!kind) return line;
  line.level = levelOf(view, cell, *kind, now);
  const SeenCell* base = servingOf(serving, family);
  const auto beside = base ? latest(view, *base, *kind) : std::nullopt;
  // A cell may be spoken of without its level, which is no level of now for that.
  if (line.level.value && line.level.age.time > line.age.time && !isGone) line.age = line.level.age;
  // Against a level of another time there is no difference to speak of.
  const auto isTooOld = [](std::chrono::nanoseconds age) { return fadeOf(age) == Fade::gone; };
  if (!line.level.value || !beside || isGone || isTooOld(line.level.age.time) ||
      isTooOld(timeSince(beside->time, now)))
    return line;
  line.difference = *line.level.value - beside->value;
  line.differenceText = differenceText(*line.difference, 0, view.style);
  return line;
}

void take(CarrierLine& carrier, const View& view, const SeenCell& cell, bool isServing, Arrival now) {
  ++carrier.cells;
  carrier.isServing |= isServing;
  const auto kind = mainLevel(cell.identity.family);
  if (!kind) return;
  Level level = levelOf(view, cell, *kind, now, false);
  if (!level.value || (carrier.best.value && *carrier.best.value >= *level.value)) return;
  carrier.best = std::move(level);
  carrier.bestName = cellName(cell.identity);
}

CarrierLine carrierOf(const View& view, const CellIdentity& cell) {
  const CarrierWords words = carrierWords(cell, view.notes.bandClass(cell.channel));
  CarrierLine carrier;
  carrier.family = cell.family;
  carrier.channel = cell.channel;
  carrier.technology = technologyWord(cell.family);
  carrier.channelText = std::to_string(cell.channel);
  carrier.bands = words.bands;
  carrier.frequency = words.frequency;
  return carrier;
}

}  // namespace

std::vector<CellLine> cellLines(const View& view, const ServingCells& serving, CellOrder& order,
                                std::size_t most, Arrival now) {
  const Lists lists = listsOf(view.survey.cells());
  auto candidates = candidatesOf(view, serving, lists, now);
  keepBest(candidates, most);
  std::vector<CellLine> lines;
  for (const std::uint32_t number : order.arrange(candidates, now)) {
    const SeenCell* cell = view.survey.cells().find(number);
    if (cell && lines.size() < most)
      lines.push_back(lineOf(view, *cell, serving, isGone(*cell, lists, now), now));
  }
  return lines;
}

// The serving cells' first, then in the order of families and channels, which never jumps.
std::vector<CarrierLine> carrierLines(const View& view, const ServingCells& serving, Arrival now) {
  const Lists lists = listsOf(view.survey.cells());
  std::map<Channel, CarrierLine> carriers;
  for (const SeenCell& cell : view.survey.cells().all()) {
    if (cell.identity.channel == CellIdentity::unknown || isGone(cell, lists, now)) continue;
    const auto place = carriers.try_emplace(channelOf(cell), CarrierLine()).first;
    if (place->second.cells == 0) place->second = carrierOf(view, cell.identity);
    take(place->second, view, cell, serves(serving, cell), now);
  }
  std::vector<CarrierLine> lines;
  for (auto& [channel, carrier] : carriers) lines.push_back(std::move(carrier));
  std::stable_partition(lines.begin(), lines.end(), [](const CarrierLine& line) { return line.isServing; });
  return lines;
}

}  // namespace kelvasi::cockpit
