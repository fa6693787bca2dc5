// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/LiveRun.h"

#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto timeBetweenLooks = 250ms;

}  // namespace

LiveRun::LiveRun(const LiveOptions& options, LiveUse use)
    : use_(std::move(use)), session_(options, [this] { update(); }) {
  session_.model().gatherReadings([this](const Readings& readings, const Intake& intake) {
    endAtFault([&] { take(readings, intake); });
  });
}

void LiveRun::run() {
  const auto timer = session_.queue().repeat(timeBetweenLooks, [this] {
    endAtFault([&] { use_.look(arrivalAt(session_.clock().now()), session_.model().isConnected()); });
  });
  session_.run();
  finish();
}

// The tree is asked for so that the generator lets the messages of the last tick go.
void LiveRun::update() {
  session_.model().topLevelNodes();
  if (session_.hasBegunToShowAnother())
    complain(
        "the daemon's technology has changed; its messages find no section until kelvasictl is started anew");
}

void LiveRun::take(const Readings& readings, const Intake& intake) {
  if (!generator_ || technology_ != session_.model().technology()) {
    finish();
    technology_ = session_.model().technology();
    use_.begin(technology_);
  }
  generator_ = session_.model().sharedLogGenerator();
  use_.take(readings, intake);
}

void LiveRun::finish() {
  if (generator_) use_.finish(*generator_);
}

template <typename Action>
void LiveRun::endAtFault(Action action) {
  try {
    action();
  } catch (const ToolError&) {
    session_.end(std::current_exception());
  }
}

}  // namespace kelvasi
