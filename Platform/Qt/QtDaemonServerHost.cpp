// SPDX-License-Identifier: Apache-2.0
#include "Platform/Qt/QtDaemonServerHost.h"

#include "Platform/Qt/DeadSockets.h"
#include "Platform/Qt/FrameServer.h"
#include "Platform/Qt/LogChannelMessages.h"

namespace kelvasi {

namespace {

class QtDaemonServer : public DaemonServer {
 public:
  explicit QtDaemonServer(std::unique_ptr<FrameServer> server) : server_(std::move(server)) {}

  void notify(std::string_view notification) override {
    const auto data = bytesOf(notification);
    if (data.size() > maximumNotification) return;
    server_->postToAll({.kind = FrameKind::notification}, data);
  }

 private:
  std::unique_ptr<FrameServer> server_;
};

bool receive(const DaemonServerHost::LogChannelHandler& handler, FrameChannel& from, const Frame& frame) {
  const std::size_t length = frame.data.size();
  if (frame.header.kind != FrameKind::logChannelRequest || length == 0 || length > maximumPortName)
    return false;
  const auto answer = handler(textOf(frame.data));
  if (!answer) return true;
  const FrameHeader header{.kind = FrameKind::logChannelAnswer, .token = frame.header.token};
  if (!from.post(header, encodeAnswer(*answer))) from.fail("peer leaves its answers unread");
  return true;
}

}  // namespace

std::unique_ptr<DaemonServer> QtDaemonServerHost::serve(LogChannelHandler handler) {
  auto server = FrameServer::open(daemonServerName, log_,
                                  [handler = std::move(handler)](FrameChannel& from, const Frame& frame) {
                                    return receive(handler, from, frame);
                                  });
  if (!server) return nullptr;
  removeDeadSockets(log_);
  return std::make_unique<QtDaemonServer>(std::move(server));
}

}  // namespace kelvasi
