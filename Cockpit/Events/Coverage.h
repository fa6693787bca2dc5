// SPDX-License-Identifier: Apache-2.0
// What arrived and was not shown.
#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "Cockpit/Words/Age.h"
#include "Cockpit/Words/TextStyle.h"
#include "LogGenerator/Intake.h"

namespace kelvasi::cockpit {

struct CoverageLine {
  std::string code;  // "0xB17F"; empty for what is no record
  Outcome outcome = Outcome::shown;
  std::string words;  // "not asked for"
  std::uint64_t messages = 0;
  std::size_t lastLength = 0;
  std::string version;  // "version 5"; empty where it is not known
  std::string sample;   // the first bytes, "01 7F 3C"
  Age age;              // of the last one
};

struct Coverage {
  std::uint64_t messages = 0;
  std::uint64_t notShown = 0;
  std::string words;                // "12,345 messages, 2 % not shown"; "12,345 messages, every one shown"
  std::vector<CoverageLine> lines;  // of what was not shown, the most frequent first
  std::uint64_t beyond = 0;         // messages not shown that no line tells of
};

Coverage coverageOf(const Intake& intake, Arrival now);
// Of counts, so many messages altogether, and so many that were not shown.
Coverage coverageOf(std::span<const IntakeCount> counts, std::uint64_t messages, std::uint64_t notShown,
                    Arrival now);
// "0xB17F"
std::string codeText(LogCode logCode);
// "12,345 messages", "12,345 messages, 2 % not shown", "... less than 1 % not shown"
std::string countersText(std::uint64_t messages, std::uint64_t notShown);

}  // namespace kelvasi::cockpit
