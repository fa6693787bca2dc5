// SPDX-License-Identifier: Apache-2.0
// Where the few traces go that are meant for the standard output and not for the system log.
#pragma once

#include <string_view>

namespace kelvasi {

class TraceOutput {
 public:
  virtual ~TraceOutput() = default;
  virtual void writeLine(std::string_view text) = 0;
};

}  // namespace kelvasi
