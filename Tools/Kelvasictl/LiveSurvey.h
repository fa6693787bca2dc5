// SPDX-License-Identifier: Apache-2.0
// The survey of a live link.
#pragma once

#include <memory>
#include <string>

#include "Tools/Kelvasictl/SurveyRun.h"

namespace kelvasi {

class LiveSurvey {
 public:
  LiveSurvey(const LiveOptions& options, const SurveyUse& use);

  // As LiveSession's; gives the survey to its use at the end, and when the technology changes.
  void run();

 private:
  void take(const Readings& readings, const Intake& intake);
  void begin();
  void finish();
  void pass();

  const SurveyUse& use_;
  LiveSession session_;
  std::string technology_;  // of the survey
  std::shared_ptr<const LogGenerator> generator_;
  std::unique_ptr<survey::Survey> survey_;
};

}  // namespace kelvasi
