// SPDX-License-Identifier: Apache-2.0
// A list of pilots as the display shows it: sorted, keyed by the place in the record and the PN offset. Used
// from record to record, it costs no allocation.
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
  // Empty again, and of this family.
  void begin(RadioFamily family);
  // `row` lasts as long as the process.
  void add(std::size_t place, std::int64_t pilot, const Row& row, std::int64_t raw,
           std::int64_t channel = CellIdentity::unknown);
  bool empty() const { return pilots_.empty(); }
  RadioFamily family() const { return family_; }

  // Shows the list under `key`, in place of what stands there, and returns it.
  const PlistDictionary& showIn(PlistDictionary& display, std::string_view key);

  // Calls `add` with the readings for `shown` in place of what stood there; their section and their list are
  // the caller's to say.
  template <typename Add>
  void forEachReading(const PlistDictionary& shown, const Add& add) const {
    add({.keyKind = Reading::Key::element, .row = &emptyRow});
    add({.keyKind = Reading::Key::element, .row = &sortedRow, .key = sortedRow.key});
    auto entry = shown.begin();
    for (const Pilot& pilot : pilots_)
      add({.keyKind = Reading::Key::element,
           .row = pilot.row,
           .raw = pilot.raw,
           .key = (++entry)->first,
           .cell = pilot.cell});
  }

 private:
  struct Pilot {
    std::size_t place;
    std::int64_t offset;
    const Row* row;
    std::int64_t raw;
    CellIdentity cell;
  };

  PlistValue::Dictionary unusedDictionary();

  static const Row emptyRow;

  RadioFamily family_ = RadioFamily::none;
  std::vector<Pilot> pilots_;                 // in the order of the list
  std::vector<PlistValue::Dictionary> pool_;  // once shown; used again when nobody else holds them
};

}  // namespace kelvasi
