// SPDX-License-Identifier: Apache-2.0
// The commands of a script, as a table.
#pragma once

#include <QString>
#include <functional>
#include <string>

namespace kelvasi {

// Neither done nor failed: to be tried again after a while.
struct StepResult {
  bool isDone = false;
  std::string failure = {};
};

using ScriptStep = std::function<StepResult()>;

// The step of a line, not empty; null where there is no such command.
ScriptStep scriptStep(const QString& line);

}  // namespace kelvasi
