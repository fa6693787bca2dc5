// SPDX-License-Identifier: Apache-2.0
#include "Tools/Kelvasictl/LiveSession.h"

#include <utility>

#include "Platform/Qt/RuntimeDirectory.h"
#include "Tools/Kelvasictl/StandardStreams.h"
#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

// A daemon that goes on sending is not waited for longer.
constexpr auto drainLimit = 1000ms;

std::string aDaemonThere() {
  const RuntimeDirectory::Place place = RuntimeDirectory::look();
  if (place.fault.empty()) return "a telephony daemon in " + place.path;
  const std::string path = place.path.empty() ? "" : place.path + " ";
  return "a telephony daemon; the runtime directory " + path + "is refused: " + place.fault;
}

}  // namespace

void LiveOptions::addTo(OptionSet verb) {
  verb.add("--seconds", seconds, "end after so many seconds; otherwise at SIGINT, SIGTERM or SIGHUP")
      .type("N")
      .between(0, 1e9, "from 0 to 1000000000");
  surroundings.addTo(verb);
}

LiveSession::LiveSession(const LiveOptions& options, KelvasiModel::ViewControllerUpdate onUpdate)
    : seconds_(options.seconds),
      surroundings_(options.surroundings),
      peerLog_(*surroundings_.log, queue_),
      ports_(peerLog_),
      daemon_(peerLog_),
      model_(surroundings_.platform(), {queue_, ports_, daemon_}, std::move(onUpdate)) {}

void LiveSession::connect() {
  model_.restartMonitor();
  if (!model_.isConnected()) complain("waiting for " + aDaemonThere());
}

void LiveSession::run() {
  queue_.post([this] { connect(); });
  int signal = 0;
  if (seconds_) {
    signal = loop_.runFor(std::chrono::milliseconds(static_cast<std::int64_t>(*seconds_ * 1000)));
  } else {
    signal = loop_.run();
  }
  if (!hasEnded_) loop_.drain(drainLimit);
  if (error_) std::rethrow_exception(error_);
  const bool timeIsOver = signal == 0 && !hasEnded_;
  if (timeIsOver && !model_.logGenerator()) throw ToolError("nothing came from " + aDaemonThere());
}

bool LiveSession::hasBegunToShowAnother() {
  const bool wasAnother = std::exchange(showsAnother_, model_.showsAnotherTechnology());
  return showsAnother_ && !wasAnother;
}

void LiveSession::end(std::exception_ptr error) {
  hasEnded_ = true;
  if (!error_) error_ = std::move(error);
  loop_.quit();
}

}  // namespace kelvasi
