// SPDX-License-Identifier: Apache-2.0
// The command line of telvon-sim.
#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "Simulator/Faults.h"
#include "Simulator/Player.h"
#include "Tools/CommandLine.h"

namespace kelvasi {

struct SimulatorOptions {
  std::string technology;      // full id
  std::string scenario;        // empty for the technology's usual one
  std::string replay;          // a capture's path; empty for a scenario
  std::string worldLog;        // the path of the world's log; empty for none
  std::string write;           // the path of a capture to be written instead of serving; empty for none
  bool isForced = false;       // the written capture may take the place of a file
  std::uint64_t messages = 0;  // of the written capture
  bool isLooping = false;
  bool leavesAtEnd = false;
  sim::Speed speed;
  double rate = 0;  // messages per second of synthetic load; 0 for none
  std::uint64_t seed = 1;
  std::chrono::seconds startAt{0};  // of the scenario's world
  std::optional<double> seconds;
  sim::Faults faults;
};

void declareOptions(CommandLine& commandLine, SimulatorOptions& options);

}  // namespace kelvasi
