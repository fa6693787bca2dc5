// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/LiveSurvey.h"

#include "Telvon/TechnologyName.h"
#include "Tools/Kelvasictl/StandardStreams.h"

namespace kelvasi {

LiveSurvey::LiveSurvey(const LiveOptions& options, const SurveyUse& use)
    : use_(use), run_(options, liveUse()) {}

LiveUse LiveSurvey::liveUse() {
  return {.begin = [this](std::string_view technology) { begin(technology); },
          .take = [this](const Readings& readings, const Intake& intake) { survey_->take(readings, intake); },
          .finish =
              [this](const LogGenerator& generator) {
                use_.take({technology_, generator, *survey_});
              },
          .look = [this](Arrival now, bool isConnected) { look(now, isConnected); }};
}

void LiveSurvey::begin(std::string_view technology) {
  technology_ = shortTechnologyName(technology);
  survey_ = std::make_unique<survey::Survey>(use_.setUp(technology_, printOut));
}

void LiveSurvey::look(Arrival now, bool isConnected) {
  use_.tick();
  if (!survey_) return;
  if (!isConnected) survey_->loseLink(now, "the daemon is not there");
  survey_->pass(now);
}

}  // namespace kelvasi
