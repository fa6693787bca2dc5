// SPDX-License-Identifier: Apache-2.0
// Another process of this machine, for measurements that need one.
#pragma once

#include <sys/types.h>

#include <string>
#include <vector>

namespace kelvasi::bench {

// A process whose standard output is dropped or, for one that is started `talking`, can be waited for. It is
// ended, if need be, and waited for when this object goes. Throws std::system_error when it cannot be
// started.
class Process {
 public:
  enum class Output { dropped, talking };

  Process(const std::string& program, const std::vector<std::string>& arguments, Output output);
  ~Process();
  Process(const Process&) = delete;
  Process& operator=(const Process&) = delete;

  // Waits for the first byte of the standard output. False when the process ends without one.
  bool waitForOutput();
  // Waits for the end; true when the exit status is 0.
  bool waitForSuccess();

 private:
  pid_t process_ = -1;
  int output_ = -1;
};

// The path of this very program.
inline constexpr const char* thisProgram = "/proc/self/exe";

// An empty private runtime directory, in force for this process and those it starts while the object is
// there. Throws std::system_error when there is none to be had.
class PrivateRuntimeDirectory {
 public:
  PrivateRuntimeDirectory();
  ~PrivateRuntimeDirectory();
  PrivateRuntimeDirectory(const PrivateRuntimeDirectory&) = delete;
  PrivateRuntimeDirectory& operator=(const PrivateRuntimeDirectory&) = delete;

 private:
  std::string path_;
};

}  // namespace kelvasi::bench
