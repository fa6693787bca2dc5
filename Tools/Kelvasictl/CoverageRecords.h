// SPDX-License-Identifier: Apache-2.0
// What became of the messages, as records.
#pragma once

#include <map>
#include <span>
#include <string>
#include <string_view>
#include <tuple>
#include <vector>

#include "LogGenerator/Intake.h"
#include "LogGenerator/LogGenerator.h"
#include "Tools/Kelvasictl/RecordOutput.h"

namespace kelvasi {

std::span<const Column> coverageColumns();

// The counts of any number of captures.
class Coverage {
 public:
  // `technology` by its short name; `known`: the codes that its decoders ask for.
  void add(std::string_view technology, const Intake& intake, std::span<const LogCode> known);
  // A record for each technology, code and outcome, the most frequent first.
  std::vector<Json> records() const;

 private:
  struct Counted {
    std::string technology;
    IntakeCount count;
    Json nearest;
  };
  using Key = std::tuple<std::string, LogCode, Outcome>;

  Json recordOf(const Counted& counted) const;
  Json recordOfBeyond() const;
  double shareOf(std::uint64_t messages) const;

  std::map<Key, Counted> counts_;
  std::uint64_t messages_ = 0;
  std::uint64_t beyond_ = 0;
};

// The codes in the generator's start command.
std::vector<LogCode> logCodesAsked(const LogGenerator& generator);

}  // namespace kelvasi
