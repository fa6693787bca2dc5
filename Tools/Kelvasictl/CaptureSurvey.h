// SPDX-License-Identifier: Apache-2.0
// The survey of one capture. It shares nothing that changes with others, so that it may have a thread of its
// own.
#pragma once

#include <memory>
#include <string>
#include <string_view>

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Readings.h"
#include "Platform/PushedClock.h"
#include "Tools/Kelvasictl/CaptureWork.h"
#include "Tools/Kelvasictl/SurveyRun.h"

namespace kelvasi {

class CaptureSurvey {
 public:
  // `surroundings` outlives it. `technology` by its identifier, empty where it is to be found.
  CaptureSurvey(const Surroundings& surroundings, std::string path, std::string technology);

  void run(const SurveyUse& use, const CaptureOutput& output);
  // Whether something of the capture could not be read.
  bool hasFault() const { return hasFault_; }
  // The result, where there was a technology.
  void giveTo(const SurveyUse& use) const;

 private:
  void begin(std::string_view technology, const SurveyUse& use, const SurveyUse::Print& print);
  void take(const CapturedMessage& message);
  // An exception of a decoder ends the process.
  void decode(const CapturedMessage& message) noexcept;

  const Surroundings& surroundings_;
  std::string path_;
  std::string technology_;
  PushedClock clock_;
  std::unique_ptr<LogGenerator> generator_;
  PlistValue::Dictionary state_ = PlistDictionary::make();
  Readings readings_;
  std::unique_ptr<survey::Survey> survey_;
  std::uint64_t messages_ = 0;
  bool hasFault_ = false;
};

}  // namespace kelvasi
