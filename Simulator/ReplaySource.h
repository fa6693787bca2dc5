// SPDX-License-Identifier: Apache-2.0
// Plays a capture's messages with the timing with which they arrived.
#pragma once

#include <functional>
#include <memory>
#include <string>

#include "Capture/CaptureReader.h"
#include "Simulator/MessageSource.h"

namespace kelvasi::sim {

class ReplaySource : public MessageSource {
 public:
  using Opener = std::function<std::unique_ptr<CaptureReader>()>;
  using EndHandler = std::function<void(const CaptureReader& capture)>;

  // `open` gives the capture from its beginning, each time anew. A source that loops begins again a second
  // after the last message. `onEnd` is called each time that a capture was read to its end or fault.
  ReplaySource(Opener open, bool isLooping, EndHandler onEnd);

  std::optional<WorldTime> nextAt() const override { return due_; }
  void take(Messages& messages) override;
  void rewind() override;

 private:
  void readFirst();
  void readNext();
  void keep(const CapturedMessage& message);

  Opener open_;
  bool isLooping_;
  EndHandler onEnd_;
  std::unique_ptr<CaptureReader> capture_;
  std::chrono::nanoseconds firstArrival_{0};
  WorldTime begin_{0};  // of this round
  std::optional<WorldTime> due_;
  Bytes next_;
};

}  // namespace kelvasi::sim
