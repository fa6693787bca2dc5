// SPDX-License-Identifier: Apache-2.0
// Traces on the standard streams, each line flushed: the process may be about to abort.
#pragma once

#include <string_view>

#include "Platform/TraceOutput.h"

namespace kelvasi {

class StandardOutputTrace : public TraceOutput {
 public:
  void writeLine(std::string_view text) override;
};

// For programs whose standard output carries their result.
class StandardErrorTrace : public TraceOutput {
 public:
  void writeLine(std::string_view text) override;
};

}  // namespace kelvasi
