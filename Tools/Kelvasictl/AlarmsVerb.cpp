// SPDX-License-Identifier: Apache-2.0
// kelvasictl alarms: watches captures or a live link by rules, and runs a program for each alarm.
#include <atomic>
#include <variant>

#include "Tools/Kelvasictl/AlarmCommand.h"
#include "Tools/Kelvasictl/EventRecords.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/SurveyRun.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

constexpr auto footer = R"(Rules look at the serving cell and at the handset itself:
  rsrp < -115 for 10s            beyond a threshold: <, <=, >, >=
  rsrp leaves -110..-60          outside a band
  rsrp absent for 30s            no value for so long
  event reject                   one of the events that "kelvasictl events" names
and may go on, in any order, with "for 10s" (how long it has to last; ms, s, min, h), "hysteresis 3" (how far the
value must come back before the alarm is over) and "every 5min" (at most so often; alarms held back are counted).

Each alarm is a record with the keys time, technology, rule, since, cell, quantity, value, unit, event, held_back and
text. The command gets the same in its environment, as KELVASI_ALARM_TIME, KELVASI_ALARM_TECHNOLOGY and so on, what
is null empty; no shell sees it, its standard input is empty, and what it prints goes to the standard error. One run
ends before the next begins: captures wait for it, a live link goes on and leaves the alarm without a run. So --jobs
is for alarms without a command.

Exit status: 0 without an alarm, 3 with one, 1 when a capture could not be read or a command failed, 2 for wrong
usage.)";

struct AlarmsOptions {
  SurveyOptions survey;
  std::vector<std::string> rules;
  std::string command;
  std::vector<std::string> arguments;
  double runEvery = 10;
};

constexpr int exitAlarm = 3;

class AlarmsVerb {
 public:
  explicit AlarmsVerb(const AlarmsOptions& options)
      : options_(options), format_(options.survey.format.format()) {
    for (const std::string& rule : options.rules)
      rules_.push_back(std::get<survey::AlarmRule>(survey::parseAlarmRule(rule)));
    if (!options.command.empty()) prepareCommand();
  }

  int run(MessageTally& tally) {
    RecordOutput(format_, alarmColumns(), printOut).begin();
    const SurveyUse use{.setUp = [this](const std::string& technology,
                                        const SurveyUse::Print& print) { return setUp(technology, print); },
                        .take = [&](const Surveyed& surveyed) { tally.add(surveyed.generator.intake()); },
                        .printsMeanwhile = true,
                        .tick =
                            [this] {
                              if (command_) command_->look();
                            }};
    const int status = runSurvey(options_.survey, use);
    if (command_) command_->finish();
    if (status != exitSuccess || (command_ && !command_->isWell())) return exitFault;
    return alarms_ > 0 ? exitAlarm : exitSuccess;
  }

 private:
  void prepareCommand() {
    std::vector<std::string> arguments{options_.command};
    arguments.insert(arguments.end(), options_.arguments.begin(), options_.arguments.end());
    const auto every = std::chrono::duration_cast<std::chrono::nanoseconds>(
        std::chrono::duration<double>(options_.runEvery));
    command_.emplace(
        std::move(arguments), every,
        options_.survey.isLive ? AlarmCommand::WhenBusy::leaveOut : AlarmCommand::WhenBusy::wait);
  }

  survey::SurveySetUp setUp(const std::string& technology, const SurveyUse::Print& print) {
    survey::SurveySetUp result;
    result.keepsSeries = false;
    result.events = 0;
    result.rules = rules_;
    result.onAlarm = [this, technology, output = RecordOutput(format_, alarmColumns(), print)](
                         const survey::Alarm& alarm) mutable { take(alarm, technology, output); };
    return result;
  }

  // With several jobs, in the thread of the capture; there is no command then.
  void take(const survey::Alarm& alarm, const std::string& technology, RecordOutput& output) {
    ++alarms_;
    const Json record = alarmRecord(alarm, technology);
    output.print(record);
    if (command_) command_->run(record, alarm.time);
  }

  const AlarmsOptions& options_;
  std::vector<survey::AlarmRule> rules_;
  const RecordOutput::Format format_;
  std::optional<AlarmCommand> command_;
  std::atomic<std::uint64_t> alarms_ = 0;
};

std::string checkRule(const std::string& text) {
  const auto parsed = survey::parseAlarmRule(text);
  const auto* error = std::get_if<survey::AlarmRuleError>(&parsed);
  return error ? "\"" + text + "\" " + error->text() : "";
}

}  // namespace

Action declareAlarms(OptionSet verb) {
  const auto options = std::make_shared<AlarmsOptions>();
  verb.add("--rule", options->rules, "what is an alarm, see below; may be given again")
      .type("RULE")
      .oneValueEach()
      .required()
      .check(checkRule);
  Option command =
      verb.add("--run", options->command, "run this program for each alarm, without a shell").type("COMMAND");
  verb.add("--argument", options->arguments, "an argument of the program; may be given again")
      .type("TEXT")
      .oneValueEach()
      .needs(command);
  verb.add("--run-every", options->runEvery,
           "run it at most once in so many seconds, by the alarms' own time; otherwise 10")
      .type("N")
      .between(0, 1e9, "from 0 to 1000000000")
      .needs(command);
  options->survey.addTo(verb);
  options->survey.addJobsTo(verb).excludes(command);
  verb.setFooter(footer);
  return [options](MessageTally& tally) { return AlarmsVerb(*options).run(tally); };
}

}  // namespace kelvasi
