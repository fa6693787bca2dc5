// SPDX-License-Identifier: Apache-2.0
#include "LogGenerator/Intake.h"

#include <algorithm>

namespace kelvasi {

namespace {

constexpr std::size_t slotCount = 2 * Intake::mostCounts;  // a power of two
static_assert((slotCount & (slotCount - 1)) == 0);

std::size_t slotOf(LogCode logCode, Outcome outcome) {
  const std::uint32_t key = logCode << 3 ^ static_cast<std::uint32_t>(outcome);
  return (key * 2654435761u) >> 16 & (slotCount - 1);
}

}  // namespace

std::string_view nameOf(Outcome outcome) {
  constexpr std::array<std::string_view, outcomes> names{
      "shown",           "not asked for",    "too short",    "not understood",
      "section missing", "unknown log type", "not a record", "property list refused"};
  return names[static_cast<std::size_t>(outcome)];
}

void Intake::count(LogCode logCode, Outcome outcome, Arrival arrival, std::span<const std::uint8_t> record,
                   std::optional<std::size_t> versionAt) {
  ++messages_;
  ++byOutcome_[static_cast<std::size_t>(outcome)];
  IntakeCount* counted = find(logCode, outcome);
  if (!counted) {
    ++beyond_;
    return;
  }
  if (counted->messages++ == 0) {
    counted->first = arrival;
    counted->sampled = static_cast<std::uint8_t>(std::min(record.size(), counted->sample.size()));
    std::ranges::copy(record.first(counted->sampled), counted->sample.begin());
  }
  counted->last = arrival;
  counted->lastLength = record.size();
  if (versionAt && *versionAt < record.size()) counted->lastVersion = record[*versionAt];
}

// Null when there is no room for another pair.
IntakeCount* Intake::find(LogCode logCode, Outcome outcome) {
  if (slots_.empty()) slots_.resize(slotCount);
  std::size_t slot = slotOf(logCode, outcome);
  for (; slots_[slot] != 0; slot = (slot + 1) & (slotCount - 1)) {
    IntakeCount& counted = counts_[slots_[slot] - 1u];
    if (counted.logCode == logCode && counted.outcome == outcome) return &counted;
  }
  if (counts_.size() == mostCounts) return nullptr;
  slots_[slot] = static_cast<std::uint16_t>(counts_.size() + 1);
  return &counts_.emplace_back(IntakeCount{.logCode = logCode, .outcome = outcome});
}

}  // namespace kelvasi
