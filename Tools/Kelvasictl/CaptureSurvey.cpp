// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/CaptureSurvey.h"

#include "Telvon/TechnologyName.h"

namespace kelvasi {

namespace {

// A generator keeps the messages since the last tick for a snapshot; so many of them at most.
constexpr std::uint64_t messagesPerTick = 1000;

}  // namespace

CaptureSurvey::CaptureSurvey(const Surroundings& surroundings, std::string path, std::string technology)
    : surroundings_(surroundings),
      path_(std::move(path)),
      technology_(std::move(technology)),
      clock_(surroundings.clock) {}

void CaptureSurvey::run(const SurveyUse& use, const CaptureOutput& output) {
  CaptureInput::Choice choice{.paths = {path_}, .technology = {}};
  if (!technology_.empty()) choice.technology = technology_;
  CaptureInput input(std::move(choice), surroundings_.plists, output.complain, output.advance);
  while (const auto message = input.next()) {
    if (!survey_) begin(message->technology, use, output.print);
    take(*message);
  }
  hasFault_ = input.hasFault();
}

void CaptureSurvey::giveTo(const SurveyUse& use) const {
  if (survey_) use.take({std::string(shortTechnologyName(technology_)), *generator_, *survey_});
}

void CaptureSurvey::begin(std::string_view technology, const SurveyUse& use, const SurveyUse::Print& print) {
  technology_ = technology;
  generator_ = LogGenerator::generatorFromTechnology(technology_, surroundings_.platformWith(clock_));
  generator_->gatherInto(&readings_);
  survey_ = std::make_unique<survey::Survey>(use.setUp(std::string(shortTechnologyName(technology_)), print));
}

void CaptureSurvey::take(const CapturedMessage& message) {
  decode(message);
  survey_->take(readings_, generator_->intake());
}

void CaptureSurvey::decode(const CapturedMessage& message) noexcept {
  clock_.set(message.arrival);
  generator_->setArrival(message.arrival);
  generator_->updateState(*state_, message.bytes);
  if (++messages_ % messagesPerTick == 0) generator_->generateLogUsingState(*state_);
}

}  // namespace kelvasi
