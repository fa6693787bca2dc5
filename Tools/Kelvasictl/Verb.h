// SPDX-License-Identifier: Apache-2.0
// The verbs of kelvasictl. Each declares its options and says what to do once they are read.
#pragma once

#include <functional>
#include <string>

#include "Tools/OptionSet.h"

namespace kelvasi {

class MessageTally;

// Adds the messages that it took in; returns the exit status; throws ToolError.
using Action = std::function<int(MessageTally& tally)>;

// `verb` outlives the action.
Action declareAlarms(OptionSet verb);
Action declareCells(OptionSet verb);
Action declareCoverage(OptionSet verb);
Action declareDecode(OptionSet verb);
Action declareDissector(OptionSet verb);
Action declareEvents(OptionSet verb);
Action declareExtcap(OptionSet verb);
Action declareFields(OptionSet verb);
Action declareMonitor(OptionSet verb);
Action declareReadings(OptionSet verb);
Action declareRecord(OptionSet verb);
Action declareRedact(OptionSet verb);
Action declareReport(OptionSet verb);
Action declareTop(OptionSet verb);

struct Verb {
  const char* name;
  const char* help;
  Action (*declare)(OptionSet verb);
};

}  // namespace kelvasi
