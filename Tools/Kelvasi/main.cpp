// SPDX-License-Identifier: Apache-2.0
// kelvasi: wires the viewer to its surroundings.
#include <unistd.h>

#include <QApplication>
#include <QCoreApplication>
#include <cstdio>
#include <cstdlib>
#include <optional>
#include <stdexcept>

#include "App/KelvasiApp.h"
#include "Platform/Plist/LibplistSerialiser.h"
#include "Platform/Posix/LargeBlocks.h"
#include "Platform/Posix/PackageResources.h"
#include "Platform/Posix/PosixClock.h"
#include "Platform/Posix/PosixFiles.h"
#include "Platform/Posix/SystemLogs.h"
#include "Platform/Posix/TerminateHandler.h"
#include "Platform/Posix/TraceOutputs.h"
#include "Platform/Qt/QtMainQueue.h"
#include "Platform/Qt/QtMessagePorts.h"
#include "Platform/Qt/QtTelephonyDaemon.h"
#include "Platform/QtDesktop/DesktopActivation.h"
#include "Platform/QtDesktop/DesktopAttention.h"
#include "Platform/QtDesktop/QtDateFormatters.h"
#include "Platform/QtDesktop/QtPreferences.h"
#include "Platform/QtWidgets/QtApplicationFramework.h"
#include "Platform/QtWidgets/QtUserInterface.h"
#include "Platform/RateLimitedLog.h"
#include "Tools/CommandLine.h"
#include "Tools/Kelvasi/Cockpit/CockpitFront.h"
#include "Tools/Kelvasi/Options.h"
#include "Tools/Kelvasi/Script.h"
#include "Tools/Kelvasi/TemplateNotice.h"
#include "Tools/Kelvasi/TerminalViewer.h"
#include "Tools/Kelvasi/ViewerMemory.h"
#include "Tools/LogDirectory.h"

namespace kelvasi {

namespace {

// False when the script that led the window failed.
bool run(QtApplicationFramework& framework, const ViewerOptions& options) {
  const auto log = makeSystemLog(options.logsToStderr, "kelvasi");
  installTerminateHandler(*log, options.logsToStderr ? "" : "kelvasi");
  StandardOutputTrace trace;
  const LibplistSerialiser plists;
  const PackageResources resources;
  const PosixClock clock;
  QtMainQueue queue;
  RateLimitedLog peerLog(*log, queue);
  QtMessagePorts ports(peerLog);
  QtTelephonyDaemon daemon(peerLog);
  const std::string memoryPath =
      options.script.empty() || !options.memory.empty() ? memoryFile(options.memory) : std::string();
  ViewerMemory memory = readMemory(memoryPath);
  if (options.colourScheme || options.followsDesktop) memory.colourScheme = options.colourScheme;
  QtUserInterface ui({.fullScreen = options.fullScreen || memory.fillsScreen,
                      .windowSize = memory.windowSize,
                      .textScale = options.textScale,
                      .colourScheme = memory.colourScheme});
  QtPreferences preferences;
  const QtDateFormatters dateFormatters;
  PosixFiles files;
  DesktopAttention attention(&QApplication::beep);
  const AppPlatform platform{.core = {*log, trace, plists, resources, clock},
                             .link = {queue, ports, daemon},
                             .shell = {ui, preferences, dateFormatters, files},
                             .paths = {.logDirectory = makeLogDirectory(),
                                       .internalInstallMarker = KELVASI_INTERNAL_INSTALL_MARKER}};
  KelvasiApp* application = nullptr;
  const ApplicationClasses classes{{"KelvasiApp", [&] {
                                      auto made = std::make_unique<KelvasiApp>(platform);
                                      made->reopenBranches(memory.branches);
                                      application = made.get();
                                      return made;
                                    }}};
  QPointer<CockpitFront> front;
  QObject::connect(qApp, &QCoreApplication::aboutToQuit, [&] {
    memory.branches = application->openBranches();
    if (const TopWidget* const window = ui.window()) {
      memory.windowSize = window->windowedSize();
      memory.fillsScreen = window->isFullScreen() && !options.fullScreen;
    }
    if (front) {
      memory.pins = front->cockpit().pinKeys();
      memory.alarms = front->cockpit().alarmRules();
    }
    writeMemory(memoryPath, memory);
  });
  const Script script(options.script);
  std::optional<DesktopActivation> activation;  // a viewer that a script leads is nobody's to raise
  if (options.script.empty())
    activation.emplace([&ui] {
      if (ui.window()) ui.window()->bringToFront();
    });
  queue.post([&] {  // when the window is there
    front = new CockpitFront(*ui.window(), *application,
                             {.clock = clock,
                              .attention = attention,
                              .ui = ui,
                              .files = files,
                              .directory = platform.paths.logDirectory});
    front->cockpit().restorePins(memory.pins);
    for (const std::string& rule : memory.alarms) front->cockpit().addAlarm(rule);
    noticeMissingTemplates(resources, ui);
  });
  framework.run(classes, "KelvasiApp", "KelvasiApp");
  return !script.hasFailed();
}

// A script's keys are meant as they are; and Qt's input method for Wayland takes no keys where there is no
// seat.
void keepInputMethodsOut() {
  ::setenv("QT_IM_MODULE", "compose", 1);
}

}  // namespace

}  // namespace kelvasi

int main(int argumentCount, char** arguments) {
  kelvasi::keepLargeBlocksApart();
  kelvasi::CommandLine commandLine("kelvasi", "Shows what the cellular modem is doing right now.");
  kelvasi::ViewerOptions options;
  kelvasi::declareOptions(commandLine.options(), options);
  if (const auto status = commandLine.parse(argumentCount, arguments)) return *status;
  const bool isForTerminal = !kelvasi::hasDisplay() && options.script.empty() && ::isatty(STDOUT_FILENO) == 1;
  if (options.isInTerminal || isForTerminal) {
    std::fprintf(stderr, "kelvasi: %s\n", kelvasi::becomeTerminalViewer(options.logsToStderr).c_str());
    return 1;
  }
  if (!kelvasi::hasDisplay()) {
    std::fprintf(stderr, "kelvasi: there is no display (neither WAYLAND_DISPLAY nor DISPLAY is set)\n");
    return 1;
  }
  if (!options.script.empty()) kelvasi::keepInputMethodsOut();
  int own = 1;  // the options are all this program's; Qt's has its variables
  kelvasi::QtApplicationFramework framework(own, arguments);
  try {
    return kelvasi::run(framework, options) ? 0 : 1;
  } catch (const std::runtime_error& fault) {
    std::fprintf(stderr, "kelvasi: %s\n", fault.what());
    return 1;
  }
}
