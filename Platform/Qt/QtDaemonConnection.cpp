// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtDaemonConnection.h"

#include <cerrno>
#include <utility>

#include "Platform/Qt/QtTelephonyDaemon.h"

namespace kelvasi {

namespace {

using Outcome = FrameChannel::Outcome;

constexpr std::size_t notificationLimit = 64;  // that wait for the event loop; more are dropped

LogChannelAnswer failure(int code) {
  return {.error = {.domain = posixErrorDomain, .code = code}, .portName = std::nullopt};
}

}  // namespace

QtDaemonConnection::QtDaemonConnection(FileDescriptor socket, SystemLog& log,
                                       std::chrono::milliseconds answerTimeout,
                                       TelephonyDaemon::NotificationHandler handler)
    : channel_(std::make_shared<FrameChannel>(std::move(socket), std::string(daemonServerName), log)),
      answerTimeout_(answerTimeout),
      handler_(std::make_shared<const TelephonyDaemon::NotificationHandler>(std::move(handler))) {
  channel_->start([this](const Frame& frame) { return take(frame); }, [] {});
}

QtDaemonConnection::~QtDaemonConnection() {
  channel_->close();
}

LogChannelAnswer QtDaemonConnection::createNetworkMonitorLogChannel(std::string_view localPortName) {
  const auto deadline = std::chrono::steady_clock::now() + answerTimeout_;
  const FrameHeader header{.kind = FrameKind::logChannelRequest, .token = ++token_};
  answer_.reset();
  Outcome outcome = channel_->sendBy(deadline, header, bytesOf(localPortName));
  if (outcome == Outcome::done)
    outcome = channel_->receiveBy(deadline, [this] { return answer_.has_value(); });
  if (outcome == Outcome::done) return *std::exchange(answer_, {});
  if (outcome == Outcome::timedOut) return failure(ETIMEDOUT);
  return failure(channel_->hadFault() ? EPROTO : ECONNRESET);
}

bool QtDaemonConnection::take(const Frame& frame) {
  if (frame.header.kind == FrameKind::logChannelAnswer) return takeAnswer(frame);
  return frame.header.kind == FrameKind::notification && takeNotification(frame);
}

bool QtDaemonConnection::takeAnswer(const Frame& frame) {
  auto answer = decodeAnswer(frame.data);
  if (!answer) return false;
  if (frame.header.token == token_) answer_ = std::move(answer);  // an earlier request's is too late
  return true;
}

bool QtDaemonConnection::takeNotification(const Frame& frame) {
  if (frame.data.size() > maximumNotification) return false;
  if (waitingNotifications_ >= notificationLimit) return true;
  ++waitingNotifications_;
  later_.post([this, handler = handler_, text = std::string(textOf(frame.data))] {
    --waitingNotifications_;
    if (*handler) (*handler)(text);
  });
  return true;
}

}  // namespace kelvasi
