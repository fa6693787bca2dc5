// SPDX-License-Identifier: Apache-2.0
// The model on a live link, inside the event loop of a verb.
#pragma once

#include <chrono>
#include <exception>
#include <optional>

#include "Model/KelvasiModel.h"
#include "Platform/Qt/QtEventLoop.h"
#include "Platform/Qt/QtMainQueue.h"
#include "Platform/Qt/QtMessagePorts.h"
#include "Platform/Qt/QtTelephonyDaemon.h"
#include "Platform/RateLimitedLog.h"
#include "Tools/Kelvasictl/Surroundings.h"

namespace kelvasi {

struct LiveOptions {
  std::optional<double> seconds;  // nothing: until a signal
  SurroundingsOptions surroundings;

  void addTo(OptionSet verb);
};

class LiveSession {
 public:
  // `onUpdate` is called after each display tick that saw new data.
  LiveSession(const LiveOptions& options, KelvasiModel::ViewControllerUpdate onUpdate);

  KelvasiModel& model() { return model_; }
  MainQueue& queue() { return queue_; }
  const Clock& clock() const { return surroundings_.clock; }
  Platform platform() const { return surroundings_.platform(); }

  // Whether the tree, since this was asked last, has become one that a generator of another technology left.
  bool hasBegunToShowAnother();

  // Connects and runs until SIGINT, SIGTERM, SIGHUP, the stated time or end(). What the sockets hold by a
  // signal or by the end of that time is still taken in. Says once where it waits when the first attempt
  // reaches no daemon. Throws what end() was given, and ToolError when the time has passed without a
  // daemon that told its technology.
  void run();
  // From within run() only.
  void end(std::exception_ptr error = nullptr);

 private:
  void connect();

  QtEventLoop loop_;  // first: it wants to be made before all else
  std::optional<double> seconds_;
  Surroundings surroundings_;
  QtMainQueue queue_;
  RateLimitedLog peerLog_;  // of what the other side causes
  QtMessagePorts ports_;
  QtTelephonyDaemon daemon_;
  KelvasiModel model_;
  bool hasEnded_ = false;  // by end()
  bool showsAnother_ = false;
  std::exception_ptr error_;
};

}  // namespace kelvasi
