// SPDX-License-Identifier: Apache-2.0
// Captures that are worked on each by itself, several side by side, while what they say comes in their order.
#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <vector>

#include "Capture/CaptureInput.h"
#include "Tools/Kelvasictl/Progress.h"

namespace kelvasi {

// Where the work on captures says what it has to say.
struct CaptureOutput {
  std::function<void(std::string_view text)> print;
  CaptureInput::Tell complain;
  CaptureInput::Advance advance;
};

struct CaptureWork {
  // Done for each capture, with several jobs in a thread of its own.
  std::function<void(std::size_t capture, const CaptureOutput& output)> work;
  // After each capture, in their order, in the caller's thread, when all that it said is out.
  std::function<void(std::size_t capture)> deliver;
  Progress::Output progress = Progress::Output::meanwhile;
};

// With one job everything is said at once. Throws what the work throws, and ToolError.
void workOnCaptures(const std::vector<std::string>& captures, unsigned jobs, const CaptureWork& work);

}  // namespace kelvasi
