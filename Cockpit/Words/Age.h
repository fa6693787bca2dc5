// SPDX-License-Identifier: Apache-2.0
// How old something is, for people: in words, and as what it costs a value of its strength.
#pragma once

#include <chrono>
#include <cstdint>
#include <string>
#include <string_view>

#include "LogGenerator/Arrival.h"

namespace kelvasi::cockpit {

// What was heard a moment ago is drawn in full, then in two steps weaker; what is gone is not a value of now.
enum class Fade : std::uint8_t { none, faded, faint, gone };

inline constexpr std::chrono::seconds liveAge{3};
inline constexpr std::chrono::seconds fadedAge{6};
inline constexpr std::chrono::seconds faintAge{15};
inline constexpr std::chrono::seconds goneAge{30};

struct Age {
  std::chrono::nanoseconds time{0};
  Fade fade = Fade::none;
  std::string text;  // "live", "6 s", "gone 30 s"

  bool operator==(const Age&) const = default;
};

// Never less than nothing, whatever clocks say.
std::chrono::nanoseconds timeSince(Arrival then, Arrival now);
Fade fadeOf(std::chrono::nanoseconds age);
std::string_view nameOf(Fade fade);  // "none", "faded", "faint", "gone"

// "0 s", "41 s", "3 min", "2 h", "4 days": whole ones, the rest dropped.
std::string durationText(std::chrono::nanoseconds time);
// "live" up to 3 s, then as durationText().
std::string ageText(std::chrono::nanoseconds age);
// With "gone" before what is gone. `isGone`: it is, however short the time.
Age ageOf(Arrival then, Arrival now, bool isGone = false);

}  // namespace kelvasi::cockpit
