// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Simulation.h"

#include <chrono>

namespace kelvasi::sim {

namespace {

using namespace std::chrono_literals;

constexpr auto sweepInterval = 1000ms;

std::chrono::milliseconds milliseconds(double seconds) {
  return std::chrono::milliseconds(static_cast<std::int64_t>(seconds * 1000));
}

}  // namespace

Simulation::Simulation(const SimulationPlatform& platform, std::string_view technology, const Faults& faults,
                       std::unique_ptr<MessageSource> source, Speed speed, SimulationHandlers handlers)
    : platform_(platform),
      faults_(faults),
      handlers_(std::move(handlers)),
      source_(std::move(source)),
      daemon_(platform.daemon, technology, faults,
              [this](Channel& channel) {
                hasStreamed_ = true;
                player_.streamBegan(channel);
              }),
      player_(platform.queue, platform.clock, daemon_, *source_, speed, faults, [this] {
        if (handlers_.sourceEnded) handlers_.sourceEnded();
      }) {}

bool Simulation::serve(DaemonServerHost& host) {
  server_ = host.serve([this](std::string_view port) { return daemon_.openChannel(port); });
  if (!server_) return false;
  sweeping_ = platform_.queue.repeat(sweepInterval, [this] { sweep(); });
  schedule(Fault::death, handlers_.die);
  schedule(Fault::stall, handlers_.stall);
  return true;
}

void Simulation::sweep() {
  daemon_.sweep();
  if (!hasStreamed_ || daemon_.channelCount() > 0) return;
  hasStreamed_ = false;
  if (handlers_.lastApplicationLeft) handlers_.lastApplicationLeft();
}

void Simulation::schedule(Fault fault, const std::function<void()>& handler) {
  if (const auto seconds = faults_.value(fault)) platform_.queue.postAfter(milliseconds(*seconds), handler);
}

}  // namespace kelvasi::sim
