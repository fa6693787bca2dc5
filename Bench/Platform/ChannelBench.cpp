// SPDX-License-Identifier: Apache-2.0
#include "Bench/Platform/ChannelBench.h"

#include "Bench/LogGenerator/DecodeBench.h"
#include "Bench/Platform/ChannelPeer.h"
#include "Bench/Support/Baselines.h"
#include "Bench/Support/Process.h"
#include "Bench/Support/Surroundings.h"
#include "Model/KelvasiModel.h"
#include "Platform/Qt/QtEventLoop.h"
#include "Platform/Qt/QtMainQueue.h"
#include "Platform/Qt/QtMessagePorts.h"
#include "Platform/Qt/QtTelephonyDaemon.h"
#include "Tests/Support/AllocationCounter.h"

namespace kelvasi::bench {

namespace {

using namespace std::chrono_literals;

// Message ports whose local ports tell when a number of messages has been handled.
class CountingPorts : public MessagePorts {
 public:
  CountingPorts(MessagePorts& ports, std::function<void()> onLast)
      : ports_(ports), onLast_(std::move(onLast)) {}

  void await(std::size_t count) { awaited_ = count; }
  std::size_t awaited() const { return awaited_; }

  std::unique_ptr<LocalPort> createLocalPort(std::string_view name,
                                             LocalPort::ReceiveHandler handler) override {
    return ports_.createLocalPort(
        name, [this, handler = std::move(handler)](MessageId id, std::span<const std::uint8_t> data) {
          auto reply = handler(id, data);
          if (--awaited_ == 0) onLast_();
          return reply;
        });
  }
  std::unique_ptr<RemotePort> createRemotePort(std::string_view name) override {
    return ports_.createRemotePort(name);
  }
  std::optional<std::string> makeUniqueIdentifier() override { return ports_.makeUniqueIdentifier(); }

 private:
  MessagePorts& ports_;
  std::function<void()> onLast_;
  std::size_t awaited_ = 0;
};

// This process's end of a channel to a peer of its own.
struct Link {
  PrivateRuntimeDirectory directory;
  Process peer{thisProgram, {"--peer"}, Process::Output::talking};
  Surroundings surroundings;
  QtEventLoop loop;
  QtMainQueue queue;
  QtMessagePorts socketPorts{surroundings.log};
  CountingPorts ports{socketPorts, [this] { loop.quit(); }};
  QtTelephonyDaemon daemon{surroundings.log};
  bool isPeerReady = peer.waitForOutput();
  std::unique_ptr<RemotePort> toPeer = ports.createRemotePort(peerPortName);

  // False when not all of the messages came.
  bool receive(std::size_t count) {
    const std::string digits = std::to_string(count);
    ports.await(count);
    toPeer->sendNow(burstRequest, Bytes(digits.begin(), digits.end()));
    loop.runFor(60s);
    return ports.awaited() == 0;
  }
};

void receiveBursts(benchmark::State& state, Link& link, std::size_t burst) {
  const std::uint64_t before = test::allocationsSoFar();
  for (auto _ : state) {
    if (!link.receive(burst)) return state.SkipWithError("messages were lost");
  }
  report(state, static_cast<std::uint64_t>(state.iterations()) * burst, test::allocationsSoFar() - before);
}

void count(benchmark::State& state, std::size_t burst) {
  constexpr std::string_view portName = "bench.count";
  Link link;
  const auto port = link.ports.createLocalPort(
      portName, [](MessageId, std::span<const std::uint8_t>) { return std::nullopt; });
  const auto connection = link.daemon.connect([](std::string_view) {});
  if (!port || !connection || !link.toPeer) return state.SkipWithError("no channel");
  if (connection->createNetworkMonitorLogChannel(portName).error.code != 0)
    return state.SkipWithError("no log channel");
  receiveBursts(state, link, burst);
}

void feedModel(benchmark::State& state, std::size_t burst) {
  Link link;
  KelvasiModel* shown = nullptr;
  KelvasiModel model(link.surroundings.platform(), {link.queue, link.ports, link.daemon},
                     [&] { shown->topLevelNodes(); });
  shown = &model;
  model.startMonitor();
  if (!model.isConnected() || !model.logGenerator()) return state.SkipWithError("no session");
  receiveBursts(state, link, burst);
}

void roundTrip(benchmark::State& state) {
  Link link;
  const auto question =
      link.surroundings.plists.serialiseXml(PlistDictionary::make({{"GetTechnology", "GetTechnology"}}));
  if (!link.toPeer || !question) return state.SkipWithError("no channel");
  const std::uint64_t before = test::allocationsSoFar();
  for (auto _ : state) {
    const SendResult result = link.toPeer->sendRequest(0, *question, 1s, 1s, RemotePort::Reply::awaited);
    if (!result.reply) return state.SkipWithError("no reply");
  }
  report(state, static_cast<std::uint64_t>(state.iterations()), test::allocationsSoFar() - before);
}

}  // namespace

void addChannel(Table& table, bool isSmoke) {
  const std::size_t burst = isSmoke ? 1000 : 200000;
  const Messages messages = channelMessages();
  table.add({.name = "channel, 100-byte messages counted",
             .work = [=](benchmark::State& state) { count(state, burst); },
             .copy = copying(messages),
             .iterations = isSmoke ? 1 : 3});
  table.add({.name = "channel, 100-byte messages into the model",
             .work = [=](benchmark::State& state) { feedModel(state, burst); },
             .copy = copying(messages),
             .plain = showing([=] { return rowsOfEach(technologies().front().id, messages); }),
             .iterations = isSmoke ? 1 : 3});
  table.add({.name = "GetTechnology, there and back", .work = roundTrip, .iterations = isSmoke ? 5 : 5000});
}

}  // namespace kelvasi::bench
