#include "Tools/Kelvasictl/LiveSession.h"

#include <CLI/CLI.hpp>

#include "Tools/Kelvasictl/ToolError.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

// A daemon that goes on sending is not waited for longer.
constexpr auto drainLimit = 1000ms;

}  // namespace

void LiveOptions::addTo(CLI::App& verb) {
  verb.add_option("--seconds", seconds, "end after so many seconds; otherwise at SIGINT or SIGTERM")
      ->type_name("N")
      ->check(CLI::Range(0.0, 1e9));
  surroundings.addTo(verb);
}

LiveSession::LiveSession(const LiveOptions& options, KelvasiModel::ViewControllerUpdate onUpdate)
    : seconds_(options.seconds),
      surroundings_(options.surroundings),
      ports_(*surroundings_.log),
      daemon_(*surroundings_.log),
      model_(surroundings_.platform(), {queue_, ports_, daemon_}, std::move(onUpdate)) {}

void LiveSession::run() {
  queue_.post([this] { model_.restartMonitor(); });
  if (seconds_) {
    loop_.runFor(std::chrono::milliseconds(static_cast<std::int64_t>(*seconds_ * 1000)));
  } else {
    loop_.run();
  }
  if (!hasEnded_) loop_.drain(drainLimit);
  if (error_) throw ToolError(*error_);
}

void LiveSession::end(std::optional<std::string> error) {
  hasEnded_ = true;
  if (!error_) error_ = std::move(error);
  loop_.quit();
}

}  // namespace kelvasi
