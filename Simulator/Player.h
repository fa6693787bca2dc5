// SPDX-License-Identifier: Apache-2.0
// Plays a source of messages to the daemon's applications: in its own time, faster or slower, or as fast as
// the applications take it. Time in the world stands still while no application streams.
#pragma once

#include <functional>
#include <memory>

#include "Platform/Clock.h"
#include "Platform/MainQueue.h"
#include "Simulator/Daemon.h"
#include "Simulator/MessageFaults.h"
#include "Simulator/MessageSource.h"

namespace kelvasi::sim {

// World seconds per second; 0 is as fast as the applications take it.
struct Speed {
  double factor = 1;
  bool isUnlimited() const { return factor == 0; }
};

class Player {
 public:
  using EndHandler = std::function<void()>;

  // What is given by reference outlives the player. `onEnd` is called each time that the source has ended.
  Player(MainQueue& queue, const Clock& clock, Daemon& daemon, MessageSource& source, Speed speed,
         const Faults& faults, EndHandler onEnd);

  // To be called when a channel's stream has begun: it is told the present state, and playing goes on. A
  // source that has ended begins anew.
  void streamBegan(Channel& channel);

 private:
  void play();
  void stop();
  void tick();
  void advance(WorldTime until);
  void burst();
  void waitForApplications();
  Task whileAlive(void (Player::*step)());
  double now() const { return clock_.now().secondsSince1970; }

  MainQueue& queue_;
  const Clock& clock_;
  Daemon& daemon_;
  MessageSource& source_;
  Speed speed_;
  MessageFaults faults_;
  EndHandler onEnd_;

  bool isPlaying_ = false;
  WorldTime worldNow_{0};
  double lastTick_ = 0;
  double lastProgress_ = 0;
  std::unique_ptr<Timer> timer_;
  Messages batch_;
  std::shared_ptr<const bool> alive_ = std::make_shared<const bool>(true);
};

}  // namespace kelvasi::sim
