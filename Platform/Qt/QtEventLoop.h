// SPDX-License-Identifier: Apache-2.0
// The event loop of a tool's main: everything of the main thread happens inside run().
#pragma once

#include <array>
#include <chrono>
#include <memory>

class QCoreApplication;

namespace kelvasi {

class QtEventLoop {
 public:
  // Made before anything else of this folder, and before any other thread: SIGINT, SIGTERM and SIGHUP (unless
  // that is ignored) are held back from this thread and those it starts, and end run() instead. A second one
  // then ends the process as usual.
  QtEventLoop();
  // Hands the signals back.
  ~QtEventLoop();
  QtEventLoop(const QtEventLoop&) = delete;
  QtEventLoop& operator=(const QtEventLoop&) = delete;

  // Runs until quit() is called or a signal comes. Returns the signal's number, 0 after quit().
  int run();
  // The same, `duration` long at most; 0 when it has passed.
  int runFor(std::chrono::milliseconds duration);
  // Handles what is there without waiting for anything, until a turn finds nothing; where things keep coming,
  // until `limit` has passed.
  void drain(std::chrono::milliseconds limit);
  // Ends run() in the present turn; without effect outside of run().
  void quit();

 private:
  class Signals;

  int argumentCount_ = 1;
  std::array<char, 8> name_{"kelvasi"};
  std::array<char*, 2> arguments_{name_.data(), nullptr};
  std::unique_ptr<QCoreApplication> application_;  // null when the process has made its own
  std::unique_ptr<Signals> signals_;
};

}  // namespace kelvasi
