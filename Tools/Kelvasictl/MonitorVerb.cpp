// SPDX-License-Identifier: Apache-2.0
// kelvasictl monitor: the display of a live link, at every update.
#include <unistd.h>

#include <utility>

#include "Platform/Clock.h"
#include "Tools/Kelvasictl/DisplayJson.h"
#include "Tools/Kelvasictl/LiveSession.h"
#include "Tools/Kelvasictl/MessageTally.h"
#include "Tools/Kelvasictl/MonitorView.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"
#include "Tools/Kelvasictl/TreeText.h"
#include "Tools/Kelvasictl/Verb.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

struct MonitorOptions {
  std::string format = "tree";
  bool once = false;
  LiveOptions live;
};

// "Connecting..." on the standard error, while that is a terminal and there is no connection.
class ConnectionStatus {
 public:
  void show(bool isConnected) {
    if (isConnected == isConnected_) return;
    isConnected_ = isConnected;
    constexpr std::string_view connecting = "\r\x1b[KConnecting...";
    constexpr std::string_view nothing = "\r\x1b[K";
    const std::string_view text = isConnected ? nothing : connecting;
    // A status that cannot be shown is no reason to stop.
    if (::write(STDERR_FILENO, text.data(), text.size()) < 0) return;
  }

 private:
  bool isConnected_ = true;
};

class MonitorVerb {
 public:
  explicit MonitorVerb(const MonitorOptions& options)
      : options_(options), session_(options.live, [this] { update(); }) {}

  int run(MessageTally& tally) {
    std::unique_ptr<Timer> statusTimer;
    if (::isatty(STDERR_FILENO) == 1)
      statusTimer = session_.queue().repeat(200ms, [this] { status_.show(session_.model().isConnected()); });
    session_.run();  // an error that ends it clears the status itself
    status_.show(true);
    if (const LogGenerator* generator = session_.model().logGenerator()) tally.add(generator->intake());
    return exitSuccess;
  }

 private:
  void update() {
    const NodeRef root = session_.model().topLevelNodes();
    if (!root) return;
    try {
      status_.show(true);
      tellWhoseDisplayItIs();
      if (options_.format == "json") {
        const double now = session_.clock().now().secondsSince1970;
        printOut(tickJson(now, session_.model().state().get("Display")));
      } else {
        view_.show(treeText(*root));
      }
      if (options_.once) session_.end();
    } catch (const ToolError&) {
      session_.end(std::current_exception());
    }
  }

  void tellWhoseDisplayItIs() {
    if (session_.hasBegunToShowAnother())
      complain(
          "the daemon's technology has changed; the display stays the one before until monitor is started "
          "anew");
  }

  const MonitorOptions& options_;
  MonitorView view_;
  ConnectionStatus status_;
  LiveSession session_;
};

}  // namespace

Action declareMonitor(OptionSet verb) {
  const auto options = std::make_shared<MonitorOptions>();
  verb.add("--format", options->format,
           "tree (the default): path TAB value, redrawn on a terminal, \"---\" between updates elsewhere; "
           "or json: a line {\"time\": ..., \"display\": ...}")
      .type("FORMAT")
      .oneOf({"tree", "json"});
  verb.addFlag("--once", options->once, "end after the first update");
  options->live.addTo(verb);
  return [options](MessageTally& tally) { return MonitorVerb(*options).run(tally); };
}

}  // namespace kelvasi
