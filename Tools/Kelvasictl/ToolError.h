// SPDX-License-Identifier: Apache-2.0
// What ends a verb early.
#pragma once

#include <stdexcept>

#include "Tools/ExitStatus.h"

namespace kelvasi {

// One line for the standard error; the exit status is exitFault.
class ToolError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

// The reader of the standard output has gone. Nothing is left to say; the exit status is exitOutputClosed.
class OutputClosed : public ToolError {
 public:
  OutputClosed() : ToolError("the reader of the standard output has gone") {}
};

}  // namespace kelvasi
