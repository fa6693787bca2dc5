// SPDX-License-Identifier: Apache-2.0
#include "Survey/Alarms/AlarmWatch.h"

#include <algorithm>
#include <utility>

namespace kelvasi::survey {

namespace {

using Time = std::chrono::nanoseconds;
using Kind = AlarmRule::Kind;

// Also where the clock has stepped back.
bool isUnbroken(std::optional<Time> last, Time time, Time longest) {
  return last && time >= *last && time - *last <= longest;
}

}  // namespace

AlarmWatch::AlarmWatch(std::vector<AlarmRule> rules, Give give) : give_(std::move(give)) {
  watched_.resize(rules.size());
  for (std::size_t place = 0; place < rules.size(); ++place) watched_[place].rule = std::move(rules[place]);
}

void AlarmWatch::change(std::vector<AlarmRule> rules) {
  std::vector<Watched> watched(rules.size());
  for (std::size_t place = 0; place < rules.size(); ++place) {
    const auto same =
        std::ranges::find(watched_, rules[place].text, [](const Watched& each) { return each.rule.text; });
    if (same != watched_.end()) watched[place] = *same;
    watched[place].rule = std::move(rules[place]);
  }
  watched_ = std::move(watched);
}

void AlarmWatch::value(const Quantity& quantity, Time time, double value, const CellIdentity& cell) {
  for (Watched& watched : watched_) {
    if (watched.rule.kind == Kind::event || watched.rule.quantity != &quantity) continue;
    if (watched.rule.kind == Kind::absent) {
      lookForAbsence(watched, time);  // the absence that this value ends
      watched.isRaised = false;
    }
    watched.cell = cell;
    if (watched.rule.kind == Kind::leavesBand) look(watched, time, value);
    watched.lastValue = time;
  }
}

void AlarmWatch::event(EventKind kind, Time time, std::string_view text, const CellIdentity& cell) {
  for (Watched& watched : watched_) {
    if (watched.rule.kind != Kind::event || watched.rule.event != kind) continue;
    raise(watched,
          {.rule = watched.rule, .time = time, .since = time, .value = {}, .cell = cell, .event = text});
  }
}

void AlarmWatch::pass(Time time) {
  for (Watched& watched : watched_) {
    if (watched.rule.kind == Kind::absent) lookForAbsence(watched, time);
  }
}

void AlarmWatch::look(Watched& watched, Time time, double value) {
  const AlarmRule& rule = watched.rule;
  const Band inOrder = watched.isRaised ? rule.band.narrowedBy(rule.hysteresis) : rule.band;
  if (inOrder.holds(value)) {
    watched.isRaised = false;
    watched.begin.reset();
    return;
  }
  if (watched.isRaised) return;
  const Time longest = std::max<Time>(longestGap, rule.holdsFor / 2);
  if (!watched.begin || !isUnbroken(watched.lastValue, time, longest)) watched.begin = time;
  if (time - *watched.begin < rule.holdsFor) return;
  watched.isRaised = true;
  raise(watched, {.rule = rule,
                  .time = time,
                  .since = *watched.begin,
                  .value = value,
                  .cell = watched.cell,
                  .event = {}});
}

void AlarmWatch::lookForAbsence(Watched& watched, Time time) {
  if (!watched.lastValue || time < *watched.lastValue) watched.lastValue = time;
  if (watched.isRaised || time - *watched.lastValue < watched.rule.holdsFor) return;
  watched.isRaised = true;
  raise(watched, {.rule = watched.rule,
                  .time = time,
                  .since = *watched.lastValue,
                  .value = {},
                  .cell = watched.cell,
                  .event = {}});
}

void AlarmWatch::raise(Watched& watched, Alarm alarm) {
  if (watched.rule.atMostEvery.count() > 0 &&
      isUnbroken(watched.lastGiven, alarm.time, watched.rule.atMostEvery - Time(1))) {
    ++watched.heldBack;
    return;
  }
  alarm.heldBack = std::exchange(watched.heldBack, 0);
  watched.lastGiven = alarm.time;
  ++given_;
  give_(alarm);
}

}  // namespace kelvasi::survey
