// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Events/EventLine.h"

#include <array>

#include "Cockpit/Serving/CellWords.h"

namespace kelvasi::cockpit {

namespace {

using survey::Event;
using survey::EventKind;

std::string cellChangeWords(const Event& event) {
  const auto from = cellFromText(event.from);
  const auto to = cellFromText(event.to);
  if (!from || !to) return event.text();
  if (from->family != to->family) return "cell change " + fullCellName(*from) + " to " + fullCellName(*to);
  const bool areNamed = from->code != CellIdentity::unknown && to->code != CellIdentity::unknown;
  if (from->channel != to->channel || !areNamed) {
    const auto shortly = [](const CellIdentity& cell) {
      return fullCellName(cell).substr(technologyWord(cell.family).size() + 1);
    };
    return "cell change " + shortly(*from) + " to " + shortly(*to);
  }
  return "cell change " + cellName(*from) + " to " + std::to_string(to->code);
}

std::string ratChangeWords(const Event& event) {
  const auto word = [](const std::string& name) {
    const auto cell = cellFromText(name + ":?");
    return cell ? std::string(technologyWord(cell->family)) : name;
  };
  return "RAT change " + word(event.from) + " to " + word(event.to);
}

}  // namespace

std::string wordsOf(const Event& event) {
  if (event.kind == EventKind::cellChange) return cellChangeWords(event);
  if (event.kind == EventKind::ratChange) return ratChangeWords(event);
  const auto cell = cellFromText(event.reason);
  if (event.kind == EventKind::serviceBack && cell) return "service back: " + fullCellName(*cell);
  return event.text();
}

EventLine eventLineOf(const Event& event, std::uint64_t number, const TextStyle& style) {
  EventLine line;
  line.number = number;
  line.time = event.time;
  line.timeText = clockText(event.time, style);
  line.words = wordsOf(event);
  line.kind = event.kind;
  line.cell = event.cell;
  return line;
}

}  // namespace kelvasi::cockpit
