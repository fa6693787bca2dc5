// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Levels/Thresholds.h"

#include <algorithm>
#include <charconv>
#include <functional>
#include <vector>

#include "Cockpit/Words/TextStyle.h"

namespace kelvasi::cockpit {

namespace {

struct Habit {
  LevelKind kind;
  Thresholds::Steps steps;
};
constexpr std::array habits{
    Habit{LevelKind::rsrp, {-80, -90, -100, -110}},   Habit{LevelKind::rsrq, {-8, -11, -14, -17}},
    Habit{LevelKind::sinr, {20, 13, 5, 0}},           Habit{LevelKind::rscp, {-75, -85, -95, -105}},
    Habit{LevelKind::ecno, {-6, -9, -12, -15}},       Habit{LevelKind::ecio, {-6, -9, -12, -15}},
    Habit{LevelKind::gsmLevel, {-65, -75, -85, -95}},
};

std::vector<std::string_view> wordsIn(std::string_view line) {
  std::vector<std::string_view> words;
  constexpr std::string_view blanks = " \t\r";
  while ((line.remove_prefix(std::min(line.find_first_not_of(blanks), line.size())), !line.empty())) {
    words.push_back(line.substr(0, line.find_first_of(blanks)));
    line.remove_prefix(words.back().size());
  }
  return words;
}

std::optional<double> numberIn(std::string_view word) {
  double number = 0;
  const auto [end, error] = std::from_chars(word.data(), word.data() + word.size(), number);
  if (error != std::errc() || end != word.data() + word.size() || !(number > -1000 && number < 1000))
    return std::nullopt;
  return number;
}

}  // namespace

std::string_view wordOf(Verdict verdict) {
  constexpr std::array<std::string_view, 6> words{"", "excellent", "good", "fair", "poor", "very poor"};
  return words[static_cast<std::size_t>(verdict)];
}

Thresholds::Thresholds() {
  for (const Habit& habit : habits) steps_[static_cast<std::size_t>(habit.kind)] = habit.steps;
}

Verdict Thresholds::verdict(LevelKind kind, double level) const {
  const auto& steps = of(kind);
  if (!steps) return Verdict::none;
  const auto reached = std::ranges::find_if(*steps, [&](double least) { return level >= least; });
  return static_cast<Verdict>(1 + (reached - steps->begin()));
}

std::string Thresholds::change(std::string_view line) {
  const auto words = wordsIn(line);
  if (words.empty() || words.front().starts_with('#')) return {};
  const auto kind = levelKindOf(words.front());
  if (!kind) return "\"" + std::string(words.front()) + "\" is no level with thresholds";
  if (words.size() != 5) return "expected four numbers: excellent, good, fair and poor";
  Steps steps{};
  for (std::size_t at = 0; at < steps.size(); ++at) {
    const auto number = numberIn(words[at + 1]);
    if (!number) return "\"" + std::string(words[at + 1]) + "\" is no number";
    steps[at] = *number;
  }
  if (std::ranges::adjacent_find(steps, std::less_equal()) != steps.end())
    return "each number has to be less than the one before it";
  steps_[static_cast<std::size_t>(*kind)] = steps;
  return {};
}

std::string Thresholds::text() const {
  std::string text;
  for (std::size_t kind = 0; kind < levelKinds; ++kind) {
    if (!steps_[kind]) continue;
    text += definitionOf(static_cast<LevelKind>(kind)).id;
    for (const double step : *steps_[kind]) text += " " + shortNumberText(step, 3);
    text += '\n';
  }
  return text;
}

}  // namespace kelvasi::cockpit
