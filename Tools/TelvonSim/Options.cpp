// SPDX-License-Identifier: Apache-2.0
#include "Tools/TelvonSim/Options.h"

#include <algorithm>
#include <cmath>
#include <iostream>

#include "Simulator/Commands.h"
#include "Simulator/ScenarioList.h"
#include "Telvon/TechnologyName.h"

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

// Both put what is meant in the text's place and return what is wrong with it.
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
  OptionSet app = commandLine.options();
  app.setFooter(listOfFaults());
  app.add("--technology", options.technology, "IFX, Orvane_GSM, Orvane_CDMA, Orvane_LTE or Orvane_UTRAN2")
      .type("TECH")
      .transform(readTechnology)
      .required();
  const Option scenario =
      app.add("--scenario", options.scenario, "what to play; see --list-scenarios").type("NAME");
  const Option replay =
      app.add("--replay", options.replay,
              "play the messages of a capture (pcap, pcapng, DLF) or a snapshot, with its timing")
          .type("CAPTURE")
          .excludes(scenario);
  app.addFlag("--loop", options.isLooping, "begin the capture again when it has ended").needs(replay);
  app.addFlag("--leave", options.leavesAtEnd,
              "end when the capture has been played, or the last application has left")
      .needs(replay);
  app.add("--speed", options.speed.factor,
          "world seconds per second; \"max\" or 0 is as fast as the applications take it")
      .type("X")
      .transform(readSpeed)
      .between(0, 1e6, "from 0 to 1000000");
  const Option rate =
      app.add("--rate", options.rate, "synthetic load: repeat the scenario's messages, N a second")
          .type("N")
          .between(1e-3, 1e9, "from 0.001 to 1000000000")
          .excludes(replay);
  app.add("--seed", options.seed, "the same seed gives the same messages").type("N").showsDefault();
  app.addReader<double>(
         "--start-at",
         [&options](double seconds) { options.startAt = std::chrono::seconds(std::llround(seconds)); },
         "begin so many whole seconds after the scenario's beginning")
      .type("N")
      .between(0, 86400, "from 0 to 86400")
      .excludes(replay);
  const Option seconds = app.add("--seconds", options.seconds, "end after so many seconds")
                             .type("N")
                             .between(0, 1e9, "from 0 to 1000000000");
  app.addReader<std::vector<std::string>>(
         "--fault",
         [&options](const std::vector<std::string>& requests) {
           for (const std::string& request : requests) {
             const std::string wrong = options.faults.add(request);
             if (!wrong.empty()) throw WrongUsage("--fault", wrong);
           }
         },
         "misbehave; see below")
      .type("FAULT");
  const Option worldLog =
      app.add("--world-log", options.worldLog,
              "write the world's cells at every step into a new file, JSON lines: which serve, their levels")
          .type("FILE")
          .excludes(replay)
          .excludes(rate);
  Option write =
      app.add("--write", options.write,
              "write what a stream from the start brings into a pcap file, without waiting, and end")
          .type("FILE")
          .excludes(replay)
          .excludes(worldLog)
          .excludes(seconds);
  const Option messages = app.add("--messages", options.messages, "how many messages go into the file")
                              .type("N")
                              .positive()
                              .needs(write);
  write.needs(messages);
  app.addFlag("--force", options.isForced, "the file may take the place of another").needs(write);
  app.addFlagThatEnds(
      "--list-scenarios", [] { std::cout << listOfScenarios(); }, "list the scenarios and end");
}

}  // namespace kelvasi
