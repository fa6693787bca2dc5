// SPDX-License-Identifier: Apache-2.0
// What a run of readings says: series, cells, events and alarms. Plain values in, no clock and no output.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "LogGenerator/Intake.h"
#include "LogGenerator/Readings.h"
#include "Survey/Alarms/AlarmWatch.h"
#include "Survey/Cells/Cells.h"
#include "Survey/Events/EventFinder.h"
#include "Survey/Events/EventLog.h"
#include "Survey/Series/SeriesStore.h"

namespace kelvasi::survey {

struct SurveySetUp {
  bool keepsSeries = true;  // otherwise series() is null
  SeriesSize series;
  std::size_t events = EventLog::mostEvents;
  std::vector<AlarmRule> rules;
  EventFinder::OnEvent onEvent;
  AlarmWatch::Give onAlarm;
};

class Survey {
 public:
  explicit Survey(SurveySetUp setUp = {});
  Survey(const Survey&) = delete;
  Survey& operator=(const Survey&) = delete;

  // Each message, in the order of arrival: its readings, and the intake that has counted it already.
  void take(const Readings& readings, const Intake& intake);
  // The time without a message.
  void pass(Arrival time);
  // What is known of the connection to a daemon.
  void loseLink(Arrival time, std::string reason) { finder_.lose(time, std::move(reason)); }

  const Cells& cells() const { return cells_; }
  const SeriesStore* series() const { return series_.get(); }
  const EventLog& events() const { return events_; }
  const AlarmWatch& alarms() const { return alarms_; }
  void changeRules(std::vector<AlarmRule> rules) { alarms_.change(std::move(rules)); }

  // Adds another drive's cells and series; its events stay its own.
  void merge(const Survey& other);

 private:
  void measured(const SeenCell* cell, const Reading& reading, double value);
  void happened(const Event& event);

  EventFinder::OnEvent onEvent_;
  Arrival now_{0};
  EventLog events_;
  AlarmWatch alarms_;
  EventFinder finder_;
  std::unique_ptr<SeriesStore> series_;
  Cells cells_;
};

}  // namespace kelvasi::survey
