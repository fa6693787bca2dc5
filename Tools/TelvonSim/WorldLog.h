// SPDX-License-Identifier: Apache-2.0
// What is true in the simulated world, a line of JSON for each of its steps, so that a display can be held
// against it:
//   {"time": 1792643696.2, "serving": ["lte:3350/362"],
//    "cells": {"lte:3350/362": {"level": -95.2, "quality": -7.4, "average_level": -95.6, ...}, ...}}
// `time` is when the step was made, seconds since 1970. Levels are dBm, qualities dB: received level of a GSM
// cell, RSCP and Ec/No, RSRP and RSRQ, in CDMA only Ec/Io.
#pragma once

#include <string>

#include "Platform/Clock.h"
#include "Platform/Posix/OutputFile.h"
#include "Simulator/Radio/TrueCell.h"

namespace kelvasi {

class WorldLog {
 public:
  // A new file, or "-" for the standard output. `clock` outlives the log.
  WorldLog(const std::string& path, const Clock& clock);

  void tell(const sim::TrueCells& cells);
  const FileError& error() const { return file_.error(); }

 private:
  const Clock& clock_;
  OutputFile file_;
};

}  // namespace kelvasi
