// SPDX-License-Identifier: Apache-2.0
// Another program, run beside this one without a shell, once at a time.
#pragma once

#include <sys/types.h>

#include <chrono>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace kelvasi {

class ChildCommand {
 public:
  using Variables = std::vector<std::pair<std::string, std::string>>;

  // The program, looked for along PATH unless it has a slash, and its arguments.
  explicit ChildCommand(std::vector<std::string> arguments) : arguments_(std::move(arguments)) {}
  // Ends it as end() does, without patience.
  ~ChildCommand();
  ChildCommand(const ChildCommand&) = delete;
  ChildCommand& operator=(const ChildCommand&) = delete;

  // With these variables added to the environment, nothing on its standard input, and its standard output on
  // our standard error. What went wrong, if anything. Must not run already.
  std::optional<std::string> start(const Variables& variables);
  // Takes note of its end; no process is left behind then.
  bool isRunning();
  void wait();
  // Lets it run on for so long at most, then asks it to end, and at last ends it.
  void end(std::chrono::milliseconds patience);

  // Runs that ended with another status than 0, by a signal too.
  unsigned failures() const { return failures_; }

 private:
  bool hasEndedWithin(std::chrono::milliseconds time);
  void noteEnd(int status);

  std::vector<std::string> arguments_;
  pid_t process_ = 0;  // 0: none
  unsigned failures_ = 0;
};

}  // namespace kelvasi
