// SPDX-License-Identifier: Apache-2.0
// The survey of a live link.
#pragma once

#include <memory>
#include <string>

#include "Tools/Kelvasictl/LiveRun.h"
#include "Tools/Kelvasictl/SurveyRun.h"

namespace kelvasi {

class LiveSurvey {
 public:
  LiveSurvey(const LiveOptions& options, const SurveyUse& use);

  // As LiveSession's; gives the survey to its use at the end, and when the technology changes.
  void run() { run_.run(); }

 private:
  LiveUse liveUse();
  void begin(std::string_view technology);
  void look(Arrival now, bool isConnected);

  const SurveyUse& use_;
  LiveRun run_;
  std::string technology_;  // of the survey, its short name
  std::unique_ptr<survey::Survey> survey_;
};

}  // namespace kelvasi
