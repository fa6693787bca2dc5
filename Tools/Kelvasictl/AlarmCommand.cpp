// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/AlarmCommand.h"

#include <algorithm>

#include "Tools/Kelvasictl/StandardStreams.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto patience = 5s;

std::string variableName(const std::string& key) {
  std::string name = "KELVASI_ALARM_" + key;
  std::ranges::transform(name, name.begin(), [](char each) {
    return each >= 'a' && each <= 'z' ? static_cast<char>(each - 'a' + 'A') : each;
  });
  return name;
}

std::string variableValue(const Json& value) {
  if (value.is_null()) return {};
  return value.is_string() ? value.get<std::string>() : value.dump();
}

std::string counted(std::uint64_t count, const std::string& thing) {
  return std::to_string(count) + " " + thing + (count == 1 ? "" : "s");
}

}  // namespace

ChildCommand::Variables AlarmCommand::variablesOf(const Json& alarm) {
  ChildCommand::Variables variables;
  for (const auto& [key, value] : alarm.items())
    variables.emplace_back(variableName(key), variableValue(value));
  return variables;
}

bool AlarmCommand::isTooEarly(std::chrono::nanoseconds time) const {
  return last_ && time >= *last_ && time - *last_ < every_;
}

void AlarmCommand::run(const Json& alarm, std::chrono::nanoseconds time) {
  if (isTooEarly(time) || (whenBusy_ == WhenBusy::leaveOut && command_.isRunning())) {
    ++leftOut_;
    return;
  }
  command_.wait();
  last_ = time;
  const auto error = command_.start(variablesOf(alarm));
  if (error && ++notStarted_ == 1) complain(*error);
}

void AlarmCommand::finish() {
  command_.end(patience);
  if (leftOut_ > 0)
    complain(counted(leftOut_, "alarm") +
             " came while the command ran or too soon after it, and went without");
  if (command_.failures() > 0) complain("the command failed in " + counted(command_.failures(), "run"));
}

}  // namespace kelvasi
