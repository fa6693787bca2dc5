// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/ReadingPrinter.h"

#include <utility>

#include "Telvon/TechnologyName.h"

namespace kelvasi {

namespace {

constexpr std::size_t mostWaiting = std::size_t{1} << 16;

}  // namespace

void ReadingWish::addTo(OptionSet verb) {
  verb.add("--format", format, "ndjson (the default) or csv").type("FORMAT").oneOf({"ndjson", "csv"});
  choice.addTo(verb);
  verb.addFlag("--changes", onlyChanges, "no line for a row that is written again as it stands");
}

ReadingPrinter::ReadingPrinter(const ReadingWish& wish, Print print)
    : wish_(wish), print_(std::move(print)), lines_(wish.lines()) {}

void ReadingPrinter::setTechnology(std::string_view technology) {
  technology_ = shortTechnologyName(technology);
}

void ReadingPrinter::take(const Readings& message) {
  if (message.all().empty() || !wish_.choice.takesMessageAt(message.arrival())) return;
  lines_.startMessage(message, technology_);
  if (wish_.onlyChanges) {
    takeChanges(message);
  } else {
    for (const Reading& reading : message.all()) takeOne(reading);
  }
  if (waiting_.size() >= mostWaiting) flush();
}

void ReadingPrinter::flush() {
  if (!waiting_.empty()) print_(waiting_);
  waiting_.clear();
}

void ReadingPrinter::takeOne(const Reading& reading) {
  path_.clear();
  appendPath(path_, reading);
  if (wish_.choice.takes(reading, path_)) lines_.append(waiting_, reading, path_, textOf(reading));
}

void ReadingPrinter::takeChanges(const Readings& message) {
  std::vector<ReadingText> wanted;
  for (const Reading& reading : message.all()) {
    std::string path = pathOf(reading);
    if (wish_.choice.takes(reading, path)) wanted.push_back({&reading, std::move(path), textOf(reading)});
  }
  for (const ReadingText& change : changes_.of(std::move(wanted)))
    lines_.append(waiting_, *change.reading, change.path, change.text);
}

}  // namespace kelvasi
