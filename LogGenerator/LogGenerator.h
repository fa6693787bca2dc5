// SPDX-License-Identifier: Apache-2.0
// A log generator turns the diagnostic stream of one radio technology into the generator state, from which
// the display tree and the snapshot are made.
//
// The state is one dictionary per session, owned by the model and handed to every call. Its keys:
//   "DisplayState"  the raw material of the last interval
//   "Display"       the display dictionary
//   "ExtraInfo"     a dictionary, new whenever "Display" is built
//   "Template"      the display template, loaded once
//   "History"       at most five history entries, the oldest first
#pragma once

#include <cstdint>
#include <memory>
#include <span>
#include <string_view>

#include "LogGenerator/Arrival.h"
#include "LogGenerator/Intake.h"
#include "LogGenerator/Readings.h"
#include "LogGenerator/RowCatalog.h"
#include "Platform/Platform.h"
#include "Plist/PlistValue.h"

namespace kelvasi {

class LogGenerator {
 public:
  // For one that is made without a word in the system log.
  struct Bare {};
  static constexpr Bare bare{};

  explicit LogGenerator(const Platform& platform);
  LogGenerator(const Platform& platform, Bare) : platform_(platform) {}
  virtual ~LogGenerator() = default;
  LogGenerator(const LogGenerator&) = delete;
  LogGenerator& operator=(const LogGenerator&) = delete;

  // Abstract: on LogGenerator itself each throws UnimplementedMethodError.

  // Takes in one log message.
  virtual void updateState(PlistDictionary& state, std::span<const std::uint8_t> data);
  // The display of this tick; may be absent.
  virtual PlistValue generateLogUsingState(PlistDictionary& state);
  // What the session sends to start the stream.
  virtual PlistValue getStartCommand() const;
  // The array that goes into a snapshot.
  virtual PlistValue getSaveContentsFromState(const PlistDictionary& state) const;

  // Whether what the state shows is this generator's: made by it, or by one of the same technology before it.
  // True while nothing is shown.
  virtual bool ownsDisplay(const PlistDictionary& state) const;

  // Appends one history entry made of the state as it is, dropping the oldest past five. An entry ends before
  // the first of its keys that the state lacks.
  static void updateHistoryInState(PlistDictionary& state, const Clock& clock);

  // The arrival of the messages from now on; the caller says it anew before each of them.
  void setArrival(Arrival arrival) { arrival_ = arrival; }
  // From now on every message's readings are gathered there, until another place or null is named.
  virtual void gatherInto(Readings* readings) { readings_ = readings; }
  // What became of the messages so far.
  const Intake& intake() const { return intake_; }
  // Goes on counting where another generator of the technology has left off.
  void continueIntake(Intake intake) { intake_ = std::move(intake); }

  // Every row that a display of the technology can have, in the order of its decoders.
  virtual void describe(RowCatalog& catalog) const;

  // The generator for what the daemon calls the technology; null for one that is not known.
  static std::unique_ptr<LogGenerator> generatorFromTechnology(std::string_view technology,
                                                               const Platform& platform);

 protected:
  const Platform& platform() const { return platform_; }
  Arrival arrival() const { return arrival_; }
  Readings* readings() const { return readings_; }  // null: nobody listens
  void count(LogCode logCode, Outcome outcome, std::span<const std::uint8_t> record,
             std::optional<std::size_t> versionAt = {}) {
    intake_.count(logCode, outcome, arrival_, record, versionAt);
  }

 private:
  Platform platform_;
  Arrival arrival_{0};
  Readings* readings_ = nullptr;
  Intake intake_;
};

}  // namespace kelvasi
