// SPDX-License-Identifier: Apache-2.0
// What a front end chooses of the texts: how a minus sign looks and where the clock stands.
#pragma once

#include <chrono>
#include <functional>
#include <string>

#include "LogGenerator/Arrival.h"

namespace kelvasi::cockpit {

struct TextStyle {
  std::string minus = "-";                                   // "\u2212" where the font has it
  std::function<std::chrono::seconds(Arrival)> eastOfUtc{};  // of the local time at a moment; empty: UTC
};

// With so many decimals, never "-0"; without a sign where it rounds to nothing.
std::string numberText(double number, int decimals, const TextStyle& style = {});
// As few decimals as tell it, at most `most`: "-7.3", "12".
std::string shortNumberText(double number, int most, const TextStyle& style = {});
// "+4", "-10", "0".
std::string differenceText(double number, int decimals, const TextStyle& style = {});
// "12,345,678"
std::string countText(std::uint64_t count);

// The time of day, "21:57:02".
std::string clockText(Arrival time, const TextStyle& style = {});
// "21:57"
std::string minuteText(Arrival time, const TextStyle& style = {});
// "2026-11-22 21:57:02"
std::string dateText(Arrival time, const TextStyle& style = {});

}  // namespace kelvasi::cockpit
