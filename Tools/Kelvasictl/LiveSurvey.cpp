// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/LiveSurvey.h"

#include "Telvon/TechnologyName.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr auto timeBetweenLooks = 250ms;

}  // namespace

// The tree is asked for so that the generator lets the messages of the last tick go.
LiveSurvey::LiveSurvey(const LiveOptions& options, const SurveyUse& use)
    : use_(use), session_(options, [this] { session_.model().topLevelNodes(); }) {
  session_.model().gatherReadings([this](const Readings& readings, const Intake& intake) {
    try {
      take(readings, intake);
    } catch (const ToolError& error) {
      session_.end(error.what());
    }
  });
}

void LiveSurvey::run() {
  const auto timer = session_.queue().repeat(timeBetweenLooks, [this] {
    try {
      pass();
    } catch (const ToolError& error) {
      session_.end(error.what());
    }
  });
  session_.run();
  finish();
}

void LiveSurvey::take(const Readings& readings, const Intake& intake) {
  if (!survey_ || technology_ != session_.model().technology()) begin();
  generator_ = session_.model().sharedLogGenerator();
  survey_->take(readings, intake);
}

void LiveSurvey::begin() {
  finish();
  technology_ = session_.model().technology();
  survey_ =
      std::make_unique<survey::Survey>(use_.setUp(std::string(shortTechnologyName(technology_)), printOut));
}

void LiveSurvey::finish() {
  if (survey_) use_.take({std::string(shortTechnologyName(technology_)), *generator_, *survey_});
}

void LiveSurvey::pass() {
  use_.tick();
  if (!survey_) return;
  const Arrival now = arrivalAt(session_.clock().now());
  if (!session_.model().isConnected()) survey_->loseLink(now, "the daemon is not there");
  survey_->pass(now);
}

}  // namespace kelvasi
