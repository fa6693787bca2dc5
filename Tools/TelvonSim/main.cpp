// SPDX-License-Identifier: Apache-2.0
// telvon-sim: wires the simulated telephony daemon to sockets, the event loop and the command line.
#include <csignal>
#include <cstdio>

#include "Platform/Plist/LibplistSerialiser.h"
#include "Platform/Posix/PosixClock.h"
#include "Platform/Posix/SystemLogs.h"
#include "Platform/Posix/TerminateHandler.h"
#include "Platform/Qt/QtDaemonServerHost.h"
#include "Platform/Qt/QtEventLoop.h"
#include "Platform/Qt/QtMainQueue.h"
#include "Platform/Qt/QtMessagePorts.h"
#include "Platform/Qt/RuntimeDirectory.h"
#include "Platform/RateLimitedLog.h"
#include "Simulator/Simulation.h"
#include "Telvon/TechnologyName.h"
#include "Tools/CommandLine.h"
#include "Tools/TelvonSim/Options.h"
#include "Tools/TelvonSim/Source.h"
#include "Tools/TelvonSim/WorldLog.h"
#include "Tools/TelvonSim/WrittenDrive.h"

namespace kelvasi {

namespace {

void complain(const std::string& text) {
  std::fprintf(stderr, "telvon-sim: %s\n", text.c_str());
}

int runLoop(QtEventLoop& loop, const std::optional<double>& seconds) {
  if (!seconds) return loop.run();
  return loop.runFor(std::chrono::milliseconds(static_cast<std::int64_t>(*seconds * 1000)));
}

sim::SimulationHandlers handlersFor(QtEventLoop& loop, const SimulatorOptions& options) {
  return {.die = [] { std::raise(SIGKILL); },
          .stall = [] { std::raise(SIGSTOP); },
          .sourceEnded =
              [&loop, leaves = options.leavesAtEnd] {
                complain("the capture has been played");
                if (leaves) loop.quit();
              },
          .lastApplicationLeft =
              [&loop, leaves = options.leavesAtEnd] {
                if (!leaves) return;
                complain("the last application has left");
                loop.quit();
              }};
}

int serve(const SimulatorOptions& options) {
  QtEventLoop loop;
  StderrSystemLog log;
  installTerminateHandler(log);
  const LibplistSerialiser plists;
  const PosixClock clock;
  QtMainQueue queue;
  RateLimitedLog peerLog(log, queue);
  QtMessagePorts ports(peerLog);
  QtDaemonServerHost host(peerLog);

  std::optional<WorldLog> world;
  if (!options.worldLog.empty()) world.emplace(options.worldLog, clock);
  if (world && world->error()) {
    complain(*world->error());
    return 1;
  }
  sim::ToldScenario::Tell tell;
  if (world) tell = [&world](const sim::TrueCells& cells) { world->tell(cells); };
  SourceResult made = makeSource(options, plists, std::move(tell));
  if (!made.source) {
    complain(made.failure);
    return made.exitStatus;
  }
  const auto directory = RuntimeDirectory::open(log, RuntimeDirectory::Side::daemon);
  if (!directory) return 1;
  sim::Simulation simulation({.daemon = {peerLog, ports, plists}, .queue = queue, .clock = clock},
                             options.technology, options.faults, std::move(made.source), options.speed,
                             handlersFor(loop, options));
  if (!simulation.serve(host)) {
    complain("cannot serve in " + directory->path());
    return 1;
  }
  complain("serving " + std::string(shortTechnologyName(options.technology)) + " in " + directory->path());
  runLoop(loop, options.seconds);
  return 0;
}

int writeDrive(const SimulatorOptions& options) {
  const LibplistSerialiser plists;
  const SourceResult made = makeSource(options, plists);
  const std::string failure = made.source ? writeCapture(*made.source, options) : made.failure;
  if (failure.empty()) return 0;
  complain(failure);
  return made.source ? 1 : made.exitStatus;
}

}  // namespace

}  // namespace kelvasi

int main(int argumentCount, char** arguments) {
  kelvasi::CommandLine commandLine(
      "telvon-sim",
      "Plays the telephony daemon: serves log channels and streams what a simulated handset gives.");
  kelvasi::SimulatorOptions options;
  kelvasi::declareOptions(commandLine, options);
  if (const auto status = commandLine.parse(argumentCount, arguments)) return *status;
  return options.write.empty() ? kelvasi::serve(options) : kelvasi::writeDrive(options);
}
