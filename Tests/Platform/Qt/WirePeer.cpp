// SPDX-License-Identifier: Apache-2.0
// The other process of the tests: plays one end of a log channel and prints what happens to it, a line each.
#include <algorithm>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <string>
#include <vector>

#include "Platform/Qt/QtDaemonServerHost.h"
#include "Platform/Qt/QtEventLoop.h"
#include "Platform/Qt/QtMainQueue.h"
#include "Platform/Qt/QtMessagePorts.h"
#include "Platform/Qt/QtTelephonyDaemon.h"
#include "Platform/SystemLog.h"

namespace kelvasi::test {
namespace {

using namespace std::chrono_literals;
using Arguments = std::vector<std::string>;

constexpr std::chrono::milliseconds patience = 30s;

__attribute__((format(printf, 1, 2))) void say(const char* format, ...) {
  std::va_list values;
  va_start(values, format);
  std::vprintf(format, values);
  va_end(values);
  std::printf("\n");
  std::fflush(stdout);
}

class PrintingLog : public SystemLog {
 public:
  bool wants(LogPriority) const override { return true; }
  void write(LogPriority priority, std::string_view text) override {
    say("log %d %.*s", static_cast<int>(priority), static_cast<int>(text.size()), text.data());
  }
};

struct Surroundings {
  QtEventLoop loop;
  PrintingLog log;
  QtMessagePorts ports{log};
};

std::span<const std::uint8_t> bytesOf(const std::string& text) {
  return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

std::string textOf(std::span<const std::uint8_t> bytes) {
  return {bytes.begin(), bytes.end()};
}

void sayResult(const SendResult& result) {
  say("status %d reply %s", static_cast<int>(result.status),
      result.reply ? ("[" + textOf(*result.reply) + "]").c_str() : "none");
}

// receive NAME: prints what it is sent, and replies with the same; to "nothing" it has no reply.
int receive(Surroundings& here, const Arguments& arguments) {
  const auto port = here.ports.createLocalPort(
      arguments.at(0), [](MessageId id, std::span<const std::uint8_t> data) -> std::optional<Bytes> {
        say("message %u %zu [%s]", id, data.size(),
            textOf(data.first(std::min<std::size_t>(data.size(), 64))).c_str());
        if (textOf(data) == "nothing") return std::nullopt;
        return Bytes(data.begin(), data.end());
      });
  say("%s", port ? "ready" : "refused");
  return port ? here.loop.run() : 1;
}

// count NAME COUNT: takes COUNT messages and says how fast they came.
int count(Surroundings& here, const Arguments& arguments) {
  const long wanted = std::stol(arguments.at(1));
  long taken = 0;
  std::chrono::steady_clock::time_point begin;
  const auto port = here.ports.createLocalPort(
      arguments.at(0), [&](MessageId, std::span<const std::uint8_t>) -> std::optional<Bytes> {
        if (taken++ == 0) begin = std::chrono::steady_clock::now();
        if (taken == wanted) here.loop.quit();
        return std::nullopt;
      });
  say("%s", port ? "ready" : "refused");
  here.loop.run();
  const std::chrono::duration<double> time = std::chrono::steady_clock::now() - begin;
  say("%ld messages in %.3f s: %.0f/s", taken, time.count(), static_cast<double>(taken) / time.count());
  return 0;
}

// send NAME COUNT SIZE: messages that begin with their number, as many at a time as the backlog takes.
int send(Surroundings& here, const Arguments& arguments) {
  const auto port = here.ports.createRemotePort(arguments.at(0));
  if (!port) return 1;
  const std::uint32_t wanted = static_cast<std::uint32_t>(std::stoul(arguments.at(1)));
  Bytes data(std::stoul(arguments.at(2)));
  std::uint32_t number = 0;
  QtMainQueue queue;
  const Task sendSome = [&] {
    for (int i = 0; i < 1000 && number < wanted; ++i, ++number) {
      for (unsigned byte = 0; byte < 4; ++byte)
        data.at(byte) = static_cast<std::uint8_t>(number >> (8 * byte) & 0xFF);
      if (!port->sendNow(0, data)) return;
    }
  };
  const auto timer = queue.repeat(0ms, sendSome);
  port->setInvalidationHandler([&] { here.loop.quit(); });  // the receiver has seen enough
  here.loop.run();
  return 0;
}

// request NAME (RECEIVE_MS TEXT)...: one request after another.
int request(Surroundings& here, const Arguments& arguments) {
  const auto port = here.ports.createRemotePort(arguments.at(0));
  if (!port) return say("no port"), 1;
  for (std::size_t i = 1; i + 1 < arguments.size(); i += 2) {
    const std::chrono::milliseconds receiveTimeout(std::stol(arguments[i]));
    sayResult(port->sendRequest(0, bytesOf(arguments[i + 1]), patience, receiveTimeout,
                                RemotePort::Reply::awaited));
  }
  here.loop.runFor(0ms);
  say("valid %d", port->isValid() ? 1 : 0);
  return 0;
}

// daemon ANSWER [DOMAIN CODE]: a server whose answer is the port name ANSWER; none to an application's port
// called "unanswered". Tells everybody who asked that it did.
int daemon(Surroundings& here, const Arguments& arguments) {
  const bool hasError = arguments.size() > 2;
  const DaemonError error{.domain = hasError ? std::stoi(arguments[1]) : 0,
                          .code = hasError ? std::stoi(arguments[2]) : 0};
  QtDaemonServerHost host(here.log);
  std::unique_ptr<DaemonServer> server;
  server = host.serve([&](std::string_view name) -> std::optional<LogChannelAnswer> {
    say("asked %.*s", static_cast<int>(name.size()), name.data());
    server->notify("asked");
    if (name == "unanswered") return std::nullopt;
    return LogChannelAnswer{.error = error, .portName = arguments.at(0)};
  });
  say("%s", server ? "ready" : "refused");
  return server ? here.loop.run() : 1;
}

void sayAnswer(const LogChannelAnswer& answer) {
  say("answer %d %d %s", answer.error.domain, answer.error.code,
      answer.portName ? ("[" + *answer.portName + "]").c_str() : "none");
}

// application NAME [MS]: asks the daemon for a channel to the port NAME, and gives it MS for the answer.
int application(Surroundings& here, const Arguments& arguments) {
  const bool isImpatient = arguments.size() > 1;
  QtTelephonyDaemon daemonSide(here.log,
                               isImpatient ? std::chrono::milliseconds(std::stol(arguments[1])) : patience);
  const auto connection = daemonSide.connect([&](std::string_view text) {
    say("notification %.*s", static_cast<int>(text.size()), text.data());
    here.loop.quit();
  });
  if (!connection) return say("no daemon"), 1;
  sayAnswer(connection->createNetworkMonitorLogChannel(arguments.at(0)));
  here.loop.runFor(0ms);
  return 0;
}

// session QUESTION START COUNT: the whole life of a session, until COUNT messages have come.
int session(Surroundings& here, const Arguments& arguments) {
  int left = std::stoi(arguments.at(2));
  const std::string name = "KelvasiApp." + here.ports.makeUniqueIdentifier().value();
  const auto local = here.ports.createLocalPort(
      name, [&](MessageId id, std::span<const std::uint8_t> data) -> std::optional<Bytes> {
        say("message %u %zu [%s]", id, data.size(), textOf(data).c_str());
        if (--left == 0) here.loop.quit();
        return std::nullopt;
      });
  QtTelephonyDaemon daemonSide(here.log, patience);
  auto connection = daemonSide.connect({});
  if (!local || !connection) return say("no daemon"), 1;
  const LogChannelAnswer answer = connection->createNetworkMonitorLogChannel(name);
  connection.reset();
  sayAnswer(answer);
  const auto remote = here.ports.createRemotePort(answer.portName.value_or(""));
  if (!remote) return say("no port"), 1;
  sayResult(remote->sendRequest(0, bytesOf(arguments.at(0)), patience, patience, RemotePort::Reply::awaited));
  sayResult(remote->sendRequest(0, bytesOf(arguments.at(1)), patience, 0ms, RemotePort::Reply::none));
  return here.loop.run();
}

const std::map<std::string, int (*)(Surroundings&, const Arguments&)> roles{
    {"application", application}, {"count", count}, {"daemon", daemon},   {"receive", receive},
    {"request", request},         {"send", send},   {"session", session},
};

}  // namespace
}  // namespace kelvasi::test

int main(int argumentCount, char** arguments) {
  using namespace kelvasi::test;
  const Arguments given(arguments + 1, arguments + argumentCount);
  const auto role = given.empty() ? roles.end() : roles.find(given.front());
  if (role == roles.end()) return EXIT_FAILURE;
  Surroundings here;
  return role->second(here, Arguments(given.begin() + 1, given.end()));
}
