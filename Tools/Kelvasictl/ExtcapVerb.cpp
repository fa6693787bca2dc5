// SPDX-License-Identifier: Apache-2.0
// kelvasictl extcap: what Wireshark starts to learn of interfaces and to capture from one. A capture is
// "kelvasictl record -", here or on the phone, into Wireshark's pipe.
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <filesystem>
#include <memory>

#include "Platform/Posix/PackageResources.h"
#include "Platform/Posix/StandardDescriptors.h"
#include "Platform/Qt/RuntimeDirectory.h"
#include "Tools/Kelvasictl/ExtcapAnswers.h"
#include "Tools/Kelvasictl/LogCodeOptions.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

struct ExtcapOptions {
  bool interfaces = false;
  bool dlts = false;
  bool config = false;
  bool capture = false;
  std::string interface;
  std::string fifo;
  std::string host;
  std::uint64_t port = 0;
  std::string user;
  std::string command = "kelvasictl";
  LogCodeOptions logCodes;
  std::string unused;
  bool unusedFlag = false;
};

bool isDaemonThere() {
  const RuntimeDirectory::Place place = RuntimeDirectory::look();
  std::error_code unknown;
  return place.fault.empty() && std::filesystem::is_socket(place.path + "/telvon", unknown);
}

std::vector<std::string> recordArguments(const LogCodeOptions& logCodes) {
  std::vector<std::string> arguments{"record", "-"};
  for (const std::string& code : logCodes.codes) arguments.insert(arguments.end(), {"--code", code});
  for (const std::string& range : logCodes.ranges) arguments.insert(arguments.end(), {"--all-codes", range});
  return arguments;
}

// Nobody is there to type a password, so keys have to do. What follows "--" is no option, whatever it begins
// with; the phone's shell reads the command.
std::vector<std::string> sshArguments(const ExtcapOptions& options) {
  if (options.host.empty()) throw ToolError("--remote-host is missing: the phone to capture from");
  std::vector<std::string> arguments{"ssh", "-o", "BatchMode=yes"};
  if (options.port != 0) arguments.insert(arguments.end(), {"-p", std::to_string(options.port)});
  if (!options.user.empty()) arguments.insert(arguments.end(), {"-l", options.user});
  std::string command = options.command;
  for (const std::string& argument : recordArguments(options.logCodes)) (command += ' ') += argument;
  arguments.insert(arguments.end(), {"--", options.host, command});
  return arguments;
}

[[noreturn]] void become(const std::string& program, std::vector<std::string> arguments) {
  std::vector<char*> pointers;
  for (std::string& argument : arguments) pointers.push_back(argument.data());
  pointers.push_back(nullptr);
  ::execvp(program.c_str(), pointers.data());
  throw ToolError(program + ": " + std::strerror(errno));
}

int capture(const ExtcapOptions& options) {
  if (options.fifo.empty()) throw ToolError("--fifo is missing: the pipe to write to");
  if (!redirectStandardOutput(options.fifo)) throw ToolError(options.fifo + ": " + std::strerror(errno));
  if (options.interface == sshInterface) become("ssh", sshArguments(options));
  std::vector<std::string> arguments = recordArguments(options.logCodes);
  arguments.insert(arguments.begin(), "kelvasictl");
  become("/proc/self/exe", std::move(arguments));
}

int run(const ExtcapOptions& options) {
  if (options.interfaces) {
    printOut(extcapInterfaces(PackageResources(std::filesystem::path()).bundleVersion().value_or(""),
                              isDaemonThere()));
    return exitSuccess;
  }
  if (options.interface != localInterface && options.interface != sshInterface)
    throw ToolError("\"" + options.interface + "\" is no interface; --extcap-interfaces lists them");
  if (options.dlts) printOut(extcapDlts());
  if (options.config) printOut(extcapConfig(options.interface));
  return options.capture ? capture(options) : exitSuccess;
}

// Wireshark says more than there is use for.
void addUnused(OptionSet& verb, ExtcapOptions& options) {
  for (const char* option : {"--extcap-version", "--extcap-capture-filter", "--extcap-reload-option",
                             "--extcap-control-in", "--extcap-control-out"})
    verb.add(option, options.unused, "accepted, and without effect").hidden();
  verb.addFlag("--extcap-cleanup-postkill", options.unusedFlag, "accepted, and without effect").hidden();
}

void addRemote(OptionSet& verb, ExtcapOptions& options) {
  verb.add("--remote-host", options.host, "the phone to capture from by ssh").type("HOST");
  verb.add("--remote-port", options.port, "of its ssh server")
      .type("PORT")
      .between(1, 65535, "from 1 to 65535");
  verb.add("--remote-username", options.user, "whose link it is").type("USER");
  verb.add("--remote-command", options.command, "kelvasictl on the phone (kelvasictl)").type("COMMAND");
}

}  // namespace

Action declareExtcap(OptionSet verb) {
  const auto options = std::make_shared<ExtcapOptions>();
  verb.addFlag("--extcap-interfaces", options->interfaces, "list the interfaces");
  verb.add("--extcap-interface", options->interface, "kelvasi, or kelvasi-ssh for that of a phone")
      .type("NAME");
  verb.addFlag("--extcap-dlts", options->dlts, "tell the link type of the interface");
  verb.addFlag("--extcap-config", options->config, "tell the options of the interface");
  verb.addFlag("--capture", options->capture, "capture from the interface into the pipe");
  verb.add("--fifo", options->fifo, "the pipe, to which a pcap stream is written").type("FILE");
  addRemote(verb, *options);
  options->logCodes.addTo(verb);
  addUnused(verb, *options);
  return [options](MessageTally&) { return run(*options); };
}

}  // namespace kelvasi
