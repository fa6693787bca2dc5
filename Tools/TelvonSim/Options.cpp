// SPDX-License-Identifier: Apache-2.0
#include "Tools/TelvonSim/Options.h"

#include <CLI/CLI.hpp>
#include <cmath>

#include "Simulator/Commands.h"
#include "Simulator/ScenarioList.h"
#include "Telvon/TechnologyName.h"
#include "Tools/NumberCheck.h"

namespace kelvasi {

namespace {

std::string listOfFaults() {
  std::string text = "Faults (several at once, each with its own --fault):\n";
  for (const sim::FaultKind& kind : sim::faultKinds()) {
    std::string name(kind.name);
    if (kind.value == sim::FaultKind::Value::required) name += "=" + std::string(kind.valueName);
    if (kind.value == sim::FaultKind::Value::optional) name += "[=" + std::string(kind.valueName) + "]";
    name.resize(std::max<std::size_t>(name.size() + 1, 22), ' ');
    text += "  " + name + std::string(kind.help) + "\n";
  }
  return text;
}

std::string listOfScenarios() {
  std::string text;
  for (const sim::ScenarioKind& kind : sim::scenarioKinds()) {
    std::string name = std::string(shortTechnologyName(kind.technology)) + " " + std::string(kind.name);
    name.resize(std::max<std::size_t>(name.size() + 1, 24), ' ');
    text += name + std::string(kind.help) + "\n";
  }
  return text;
}

// Both take a text apart for CLI11, whose convention is to return what is wrong with it.
std::string readTechnology(std::string& text) {
  const auto id = technologyId(text);
  if (!id) return "there is no technology \"" + text + "\"";
  text = *id;
  return {};
}

std::string readSpeed(std::string& text) {
  if (text == "max") text = "0";
  return {};
}

void offerWords(CommandLine& commandLine) {
  std::vector<std::string> technologies;
  std::vector<std::string> scenarios;
  std::vector<std::string> faults;
  for (const std::string_view id : technologyIds()) technologies.emplace_back(shortTechnologyName(id));
  for (const sim::ScenarioKind& kind : sim::scenarioKinds()) {
    if (std::ranges::find(scenarios, kind.name) == scenarios.end()) scenarios.emplace_back(kind.name);
  }
  for (const sim::FaultKind& kind : sim::faultKinds())
    faults.push_back(std::string(kind.name) + (kind.value == sim::FaultKind::Value::required ? "=" : ""));
  commandLine.offerWords("TECH", std::move(technologies));
  commandLine.offerWords("NAME", std::move(scenarios));
  commandLine.offerWords("FAULT", std::move(faults));
}

}  // namespace

void declareOptions(CommandLine& commandLine, SimulatorOptions& options) {
  offerWords(commandLine);
  CLI::App& app = commandLine.app();
  app.footer(listOfFaults());
  app.add_option("--technology", options.technology,
                 "IFX, Orvane_GSM, Orvane_CDMA, Orvane_LTE or Orvane_UTRAN2")
      ->type_name("TECH")
      ->transform(CLI::Validator(readTechnology, ""))
      ->required();
  const auto scenario =
      app.add_option("--scenario", options.scenario, "what to play; see --list-scenarios")->type_name("NAME");
  app.add_option("--replay", options.replay,
                 "play the messages of a capture (pcap, pcapng, DLF) or a snapshot, with its timing")
      ->type_name("CAPTURE")
      ->excludes(scenario);
  app.add_flag("--loop", options.isLooping, "begin the capture again when it has ended")->needs("--replay");
  app.add_flag("--leave", options.leavesAtEnd,
               "end when the capture has been played, or the last application has left")
      ->needs("--replay");
  app.add_option("--speed", options.speed.factor,
                 "world seconds per second; \"max\" or 0 is as fast as the applications take it")
      ->type_name("X")
      ->transform(CLI::Validator(readSpeed, ""))
      ->check(numberBetween(0, 1e6, "from 0 to 1000000"));
  app.add_option("--rate", options.rate, "synthetic load: repeat the scenario's messages, N a second")
      ->type_name("N")
      ->check(numberBetween(1e-3, 1e9, "from 0.001 to 1000000000"))
      ->excludes("--replay");
  app.add_option("--seed", options.seed, "the same seed gives the same messages")
      ->type_name("N")
      ->capture_default_str();
  app.add_option_function<double>(
         "--start-at",
         [&options](double seconds) { options.startAt = std::chrono::seconds(std::llround(seconds)); },
         "begin so many whole seconds after the scenario's beginning")
      ->type_name("N")
      ->check(numberBetween(0, 86400, "from 0 to 86400"))
      ->excludes("--replay");
  app.add_option("--seconds", options.seconds, "end after so many seconds")
      ->type_name("N")
      ->check(numberBetween(0, 1e9, "from 0 to 1000000000"));
  app.add_option_function<std::vector<std::string>>(
         "--fault",
         [&options](const std::vector<std::string>& requests) {
           for (const std::string& request : requests) {
             const std::string wrong = options.faults.add(request);
             if (!wrong.empty()) throw CLI::ValidationError("--fault", wrong);
           }
         },
         "misbehave; see below")
      ->type_name("FAULT");
  const auto write =
      app.add_option("--write", options.write,
                     "write what a stream from the start brings into a pcap file, without waiting, and end")
          ->type_name("FILE")
          ->excludes("--replay")
          ->excludes("--seconds");
  const auto messages = app.add_option("--messages", options.messages, "how many messages go into the file")
                            ->type_name("N")
                            ->check(CLI::PositiveNumber)
                            ->needs(write);
  write->needs(messages);
  app.add_flag("--force", options.isForced, "the file may take the place of another")->needs(write);
  app.add_flag_callback(
      "--list-scenarios",
      [] {
        std::cout << listOfScenarios();
        throw CLI::Success();
      },
      "list the scenarios and end");
}

}  // namespace kelvasi
