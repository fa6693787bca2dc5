// SPDX-License-Identifier: Apache-2.0
// What the messages of a live link say, technology by technology.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <string_view>

#include "Tools/Kelvasictl/LiveSession.h"

namespace kelvasi {

// What ToolErrors these throw ends the session.
struct LiveUse {
  // Before the first message, and before the first one of another technology than before (by its identifier).
  std::function<void(std::string_view technology)> begin;
  std::function<void(const Readings& readings, const Intake& intake)> take;
  // At the end, and before another technology begins.
  std::function<void(const LogGenerator& generator)> finish;
  // Four times a second, also while nothing comes.
  std::function<void(Arrival now, bool isConnected)> look;
};

class LiveRun {
 public:
  LiveRun(const LiveOptions& options, LiveUse use);

  // As LiveSession's.
  void run();

 private:
  void take(const Readings& readings, const Intake& intake);
  void finish();
  void update();
  template <typename Action>
  void endAtFault(Action action);

  LiveUse use_;
  LiveSession session_;
  std::string technology_;
  std::shared_ptr<const LogGenerator> generator_;  // null before the first message
};

}  // namespace kelvasi
