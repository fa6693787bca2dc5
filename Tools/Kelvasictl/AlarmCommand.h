// SPDX-License-Identifier: Apache-2.0
// The program that is run for an alarm.
#pragma once

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "Platform/Posix/ChildCommand.h"
#include "Tools/Kelvasictl/RecordOutput.h"

namespace kelvasi {

class AlarmCommand {
 public:
  enum class WhenBusy { wait, leaveOut };

  // Not before `every` after the alarm that it was run for last, by the alarms' own time.
  AlarmCommand(std::vector<std::string> arguments, std::chrono::nanoseconds every, WhenBusy whenBusy)
      : command_(std::move(arguments)), every_(every), whenBusy_(whenBusy) {}

  // Says on the standard error when it cannot be started.
  void run(const Json& alarm, std::chrono::nanoseconds time);
  // To be called now and then, so that an ended run is noticed.
  void look() { command_.isRunning(); }
  // Lets the last run come to its end, and says how many alarms went without and how many runs failed.
  void finish();

  // Whether every run could be started and ended well.
  bool isWell() const { return notStarted_ == 0 && command_.failures() == 0; }

  // The members of an alarm's record as variables: "held_back" is KELVASI_ALARM_HELD_BACK, null is empty.
  static ChildCommand::Variables variablesOf(const Json& alarm);

 private:
  bool isTooEarly(std::chrono::nanoseconds time) const;

  ChildCommand command_;
  std::chrono::nanoseconds every_;
  WhenBusy whenBusy_;
  std::optional<std::chrono::nanoseconds> last_;
  std::uint64_t leftOut_ = 0;
  unsigned notStarted_ = 0;
};

}  // namespace kelvasi
