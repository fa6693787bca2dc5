// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Daemon.h"

#include <algorithm>
#include <utility>
#include <vector>

namespace kelvasi::sim {

namespace {
constexpr std::string_view portPrefix = "telvon.log.";
constexpr MessageId commandId = 0;
constexpr DaemonError noApplicationPort{.domain = 1, .code = 2};
constexpr DaemonError noPort{.domain = 1, .code = 12};
constexpr DaemonError tooManyChannels{.domain = 1, .code = 24};
}  // namespace

Daemon::Daemon(const DaemonPlatform& platform, std::string_view technology, Faults faults,
               StreamHandler onStream)
    : platform_(platform),
      technology_(technology),
      faults_(std::move(faults)),
      onStream_(std::move(onStream)) {}

std::optional<LogChannelAnswer> Daemon::openChannel(std::string_view applicationPort) {
  if (faults_.has(Fault::noChannel)) return std::nullopt;
  if (channels_.size() >= channelLimit) {
    platform_.log.print(LogPriority::error, "More than %zu channels; one refused", channelLimit);
    return LogChannelAnswer{.error = tooManyChannels, .portName = std::nullopt};
  }
  const auto identifier = platform_.ports.makeUniqueIdentifier();
  if (!identifier) return LogChannelAnswer{.error = noPort, .portName = std::nullopt};
  const std::string name = std::string(portPrefix) + *identifier;
  if (auto faulty = faultyChannelAnswer(name, faults_)) return faulty;
  const DaemonError error = addChannel(name, applicationPort);
  if (error.code == 0) return LogChannelAnswer{.error = {}, .portName = name};
  platform_.log.print(LogPriority::error, "No channel for %s", std::string(applicationPort).c_str());
  return LogChannelAnswer{.error = error, .portName = std::nullopt};
}

DaemonError Daemon::addChannel(const std::string& name, std::string_view applicationPort) {
  auto application = platform_.ports.createRemotePort(applicationPort);
  if (!application) return noApplicationPort;
  auto channel = std::make_unique<Channel>(name, std::move(application));
  auto port = platform_.ports.createLocalPort(
      name, [this, &to = *channel](MessageId id, std::span<const std::uint8_t> data) {
        return receive(to, id, data);
      });
  if (!port) return noPort;
  port->setDesertionHandler([this, name] { close(name); });
  channels_.emplace(name, Entry{std::move(channel), std::move(port)});
  return {};
}

std::optional<Bytes> Daemon::receive(Channel& channel, MessageId id, std::span<const std::uint8_t> data) {
  if (id != commandId) return std::nullopt;
  Command command = parseCommand(platform_.plists, data);
  switch (command.kind) {
    case Command::Kind::getTechnology:
      return technologyAnswer(platform_.plists, technology_, faults_);
    case Command::Kind::start:
      start(channel, std::move(command.subscription));
      break;
    case Command::Kind::stop:
      channel.stop();
      break;
    case Command::Kind::unknown:
      platform_.log.print(LogPriority::error, "%s: a command that is none", channel.name().c_str());
      break;
  }
  return std::nullopt;
}

void Daemon::start(Channel& channel, Subscription subscription) {
  const std::string wanted =
      subscription.isForEverything() ? "every log code" : std::to_string(subscription.size()) + " log codes";
  platform_.log.print(LogPriority::notice, "%s: streaming %s", channel.name().c_str(), wanted.c_str());
  channel.start(std::move(subscription));
  onStream_(channel);
}

bool Daemon::isStreaming() const {
  return std::ranges::any_of(channels_, [](const auto& entry) {
    return entry.second.channel->isStreaming() && entry.second.channel->isValid();
  });
}

void Daemon::send(const Messages& messages) {
  for (const auto& [name, entry] : channels_) {
    for (const Message& message : messages) entry.channel->send(message);
  }
}

void Daemon::sendOrHold(const Messages& messages) {
  for (const auto& [name, entry] : channels_) {
    for (const Message& message : messages) entry.channel->sendOrHold(message);
  }
}

bool Daemon::flush() {
  bool isDone = true;
  for (const auto& [name, entry] : channels_) {
    entry.channel->flush();
    isDone = isDone && !entry.channel->isHolding();
  }
  return isDone;
}

void Daemon::giveUp() {
  for (const auto& [name, entry] : channels_) {
    if (entry.channel->isHolding()) entry.channel->giveUp();
  }
}

void Daemon::close(const std::string& name) {
  platform_.log.print(LogPriority::notice, "%s: closed, its application has gone", name.c_str());
  channels_.erase(name);
}

void Daemon::sweep() {
  for (const auto& [name, entry] : channels_) {
    const std::uint64_t dropped = entry.channel->takeDropped();
    if (dropped != 0 && entry.channel->isValid())
      platform_.log.print(LogPriority::warning, "%s: %llu messages dropped, its application does not keep up",
                          name.c_str(), static_cast<unsigned long long>(dropped));
  }
  std::vector<std::string> deserted;
  for (const auto& [name, entry] : channels_) {
    if (!entry.channel->isValid()) deserted.push_back(name);
  }
  for (const std::string& name : deserted) close(name);
}

}  // namespace kelvasi::sim
