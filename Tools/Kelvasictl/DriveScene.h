// SPDX-License-Identifier: Apache-2.0
// A recorded drive as a scene of `top`. It is read once to its end, for events and the timeline. The state at
// a moment is what decoding up to it makes: forwards from where it stands, backwards from the beginning, a
// slice at a time, so that keys are answered meanwhile. Its memory is that of two engines, whatever the
// drive's length.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "Tools/Kelvasictl/DriveEngine.h"
#include "Tools/Kelvasictl/Ribbon.h"
#include "Tools/Top/Scene.h"

namespace kelvasi {

class DriveScene : public top::Scene {
 public:
  // `surroundings` outlives it. Opens the captures; hasMessages() says whether there is anything in them.
  DriveScene(const Surroundings& surroundings, CaptureInput::Choice choice, cockpit::TextStyle style,
             CaptureInput::Tell tell);

  bool hasMessages() const { return whole_->begin().has_value(); }
  bool hasFault() const { return whole_->hasFault(); }

  // Whether there is work to be done; and a slice of it, some ten milliseconds.
  bool isWorking() const { return isReading() || here_ || !hasArrived_; }
  void work();
  // Every second.
  void pass();

  cockpit::Cockpit& cockpit() override { return shown().cockpit(); }
  Arrival moment() const override { return moment_; }
  cockpit::Snapshot face() override { return shown().cockpit().at(moment_); }
  NodeRef root() override { return shown().root(); }
  std::vector<cockpit::EventLine> events(std::size_t most) const override;
  std::string status() const override;
  PlistValue saveContents() override { return shown().saveContents(); }
  std::string whyNoSave() const override;
  void pause() override { isPlaying_ = !isPlaying_; }
  bool step(int by) override;
  void move(std::chrono::nanoseconds by) override { goTo(target_ + by); }
  void goTo(Arrival moment) override;
  std::optional<top::Timeline> timeline(std::size_t columns) const override;

 private:
  bool isReading() const { return !whole_->isAtEnd(); }
  DriveEngine& shown() const { return shown_ ? *shown_ : *whole_; }
  std::unique_ptr<DriveEngine> engine() const;
  std::vector<Arrival> eventTimes() const;
  void read();
  void seek();
  void arrive(std::unique_ptr<DriveEngine> engine);
  std::string workWords() const;

  const Surroundings& surroundings_;
  CaptureInput::Choice choice_;
  cockpit::TextStyle style_;
  std::unique_ptr<DriveEngine> whole_;
  std::unique_ptr<DriveEngine> shown_;  // null: the whole, at its end
  std::unique_ptr<DriveEngine> here_;   // from the beginning on its way to the target; null: there is none
  Ribbon ribbon_;
  std::uint64_t size_ = 0;  // bytes of all files, as far as they are known
  Arrival from_{0};
  Arrival to_{0};
  Arrival moment_{0};
  Arrival target_{0};
  bool hasArrived_ = true;  // at the target
  bool isPlaying_ = false;
};

}  // namespace kelvasi
