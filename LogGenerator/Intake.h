// SPDX-License-Identifier: Apache-2.0
// What became of the messages that came in: each ends in exactly one way, and every way is counted. Never
// part of a display or a snapshot.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <string_view>
#include <vector>

#include "LogGenerator/Arrival.h"
#include "LogGenerator/LogCode.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

enum class Outcome : std::uint8_t {
  shown,
  notAskedFor,          // no decoder wants the code
  tooShort,             // shorter than the record has to be
  notUnderstood,        // long enough, and yet not the record that is known: its version, its parts
  sectionMissing,       // the template has no place for it
  unknownLogType,       // neither of the baseband nor of the telephony daemon
  notARecord,           // shorter than a record's header
  propertyListRefused,  // what the daemon sent is no property list, or not of the kind that was expected
};
inline constexpr std::size_t outcomes = 8;

// "shown", "not asked for", "too short" and so on, for people and scripts.
std::string_view nameOf(Outcome outcome);

// Of one code and one outcome. For what is no record, and of an unknown log type, the code is 0 or what
// stands where a code would.
struct IntakeCount {
  static constexpr std::size_t sampleSize = 64;

  LogCode logCode = 0;
  Outcome outcome = Outcome::shown;
  std::uint64_t messages = 0;
  Arrival first{0};
  Arrival last{0};
  std::size_t lastLength = 0;                     // of the record, its prefix of two bytes left out
  std::optional<std::uint8_t> lastVersion = {};   // where the record is known to have a version
  std::array<std::uint8_t, sampleSize> sample{};  // the beginning of the first such record
  std::uint8_t sampled = 0;                       // how many bytes of it
};

class Intake {
 public:
  // As many pairs of code and outcome are told apart; messages of further ones are counted together.
  static constexpr std::size_t mostCounts = 1024;

  // `versionAt`: the byte of the record that says its version, if any.
  void count(LogCode logCode, Outcome outcome, Arrival arrival, std::span<const std::uint8_t> record,
             std::optional<std::size_t> versionAt = {});

  std::span<const IntakeCount> counts() const { return counts_; }  // in the order in which they first came
  std::uint64_t messages() const { return messages_; }
  std::uint64_t messages(Outcome outcome) const { return byOutcome_[static_cast<std::size_t>(outcome)]; }
  // Messages that no line of counts() tells of.
  std::uint64_t beyond() const { return beyond_; }

 private:
  IntakeCount* find(LogCode logCode, Outcome outcome);

  std::vector<IntakeCount> counts_;
  std::vector<std::uint16_t> slots_;  // by hash: the place in counts_, and one more; 0 is a free slot
  std::uint64_t messages_ = 0;
  std::array<std::uint64_t, outcomes> byOutcome_{};
  std::uint64_t beyond_ = 0;
};

}  // namespace kelvasi
