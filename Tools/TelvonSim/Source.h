// SPDX-License-Identifier: Apache-2.0
// What telvon-sim plays, as its command line says.
#pragma once

#include <memory>
#include <string>

#include "Platform/PlistSerialiser.h"
#include "Simulator/MessageSource.h"
#include "Simulator/ToldScenario.h"
#include "Tools/TelvonSim/Options.h"

namespace kelvasi {

struct SourceResult {
  std::unique_ptr<sim::MessageSource> source;  // null on failure
  std::string failure = {};                    // one line
  int exitStatus = 0;
};

// `plists` outlives the source.
// `tell`, where there is one, gets the world's cells after each step of a scenario.
SourceResult makeSource(const SimulatorOptions& options, const PlistSerialiser& plists,
                        sim::ToldScenario::Tell tell = {});

}  // namespace kelvasi
