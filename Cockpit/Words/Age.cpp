// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Words/Age.h"

#include <algorithm>
#include <array>

namespace kelvasi::cockpit {

namespace {

using namespace std::chrono_literals;

struct Unit {
  std::chrono::nanoseconds from;  // shorter times have the unit before
  std::chrono::nanoseconds length;
  std::string_view word;
};
constexpr std::array units{Unit{96h, 24h, " days"}, Unit{2h, 1h, " h"}, Unit{1min, 1min, " min"},
                           Unit{0s, 1s, " s"}};

}  // namespace

std::chrono::nanoseconds timeSince(Arrival then, Arrival now) {
  return std::max(now - then, Arrival(0));
}

Fade fadeOf(std::chrono::nanoseconds age) {
  if (age >= goneAge) return Fade::gone;
  if (age >= faintAge) return Fade::faint;
  return age >= fadedAge ? Fade::faded : Fade::none;
}

std::string_view nameOf(Fade fade) {
  constexpr std::array<std::string_view, 4> names{"none", "faded", "faint", "gone"};
  return names[static_cast<std::size_t>(fade)];
}

std::string durationText(std::chrono::nanoseconds time) {
  const auto unit = std::ranges::find_if(units, [&](const Unit& each) { return time >= each.from; });
  const Unit& chosen = unit == units.end() ? units.back() : *unit;
  return std::to_string(std::max<std::int64_t>(time / chosen.length, 0)) + std::string(chosen.word);
}

std::string ageText(std::chrono::nanoseconds age) {
  return age <= liveAge ? "live" : durationText(age);
}

Age ageOf(Arrival then, Arrival now, bool isGone) {
  const auto time = timeSince(then, now);
  const Fade fade = isGone ? Fade::gone : fadeOf(time);
  return {time, fade, fade == Fade::gone ? "gone " + durationText(time) : ageText(time)};
}

}  // namespace kelvasi::cockpit
