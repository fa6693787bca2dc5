// The verbs of kelvasictl. Each declares its options and says what to do once they are read.
#pragma once

#include <functional>
#include <string>

namespace CLI {
class App;
}

namespace kelvasi {

// Returns the exit status; throws ToolError.
using Action = std::function<int()>;

// `verb` outlives the action.
Action declareDecode(CLI::App& verb);
Action declareMonitor(CLI::App& verb);
Action declareRecord(CLI::App& verb);

struct Verb {
  const char* name;
  const char* help;
  Action (*declare)(CLI::App& verb);
};

}  // namespace kelvasi
