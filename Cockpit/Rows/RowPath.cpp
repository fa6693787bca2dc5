// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/RowPath.h"

#include <algorithm>

#include "LogGenerator/SortPrefix.h"

namespace kelvasi::cockpit {

namespace {

bool isDigit(char character) {
  return character >= '0' && character <= '9';
}

bool isPlace(std::string_view step) {
  return !step.empty() && std::ranges::all_of(step, isDigit);
}

std::string unescaped(std::string_view step) {
  std::string text;
  for (std::size_t at = 0; at < step.size(); ++at) {
    const bool isEscape =
        step[at] == '~' && at + 1 < step.size() && (step[at + 1] == '0' || step[at + 1] == '1');
    text += isEscape ? (step[++at] == '1' ? '/' : '~') : step[at];
  }
  return text;
}

// "2;UMTS" orders its section; "12" before a semicolon only, not any text with one.
std::string_view shownName(std::string_view step) {
  const auto end = step.find(';');
  return end != std::string_view::npos && isPlace(step.substr(0, end)) ? withoutSortPrefix(step) : step;
}

template <typename Take>
void forEachStep(std::string_view path, Take&& take) {
  while (!path.empty()) {
    path.remove_prefix(1);
    const auto end = std::min(path.find('/'), path.size());
    take(path.substr(0, end));
    path.remove_prefix(end);
  }
}

}  // namespace

std::vector<std::string> stepsOf(std::string_view path) {
  std::vector<std::string> steps;
  forEachStep(path, [&](std::string_view step) { steps.push_back(unescaped(step)); });
  return steps;
}

// A node's path has no doubled separators, whatever the names in it.
std::string nodePathOf(std::string_view path) {
  std::string node = "/";
  const auto append = [&](char character) {
    if (character != '/' || node.back() != '/') node += character;
  };
  for (const std::string& step : stepsOf(path)) {
    append('/');
    for (const char character : shownName(step)) append(character);
  }
  if (node.size() > 1 && node.back() == '/') node.pop_back();
  return node;
}

std::string rowNameOf(std::string_view path) {
  const auto steps = stepsOf(path);
  if (steps.empty()) return {};
  // An entry of a list of numbers is called by the list.
  if (isPlace(steps.back()) && steps.size() > 1) return steps[steps.size() - 2] + " " + steps.back();
  return std::string(shownName(steps.back()));
}

std::string placeTextOf(std::string_view path) {
  auto steps = stepsOf(path);
  std::string text;
  if (!steps.empty()) steps.pop_back();
  for (const std::string& step : steps) {
    if (isPlace(step)) continue;
    if (!text.empty()) text += ", ";
    text += shownName(step);
  }
  return text;
}

std::string shapeOf(std::string_view path) {
  std::string shape;
  forEachStep(path, [&](std::string_view step) {
    shape += '/';
    shape += isPlace(step) ? std::string_view("*") : step;
  });
  return shape;
}

}  // namespace kelvasi::cockpit
