// SPDX-License-Identifier: Apache-2.0
#include "Tools/TelvonSim/Source.h"

#include <cstdio>

#include "Simulator/LoadSource.h"
#include "Simulator/ReplaySource.h"
#include "Simulator/ScenarioList.h"
#include "Telvon/TechnologyName.h"

namespace kelvasi {

namespace {

constexpr int wrongUsage = 2;

using Tell = sim::ToldScenario::Tell;

std::unique_ptr<sim::Scenario> begun(const sim::ScenarioKind& kind, const SimulatorOptions& options,
                                     const PlistSerialiser& plists, const Tell& tell = {}) {
  auto scenario = kind.make(options.seed, plists);
  sim::skip(*scenario, options.startAt);
  if (!tell) return scenario;
  return std::make_unique<sim::ToldScenario>(std::move(scenario), tell);
}

SourceResult scenarioSource(const SimulatorOptions& options, const PlistSerialiser& plists, Tell tell) {
  const sim::ScenarioKind* kind = sim::findScenario(options.technology, options.scenario);
  if (!kind) {
    const std::string wanted =
        options.scenario.empty() ? "scenario" : "scenario \"" + options.scenario + "\"";
    return {.source = nullptr,
            .failure = "there is no " + wanted + " for " +
                       std::string(shortTechnologyName(options.technology)) + " (try --list-scenarios)",
            .exitStatus = wrongUsage};
  }
  if (options.rate > 0)
    return {.source = std::make_unique<sim::LoadSource>(begun(*kind, options, plists), options.rate)};
  return {.source = std::make_unique<sim::ScenarioSource>([kind, options, &plists, tell = std::move(tell)] {
            return begun(*kind, options, plists, tell);
          })};
}

void tellFaults(const CaptureReader& capture) {
  for (const std::string& line : capture.complaints()) std::fprintf(stderr, "telvon-sim: %s\n", line.c_str());
}

SourceResult replaySource(const SimulatorOptions& options, const PlistSerialiser& plists) {
  SourceResult result;
  result.source = std::make_unique<sim::ReplaySource>(
      [path = options.replay, &plists] { return openCapture(path, plists); }, options.isLooping, tellFaults);
  if (!result.source->nextAt())
    return {.source = nullptr, .failure = options.replay + ": no messages to play", .exitStatus = 1};
  return result;
}

}  // namespace

SourceResult makeSource(const SimulatorOptions& options, const PlistSerialiser& plists, Tell tell) {
  if (!options.replay.empty()) return replaySource(options, plists);
  return scenarioSource(options, plists, std::move(tell));
}

}  // namespace kelvasi
