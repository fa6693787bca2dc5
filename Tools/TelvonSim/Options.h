// The command line of telvon-sim.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "Simulator/Faults.h"
#include "Simulator/Player.h"

namespace kelvasi {

struct Options {
  std::string technology;  // full id
  std::string scenario;    // empty for the technology's usual one
  std::string replay;      // a capture's path; empty for a scenario
  bool isLooping = false;
  bool leavesAtEnd = false;
  sim::Speed speed;
  double rate = 0;  // messages per second of synthetic load; 0 for none
  std::uint64_t seed = 1;
  std::optional<double> seconds;
  sim::Faults faults;
};

// A technology's id as a user gives it.
std::string shortName(std::string_view technology);

struct CommandLine {
  std::optional<Options> options;
  int exitStatus = 0;  // when there is nothing to run: help was asked for, or the usage is wrong
};

// Prints what it has to say itself.
CommandLine parseCommandLine(int argumentCount, const char* const* arguments);

}  // namespace kelvasi
