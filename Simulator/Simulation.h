// SPDX-License-Identifier: Apache-2.0
// A whole simulated handset: the daemon's server, its log channels, what is played to them, and the faults
// that come with time.
#pragma once

#include <functional>
#include <memory>
#include <string_view>

#include "Simulator/Daemon.h"
#include "Simulator/Player.h"

namespace kelvasi::sim {

struct SimulationPlatform {
  DaemonPlatform daemon;
  MainQueue& queue;
  const Clock& clock;
};

struct SimulationHandlers {
  std::function<void()> die;    // ends the process without a goodbye
  std::function<void()> stall;  // stops the process
  std::function<void()> sourceEnded;
  std::function<void()> lastApplicationLeft;  // of those that had begun a stream; noticed within a second
};

class Simulation {
 public:
  Simulation(const SimulationPlatform& platform, std::string_view technology, const Faults& faults,
             std::unique_ptr<MessageSource> source, Speed speed, SimulationHandlers handlers);

  // False, with the reason in the system log, when there can be no server.
  bool serve(DaemonServerHost& host);
  const Daemon& daemon() const { return daemon_; }

 private:
  void sweep();
  void schedule(Fault fault, const std::function<void()>& handler);

  SimulationPlatform platform_;
  Faults faults_;
  SimulationHandlers handlers_;
  std::unique_ptr<MessageSource> source_;
  Daemon daemon_;
  Player player_;
  bool hasStreamed_ = false;  // since the last application left
  std::unique_ptr<Timer> sweeping_;
  std::unique_ptr<DaemonServer> server_;
};

}  // namespace kelvasi::sim
