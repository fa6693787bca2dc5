// SPDX-License-Identifier: Apache-2.0
// The log-channel session of KelvasiModel.
#include <chrono>

#include "Model/KelvasiModel.h"
#include "Platform/PlistSerialiser.h"
#include "Platform/SystemLog.h"

namespace kelvasi {

namespace {

using namespace std::chrono_literals;

constexpr MessageId logMessageId = 0;
constexpr std::string_view technologyKey = "GetTechnology";
constexpr auto sendTimeout = 1000ms;
constexpr auto technologyTimeout = 1000ms;
constexpr auto retryDelay = 5000ms;
constexpr auto displayInterval = 2000ms;

// Without its handler first: the session's own tear-down never restarts it.
template <typename Port>
void close(std::unique_ptr<Port>& port) {
  if (!port) return;
  port->setInvalidationHandler({});
  port->invalidate();
  port.reset();
}

}  // namespace

void KelvasiModel::restartMonitor() {
  destroyPorts();
  startMonitor();
}

void KelvasiModel::startMonitor() {
  if (displayUpdateTimer_) return;
  if (!createPorts()) {
    platform_.log.print(LogPriority::error, "Could not create the ports necessary");
    return retryMonitor();
  }
  configureGenerator();
  if (!logGenerator_) {
    platform_.log.print(LogPriority::error, "No log generator technology works");
    return retryMonitor();
  }
  if (!sendStartCommand()) return retryMonitor();
  platform_.log.print(LogPriority::error, "Starting the display update timer");
  displayUpdateTimer_ = link_.queue.repeat(displayInterval, [this] { refresh(); });
}

void KelvasiModel::retryMonitor() {
  destroyPorts();
  link_.queue.postAfter(retryDelay, whileAlive([this] { startMonitor(); }));
}

bool KelvasiModel::createPorts() {
  const auto identifier = link_.ports.makeUniqueIdentifier();
  if (!identifier) return false;
  const std::string name = "KelvasiApp." + *identifier;
  recvPort_ = link_.ports.createLocalPort(
      name, [this](MessageId id, std::span<const std::uint8_t> data) -> std::optional<Bytes> {
        if (id == logMessageId) updateWithData(data);
        return std::nullopt;
      });
  if (recvPort_)
    recvPort_->setInvalidationHandler([this, port = recvPort_.get()] { portWasInvalidated(port); });
  auto daemon = link_.daemon.connect([this](std::string_view) { refresh(); });
  if (!daemon) {
    platform_.log.print(LogPriority::error, "Could not create TelvonServerConnection");
    return false;
  }
  // A port that could not be created has no name, which the daemon refuses.
  const LogChannelAnswer answer = daemon->createNetworkMonitorLogChannel(recvPort_ ? name : "");
  daemon.reset();
  if (answer.error.code != 0) {
    platform_.log.print(LogPriority::error,
                        "_TelvonServerConnectionNetworkMonitorCreateLogChannel returns error: %ld!",
                        static_cast<long>(answer.error.code));
    return false;
  }
  return connectSendPort(answer.portName.value_or(""));
}

bool KelvasiModel::connectSendPort(const std::string& portName) {
  if (portName.empty()) {
    platform_.log.print(LogPriority::error, "Could not create a log channel (Telvon returned null port)!");
    return false;
  }
  sendPort_ = link_.ports.createRemotePort(portName);
  if (!sendPort_) {
    platform_.log.print(LogPriority::error, "Could not create the remote port!");
    return false;
  }
  platform_.log.print(LogPriority::error, " ***** Created ports (send=%p, recv=%p)",
                      static_cast<void*>(sendPort_.get()), static_cast<void*>(recvPort_.get()));
  return true;
}

void KelvasiModel::destroyPorts() {
  displayUpdateTimer_.reset();
  close(recvPort_);
  close(sendPort_);
}

void KelvasiModel::configureGenerator() {
  const auto reply = askForTechnology();
  if (!reply) return;
  const auto parsed = platform_.plists.parse(*reply);
  if (!parsed) {
    platform_.log.print(LogPriority::error,
                        " ***** Could not parse reply to GetTechnology; cannot configure");
    return;
  }
  const PlistValue technology =
      parsed->dictionary() ? parsed->dictionary()->get(technologyKey) : PlistValue();
  if (technology.isAbsent()) {
    platform_.log.print(LogPriority::error, " ***** Reply to GetTechnology had no answer; cannot configure");
    return;
  }
  makeGenerator(technology.string() ? *technology.string() : std::string());
  platform_.log.print(LogPriority::error, "Got log generated: %p", static_cast<void*>(logGenerator_.get()));
}

void KelvasiModel::makeGenerator(const std::string& technology) {
  auto generator = LogGenerator::generatorFromTechnology(technology, platform_);
  if (generator && logGenerator_ && technology == technology_)
    generator->continueIntake(logGenerator_->intake());
  if (generator && readingsHandler_) generator->gatherInto(&readings_);
  logGenerator_ = std::move(generator);
  technology_ = technology;
}

std::optional<Bytes> KelvasiModel::askForTechnology() {
  const auto command =
      platform_.plists.serialiseXml(PlistDictionary::make({{std::string(technologyKey), technologyKey}}));
  if (!command) {
    platform_.log.print(LogPriority::error, " Could not generate GetTechnology command; cannot configure");
    return std::nullopt;
  }
  // Without a port the outcome is that of a port that is no longer valid.
  const SendResult result = sendPort_ ? sendPort_->sendRequest(logMessageId, *command, sendTimeout,
                                                               technologyTimeout, RemotePort::Reply::awaited)
                                      : SendResult{};
  if (result.status != SendStatus::success) {
    platform_.log.print(LogPriority::error, " ***** Could not send the GetTechnology command (got error=%d)",
                        static_cast<int>(result.status));
    return std::nullopt;
  }
  if (!result.reply) {
    platform_.log.print(LogPriority::error, " ***** No response to GetTechnology; cannot configure");
  }
  return result.reply;
}

bool KelvasiModel::sendStartCommand() {
  PlistValue wish = logGenerator_->getStartCommand();
  if (startCommandChange_) wish = startCommandChange_(std::move(wish));
  const auto command = platform_.plists.serialiseXml(wish);
  if (!command) {
    platform_.log.print(LogPriority::error, " Could not generate PLIST");
    return false;
  }
  const SendResult result =
      sendPort_->sendRequest(logMessageId, *command, sendTimeout, 0ms, RemotePort::Reply::none);
  if (result.status != SendStatus::success) {
    platform_.log.print(LogPriority::error, " ***** Could not send the START command (got error=%d)",
                        static_cast<int>(result.status));
    return false;
  }
  return true;
}

void KelvasiModel::portWasInvalidated(const void* port) {
  platform_.log.print(LogPriority::error, " ***** INVALIDATED %p *****", port);
  restartMonitor();
}

}  // namespace kelvasi
