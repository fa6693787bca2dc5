// SPDX-License-Identifier: Apache-2.0
// The verbs of kelvasictl. Each declares its options and says what to do once they are read.
#pragma once

#include <functional>
#include <string>

namespace CLI {
class App;
}

namespace kelvasi {

class MessageTally;

// Adds the messages that it took in; returns the exit status; throws ToolError.
using Action = std::function<int(MessageTally& tally)>;

// `verb` outlives the action.
Action declareAlarms(CLI::App& verb);
Action declareCells(CLI::App& verb);
Action declareCoverage(CLI::App& verb);
Action declareDecode(CLI::App& verb);
Action declareEvents(CLI::App& verb);
Action declareFields(CLI::App& verb);
Action declareMonitor(CLI::App& verb);
Action declareReadings(CLI::App& verb);
Action declareRecord(CLI::App& verb);

struct Verb {
  const char* name;
  const char* help;
  Action (*declare)(CLI::App& verb);
};

}  // namespace kelvasi
