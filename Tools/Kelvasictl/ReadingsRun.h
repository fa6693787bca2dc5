// SPDX-License-Identifier: Apache-2.0
// The readings of captures, one after the other, as one run.
#pragma once

#include <optional>
#include <string>
#include <vector>

#include "Platform/PushedClock.h"
#include "Tools/Kelvasictl/CaptureWork.h"
#include "Tools/Kelvasictl/Decode.h"
#include "Tools/Kelvasictl/ReadingPrinter.h"
#include "Tools/Kelvasictl/Surroundings.h"

namespace kelvasi {

// It shares nothing that changes with others, so that it may have a thread of its own.
class ReadingsRun {
 public:
  // `wish` and `surroundings` outlive it. The run has one technology, that of the first message unless
  // `choice` names it.
  ReadingsRun(const ReadingWish& wish, const Surroundings& surroundings, CaptureInput::Choice choice);

  void run(const CaptureOutput& output);
  // Whether something could not be read.
  bool hasFault() const { return hasFault_; }
  // What became of the messages; null where there was no technology.
  const Intake* intake() const { return decode_ ? &decode_->intake() : nullptr; }

 private:
  void begin(std::string_view technology);

  const ReadingWish& wish_;
  const Surroundings& surroundings_;
  CaptureInput::Choice choice_;
  PushedClock clock_;
  Readings readings_;
  std::optional<Decode> decode_;
  bool hasFault_ = false;
};

}  // namespace kelvasi
