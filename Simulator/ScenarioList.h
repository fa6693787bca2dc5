// SPDX-License-Identifier: Apache-2.0
// The scenarios, by technology and name. To add one: a row in ScenarioList.cpp.
#pragma once

#include <cstdint>
#include <memory>
#include <span>
#include <string_view>

#include "Simulator/Scenario.h"

namespace kelvasi::sim {

struct ScenarioKind {
  std::string_view technology;  // full id
  std::string_view name;
  std::string_view help;
  std::unique_ptr<Scenario> (*make)(std::uint64_t seed, const PlistSerialiser& plists);
};

// The first of a technology is the usual one.
std::span<const ScenarioKind> scenarioKinds();

// Null when there is no such scenario; an empty name asks for the technology's usual one.
const ScenarioKind* findScenario(std::string_view technology, std::string_view name);

}  // namespace kelvasi::sim
