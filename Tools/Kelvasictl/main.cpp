// SPDX-License-Identifier: Apache-2.0
// kelvasictl: wires the verbs to the command line.
#include <array>
#include <vector>

#include "Platform/Posix/StandardDescriptors.h"
#include "Radio/Quantity.h"
#include "Telvon/TechnologyName.h"
#include "Tools/CommandLine.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

constexpr std::array verbs{
    Verb{"decode", "decode captures and print the display", declareDecode},
    Verb{"monitor", "print the display of a live link at every update", declareMonitor},
    Verb{"top", "cockpit and panes on a terminal, of a live link or of a drive", declareTop},
    Verb{"readings", "print what every message wrote or removed, a line each", declareReadings},
    Verb{"record", "record a live link to a capture", declareRecord},
    Verb{"cells", "the cells of captures or of a live link, with their levels", declareCells},
    Verb{"events", "what happened: cell changes, states, rejects, service, link", declareEvents},
    Verb{"coverage", "what became of the messages, by log code", declareCoverage},
    Verb{"alarms", "watch captures or a live link by rules", declareAlarms},
    Verb{"dissector", "print a dissector for Wireshark, made from the tables of the decoders",
         declareDissector},
    Verb{"extcap", "make live links appear among the interfaces of Wireshark", declareExtcap},
    Verb{"report", "a drive on one page, for a browser or paper", declareReport},
    Verb{"redact", "write a capture anew without what says of whom it is", declareRedact},
    Verb{"fields", "list every row of every technology, and what stands behind it", declareFields},
};

std::string verbNames() {
  std::string names;
  for (const Verb& verb : verbs) {
    if (!names.empty()) names += &verb == &verbs.back() ? " or " : ", ";
    names += verb.name;
  }
  return names;
}

std::vector<std::string> technologyNames() {
  std::vector<std::string> names;
  for (const std::string_view id : technologyIds()) names.emplace_back(shortTechnologyName(id));
  return names;
}

std::vector<std::string> quantityNames() {
  std::vector<std::string> names;
  for (const Quantity* quantity : quantity::all) names.emplace_back(quantity->id);
  return names;
}

int run(int argumentCount, char** arguments, MessageTally& tally) {
  CommandLine commandLine("kelvasictl",
                          "Decodes, watches and records the diagnostic stream of a cellular modem.");
  std::vector<Action> actions;
  actions.reserve(verbs.size());
  for (const Verb& verb : verbs) actions.push_back(verb.declare(commandLine.addVerb(verb.name, verb.help)));
  commandLine.addHelpVerb();
  commandLine.offerWords("TECH", technologyNames());
  commandLine.offerWords("GLOB", quantityNames());
  commandLine.offerWords("RULE", quantityNames());
  if (const auto status = commandLine.parse(argumentCount, arguments)) return *status;
  for (std::size_t place = 0; place < verbs.size(); ++place) {
    if (commandLine.asksFor(verbs[place].name)) return actions[place](tally);
  }
  complain("a subcommand is missing: " + verbNames() + " (try --help)");
  return exitWrongUsage;
}

}  // namespace

}  // namespace kelvasi

// NOLINTNEXTLINE(bugprone-exception-escape): the terminate handler tells of what is no ToolError
int main(int argumentCount, char** arguments) {
  kelvasi::secureStandardDescriptors();
  kelvasi::MessageTally tally;
  int status = kelvasi::exitFault;
  try {
    status = kelvasi::run(argumentCount, arguments, tally);
  } catch (const kelvasi::OutputClosed&) {
    return kelvasi::exitOutputClosed;
  } catch (const kelvasi::ToolError& error) {
    kelvasi::complain(error.what());
  }
  if (const std::string notShown = tally.text(); !notShown.empty()) kelvasi::complain(notShown);
  return status;
}
