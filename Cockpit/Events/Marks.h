// SPDX-License-Identifier: Apache-2.0
// Moments that a user marked, each with a note if one followed.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "Cockpit/Events/EventLine.h"

namespace kelvasi::cockpit {

class Marks {
 public:
  static constexpr std::size_t mostMarks = 4096;  // past them the oldest make way

  std::uint64_t set(Arrival time, std::string note, const TextStyle& style);
  bool note(std::uint64_t mark, std::string text);
  const std::vector<MarkLine>& all() const { return marks_; }
  std::vector<MarkLine> newestFirst(std::size_t most) const;

 private:
  std::vector<MarkLine> marks_;
  std::uint64_t next_ = 1;
};

}  // namespace kelvasi::cockpit
