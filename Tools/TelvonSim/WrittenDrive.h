// SPDX-License-Identifier: Apache-2.0
// A drive that goes into a capture instead of to an application.
#pragma once

#include <string>

#include "Simulator/MessageSource.h"
#include "Tools/TelvonSim/Options.h"

namespace kelvasi {

// Writes the source's first messages, arriving when the simulated world has them. What went wrong, in one
// line; empty when nothing did.
std::string writeCapture(sim::MessageSource& source, const SimulatorOptions& options);

}  // namespace kelvasi
