// SPDX-License-Identifier: Apache-2.0
// Where the messages of a verb come from: captures, or a live link.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "Tools/Kelvasictl/LiveSession.h"

namespace CLI {
class App;
class Option;
}  // namespace CLI

namespace kelvasi {

struct InputOptions {
  std::string technology;  // its identifier; empty: that of captures is found
  std::vector<std::string> captures;
  std::optional<unsigned> jobs;  // captures that are worked on side by side
  bool isLive = false;
  LiveOptions live;

  // `severalCaptures` ends the help of CAPTURE: what becomes of several of them.
  void addTo(CLI::App& verb, const std::string& severalCaptures);
  CLI::Option* addJobsTo(CLI::App& verb, const std::string& help);
};

}  // namespace kelvasi
