// SPDX-License-Identifier: Apache-2.0
// The options that ask the daemon for more log codes than the display shows.
#pragma once

#include <string>
#include <vector>

#include "LogGenerator/LogCode.h"
#include "Tools/OptionSet.h"

namespace kelvasi {

struct LogCodeOptions {
  std::vector<std::string> codes;
  std::vector<std::string> ranges;

  void addTo(OptionSet verb);
  // Of options that were accepted, in their order.
  std::vector<LogCode> all() const;
};

}  // namespace kelvasi
