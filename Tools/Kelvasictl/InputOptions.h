// SPDX-License-Identifier: Apache-2.0
// Where the messages of a verb come from: captures, or a live link.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "Tools/Kelvasictl/LiveSession.h"

namespace kelvasi {

struct InputOptions {
  std::string technology;  // its identifier; empty: that of captures is found
  std::vector<std::string> captures;
  std::optional<unsigned> jobs;  // captures that are worked on side by side
  bool isLive = false;
  LiveOptions live;

  // `severalCaptures` ends the help of CAPTURE: what becomes of several of them.
  void addTo(OptionSet verb, const std::string& severalCaptures);
  Option addJobsTo(OptionSet verb, const std::string& help);
};

}  // namespace kelvasi
