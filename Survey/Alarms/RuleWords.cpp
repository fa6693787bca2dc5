// SPDX-License-Identifier: Apache-2.0
#include "Survey/Alarms/RuleWords.h"

#include <array>
#include <charconv>
#include <cmath>
#include <utility>

namespace kelvasi::survey {

namespace {

using namespace std::chrono_literals;

constexpr std::string_view letters = "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ_";
constexpr std::string_view digits = "0123456789";

constexpr std::array<std::pair<std::string_view, std::chrono::nanoseconds>, 4> units{
    {{"ms", 1ms}, {"s", 1s}, {"min", 1min}, {"h", 1h}}};

bool isOneOf(char character, std::string_view set) {
  return set.find(character) != std::string_view::npos;
}

// Digits with at most one sign and one point; the two points of a band are not part of it.
std::string_view numberAt(std::string_view text) {
  std::size_t end = !text.empty() && (text[0] == '-' || text[0] == '+') ? 1 : 0;
  bool hasPoint = false;
  for (; end < text.size(); ++end) {
    const bool isPoint = text[end] == '.' && !hasPoint && !text.substr(end).starts_with("..");
    if (!isPoint && !isOneOf(text[end], digits)) break;
    hasPoint = hasPoint || isPoint;
  }
  return text.substr(0, end);
}

std::string_view wordAt(std::string_view text) {
  if (text.empty()) return {};
  if (isOneOf(text[0], letters)) {
    const std::size_t end =
        text.find_first_not_of("abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ_0123456789");
    return text.substr(0, end);
  }
  for (const std::string_view sign : {"<=", ">=", "..", "<", ">"}) {
    if (text.starts_with(sign)) return text.substr(0, sign.size());
  }
  const std::string_view number = numberAt(text);
  return number.empty() ? text.substr(0, text.find(' ')) : number;
}

}  // namespace

std::string_view RuleWords::ahead() const {
  return wordAt(text_.substr(at_));
}

void RuleWords::advance() {
  at_ += ahead().size();
  skipBlanks();
}

bool RuleWords::take(std::string_view word) {
  if (ahead() != word || word.empty()) return false;
  advance();
  return true;
}

std::optional<double> RuleWords::number() {
  std::string_view word = ahead();
  if (word.starts_with('+')) word.remove_prefix(1);
  double value = 0;
  const auto [end, error] =
      std::from_chars(word.data(), word.data() + word.size(), value, std::chars_format::fixed);
  if (error != std::errc() || end != word.data() + word.size() || !std::isfinite(value)) return std::nullopt;
  advance();
  return value;
}

std::optional<std::chrono::nanoseconds> RuleWords::duration() {
  const std::size_t begin = at_;
  if (const auto count = number(); count && *count >= 0 && *count < 1e9) {
    for (const auto& [unit, length] : units) {
      if (take(unit))
        return std::chrono::nanoseconds(std::llround(*count * static_cast<double>(length.count())));
    }
  }
  at_ = begin;
  return std::nullopt;
}

void RuleWords::skipBlanks() {
  while (at_ < text_.size() && (text_[at_] == ' ' || text_[at_] == '\t')) ++at_;
}

}  // namespace kelvasi::survey
