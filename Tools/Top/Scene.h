// SPDX-License-Identifier: Apache-2.0
// What there is to show, and where in time it stands: a live link, or a drive.
#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <vector>

#include "Cockpit/Cockpit.h"
#include "Model/KelvasiModelNode.h"
#include "Plist/PlistValue.h"
#include "Survey/Series/Spread.h"

namespace kelvasi::top {

// What lies under a drive: all of it, and the moment that is shown.
struct Timeline {
  Arrival from{0};
  Arrival to{0};
  Arrival moment{0};
  std::string level = {};                   // what the ribbon shows, "RSRP"; empty where there is none
  std::vector<survey::Spread> ribbon = {};  // of the serving cell, equal stretches
  std::vector<Arrival> events = {};         // in their order
  std::vector<Arrival> marks = {};
  std::string work = {};  // what is being done, "reading, 41 %"; empty for nothing
};

class Scene {
 public:
  virtual ~Scene() = default;

  // For rows, searches, charts, pins and marks.
  virtual cockpit::Cockpit& cockpit() = 0;
  // The moment that is shown.
  virtual Arrival moment() const = 0;
  // All that is on the cockpit's face at that moment.
  virtual cockpit::Snapshot face() = 0;
  // The display tree of that moment; null before there is one.
  virtual NodeRef root() = 0;
  // The newest events up to that moment, the newest first.
  virtual std::vector<cockpit::EventLine> events(std::size_t most) const = 0;

  // "Updated 2026-11-22 at 21:57:02", "Connecting...", "PAUSED, 12 newer".
  virtual std::string status() const = 0;
  // What a snapshot would hold; absent where there is nothing.
  virtual PlistValue saveContents() = 0;
  // Why none can be saved now, for people; empty when one can.
  virtual std::string whyNoSave() const { return {}; }

  // Holds the display still, or lets it go on; in a drive, plays it or stops.
  virtual void pause() = 0;
  // To the state or the event before or after; false at an end.
  virtual bool step(int by) = 0;
  virtual void move(std::chrono::nanoseconds by) = 0;
  virtual void goTo(Arrival moment) = 0;
  // Nothing on a live link.
  virtual std::optional<Timeline> timeline(std::size_t columns) const = 0;
};

}  // namespace kelvasi::top
