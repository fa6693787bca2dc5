// SPDX-License-Identifier: Apache-2.0
// A cockpit that is fed with typed readings. Times are counted from noon.
#pragma once

#include <deque>
#include <string>
#include <utility>

#include "Cockpit/Cockpit.h"
#include "Tests/Survey/TypedReadings.h"

namespace kelvasi::cockpit {

using namespace kelvasi::test;

inline constexpr CellIdentity cell404{RadioFamily::lte, 3350, 404};
inline constexpr CellIdentity cell362{RadioFamily::lte, 3350, 362};
inline constexpr CellIdentity cell257{RadioFamily::lte, 3350, 257};

// A record of the serving cell.
inline Message served(Arrival after, const CellIdentity& cell, std::int64_t rsrp) {
  Message message(after);
  message.serving(cell, quantity::earfcn, cell.channel)
      .serving(cell, quantity::pci, cell.code)
      .serving(cell, quantity::rsrp, rsrp);
  return message;
}

class Fed {
 public:
  explicit Fed(CockpitSetUp setUp = {}) : cockpit(small(std::move(setUp))) {}

  // The rows that readings refer to last as long as the test.
  void take(Message message) {
    messages_.push_back(std::move(message));
    const Readings& readings = messages_.back();
    intake.count(readings.logCode(), Outcome::shown, readings.arrival(), {});
    cockpit.take(readings, intake);
  }
  Snapshot at(Arrival after) { return cockpit.at(noon + after); }

  Intake intake;
  Cockpit cockpit;

 private:
  static CockpitSetUp small(CockpitSetUp setUp) {
    setUp.ofCells = {.series = 64, .blocks = {600, 60, 60}};
    setUp.ofRows = {.series = 64, .blocks = {600, 60, 60}};
    return setUp;
  }

  std::deque<Message> messages_;
};

}  // namespace kelvasi::cockpit
