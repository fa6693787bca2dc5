// SPDX-License-Identifier: Apache-2.0
// A phase of a mobility-management procedure: what the record of the state says meanwhile, how long it lasts
// and what it asks of the radio.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

#include "Simulator/Random.h"

namespace kelvasi::sim::gsm {

// What a domain needs of a radio connection; `connecting` is one that is being set up.
enum class Need { none, connecting, signalling, speech, data };

// The number of a text in a decoder's table; does not compile when there is no such text.
consteval std::uint8_t numberOf(std::span<const std::string_view> texts, std::string_view text) {
  for (std::size_t number = 0; number < texts.size(); ++number) {
    if (texts[number] == text) return static_cast<std::uint8_t>(number);
  }
  throw "no such text in this table";
}

struct PhaseRow {
  std::uint8_t state;
  std::uint8_t subState;
  double shortest;  // seconds
  double longest;
  Need need = Need::none;
};

// Where a procedure stands, and for how much longer.
template <typename Phase>
class PhaseClock {
 public:
  // `rows` are in the order of the enumeration.
  PhaseClock(std::span<const PhaseRow> rows, Phase phase) : rows_(rows), phase_(phase) {}

  Phase phase() const { return phase_; }
  const PhaseRow& row() const { return rows_[static_cast<std::size_t>(phase_)]; }
  void enter(Phase phase, Random& random) {
    phase_ = phase;
    left_ = random.between(row().shortest, row().longest);
  }
  // Lets time pass. True once the phase is over.
  bool pass(double seconds) {
    left_ -= seconds;
    return left_ <= 0;
  }

 private:
  std::span<const PhaseRow> rows_;
  Phase phase_;
  double left_ = 0;
};

}  // namespace kelvasi::sim::gsm
