// SPDX-License-Identifier: Apache-2.0
#include "Survey/Alarms/AlarmRule.h"

#include <array>
#include <optional>

#include "Survey/Alarms/RuleWords.h"

namespace kelvasi::survey {

namespace {

constexpr std::string_view aDuration = "a duration such as 10s, 500ms, 5min or 1h";

// Thrown and caught in this file only.
class Parser {
 public:
  explicit Parser(std::string_view text) : words_(text) { rule_.text = text; }

  AlarmRule rule() {
    subject();
    while (!words_.isAtEnd()) option();
    if (rule_.kind == AlarmRule::Kind::absent && rule_.holdsFor.count() == 0)
      expected("\"for\" with a duration, after which no value is an alarm");
    return rule_;
  }

 private:
  void subject() {
    if (words_.take("event")) return event();
    rule_.quantity = quantityOf(words_.ahead());
    if (!rule_.quantity || !isMeasured(*rule_.quantity))
      expected("a measured quantity such as rsrp, rsrq, rscp, ecno or rssi, or \"event\"");
    words_.advance();
    condition();
  }

  static bool isMeasured(const Quantity& quantity) { return quantity.kind == QuantityKind::measurement; }

  void event() {
    const auto kind = eventKindOf(words_.ahead());
    if (!kind) expected("an event: " + eventNames());
    words_.advance();
    rule_.kind = AlarmRule::Kind::event;
    rule_.event = *kind;
  }

  static std::string eventNames() {
    std::string names;
    for (const std::string_view name : eventKindNames) {
      if (!names.empty()) names += name == eventKindNames.back() ? " or " : ", ";
      names += name;
    }
    return names;
  }

  void condition() {
    Band& band = rule_.band;
    if (words_.take("absent")) {
      rule_.kind = AlarmRule::Kind::absent;
    } else if (words_.take("<")) {
      band.least = value();
    } else if (words_.take(">")) {
      band.most = value();
    } else if (words_.take("<=")) {
      band = {.least = value(), .isOpen = true};
    } else if (words_.take(">=")) {
      band = {.most = value(), .isOpen = true};
    } else if (words_.take("leaves")) {
      leftBand();
    } else {
      expected("<, <=, >, >=, \"leaves\" or \"absent\"");
    }
  }

  void leftBand() {
    rule_.band.least = value();
    if (!words_.take("..")) expected("\"..\" and the upper end of the band");
    const std::size_t upper = words_.position();
    rule_.band.most = value();
    if (rule_.band.most <= rule_.band.least)
      throw AlarmRuleError{upper, "an upper end of the band above the lower one", {}};
  }

  void option() {
    const bool isEvent = rule_.kind == AlarmRule::Kind::event;
    const bool isBand = rule_.kind == AlarmRule::Kind::leavesBand;
    if (words_.take("every")) {
      rule_.atMostEvery = duration();
    } else if (!isEvent && words_.take("for")) {
      rule_.holdsFor = duration();
    } else if (isBand && words_.take("hysteresis")) {
      rule_.hysteresis = hysteresis();
    } else if (isBand) {
      expected("\"for\", \"hysteresis\", \"every\" or the end");
    } else {
      expected(isEvent ? "\"every\" or the end" : "\"for\", \"every\" or the end");
    }
  }

  double hysteresis() {
    const std::size_t begin = words_.position();
    const double margin = value();
    if (margin < 0) throw AlarmRuleError{begin, "a hysteresis of 0 or more", {}};
    if (2 * margin > rule_.band.most - rule_.band.least)
      throw AlarmRuleError{begin, "a hysteresis of at most half the band", {}};
    return margin;
  }

  // A number; the quantity's unit may follow.
  double value() {
    const auto number = words_.number();
    if (!number) expected("a number");
    words_.take(rule_.quantity->unit);
    return *number;
  }

  std::chrono::nanoseconds duration() {
    const auto length = words_.duration();
    if (!length) expected(aDuration);
    return *length;
  }

  [[noreturn]] void expected(std::string_view what) const {
    throw AlarmRuleError{words_.position(), std::string(what), std::string(words_.ahead())};
  }

  RuleWords words_;
  AlarmRule rule_;
};

}  // namespace

std::string AlarmRuleError::text() const {
  std::string result = "at " + std::to_string(position + 1) + ": expected " + expected;
  if (!found.empty()) result += ", found \"" + found + "\"";
  return result;
}

std::variant<AlarmRule, AlarmRuleError> parseAlarmRule(std::string_view text) {
  try {
    return Parser(text).rule();
  } catch (const AlarmRuleError& error) {
    return error;
  }
}

}  // namespace kelvasi::survey
