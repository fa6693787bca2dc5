// SPDX-License-Identifier: Apache-2.0
// A list of pilots as the display shows it: sorted, keyed by the place in the record and the PN offset.
#pragma once

#include <cstdint>
#include <vector>

#include "LogGenerator/Reading.h"
#include "LogGenerator/Row.h"
#include "LogGenerator/SortPrefix.h"

namespace kelvasi {

// What every such list begins with.
inline constexpr Row sortedRow{.key = sortedMark,
                               .quantity = quantity::none,
                               .special = ValueText{0, sortedMark},
                               .reason = "asks for the list to be shown sorted"};

class PilotList {
 public:
  // `isGathered`: somebody listens, and readings() will be asked for.
  PilotList(RadioFamily family, bool isGathered);

  // `row` lasts as long as the process.
  void add(std::size_t place, std::int64_t pilot, const Row& row, std::int64_t raw,
           std::int64_t channel = CellIdentity::unknown);
  bool empty() const { return list_->size() == 1; }  // there is always the mark
  RadioFamily family() const { return family_; }

  PlistValue list() const { return list_; }
  // For the list in place of what stands there; their section and their list are the caller's to say.
  std::vector<Reading> readings() const;

 private:
  struct Pilot {
    const Row* row;
    std::int64_t raw;
    CellIdentity cell;
  };

  RadioFamily family_;
  bool isGathered_;
  PlistValue::Dictionary list_;
  std::vector<Pilot> pilots_;  // in the order of the list, where they are gathered
};

}  // namespace kelvasi
