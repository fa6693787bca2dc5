// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Events/Coverage.h"

#include <algorithm>
#include <array>
#include <charconv>

namespace kelvasi::cockpit {

namespace {

std::string hexText(std::uint64_t number, std::size_t digits) {
  std::array<char, 16> text;
  const auto end = std::to_chars(text.data(), text.data() + text.size(), number, 16).ptr;
  std::string hex(text.data(), end);
  std::ranges::transform(hex, hex.begin(), [](char each) {
    return each >= 'a' && each <= 'f' ? static_cast<char>(each - 'a' + 'A') : each;
  });
  return std::string(hex.size() < digits ? digits - hex.size() : 0, '0') + hex;
}

std::string sampleText(const IntakeCount& count) {
  std::string text;
  for (std::size_t at = 0; at < count.sampled; ++at) {
    if (at > 0) text += ' ';
    text += hexText(count.sample[at], 2);
  }
  return text;
}

CoverageLine lineOf(const IntakeCount& count, Arrival now) {
  CoverageLine line;
  const bool hasCode = count.outcome != Outcome::notARecord;
  if (hasCode) line.code = codeText(count.logCode);
  line.outcome = count.outcome;
  line.words = nameOf(count.outcome);
  line.messages = count.messages;
  line.lastLength = count.lastLength;
  if (count.lastVersion) line.version = "version " + std::to_string(*count.lastVersion);
  line.sample = sampleText(count);
  line.age = ageOf(count.last, now);
  return line;
}

}  // namespace

std::string codeText(LogCode logCode) {
  return "0x" + hexText(logCode, 4);
}

std::string countersText(std::uint64_t messages, std::uint64_t notShown) {
  std::string text = countText(messages) + (messages == 1 ? " message" : " messages");
  if (notShown == 0) return text;
  const auto share =
      static_cast<std::uint64_t>(100.0 * static_cast<double>(notShown) / static_cast<double>(messages));
  return text + ", " + (share == 0 ? "less than 1" : std::to_string(share)) + " % not shown";
}

Coverage coverageOf(const Intake& intake, Arrival now) {
  return coverageOf(intake.counts(), intake.messages(), intake.messages() - intake.messages(Outcome::shown),
                    now);
}

Coverage coverageOf(std::span<const IntakeCount> counts, std::uint64_t messages, std::uint64_t notShown,
                    Arrival now) {
  Coverage coverage;
  coverage.messages = messages;
  coverage.notShown = coverage.beyond = notShown;
  for (const IntakeCount& count : counts) {
    if (count.outcome == Outcome::shown) continue;
    coverage.lines.push_back(lineOf(count, now));
    coverage.beyond -= std::min(coverage.beyond, count.messages);
  }
  std::ranges::stable_sort(coverage.lines, std::ranges::greater(), &CoverageLine::messages);
  coverage.words = countersText(coverage.messages, coverage.notShown);
  if (coverage.messages == 0) {
    coverage.words = "Nothing received yet";
  } else if (coverage.notShown == 0) {
    coverage.words += ", every one shown";
  }
  return coverage;
}

}  // namespace kelvasi::cockpit
