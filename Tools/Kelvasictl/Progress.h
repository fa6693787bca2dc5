// SPDX-License-Identifier: Apache-2.0
// How far a verb has come with its captures, shown on the standard error while that is a terminal.
#pragma once

#include <chrono>
#include <mutex>
#include <string>
#include <vector>

#include "Tools/Kelvasictl/ProgressText.h"

namespace kelvasi {

class Progress {
 public:
  // When the verb writes to the standard output. Where both are the terminal, `meanwhile` leaves it the
  // place.
  enum class Output { atTheEnd, meanwhile };

  Progress(const std::vector<std::string>& captures, Output output);
  // Takes the line away.
  ~Progress();
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;

  // So many more messages, and bytes of the files, were read. From any thread; shows the line now and then.
  void add(std::uint64_t messages, std::uint64_t bytes);

 private:
  using Time = std::chrono::steady_clock::time_point;

  void show(Time now);

  const bool isShown_;
  const Time begin_;
  std::mutex mutex_;
  ProgressFigures figures_;
  Time next_;
  bool isOnScreen_ = false;
};

}  // namespace kelvasi
